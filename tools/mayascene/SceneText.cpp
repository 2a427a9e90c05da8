#include "tools/mayascene/SceneText.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <cstring>

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

}  // namespace

std::unique_ptr<SceneText> SceneText::open(const std::filesystem::path& path, std::string* failure) {
  const SceneLook look = lookAtScene(path);
  if (!look.readable) {
    *failure = look.failure;
    return nullptr;
  }
  const int descriptor = ::open(path.c_str(), O_RDONLY | O_CLOEXEC | O_NOCTTY);
  struct stat status {};
  std::unique_ptr<SceneText> scene(new SceneText);
  ssize_t count = -1;
  if (descriptor >= 0 && ::fstat(descriptor, &status) == 0) {
    const auto size = static_cast<std::size_t>(status.st_size);
    scene->bytes_ = std::make_unique_for_overwrite<char[]>(size);
    count = readAll(descriptor, scene->bytes_.get(), size);
  }
  if (count < 0) *failure = std::string("cannot be read: ") + std::strerror(errno);
  if (descriptor >= 0) ::close(descriptor);
  if (count < 0) return nullptr;
  scene->size_ = static_cast<std::size_t>(count);
  return scene;
}

}  // namespace mayascene
