// MA0601 to MA0699: what a bake writes.
#include "diag/TableInternal.h"

namespace diag {
namespace {

constexpr Entry kBakeCodes[] = {
    {.code = Code::NoCamera,
     .severity = Severity::Warning,
     .symbol = "NoCamera",
     .sentence = "the scene has no camera that somebody set up",
     .meaning = "Orthographic cameras and the four cameras that every scene begins with do not come over. "
                "The bake is a valid scene without a camera.",
     .example = "createNode camera -s -n \"perspShape\" -p \"persp\";",
     .help = "Check whether the camera is in a referenced file, or export it with the scene."},
    {.code = Code::TooManyFrames,
     .severity = Severity::Error,
     .symbol = "TooManyFrames",
     .sentence = "the frames {0} to {1} are too many for a bake",
     .meaning = "Without --frames a bake has at most 100,000 frames, and never more than the time of a "
                "composition can hold. A single key far away from the others can make the range that long.",
     .example = "setAttr \".ktv[0:1]\" 1 0 1000000000 1;",
     .help = "Choose the frames: --frames A:B."},
    {.code = Code::ClockTimeUnit,
     .severity = Severity::Warning,
     .symbol = "ClockTimeUnit",
     .sentence = "the scene counts time in \"{0}\", not in frames: the bake counts 24 frames a second",
     .meaning = "The scene has no frame rate. The bake has a value for each frame of film, and all frame "
                "numbers are those.",
     .example = "currentUnit -t sec;",
     .help = "Set the frame rate of the shot in the scene where another one is wanted."},
    {.code = Code::CameraInWorldSpace,
     .severity = Severity::Warning,
     .symbol = "CameraInWorldSpace",
     .sentence = "\"{0}\" comes without the transforms above it",
     .meaning =
         "Null layers cannot show the transforms above the camera exactly: these are scaled or sheared, or "
         "in another file. The camera has its place in the world at every frame.",
     .example = "createNode transform -n \"rig\";\nsetAttr \".s\" -type \"double3\" 2 2 2 ;",
     .help = "Nothing has to be done for the picture. Take the scale out of the rig where the null layers "
             "are wanted."},
};

}  // namespace

std::span<const Entry> BakeCodes() { return kBakeCodes; }

}  // namespace diag
