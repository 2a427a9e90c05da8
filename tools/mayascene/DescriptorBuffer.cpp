#include "tools/mayascene/DescriptorBuffer.h"

#include <unistd.h>

#include <cerrno>

namespace mayascene {

DescriptorBuffer::DescriptorBuffer(int descriptor) : descriptor_(descriptor), buffer_() {
  setp(buffer_.data(), buffer_.data() + buffer_.size());
}

DescriptorBuffer::int_type DescriptorBuffer::overflow(int_type letter) {
  if (sync() != 0) return traits_type::eof();
  if (traits_type::eq_int_type(letter, traits_type::eof())) return traits_type::not_eof(letter);
  *pptr() = traits_type::to_char_type(letter);
  pbump(1);
  return letter;
}

int DescriptorBuffer::sync() {
  const char* from = pbase();
  while (failure_ == 0 && from < pptr()) {
    const ssize_t count = ::write(descriptor_, from, static_cast<std::size_t>(pptr() - from));
    if (count > 0) from += count;
    if (count < 0 && errno != EINTR) failure_ = errno;
  }
  setp(buffer_.data(), buffer_.data() + buffer_.size());
  return failure_ == 0 ? 0 : -1;
}

}  // namespace mayascene
