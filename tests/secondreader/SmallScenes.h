// Scenes of a few hundred bytes that together hold everything that the importer reads.
#pragma once

#include <string_view>
#include <vector>

namespace secondreader {

struct SmallScene {
  std::string_view name;  // letters only
  std::string_view text;
};

const std::vector<SmallScene>& smallScenes();

}  // namespace secondreader
