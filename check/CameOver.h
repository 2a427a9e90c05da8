// What an import made of a scene, in plain numbers. The caller fills it in after an import; the rules never
// guess it.
#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>
#include <vector>

namespace check {

// One property of a layer: a value, and keys that stand over it.
struct CameOverStream {
  std::array<double, 3> value{};  // of a property of one number, the first
  std::vector<double> times;      // of the keys, in seconds, rising; empty: no keys
  std::vector<double> values;     // as many for each key as the property has numbers
};

enum class LayerKind : std::uint8_t { Camera, Null };

struct CameOverLayer {
  LayerKind kind = LayerKind::Null;
  std::string name;                   // bytes
  std::optional<std::size_t> parent;  // the layer's place in the list
  bool aimed = false;                 // a camera that looks at its point of interest
  CameOverStream position;            // points, or the scene's own unit
  CameOverStream scale;               // percent
  CameOverStream rotateX;             // degrees, as the next two
  CameOverStream rotateY;
  CameOverStream rotateZ;
  CameOverStream interest;  // of a camera that is aimed: its point of interest
  CameOverStream zoom;      // of a camera: pixels
};

// The composition that shows the picture; its layers may lie in one that is nested in it.
struct CameOverComposition {
  double width = 0.0;  // pixels
  double height = 0.0;
  double pixelAspect = 1.0;
  double framesPerSecond = 0.0;
  double seconds = 0.0;
  double layerWidth = 0.0;  // of the composition that the layers lie in
};

enum class Stop : std::uint8_t {
  None,           // the import ran to its end
  NotAScene,      // it began nothing: the file is no Maya ASCII scene
  RefusedByte,    // a byte that begins nothing
  UnexpectedEnd,  // the text ended inside something
  UnequalKeys,    // the channels of a node have different numbers of keys
  BadNumber,      // a number that cannot be read
  LargeNumber,    // a number that is too large
  Other,
};

struct CameOver {
  Stop stop = Stop::None;
  std::int64_t code = 0;            // what the import returned
  std::string sentence;             // what the code means
  std::uint64_t line = 0;           // of the stop, from 1; 0: not known
  bool distancesConverted = false;  // from the scene's unit to points
  std::optional<CameOverComposition> composition;
  std::vector<CameOverLayer> layers;  // in the order in which they were made
};

}  // namespace check
