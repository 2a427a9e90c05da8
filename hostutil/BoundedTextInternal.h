// A text written into a buffer of fixed size.
#pragma once

#include <cstdint>
#include <cstring>

namespace hostutil {

// Appends pieces, as long as they fit whole with a NUL after them. From the first piece on that does not fit,
// nothing more is written; the size that all of them need is still counted.
template <typename Unit>
class BoundedText {
 public:
  // A null buffer has no room at all.
  BoundedText(Unit* buffer, std::int64_t capacity)
      : buffer_(buffer), capacity_(buffer != nullptr ? capacity : 0) {
    if (capacity_ > 0) buffer_[0] = 0;
  }

  void Append(const Unit* piece, std::int64_t count) {
    if (Fits() && count < capacity_ - needed_) {
      std::memcpy(buffer_ + needed_, piece, static_cast<std::size_t>(count) * sizeof(Unit));
      written_ = needed_ + count;
      buffer_[written_] = 0;
    }
    needed_ += count;
  }

  // The units of all pieces, without the NUL.
  std::int64_t Needed() const { return needed_; }

  bool Fits() const { return capacity_ > 0 && needed_ == written_; }

  void Clear() {
    if (capacity_ > 0) buffer_[0] = 0;
  }

 private:
  Unit* buffer_;
  std::int64_t capacity_;
  std::int64_t needed_ = 0;
  std::int64_t written_ = 0;
};

}  // namespace hostutil
