// An array of plain values that grows at its end and keeps its memory when it is cleared.
#pragma once

#include <algorithm>
#include <cstddef>
#include <vector>

namespace refhost {

template <typename Value>
class Column {
 public:
  std::size_t size() const { return size_; }
  bool empty() const { return size_ == 0; }
  const Value* begin() const { return room_.data(); }
  const Value* end() const { return room_.data() + size_; }
  Value& operator[](std::size_t at) { return room_[at]; }
  const Value& operator[](std::size_t at) const { return room_[at]; }

  // Whether `count` more values fit without more memory; makes room for them.
  bool hasRoom(std::size_t count) const { return capacity_ - size_ >= count; }
  [[gnu::cold]] void makeRoom(std::size_t count) {
    if (!hasRoom(count)) grow(size_ + count);
  }

  // The place of the next value, writable as far as there is room; adds `count` values that were written
  // there.
  Value* next() { return room_.data() + size_; }
  void advance(std::size_t count) { size_ += count; }

  // New values are zero.
  void resize(std::size_t size) {
    if (size > capacity_) grow(size);
    if (size > size_) std::fill(room_.data() + size_, room_.data() + size, Value{});
    size_ = size;
  }

  void clear() { size_ = 0; }

 private:
  void grow(std::size_t least) {
    constexpr std::size_t kFirstRoom = 64;
    room_.resize(std::max({least, 2 * capacity_, kFirstRoom}));
    capacity_ = room_.size();
  }

  std::vector<Value> room_;  // the values, and zeros or old values after them
  std::size_t size_ = 0;
  std::size_t capacity_ = 0;  // the size of `room_`, kept because every value needs it
};

}  // namespace refhost
