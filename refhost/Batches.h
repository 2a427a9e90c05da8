// Keyframe batches: keys that wait for the commit, in columns.
#pragma once

#include <cstddef>
#include <cstdint>
#include <vector>

#include "refhost/Project.h"

namespace refhost {

// The order of key times, exact: value / scale without dividing. A time of scale 0, which only a permissive
// host takes, comes after every other, by its value.
bool timeLess(const T_Time& a, const T_Time& b);

struct Batch {
  Layer* layer = nullptr;
  Stream* stream = nullptr;
  std::vector<T_Time> times;
  std::vector<double> values;        // dimension numbers per key; 0 until the key has its value
  std::vector<std::uint8_t> valued;  // 1 when the key has its value
  std::size_t valuedCount = 0;
  bool endFailed = false;  // a rehearsal made its EndKeyframeBatch fail

  void addKey(const T_Time& time) {
    times.push_back(time);
    values.resize(values.size() + static_cast<std::size_t>(stream->dimension), 0.0);
    valued.push_back(0);
  }

  void setValue(std::size_t index, const double* value) {
    const std::size_t dimension = static_cast<std::size_t>(stream->dimension);
    for (std::size_t i = 0; i < dimension; ++i) values[index * dimension + i] = value[i];
    if (valued[index] == 0) ++valuedCount;
    valued[index] = 1;
  }
};

// Moves the keys of the batch into the columns (null: there are none yet): sorted by time, stably, of equal
// times the later stays (those of the batch are later than those that are there), keys without a value
// dropped. The batch is spent afterwards.
void commitKeys(Batch& batch, std::unique_ptr<KeyColumns>& keys);

}  // namespace refhost
