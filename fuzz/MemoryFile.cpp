#include "fuzz/MemoryFile.h"

#include <sys/mman.h>
#include <sys/types.h>
#include <unistd.h>

#include <string>

#include "fuzz/Require.h"

namespace fuzz {

MemoryFile::MemoryFile()
    : descriptor_(memfd_create("fuzz", MFD_CLOEXEC)), path_("/proc/self/fd/" + std::to_string(descriptor_)) {
  Require(descriptor_ >= 0, "a file in memory can be made");
}

MemoryFile::~MemoryFile() { close(descriptor_); }

void MemoryFile::Write(std::string_view bytes) {
  Require(ftruncate(descriptor_, 0) == 0, "the file in memory can be emptied");
  const ssize_t written = pwrite(descriptor_, bytes.data(), bytes.size(), 0);
  Require(written >= 0 && static_cast<std::size_t>(written) == bytes.size(),
          "the file in memory takes the bytes");
}

}  // namespace fuzz
