#include "tests/secondreader/PlayedFile.h"

namespace secondreader {

HostError PlayedFile::open() {
  HostError code = HOST_ERR_NONE;
  if (host_->serviceFails("FileOpen", &code)) return code;
  if (open_) return HOST_ERR_FILE_STATE;
  open_ = true;
  place_ = 0;
  return HOST_ERR_NONE;
}

HostError PlayedFile::read(std::size_t count, std::string* buffer) {
  HostError code = HOST_ERR_NONE;
  if (buffer != nullptr) buffer->assign(count, '\0');
  if (host_->serviceFails("FileRead", &code)) return code;
  if (buffer == nullptr) return HOST_ERR_UTILITY_NULL;
  if (!open_) return HOST_ERR_FILE_STATE;
  const std::string_view got = bytes_.substr(place_, count);
  place_ += got.size();
  buffer->replace(0, got.size(), got);
  return got.size() == count ? HOST_ERR_NONE : HOST_ERR_FILE_SHORT_READ;
}

HostError PlayedFile::close() {
  HostError code = HOST_ERR_NONE;
  if (!host_->serviceFails("FileClose", &code)) open_ = false;
  return code;
}

HostError PlayedFile::size(std::size_t* size) {
  HostError code = HOST_ERR_NONE;
  const bool nothing = host_->serviceFails("FileSize", &code);
  *size = nothing ? 0 : bytes_.size();
  return code;
}

HostError PlayedFile::dispose() {
  HostError code = HOST_ERR_NONE;
  if (!host_->serviceFails("FileDispose", &code)) --host_->files;
  return code;
}

HostError PlayedFile::readFromStart(std::size_t count, std::string* buffer) {
  const HostError kept = host_->guarded([&] {
    check(open());
    check(read(count, buffer));
  });
  const HostError closed = close();
  return kept != HOST_ERR_NONE ? kept : closed;
}

}  // namespace secondreader
