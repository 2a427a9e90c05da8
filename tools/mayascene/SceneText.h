// The bytes of a scene's file.
#pragma once

#include <cstddef>
#include <filesystem>
#include <memory>
#include <string>
#include <string_view>

namespace mayascene {

// A regular file in memory.
class SceneText {
 public:
  // Reads the file. If another program shortens it meanwhile, the text is shorter. Null with a sentence in
  // *failure when it cannot be read.
  static std::unique_ptr<SceneText> open(const std::filesystem::path& path, std::string* failure);

  // Maps the file, which saves the time and the memory of a copy. If another program shortens it meanwhile,
  // SIGBUS ends the process: only for a process that works for this file alone, under a parent that watches
  // it. Else as open().
  static std::unique_ptr<SceneText> map(const std::filesystem::path& path, std::string* failure);

  ~SceneText();
  SceneText(const SceneText&) = delete;
  SceneText& operator=(const SceneText&) = delete;

  // Lives as long as the object.
  std::string_view text() const { return {mapped_ != nullptr ? mapped_ : bytes_.get(), size_}; }

 private:
  SceneText() = default;

  std::unique_ptr<char[]> bytes_;
  char* mapped_ = nullptr;
  std::size_t size_ = 0;
};

}  // namespace mayascene
