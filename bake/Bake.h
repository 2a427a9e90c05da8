// Makes of a scene a small one that the importer takes: cameras, what stands above them, locators, with a
// value at every frame.
#pragma once

#include <cstddef>
#include <optional>
#include <ostream>
#include <string>
#include <vector>

#include "bake/FrameRange.h"
#include "bake/Options.h"
#include "diag/Collector.h"
#include "scene/Scene.h"

namespace bake {

// How a node comes over.
enum class Method {
  kHierarchy,  // under the transforms that stand above it
  kWorld,      // against the world, without them
};

// What became of one camera.
struct CameraReport {
  std::string path;  // in the scene
  std::string name;  // in the bake; empty where it was not written
  Method method = Method::kHierarchy;
  bool moves = false;      // its place, or that of something above it
  bool lensMoves = false;  // its focal length
  bool written = false;
  std::vector<std::string> differences;  // sentences: what a composition shows otherwise
};

struct Report {
  std::optional<FrameRange> frames;  // in the scene's own numbers
  std::vector<CameraReport> cameras;
  std::size_t locators = 0;
  std::size_t locatorsLeftOut = 0;  // they have no mark
};

// The words of a bake's first comment.
struct Origin {
  std::string tool;     // "mayascene 1.0.0"
  std::string file;     // the scene's name; may hold any bytes
  std::string options;  // as they were given
};

// Writes the bake of the scene. Cameras that can be written are written also where another one cannot.
// Nothing is written where the report has no frames. The same input gives the same bytes.
Report Bake(const scene::Scene& scene, const Options& options, const Origin& origin,
            diag::Collector* diagnostics, std::ostream& out);

}  // namespace bake
