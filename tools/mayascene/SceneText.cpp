#include "tools/mayascene/SceneText.h"

#include <fcntl.h>
#include <sys/mman.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <cstring>
#include <optional>

#include "tools/mayascene/SceneFile.h"

namespace mayascene {
namespace {

// Reads up to `size` bytes. Returns how many there were, or -1.
ssize_t readAll(int descriptor, char* bytes, std::size_t size) {
  std::size_t filled = 0;
  while (filled < size) {
    const ssize_t count = ::read(descriptor, bytes + filled, size - filled);
    if (count < 0 && errno == EINTR) continue;
    if (count < 0) return -1;
    if (count == 0) break;
    filled += static_cast<std::size_t>(count);
  }
  return static_cast<ssize_t>(filled);
}

// A file that is open, and closed at the end.
class Descriptor {
 public:
  explicit Descriptor(const std::filesystem::path& path)
      : number_(::open(path.c_str(), O_RDONLY | O_CLOEXEC | O_NOCTTY)) {}
  ~Descriptor() {
    if (number_ >= 0) ::close(number_);
  }
  Descriptor(const Descriptor&) = delete;
  Descriptor& operator=(const Descriptor&) = delete;

  int number() const { return number_; }

  // None, with the reason in errno, where the file is not open.
  std::optional<std::size_t> size() const {
    struct stat status {};
    if (number_ < 0 || ::fstat(number_, &status) != 0) return std::nullopt;
    return static_cast<std::size_t>(status.st_size);
  }

 private:
  int number_;
};

bool isReadable(const std::filesystem::path& path, std::string* failure) {
  const SceneLook look = lookAtScene(path);
  if (!look.readable) *failure = look.failure;
  return look.readable;
}

std::string unread() { return std::string("cannot be read: ") + std::strerror(errno); }

}  // namespace

std::unique_ptr<SceneText> SceneText::open(const std::filesystem::path& path, std::string* failure) {
  if (!isReadable(path, failure)) return nullptr;
  const Descriptor file(path);
  std::unique_ptr<SceneText> scene(new SceneText);
  ssize_t count = -1;
  if (const std::optional<std::size_t> size = file.size()) {
    scene->bytes_ = std::make_unique_for_overwrite<char[]>(*size);
    count = readAll(file.number(), scene->bytes_.get(), *size);
  }
  if (count < 0) {
    *failure = unread();
    return nullptr;
  }
  scene->size_ = static_cast<std::size_t>(count);
  return scene;
}

std::unique_ptr<SceneText> SceneText::map(const std::filesystem::path& path, std::string* failure) {
  if (!isReadable(path, failure)) return nullptr;
  const Descriptor file(path);
  const std::optional<std::size_t> size = file.size();
  // An empty file cannot be mapped, nor can those of some file systems.
  void* const mapped =
      size.value_or(0) == 0 ? MAP_FAILED : ::mmap(nullptr, *size, PROT_READ, MAP_PRIVATE, file.number(), 0);
  if (mapped == MAP_FAILED) return open(path, failure);
  std::unique_ptr<SceneText> scene(new SceneText);
  scene->mapped_ = static_cast<char*>(mapped);
  scene->size_ = *size;
  return scene;
}

SceneText::~SceneText() {
  if (mapped_ != nullptr) ::munmap(mapped_, size_);
}

}  // namespace mayascene
