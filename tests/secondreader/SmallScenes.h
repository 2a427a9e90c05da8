// Scenes of a few hundred bytes that together hold everything that the importer reads.
#pragma once

#include <ostream>
#include <string_view>
#include <vector>

namespace secondreader {

struct SmallScene {
  std::string_view name;  // letters only
  std::string_view text;
};

// What a list of tests shows of the scene; its bytes would show addresses, which differ from run to run.
inline void PrintTo(const SmallScene& scene, std::ostream* stream) { *stream << scene.name; }

const std::vector<SmallScene>& smallScenes();

}  // namespace secondreader
