// The losses of an import, and what stopped one.
#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "diag/Collector.h"
#include "scene/Scene.h"

namespace bake {

struct Loss {
  std::string sentence;              // without a full stop; escaped for a terminal
  std::optional<diag::Range> place;  // none: it has no place in the file
  bool comesWithBake = true;         // a bake of the scene brings it
};

// The result of an import, as far as FindLoss needs it. The names are those of the layers, which must outlive
// it.
struct CameOver {
  struct Null {
    std::string_view name;
    std::size_t keys = 0;
  };
  struct Camera {
    std::string_view name;
    std::size_t keys = 0;      // of its place
    std::size_t zoomKeys = 0;  // of its lens
    bool aimed = false;
    std::vector<Null> above;  // from its parent upwards
  };
  std::vector<Camera> cameras;  // in the order in which they were made
  std::size_t layers = 0;       // of any kind

  // Of the composition; 0 where there is none.
  double width = 0.0;
  double height = 0.0;
  double pixelAspect = 0.0;
  double framesPerSecond = 0.0;
};

// The first thing that an import without an error did not bring as it is in the scene: camera by camera in
// the order of the file, then the picture. A loss that a bake would mend comes before one that it would not.
// None where all came over.
std::optional<Loss> FindLoss(const scene::Scene& scene, const CameOver& import);

// Why the import of the scene stopped.
enum class Stop {
  kByte,       // at a byte that no word begins with
  kEnd,        // at the end of the text
  kNumber,     // at a number
  kKeyCounts,  // at channels of a node with different numbers of keys
};

// What stopped the import; none where the scene does not show it. `line` counts from 1, with line ends as
// diag::LineAndColumn has them; 0: not known. `layer` is the name of the last layer that was made, empty
// where there is none; with kKeyCounts it is that of the node or of its camera. `diagnostics` are those of
// the reading of the scene.
std::optional<Loss> FindStop(const scene::Scene& scene, diag::Collector* diagnostics, Stop stop,
                             std::uint32_t line, std::string_view layer);

}  // namespace bake
