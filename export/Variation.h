// Which values of a layer are written for each frame: those that change, with keys or not.
#pragma once

#include <cstddef>

#include "export/Composition.h"

namespace interchange {

// Whether the value at any frame differs from that at the first.
bool Varies(const Channel& channel, std::size_t frames);
bool Varies(const Channel (&channels)[3], std::size_t frames);

// Whether the resulting rotation changes. That of an aimed camera also follows its place and its interest.
bool RotationVaries(const Layer& layer, std::size_t frames);

// Whether, at any of the frames, the layer is mirrored or its scale differs between axes.
bool IsScaledUnevenly(const Layer& layer, std::size_t frames);

}  // namespace interchange
