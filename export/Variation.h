// Which values of a layer are written for each frame: those that change, not those that have keys.
#pragma once

#include <cstddef>

#include "export/Composition.h"

namespace interchange {

// Whether the value is another at any of the frames than at the first.
bool Varies(const Channel& channel, std::size_t frames);
bool Varies(const Channel (&channels)[3], std::size_t frames);

// The resulting rotation: of an aimed camera also by where it is and where it looks.
bool RotationVaries(const Layer& layer, std::size_t frames);

// Whether the layer is scaled by other than the same on all axes, or mirrored, at any of the frames.
bool IsScaledUnevenly(const Layer& layer, std::size_t frames);

}  // namespace interchange
