// The bytes of a scene's file.
#pragma once

#include <cstddef>
#include <filesystem>
#include <memory>
#include <string>
#include <string_view>

namespace mayascene {

// A regular file in memory. It is read, not mapped: one that another program cuts off meanwhile is shorter,
// and nothing worse.
class SceneText {
 public:
  // Null with a sentence in *failure when the file cannot be read.
  static std::unique_ptr<SceneText> open(const std::filesystem::path& path, std::string* failure);

  // Lives as long as the object.
  std::string_view text() const { return {bytes_.get(), size_}; }

 private:
  SceneText() = default;

  std::unique_ptr<char[]> bytes_;
  std::size_t size_ = 0;
};

}  // namespace mayascene
