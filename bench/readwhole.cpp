// bench-readwhole FILE: the yardstick R. Opens the file, allocates size + 2 bytes, reads it whole.
#include <cstdio>
#include <cstdlib>
int main(int argc, char** argv) {
  std::FILE* file = argc == 2 ? std::fopen(argv[1], "rb") : nullptr;
  if (file == nullptr || std::fseek(file, 0, SEEK_END) != 0) return 1;
  const auto size = static_cast<std::size_t>(std::ftell(file));
  std::rewind(file);
  std::setvbuf(file, nullptr, _IONBF, 0);
  char* text = static_cast<char*>(std::malloc(size + 2));
  return text != nullptr && std::fread(text, 1, size, file) == size && text[size / 2] != 1 ? 0 : 1;
}
