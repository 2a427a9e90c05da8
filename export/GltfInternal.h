// What a glTF file holds of a composition, in the order of its data; shared by the two forms of the file.
//
// Lengths are metres. Data are floats of 32 bits: the times of all frames, then a run for each track.
#pragma once

#include <cstddef>
#include <cstdint>
#include <limits>
#include <ostream>
#include <string_view>
#include <vector>

#include "diag/Collector.h"
#include "export/Composition.h"

namespace interchange {

enum class GltfPath : std::uint8_t { Translation, Rotation, Scale, Zoom };

// Values of a layer for each frame.
struct GltfTrack {
  std::size_t layer = 0;
  std::size_t camera = 0;  // of a zoom: which of the cameras
  GltfPath path = GltfPath::Translation;

  std::size_t components() const;
  std::string_view type() const;  // "VEC3"
};

class GltfPlan {
 public:
  // Of a writable composition, which outlives the plan.
  explicit GltfPlan(const Composition& composition);

  const Composition& composition() const { return composition_; }
  const std::vector<GltfTrack>& tracks() const { return tracks_; }

  // Seconds; the frame's own number over the rate where that can be said, or counted from the first frame.
  double SecondsAt(std::size_t frame) const;
  bool CountsFromFirstFrame() const { return start_ != composition_.firstFrame; }

  // Whether each frame's time is a later float than that of the frame before, and so on up to the last.
  bool TimesRise() const;

  // Bytes of the times, of a track, of everything.
  std::uint64_t TimesSize() const;
  std::uint64_t SizeOf(const GltfTrack& track) const;
  std::uint64_t DataSize() const;

 private:
  const Composition& composition_;
  std::vector<GltfTrack> tracks_;
  double start_;
};

// Whether it is still finite as a float.
inline bool FitsFloat(double value) {
  return value <= std::numeric_limits<float>::max() && value >= -std::numeric_limits<float>::max();
}

// The angle of the picture from its lower to its upper edge, in radians.
double VerticalRadians(const Composition& composition, double zoom);

// Whether every value that is said once is one that the format takes; what is not is reported.
bool GltfTakesStill(const Composition& composition, diag::Collector* diagnostics);

// The whole JSON. `dataUri` refers to the file with the data; empty where they follow in the same file.
void WriteGltfJson(const GltfPlan& plan, std::string_view dataUri, std::ostream& out);

// The data. False where a value is none that the format takes, which is reported.
bool WriteGltfData(const GltfPlan& plan, std::ostream& out, diag::Collector* diagnostics);

}  // namespace interchange
