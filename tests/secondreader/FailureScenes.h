// Small scenes that together reach every suite call, utility service and code of an import.
#pragma once

#include <ostream>
#include <string>
#include <vector>

namespace testsupport {

struct FailureScene {
  std::string name;
  std::string text;
  int zoomKeys = 0;
};

const std::vector<FailureScene>& FailureScenes();

inline void PrintTo(const FailureScene& scene, std::ostream* out) { *out << scene.name; }

}  // namespace testsupport
