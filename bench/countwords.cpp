// A yardstick: reads the file whole, into a buffer on large pages, and counts its words. An import has to do
// at least as much. A read into fresh small pages mostly waits for page faults, whose cost differs several
// times between processors.
#include <fcntl.h>
#include <sys/mman.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cstdint>
#include <cstdio>

#include "bench/WordCount.h"

namespace {

// Room for `size` bytes that begins on the boundary of a large page and asks for such pages. Null when there
// is none. It goes with the process.
char* takeLargePages(std::size_t size) {
  constexpr std::size_t kLargePage = std::size_t{2} << 20;
  const std::size_t wholePages = (size / kLargePage + 1) * kLargePage;
  void* const room =
      mmap(nullptr, wholePages + kLargePage, PROT_READ | PROT_WRITE, MAP_PRIVATE | MAP_ANONYMOUS, -1, 0);
  if (room == MAP_FAILED) return nullptr;
  const auto address = reinterpret_cast<std::uintptr_t>(room);
  char* const first = static_cast<char*>(room) + (kLargePage - address % kLargePage) % kLargePage;
  madvise(first, wholePages, MADV_HUGEPAGE);
  return first;
}

bool readWhole(int file, char* buffer, std::size_t size) {
  for (std::size_t done = 0; done < size;) {
    const ssize_t count = read(file, buffer + done, size - done);
    if (count <= 0) return false;
    done += static_cast<std::size_t>(count);
  }
  return true;
}

}  // namespace

int main(int argc, char** argv) {
  const int file = argc == 2 ? open(argv[1], O_RDONLY) : -1;
  struct stat status {};
  if (file < 0 || fstat(file, &status) != 0) {
    std::fprintf(stderr, "bench-countwords: cannot read %s\n",
                 argc == 2 ? argv[1] : "without one file's name");
    return 2;
  }
  const auto size = static_cast<std::size_t>(status.st_size);
  char* const buffer = takeLargePages(size);
  if (buffer == nullptr || !readWhole(file, buffer, size)) {
    std::fprintf(stderr, "bench-countwords: cannot read %s\n", argv[1]);
    return 2;
  }
  std::printf("%zu\n", bench::countWords(buffer, size));
}
