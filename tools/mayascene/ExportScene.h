// Makes the plain description that the writers take, from the result of an import.
#pragma once

#include <optional>

#include "bake/Options.h"
#include "diag/Collector.h"
#include "export/Composition.h"
#include "refhost/Project.h"
#include "tools/mayascene/SceneNumbers.h"

namespace mayascene {

struct DescriptionOptions {
  std::optional<bake::FrameSpan> frames;  // in the scene's own numbers; none: those of the numbers
  double scale = 1.0;                     // of all lengths, after the importer's conversion was undone
  interchange::Axes axes = interchange::Axes::Scene;
  bool keys = false;  // lists of keys instead of values at frames
};

// The most frames of a description: without and with chosen frames.
inline constexpr double kMostFramesUnasked = 100'000;
inline constexpr double kMostFrames = 2'000'000;

// Describes the composition of the folder, which has one. Of two nested ones it describes the inner, square
// one, with the pixel aspect of the outer one. `linearUnits` is the preference that the scene was imported
// with: where it is not 0, lengths are divided by the points of one unit. None after an error, which is
// reported: too many frames.
std::optional<interchange::Composition> describe(const refhost::Folder& folder, const SceneNumbers& numbers,
                                                 std::int32_t linearUnits, const DescriptionOptions& options,
                                                 diag::Collector* diagnostics);

}  // namespace mayascene
