// Finds the scenes that the arguments name, in folders too.
#pragma once

#include <string>
#include <vector>

namespace mayascene {

// A folder that could not be searched, or not to its end.
struct UnreadFolder {
  std::string path;
  std::string sentence;  // why
};

struct FoundScenes {
  std::vector<std::string> scenes;
  std::vector<UnreadFolder> unread;
  std::vector<std::string> empty;  // folders among the arguments in which no scene was found
};

// Searches the folders among the arguments, and the folders in them, for names that end in ".ma", in capitals
// or not. Every other argument is a scene as it stands, whatever its name, and whether it exists or not.
//
// The order is that of the arguments; in a folder that of the names, byte by byte. Names that begin with "."
// are passed over. Links are followed, and each folder is searched once, where it is met first, so circles of
// links end. Where a folder cannot be read, only its own scenes are missing.
FoundScenes findScenes(const std::vector<std::string>& arguments);

}  // namespace mayascene
