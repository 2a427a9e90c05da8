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
  // Reads the file. One that another program cuts off meanwhile is shorter, and nothing worse. Null with a
  // sentence in *failure when it cannot be read.
  static std::unique_ptr<SceneText> open(const std::filesystem::path& path, std::string* failure);

  // Maps the file, which takes neither the time to copy it nor the memory. One that another program cuts off
  // meanwhile ends the process with SIGBUS: for a process that works for this file alone, and that another
  // one watches. Else as open().
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
