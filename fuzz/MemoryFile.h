// A file in memory, with a path, for code that reads files.
#pragma once

#include <filesystem>
#include <string_view>

namespace fuzz {

class MemoryFile {
 public:
  MemoryFile();
  ~MemoryFile();
  MemoryFile(const MemoryFile&) = delete;
  MemoryFile& operator=(const MemoryFile&) = delete;

  // Replaces what the file holds.
  void Write(std::string_view bytes);

  // Valid in this process, while the object lives.
  const std::filesystem::path& path() const { return path_; }

 private:
  int descriptor_;
  std::filesystem::path path_;
};

}  // namespace fuzz
