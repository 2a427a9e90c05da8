#include "motion/Curve.h"

#include <algorithm>
#include <cmath>
#include <numeric>
#include <utility>

#include "motion/CurveTangents.h"

namespace motion {
namespace {

constexpr double kOnKey = 1e-10;  // seconds

bool Finite(const CurveKey& key) { return std::isfinite(key.time) && std::isfinite(key.value); }

bool InOrder(const std::vector<CurveKey>& keys) {
  for (std::size_t key = 0; key < keys.size(); ++key) {
    if (!Finite(keys[key]) || (key > 0 && !(keys[key - 1].time < keys[key].time))) return false;
  }
  return true;
}

// The numbers of the keys that stay, in ascending order of their times.
std::vector<std::size_t> Order(const std::vector<CurveKey>& keys) {
  std::vector<std::size_t> order(keys.size());
  std::iota(order.begin(), order.end(), std::size_t{0});
  std::erase_if(order, [&keys](std::size_t key) { return !Finite(keys[key]); });
  std::stable_sort(order.begin(), order.end(),
                   [&keys](std::size_t a, std::size_t b) { return keys[a].time < keys[b].time; });
  std::vector<std::size_t> kept;
  for (const std::size_t key : order) {
    if (!kept.empty() && keys[kept.back()].time == keys[key].time) kept.pop_back();
    kept.push_back(key);
  }
  return kept;
}

CurveSide Reordered(const CurveData& data, Side side, const std::vector<std::size_t>& order) {
  const CurveSide& from = side == Side::kIn ? data.in : data.out;
  CurveSide to;
  for (const std::size_t key : order) {
    to.types.push_back(TangentType(data, side, key));
    const bool written = key >= from.firstTangent && key - from.firstTangent < from.tangents.size();
    to.tangents.push_back(written ? from.tangents[key - from.firstTangent] : Tangent{});
  }
  return to;
}

void PutInOrder(CurveData* data) {
  const std::vector<std::size_t> order = Order(data->keys);
  CurveSide in = Reordered(*data, Side::kIn, order);
  CurveSide out = Reordered(*data, Side::kOut, order);
  std::vector<CurveKey> keys;
  for (const std::size_t key : order) keys.push_back(data->keys[key]);
  data->keys = std::move(keys);
  data->in = std::move(in);
  data->out = std::move(out);
}

}  // namespace

Curve::Curve(CurveData data) : data_(std::move(data)) {
  if (!InOrder(data_.keys)) PutInOrder(&data_);
}

double Curve::At(double seconds) const {
  CurveCursor cursor;
  return At(seconds, &cursor);
}

double Curve::At(double seconds, CurveCursor* cursor) const {
  const std::vector<CurveKey>& keys = data_.keys;
  if (keys.empty()) return 0.0;
  if (keys.size() == 1) return keys.front().value;
  if (seconds < keys.front().time - kOnKey || seconds > keys.back().time + kOnKey) {
    return Outside(seconds, cursor);
  }
  return Inside(seconds, cursor);
}

// The key on the left of the span that the time lies in.
std::size_t Curve::FindSpan(double seconds, std::size_t hint) const {
  const std::vector<CurveKey>& keys = data_.keys;
  for (std::size_t key = hint; key < hint + 2 && key + 1 < keys.size(); ++key) {
    if (keys[key].time <= seconds && seconds < keys[key + 1].time) return key;
  }
  const auto after = std::upper_bound(keys.begin() + 1, keys.end() - 1, seconds,
                                      [](double time, const CurveKey& key) { return time < key.time; });
  return static_cast<std::size_t>(after - keys.begin()) - 1;
}

double Curve::Inside(double seconds, CurveCursor* cursor) const {
  cursor->key_ = FindSpan(seconds, cursor->key_);
  const CurveKey& left = data_.keys[cursor->key_];
  const CurveKey& right = data_.keys[cursor->key_ + 1];
  if (std::fabs(seconds - left.time) <= kOnKey) return left.value;
  if (std::fabs(seconds - right.time) <= kOnKey) return right.value;
  if (cursor->spanOf_ != cursor->key_) {
    cursor->span_ = CurveSpan(data_, cursor->key_);
    cursor->spanOf_ = cursor->key_;
  }
  return cursor->span_.At(seconds);
}

double Curve::Outside(double seconds, CurveCursor* cursor) const {
  const bool after = seconds > data_.keys.back().time;
  const std::size_t end = after ? data_.keys.size() - 1 : 0;
  const CurveKey& key = data_.keys[end];
  const int code = after ? data_.postInfinity : data_.preInfinity;
  switch (code) {
    case infinity::kLinear:
      return key.value + Slope(TangentAt(data_, after ? Side::kOut : Side::kIn, end)) * (seconds - key.time);
    case infinity::kCycle:
    case infinity::kCycleWithOffset:
    case infinity::kOscillate:
      return Repeated(code, std::fabs(seconds - key.time), after, cursor);
    default:
      return key.value;
  }
}

double Curve::Repeated(int code, double distance, bool after, CurveCursor* cursor) const {
  const CurveKey& first = data_.keys.front();
  const CurveKey& last = data_.keys.back();
  const double length = last.time - first.time;
  double rest = std::fmod(distance, length);
  double turns = std::round((distance - rest) / length);
  // Rounding can leave the rest just short of a whole turn, which then counts as whole.
  if (length - rest <= kOnKey) {
    rest = 0.0;
    turns += 1.0;
  }
  const bool back = code == infinity::kOscillate && std::fmod(turns, 2.0) == 0.0;
  const bool fromFirst = after != back;
  const double value = Inside(fromFirst ? first.time + rest : last.time - rest, cursor);
  if (code != infinity::kCycleWithOffset) return value;
  const double offset = (turns + 1.0) * (last.value - first.value);
  return after ? value + offset : value - offset;
}

}  // namespace motion
