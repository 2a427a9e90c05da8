// What the streams of a layer are called, in the outline and in the JSON document.
#pragma once

#include <cstdint>
#include <string_view>

#include "refhost/Project.h"

namespace mayascene {

struct StreamWords {
  std::int32_t id;
  std::string_view label;        // in the outline
  std::string_view cameraLabel;  // the same on a camera
  std::string_view unitSign;     // behind a value in the outline
  std::string_view name;         // in the document
  std::string_view cameraName;   // the same on a camera
  std::string_view unit;         // in the document
};

// In the order in which a person asks for them.
inline constexpr StreamWords kStreamWords[] = {
    {refhost::kZoomStream, "zoom", "zoom", " px", "zoom", "zoom", "pixels"},
    {refhost::kPositionStream, "position", "position", " pt", "position", "position", "points"},
    {refhost::kXRotationStream, "X rotation", "X rotation", " deg", "xRotation", "xRotation", "degrees"},
    {refhost::kYRotationStream, "Y rotation", "Y rotation", " deg", "yRotation", "yRotation", "degrees"},
    {refhost::kZRotationStream, "Z rotation", "Z rotation", " deg", "zRotation", "zRotation", "degrees"},
    {refhost::kScaleStream, "scale", "scale", " %", "scale", "scale", "percent"},
    {refhost::kAnchorStream, "anchor point", "point of interest", " pt", "anchorPoint", "pointOfInterest",
     "points"},
};

}  // namespace mayascene
