// Makes a small scene that the importer takes: the cameras and locators of a scene and the transforms above
// them, with a value at every frame.
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
  kHierarchy,  // under the transforms above it
  kWorld,      // in world space, without them
};

// The result for one camera.
struct CameraReport {
  std::string path;  // in the scene
  std::string name;  // in the bake; empty where it was not written
  Method method = Method::kHierarchy;
  bool moves = false;      // its place, or that of something above it
  bool lensMoves = false;  // its focal length
  bool written = false;
  std::vector<std::string> differences;  // a sentence for each thing that a composition shows differently
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

// Writes the bake of the scene. A camera that cannot be written does not keep the others from being written.
// Nothing is written when the report has no frames. A write that fails shows in the stream's state. The same
// input gives the same bytes.
Report Bake(const scene::Scene& scene, const Options& options, const Origin& origin,
            diag::Collector* diagnostics, std::ostream& out);

}  // namespace bake
