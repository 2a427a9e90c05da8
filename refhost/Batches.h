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
  std::vector<double> values;  // dimension numbers per key, as far as keys got values
  // Which keys have a value, 1 or 0. Empty as long as they got theirs in their order: those that `values`
  // holds.
  std::vector<std::uint8_t> valued;
  bool endFailed = false;  // a rehearsal made its EndKeyframeBatch fail

  void addKey(const T_Time& time) { times.push_back(time); }

  // There is a key of that index.
  void setValue(std::size_t index, const double* value) {
    const std::size_t dimension = static_cast<std::size_t>(stream->dimension);
    if (index * dimension == values.size() && valued.empty()) {
      for (std::size_t i = 0; i < dimension; ++i) values.push_back(value[i]);
    } else {
      setValueOutOfOrder(index, value);
    }
  }

  void setValueOutOfOrder(std::size_t index, const double* value);
};

// Moves the keys of the batch into the columns (null: there are none yet): sorted by time, stably, of equal
// times the later stays (those of the batch are later than those that are there), keys without a value
// dropped. The batch is spent afterwards.
void commitKeys(Batch& batch, std::unique_ptr<KeyColumns>& keys);

}  // namespace refhost
