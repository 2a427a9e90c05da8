// The numbers by which the host's layers name their properties, and what they measure.
#pragma once

#include <cstdint>

enum LayerStreamId : std::int32_t {
  kAnchorPointStream = 0,  // points; on a camera layer its point of interest
  kPositionStream = 1,     // points
  kScaleStream = 2,        // percent
  kRotationZStream = 3,    // degrees
  kRotationXStream = 8,    // degrees
  kRotationYStream = 9,    // degrees
  kZoomStream = 11,        // pixels; camera layers only
};
