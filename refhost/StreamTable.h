// The streams that a layer has from its creation: numbers, names, dimensions and defaults.
#pragma once

#include <cstdint>
#include <vector>

#include "refhost/Project.h"

namespace refhost {

inline constexpr int32_t kAnchorStream = 0;  // a camera's point of interest
inline constexpr int32_t kPositionStream = 1;
inline constexpr int32_t kScaleStream = 2;
inline constexpr int32_t kZRotationStream = 3;
inline constexpr int32_t kXRotationStream = 8;
inline constexpr int32_t kYRotationStream = 9;
inline constexpr int32_t kZoomStream = 11;  // cameras only

// The streams of a layer of that kind, in the order of their numbers, with the defaults that do not depend on
// the composition.
std::vector<Stream> makeStreams(LayerKind kind);

// "position"; a camera's anchor point is its "point of interest".
const char* streamName(int32_t id, LayerKind kind);

}  // namespace refhost
