#include "export/Composition.h"

#include <algorithm>
#include <cmath>

namespace interchange {

double Channel::AtKeys(double frame) const {
  const std::vector<double>& places = *places_;
  const std::vector<double>& values = *values_;
  const auto after =
      static_cast<std::size_t>(std::upper_bound(places.begin(), places.end(), frame) - places.begin());
  if (after == 0) return values.front();
  if (after == places.size()) return values.back();
  const double part = (frame - places[after - 1]) / (places[after] - places[after - 1]);
  if (part == 0.0) return values[after - 1];
  // Neither product overflows where both values are finite.
  return values[after - 1] * (1.0 - part) + values[after] * part;
}

bool Channel::IsSound(std::size_t frames) const {
  const auto finite = [](double value) { return std::isfinite(value); };
  if (!values_) return finite(value_);
  if (places_) {
    if (places_->empty() || values_->size() != places_->size()) return false;
    if (!std::all_of(places_->begin(), places_->end(), finite)) return false;
    const auto flat = std::adjacent_find(places_->begin(), places_->end(), std::greater_equal<>());
    if (flat != places_->end()) return false;
  } else if (values_->size() < frames) {
    return false;
  }
  return std::all_of(values_->begin(), values_->end(), finite);
}

}  // namespace interchange
