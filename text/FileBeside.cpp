#include "text/FileBeside.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <cstdio>
#include <filesystem>
#include <system_error>

namespace text {
namespace {

constexpr mode_t kNewFileMode = 0666;  // reduced by the user's mask
constexpr mode_t kPermissionBits = 07777;
constexpr int kMostLinks = 40;  // that one name leads through; the system follows no more either

// Empty where the links lead in a circle.
std::filesystem::path WithoutLinks(const std::string& target) {
  std::filesystem::path place = target;
  for (int links = 0; links < kMostLinks; ++links) {
    std::error_code isNoLink;
    const std::filesystem::path next = std::filesystem::read_symlink(place, isNoLink);
    if (isNoLink) return place;
    place = place.parent_path() / next;
  }
  return {};
}

bool WriteAll(int descriptor, std::string_view content) {
  while (!content.empty()) {
    const ssize_t written = ::write(descriptor, content.data(), content.size());
    if (written < 0 && errno == EINTR) continue;
    if (written < 0) return false;
    content.remove_prefix(static_cast<std::size_t>(written));
  }
  return true;
}

}  // namespace

std::string NameBeside(const std::string& place) {
  static int serial = 0;
  const std::string name = ".mayascene-" + std::to_string(::getpid()) + '-' + std::to_string(++serial);
  return (std::filesystem::path(place).parent_path() / name).string();
}

FileBeside::~FileBeside() { Remove(); }

bool FileBeside::FindPlace(const std::string& target) {
  place_ = WithoutLinks(target).string();
  if (place_.empty()) {
    errno = ELOOP;
    return false;
  }
  if (::access(place_.c_str(), W_OK) != 0) {
    if (errno != ENOENT) return false;
  } else if (!std::filesystem::is_regular_file(place_)) {
    errno = EEXIST;
    return false;
  }
  beside_ = NameBeside(place_);
  return true;
}

int FileBeside::Create() {
  struct stat existing {};
  const bool replaces = ::stat(place_.c_str(), &existing) == 0;
  const int descriptor = ::open(beside_.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, kNewFileMode);
  if (descriptor < 0 || !replaces || ::fchmod(descriptor, existing.st_mode & kPermissionBits) == 0)
    return descriptor;
  const int number = errno;
  ::close(descriptor);
  errno = number;
  return -1;
}

bool FileBeside::TakePlace() {
  if (std::rename(beside_.c_str(), place_.c_str()) != 0) return false;
  beside_.clear();
  return true;
}

void FileBeside::Remove() {
  if (!beside_.empty()) ::unlink(beside_.c_str());
  beside_.clear();
}

bool ReplaceFile(const std::string& target, std::string_view content) {
  FileBeside file;
  if (!file.FindPlace(target)) return false;
  const int descriptor = file.Create();
  if (descriptor < 0) return false;
  const bool whole = WriteAll(descriptor, content);
  const int number = errno;
  // A file system that is full can say so no earlier than here.
  if (::close(descriptor) == 0 && whole) return file.TakePlace();
  if (!whole) errno = number;
  return false;
}

}  // namespace text
