// A look at a scene's file before the importer gets its path.
#pragma once

#include <filesystem>
#include <string>
#include <string_view>

namespace mayascene {

struct SceneLook {
  bool readable = false;    // a regular file that can be opened
  std::string failure;      // where it is not readable: why, in words
  bool mayaHeader = false;  // it begins with "//Maya", in capitals or not
};

// "//Maya", in capitals or not.
bool beginsAsScene(std::string_view text);

// Never waits: a FIFO without a writer and a directory are recognised at once.
SceneLook lookAtScene(const std::filesystem::path& path);

}  // namespace mayascene
