#include "refhost/Batches.h"

#include <algorithm>
#include <numeric>
#include <utility>

namespace refhost {
namespace {

void dropKeysWithoutValue(Batch& batch) {
  const std::size_t dimension = static_cast<std::size_t>(batch.stream->dimension);
  if (batch.nextValued != Batch::kOutOfOrder) {
    batch.times.resize(batch.nextValued);
    return;
  }
  std::size_t kept = 0;
  for (std::size_t key = 0; key < batch.valued.size(); ++key) {
    if (batch.valued[key] == 0) continue;
    batch.times[kept] = batch.times[key];
    for (std::size_t i = 0; i < dimension; ++i) {
      batch.values[kept * dimension + i] = batch.values[key * dimension + i];
    }
    ++kept;
  }
  batch.times.resize(kept);
  batch.values.resize(kept * dimension);
}

// Whether the times have one scale and grow. Compares all of them without a branch, so that the compiler can
// use vector instructions.
bool isPlainlyAscending(const std::vector<T_Time>& times) {
  unsigned inOrder = times.front().scale != 0 ? 1 : 0;
  for (std::size_t i = 1; i < times.size(); ++i) {
    inOrder &= static_cast<unsigned>(times[i].scale == times[0].scale);
    inOrder &= static_cast<unsigned>(times[i].value > times[i - 1].value);
  }
  return inOrder != 0;
}

bool isAscending(const std::vector<T_Time>& times) {
  return isPlainlyAscending(times) ||
         std::adjacent_find(times.begin(), times.end(),
                            [](const T_Time& a, const T_Time& b) { return !timeLess(a, b); }) == times.end();
}

KeyColumns sorted(const std::vector<T_Time>& times, const std::vector<double>& values,
                  std::size_t dimension) {
  std::vector<std::size_t> order(times.size());
  std::iota(order.begin(), order.end(), std::size_t{0});
  std::stable_sort(order.begin(), order.end(),
                   [&](std::size_t a, std::size_t b) { return timeLess(times[a], times[b]); });
  std::vector<T_Time> sortedTimes;
  std::vector<double> sortedValues;
  sortedTimes.reserve(order.size());
  sortedValues.reserve(order.size() * dimension);
  for (std::size_t place = 0; place < order.size(); ++place) {
    const bool laterOfSameTime =
        place + 1 < order.size() && !timeLess(times[order[place]], times[order[place + 1]]);
    if (laterOfSameTime) continue;
    sortedTimes.push_back(times[order[place]]);
    const auto first = values.begin() + static_cast<std::ptrdiff_t>(order[place] * dimension);
    sortedValues.insert(sortedValues.end(), first, first + static_cast<std::ptrdiff_t>(dimension));
  }
  return {KeyTimes(std::move(sortedTimes)), std::move(sortedValues)};
}

KeyColumns inOrder(std::vector<T_Time>&& times, std::vector<double>&& values, std::size_t dimension) {
  if (!isAscending(times)) return sorted(times, values, dimension);
  return {KeyTimes(std::move(times)), std::move(values)};
}

}  // namespace

void Batch::clear() {
  layer = nullptr;
  stream = nullptr;
  times.clear();
  values.clear();
  valued.clear();
  nextValued = 0;
  endFailed = false;
}

void Batch::setValueSlowly(std::size_t index, const double* value) {
  if (index == nextValued) {
    values.makeRoom(kMostDimensions);
    return setValue(index, value);
  }
  const std::size_t dimension = static_cast<std::size_t>(stream->dimension);
  if (nextValued != kOutOfOrder) valued.assign(nextValued, 1);
  nextValued = kOutOfOrder;
  if (index >= valued.size()) {
    valued.resize(index + 1, 0);
    values.resize(valued.size() * dimension);
  }
  valued[index] = 1;
  for (std::size_t i = 0; i < dimension; ++i) values[index * dimension + i] = value[i];
}

bool timeLess(const T_Time& a, const T_Time& b) {
  if (a.scale == 0 || b.scale == 0) {
    if (a.scale == 0 && b.scale == 0) return a.value < b.value;
    return b.scale == 0;
  }
  return std::int64_t{a.value} * std::int64_t{b.scale} < std::int64_t{b.value} * std::int64_t{a.scale};
}

void commitKeys(Batch& batch, std::unique_ptr<KeyColumns>& keys, KeyTimes* ascending) {
  dropKeysWithoutValue(batch);
  if (batch.times.empty()) return;
  std::vector<double> values;
  if (keys != nullptr) values = std::move(keys->values);
  values.insert(values.end(), batch.values.begin(), batch.values.end());
  if (keys == nullptr && ascending->equal(batch.times.begin(), batch.times.size())) {
    keys = std::make_unique<KeyColumns>(KeyColumns{*ascending, std::move(values)});
    return;
  }
  std::vector<T_Time> times;
  if (keys != nullptr) times = keys->times;
  times.insert(times.end(), batch.times.begin(), batch.times.end());
  const auto dimension = static_cast<std::size_t>(batch.stream->dimension);
  KeyColumns columns = inOrder(std::move(times), std::move(values), dimension);
  *ascending = columns.times;
  keys = std::make_unique<KeyColumns>(std::move(columns));
}

}  // namespace refhost
