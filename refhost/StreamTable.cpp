#include "refhost/StreamTable.h"

#include <cstddef>
#include <cstdint>

namespace refhost {
namespace {

constexpr double kFullScale = 100.0;  // percent

struct StreamFacts {
  std::int32_t id;
  std::int32_t dimension;
  double standard;  // the default of each component
  const char* name;
};

// The zoom is last, so that the streams of a layer without one are the beginning of the table.
constexpr StreamFacts kStreams[] = {
    {HOST_STREAM_ANCHOR_POINT, 3, 0.0, "anchor point"},
    {HOST_STREAM_POSITION, 3, 0.0, "position"},
    {HOST_STREAM_SCALE, 3, kFullScale, "scale"},
    {HOST_STREAM_ROTATION_Z, 1, 0.0, "Z rotation"},
    {HOST_STREAM_ROTATION_X, 1, 0.0, "X rotation"},
    {HOST_STREAM_ROTATION_Y, 1, 0.0, "Y rotation"},
    {HOST_STREAM_ZOOM, 1, 0.0, "zoom"},
};
constexpr std::size_t kStreamCount = sizeof(kStreams) / sizeof(kStreams[0]);

constexpr bool areInOrderOfPlaces() {
  for (std::size_t place = 0; place < kStreamCount; ++place) {
    if (streamPlace(kStreams[place].id) != place) return false;
  }
  return true;
}
static_assert(areInOrderOfPlaces());

}  // namespace

std::vector<Stream> makeStreams(LayerKind kind) {
  const std::size_t count = kind == LayerKind::Camera ? kStreamCount : kStreamCount - 1;
  std::vector<Stream> streams(count);
  for (std::size_t i = 0; i < count; ++i) {
    streams[i].id = kStreams[i].id;
    streams[i].dimension = kStreams[i].dimension;
    for (std::int32_t component = 0; component < kStreams[i].dimension; ++component) {
      streams[i].value[component] = kStreams[i].standard;
    }
  }
  return streams;
}

const char* streamName(std::int32_t id, LayerKind kind) {
  if (id == HOST_STREAM_ANCHOR_POINT && kind == LayerKind::Camera) return "point of interest";
  for (const StreamFacts& facts : kStreams) {
    if (facts.id == id) return facts.name;
  }
  return "stream";
}

}  // namespace refhost
