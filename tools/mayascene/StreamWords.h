// The names of a layer's streams, in the outline and in the JSON document.
#pragma once

#include <cstdint>
#include <string_view>

#include "hostapi/LayerStreams.h"

namespace mayascene {

struct StreamWords {
  std::int32_t id;
  std::string_view label;        // in the outline
  std::string_view cameraLabel;  // the same on a camera
  std::string_view unitSign;     // after a value in the outline
  std::string_view name;         // in the document
  std::string_view cameraName;   // the same on a camera
  std::string_view unit;         // in the document
};

// In the order of the outline.
inline constexpr StreamWords kStreamWords[] = {
    {HOST_STREAM_ZOOM, "zoom", "zoom", " px", "zoom", "zoom", "pixels"},
    {HOST_STREAM_POSITION, "position", "position", " pt", "position", "position", "points"},
    {HOST_STREAM_ROTATION_X, "X rotation", "X rotation", " deg", "xRotation", "xRotation", "degrees"},
    {HOST_STREAM_ROTATION_Y, "Y rotation", "Y rotation", " deg", "yRotation", "yRotation", "degrees"},
    {HOST_STREAM_ROTATION_Z, "Z rotation", "Z rotation", " deg", "zRotation", "zRotation", "degrees"},
    {HOST_STREAM_SCALE, "scale", "scale", " %", "scale", "scale", "percent"},
    {HOST_STREAM_ANCHOR_POINT, "anchor point", "point of interest", " pt", "anchorPoint", "pointOfInterest",
     "points"},
};

}  // namespace mayascene
