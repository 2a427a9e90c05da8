// Files, over the system's own calls.
#include "hostutil/HostFile.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <cstdint>
#include <cstring>
#include <new>
#include <string>
#include <unordered_set>
#include <vector>

#include "hostapi/ErrorCodes.h"
#include "hostutil/PathsInternal.h"
#include "hostutil/RegistryInternal.h"
#include "hostutil/RehearsalInternal.h"
#include "hostutil/UTF16StringInternal.h"

namespace {

constexpr int kClosed = -1;
constexpr std::int64_t kLargestSize = INT32_MAX;
constexpr HostUTF16Unit kSlash = '/';

// All files that this library made and that are not disposed of: any other handle is refused.
std::unordered_set<const HostFile*> liveFiles;

}  // namespace

struct HostFile final : hostutil::LiveObject {
  explicit HostFile(const UTF16String& text)
      : LiveObject(Kind::File), pathUnits(text.units), path(hostutil::PathBytes(text.units.data())) {
    liveFiles.insert(this);
  }
  ~HostFile() override {
    liveFiles.erase(this);
    if (descriptor != kClosed) close(descriptor);
  }

  std::string Describe() const override { return "file " + hostutil::ShownLine(pathUnits.data()); }

  const std::vector<HostUTF16Unit> pathUnits;  // with their NUL
  const std::string path;                      // as the system knows it
  int descriptor = kClosed;
};

namespace {

bool IsFile(const HostFile* file) { return liveFiles.count(file) != 0; }

// O_NONBLOCK lets the open of a FIFO return, so that it can be looked at; a regular file ignores it.
int OpenWithoutBlocking(const char* path) {
  for (;;) {
    const int descriptor = open(path, O_RDONLY | O_NONBLOCK | O_CLOEXEC | O_NOCTTY);
    if (descriptor >= 0 || errno != EINTR) return descriptor;
  }
}

HostError CloseDescriptor(HostFile* file) {
  if (file->descriptor == kClosed) return HOST_ERR_NONE;
  const int result = close(file->descriptor);
  file->descriptor = kClosed;
  // An interrupted close has closed the descriptor.
  return result == 0 || errno == EINTR ? HOST_ERR_NONE : HOST_ERR_FILE_CLOSE;
}

bool Query(const HostFile& file, struct stat* status) {
  const int result =
      file.descriptor != kClosed ? fstat(file.descriptor, status) : stat(file.path.c_str(), status);
  return result == 0 && S_ISREG(status->st_mode);
}

// False when the file ends, or fails, before all bytes are there.
bool ReadWhole(int descriptor, char* buffer, std::int64_t count) {
  while (count > 0) {
    const ssize_t got = read(descriptor, buffer, static_cast<std::size_t>(count));
    if (got < 0 && errno == EINTR) continue;
    if (got <= 0) return false;
    buffer += got;
    count -= got;
  }
  return true;
}

// After the last slash.
std::vector<HostUTF16Unit> LastComponent(const std::vector<HostUTF16Unit>& path) {
  const auto slash = std::find(path.rbegin(), path.rend(), kSlash);
  return {slash.base(), path.end()};
}

}  // namespace

HostError HostFileCreate(const UTF16String* path, HostFile** file) {
  if (HostError code; hostutil::Rehearsed(HOST_UTILITY_FileCreate, &code)) {
    hostutil::HandOutNothing(file);
    return code;
  }
  if (file == nullptr) return HOST_ERR_UTILITY_NULL;
  *file = nullptr;
  if (path == nullptr) return HOST_ERR_UTILITY_NULL;
  try {
    *file = new HostFile(*path);
  } catch (const std::bad_alloc&) {
    return HOST_ERR_TEXT_MEMORY;
  }
  return HOST_ERR_NONE;
}

HostError HostFileOpen(HostFile* file, std::int32_t mode) {
  if (HostError code; hostutil::Rehearsed(HOST_UTILITY_FileOpen, &code)) return code;
  if (!IsFile(file)) return HOST_ERR_UTILITY_NULL;
  if (file->descriptor != kClosed) return HOST_ERR_FILE_STATE;
  if (mode != HOST_FILE_READ) return HOST_ERR_FILE_OPEN;
  file->descriptor = OpenWithoutBlocking(file->path.c_str());
  if (file->descriptor == kClosed) return HOST_ERR_FILE_OPEN;
  struct stat status;
  if (Query(*file, &status)) return HOST_ERR_NONE;
  CloseDescriptor(file);
  return HOST_ERR_FILE_OPEN;
}

HostError HostFileSize(HostFile* file, std::int64_t* size) {
  if (HostError code; hostutil::Rehearsed(HOST_UTILITY_FileSize, &code)) {
    hostutil::HandOutNothing(size);
    return code;
  }
  if (size == nullptr) return HOST_ERR_UTILITY_NULL;
  *size = 0;
  if (!IsFile(file)) return HOST_ERR_UTILITY_NULL;
  struct stat status;
  if (!Query(*file, &status) || status.st_size > kLargestSize) return HOST_ERR_FILE_SIZE;
  *size = status.st_size;
  return HOST_ERR_NONE;
}

HostError HostFileRead(HostFile* file, std::int64_t count, void* buffer) {
  if (HostError code; hostutil::Rehearsed(HOST_UTILITY_FileRead, &code)) {
    if (buffer != nullptr && count > 0) std::memset(buffer, 0, static_cast<std::size_t>(count));
    return code;
  }
  if (!IsFile(file) || buffer == nullptr) return HOST_ERR_UTILITY_NULL;
  if (file->descriptor == kClosed) return HOST_ERR_FILE_STATE;
  const bool whole = count >= 0 && ReadWhole(file->descriptor, static_cast<char*>(buffer), count);
  return whole ? HOST_ERR_NONE : HOST_ERR_FILE_SHORT_READ;
}

HostError HostFileClose(HostFile* file) {
  if (HostError code; hostutil::Rehearsed(HOST_UTILITY_FileClose, &code)) return code;
  return IsFile(file) ? CloseDescriptor(file) : HOST_ERR_UTILITY_NULL;
}

HostError HostFileName(HostFile* file, UTF16String** name) {
  if (HostError code; hostutil::Rehearsed(HOST_UTILITY_FileName, &code)) {
    hostutil::HandOutNothing(name);
    return code;
  }
  if (name == nullptr) return HOST_ERR_UTILITY_NULL;
  *name = nullptr;
  if (!IsFile(file)) return HOST_ERR_UTILITY_NULL;
  try {
    *name = new UTF16String(LastComponent(file->pathUnits));
  } catch (const std::bad_alloc&) {
    return HOST_ERR_TEXT_MEMORY;
  }
  return HOST_ERR_NONE;
}

HostError HostFileDispose(HostFile* file) {
  // Set first, so that it remains when a rehearsal makes the release fail, by a code or an exception.
  // Otherwise the object is gone with its mark.
  if (IsFile(file)) file->MarkReleaseFailed();
  if (HostError code; hostutil::Rehearsed(HOST_UTILITY_FileDispose, &code)) return code;
  if (!IsFile(file)) return HOST_ERR_UTILITY_NULL;
  const HostError closed = CloseDescriptor(file);
  delete file;
  return closed;
}
