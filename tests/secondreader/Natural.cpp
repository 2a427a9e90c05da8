#include "tests/secondreader/Natural.h"

#include <algorithm>

namespace secondreader {
namespace {

constexpr std::size_t kPartBits = 32;

}  // namespace

Natural::Natural(std::uint32_t value) : parts_{value} { dropLeadingZeros(); }

void Natural::dropLeadingZeros() {
  while (!parts_.empty() && parts_.back() == 0) parts_.pop_back();
}

void Natural::multiplyAndAdd(std::uint32_t factor, std::uint32_t summand) {
  std::uint64_t carry = summand;
  for (std::uint32_t& part : parts_) {
    carry += std::uint64_t{part} * factor;
    part = static_cast<std::uint32_t>(carry);
    carry >>= kPartBits;
  }
  parts_.push_back(static_cast<std::uint32_t>(carry));
  dropLeadingZeros();
}

void Natural::doubled(std::size_t times) {
  for (; times % kPartBits != 0; --times) multiplyAndAdd(2, 0);
  if (!isZero()) parts_.insert(parts_.begin(), times / kPartBits, 0);
}

void Natural::halved(std::size_t times) {
  const std::size_t whole = std::min(times / kPartBits, parts_.size());
  parts_.erase(parts_.begin(), parts_.begin() + static_cast<std::ptrdiff_t>(whole));
  for (times %= kPartBits; times != 0; --times) {
    std::uint32_t carry = 0;
    for (auto part = parts_.rbegin(); part != parts_.rend(); ++part) {
      const std::uint32_t next = *part & 1;
      *part = *part >> 1 | carry << (kPartBits - 1);
      carry = next;
    }
  }
  dropLeadingZeros();
}

void Natural::subtract(const Natural& other) {
  std::int64_t borrow = 0;
  for (std::size_t i = 0; i < parts_.size(); ++i) {
    std::int64_t difference = std::int64_t{parts_[i]} - borrow;
    if (i < other.parts_.size()) difference -= other.parts_[i];
    borrow = difference < 0 ? 1 : 0;
    parts_[i] = static_cast<std::uint32_t>(difference);
  }
  dropLeadingZeros();
}

int Natural::compare(const Natural& other) const {
  if (parts_.size() != other.parts_.size()) return parts_.size() < other.parts_.size() ? -1 : 1;
  for (std::size_t i = parts_.size(); i-- > 0;) {
    if (parts_[i] != other.parts_[i]) return parts_[i] < other.parts_[i] ? -1 : 1;
  }
  return 0;
}

std::size_t Natural::bits() const {
  if (isZero()) return 0;
  std::size_t count = (parts_.size() - 1) * kPartBits;
  for (std::uint32_t part = parts_.back(); part != 0; part >>= 1) ++count;
  return count;
}

// By hand, as with paper and pencil: the divisor is laid under the highest place where it may fit, and then
// moved down place by place.
std::uint64_t divide(Natural* dividend, const Natural& divisor) {
  if (dividend->bits() < divisor.bits()) return 0;
  const std::size_t places = dividend->bits() - divisor.bits();
  Natural laid = divisor;
  laid.doubled(places);
  std::uint64_t quotient = 0;
  for (std::size_t place = 0; place <= places; ++place) {
    quotient <<= 1;
    if (dividend->compare(laid) >= 0) {
      dividend->subtract(laid);
      quotient |= 1;
    }
    laid.halved(1);
  }
  return quotient;
}

}  // namespace secondreader
