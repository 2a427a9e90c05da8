// Keyframe batches: keys that are not committed yet, in columns.
#pragma once

#include <cstddef>
#include <cstdint>
#include <vector>

#include "refhost/Column.h"
#include "refhost/Project.h"

namespace refhost {

// The order of key times, exact: value / scale without dividing. A time of scale 0, which only a permissive
// host takes, comes after every other, by its value.
bool timeLess(const T_Time& a, const T_Time& b);

struct Batch {
  Layer* layer = nullptr;
  Stream* stream = nullptr;
  Column<T_Time> times;
  Column<double> values;  // `dimension` numbers for each key that has a value
  // 1 for each key that has a value, else 0. Empty while values come in the order of the keys: then the first
  // `nextValued` keys have one.
  std::vector<std::uint8_t> valued;
  std::size_t nextValued = 0;  // the next key to get a value, or kOutOfOrder once they came out of order
  bool endFailed = false;      // a rehearsal made its EndKeyframeBatch fail

  static constexpr std::size_t kOutOfOrder = SIZE_MAX;
  static constexpr std::size_t kMostDimensions = 3;

  // Adds a key without a value. `times` must have room for it.
  void addKey(const T_Time& time) {
    *times.next() = time;
    times.advance(1);
  }

  // Gives an existing key its value: as many of the three numbers as the stream has dimensions.
  void setValue(std::size_t index, const double* value) {
    if (index != nextValued || !values.hasRoom(kMostDimensions)) [[unlikely]]
      return setValueSlowly(index, value);
    double* const next = values.next();
    next[0] = value[0];
    next[1] = value[1];
    next[2] = value[2];
    values.advance(static_cast<std::size_t>(stream->dimension));
    ++nextValued;
  }

  // Makes the batch blank. The columns keep their memory for the next batch.
  void clear();

 private:
  // Handles a key out of order, and values without room.
  [[gnu::cold]] void setValueSlowly(std::size_t index, const double* value);
};

// Merges the keys of the batch into the columns (null: there are none yet): sorted by time, stably. Of keys
// at equal times the later one stays, and those of the batch are later; keys without a value are dropped.
// `ascending` holds the times of the last commit: equal times are shared with it, and it becomes the times of
// this commit. The batch must not be used afterwards.
void commitKeys(Batch& batch, std::unique_ptr<KeyColumns>& keys, KeyTimes* ascending);

}  // namespace refhost
