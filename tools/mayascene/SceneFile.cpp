#include "tools/mayascene/SceneFile.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <cerrno>
#include <cstddef>
#include <cstring>
#include <string_view>

namespace mayascene {
namespace {

constexpr std::string_view kHeader = "//maya";

class Descriptor {
 public:
  explicit Descriptor(int value) : value_(value) {}
  ~Descriptor() {
    if (value_ >= 0) ::close(value_);
  }
  Descriptor(const Descriptor&) = delete;
  Descriptor& operator=(const Descriptor&) = delete;
  int value() const { return value_; }

 private:
  int value_;
};

// False where the read fails: the importer reads the file itself and reports the failure.
bool hasMayaHeader(int descriptor) {
  std::array<char, kHeader.size()> head{};
  std::size_t filled = 0;
  while (filled < head.size()) {
    const ssize_t count = ::read(descriptor, head.data() + filled, head.size() - filled);
    if (count < 0 && errno == EINTR) continue;
    if (count <= 0) return false;
    filled += static_cast<std::size_t>(count);
  }
  return beginsAsScene({head.data(), head.size()});
}

}  // namespace

bool beginsAsScene(std::string_view text) {
  return std::equal(kHeader.begin(), kHeader.end(), text.begin(),
                    text.begin() + std::min(text.size(), kHeader.size()), [](char wanted, char found) {
                      return wanted ==
                             (found >= 'A' && found <= 'Z' ? static_cast<char>(found - 'A' + 'a') : found);
                    });
}

SceneLook lookAtScene(const std::filesystem::path& path) {
  SceneLook look;
  const Descriptor file(::open(path.c_str(), O_RDONLY | O_NONBLOCK | O_CLOEXEC | O_NOCTTY));
  if (file.value() < 0) {
    look.failure = std::string("cannot be opened: ") + std::strerror(errno);
    return look;
  }
  struct stat status {};
  if (::fstat(file.value(), &status) != 0) {
    look.failure = std::string("cannot be examined: ") + std::strerror(errno);
    return look;
  }
  if (!S_ISREG(status.st_mode)) {
    look.failure = S_ISDIR(status.st_mode) ? "is a directory, not a file" : "is not a regular file";
    return look;
  }
  look.readable = true;
  look.mayaHeader = hasMayaHeader(file.value());
  return look;
}

}  // namespace mayascene
