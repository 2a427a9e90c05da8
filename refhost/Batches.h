// Keyframe batches: keys that wait for the commit, in columns.
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
  Column<double> values;  // dimension numbers per key, as far as keys got values
  // Which keys have a value, 1 or 0. Empty as long as they got theirs in their order: those that `values`
  // holds.
  std::vector<std::uint8_t> valued;
  std::size_t nextValued = 0;  // the key whose turn it is to get its value; none when they came out of order
  bool endFailed = false;      // a rehearsal made its EndKeyframeBatch fail

  static constexpr std::size_t kOutOfOrder = SIZE_MAX;
  static constexpr std::size_t kMostDimensions = 3;

  // There is room for the key in `times`.
  void addKey(const T_Time& time) {
    *times.next() = time;
    times.advance(1);
  }

  // Gives the key of that index, which is there, its value: as many of the three numbers as the stream has.
  void setValue(std::size_t index, const double* value) {
    if (index != nextValued || !values.hasRoom(kMostDimensions)) [[unlikely]]
      return setValueApart(index, value);
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
  // Where there is no room, or it is not the key's turn.
  [[gnu::cold]] void setValueApart(std::size_t index, const double* value);
};

// Takes the keys of the batch into the columns (null: there are none yet): sorted by time, stably, of equal
// times the later stays (those of the batch are later than those that are there), keys without a value
// dropped. Key times that are those of `ascending`, the times that were taken last, are shared with them; it
// becomes the times that were taken now. The batch is spent afterwards.
void commitKeys(Batch& batch, std::unique_ptr<KeyColumns>& keys, KeyTimes* ascending);

}  // namespace refhost
