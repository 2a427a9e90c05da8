// bench-readwhole FILE: what an import cannot be faster than, and yet is: a plain program that opens the
// file, allocates its size and two bytes, and reads it whole.
#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cstdlib>

int main(int argc, char** argv) {
  struct stat facts {};
  const int file = argc == 2 ? open(argv[1], O_RDONLY) : -1;
  if (file < 0 || fstat(file, &facts) != 0) return 1;
  const auto size = static_cast<std::size_t>(facts.st_size);
  char* const text = static_cast<char*>(std::malloc(size + 2));
  std::size_t done = 0;
  for (ssize_t got = 1; text != nullptr && done < size && got > 0; done += static_cast<std::size_t>(got)) {
    got = read(file, text + done, size - done);
  }
  std::free(text);
  close(file);
  return done == size ? 0 : 1;
}
