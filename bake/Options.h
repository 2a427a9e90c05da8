// The options of a bake.
#pragma once

#include <optional>
#include <string>
#include <vector>

namespace bake {

// Frames of the scene, both ends included.
struct FrameSpan {
  double first = 1.0;
  double last = 1.0;
};

enum class Locators {
  kMarked,  // those whose names the importer takes
  kAll,     // the others too, with a mark before their names
  kNone,
};

struct Options {
  std::optional<FrameSpan> frames;   // none: the playback range and all keys of what is written
  double step = 1.0;                 // frames from one key to the next; positive
  std::vector<std::string> cameras;  // names or paths of transforms or cameras, with case; none: all of them
  bool world = false;                // without the transforms above
  Locators locators = Locators::kMarked;
};

}  // namespace bake
