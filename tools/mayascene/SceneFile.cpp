#include "tools/mayascene/SceneFile.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

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

char lowered(char letter) {
  return letter >= 'A' && letter <= 'Z' ? static_cast<char>(letter - 'A' + 'a') : letter;
}

// A read that fails counts as another header: the importer reads for itself and says what is wrong.
bool hasMayaHeader(int descriptor) {
  std::array<char, kHeader.size()> head{};
  std::size_t filled = 0;
  while (filled < head.size()) {
    const ssize_t count = ::read(descriptor, head.data() + filled, head.size() - filled);
    if (count < 0 && errno == EINTR) continue;
    if (count <= 0) return false;
    filled += static_cast<std::size_t>(count);
  }
  for (char& letter : head) letter = lowered(letter);
  return std::string_view(head.data(), head.size()) == kHeader;
}

}  // namespace

SceneLook lookAtScene(const std::filesystem::path& path) {
  SceneLook look;
  const Descriptor file(::open(path.c_str(), O_RDONLY | O_NONBLOCK | O_CLOEXEC | O_NOCTTY));
  if (file.value() < 0) {
    look.failure = std::string("cannot be opened: ") + std::strerror(errno);
    return look;
  }
  struct stat status {};
  if (::fstat(file.value(), &status) != 0) {
    look.failure = std::string("cannot be looked at: ") + std::strerror(errno);
    return look;
  }
  if (!S_ISREG(status.st_mode)) {
    look.failure = S_ISDIR(status.st_mode) ? "is a directory, not a file" : "is no regular file";
    return look;
  }
  look.readable = true;
  look.mayaHeader = hasMayaHeader(file.value());
  return look;
}

}  // namespace mayascene
