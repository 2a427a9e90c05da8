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

  // Seconds: from frame 0 where the format can hold such times, else from the first frame.
  double SecondsAt(std::size_t frame) const;
  bool CountsFromFirstFrame() const { return start_ != composition_.firstFrame; }

  // Whether the times of the frames, as floats, are finite and strictly ascending.
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

// Whether the value is finite as a float.
inline bool FitsFloat(double value) {
  return value <= std::numeric_limits<float>::max() && value >= -std::numeric_limits<float>::max();
}

// Whether the format takes every value that does not change. Reports those that it does not take.
bool GltfTakesStill(const Composition& composition, diag::Collector* diagnostics);

// The whole JSON. `dataUri` refers to the file with the data; empty where they follow in the same file.
void WriteGltfJson(const GltfPlan& plan, std::string_view dataUri, std::ostream& out);

// The data. False, with a report, where the format does not take a value.
bool WriteGltfData(const GltfPlan& plan, std::ostream& out, diag::Collector* diagnostics);

}  // namespace interchange
