// MA1101 to MA1199: what an export cannot say.
#include "diag/TableInternal.h"

namespace diag {
namespace {

constexpr Entry kExportCodes[] = {
    {.code = Code::ExportNotFinite,
     .severity = Severity::Error,
     .symbol = "ExportNotFinite",
     .sentence = "{0}: the {1} has a value that is no finite number",
     .meaning = "No format can hold such a value. Nothing is written of the scene.",
     .example = "",
     .help = "Leave out --permissive, or find in the scene what computes the {1} of {0}."},
    {.code = Code::ExportPictureUnusable,
     .severity = Severity::Error,
     .symbol = "ExportPictureUnusable",
     .sentence = "the composition has no size, no frame rate or no frames",
     .meaning = "Without them no lens has an angle and no frame has a time. Nothing is written of the scene.",
     .example = "",
     .help = "Leave out --permissive, and set resolution and frame rate in the scene."},
    {.code = Code::ExportLensUnusable,
     .severity = Severity::Error,
     .symbol = "ExportLensUnusable",
     .sentence = "{0}: the lens has no angle: its zoom and its film are not above 0 at all frames",
     .meaning = "A camera without a focal length shows nothing. Nothing is written of the scene.",
     .example = "",
     .help = "Give {0} a focal length and a film back above 0."},
    {.code = Code::ExportParentCircle,
     .severity = Severity::Error,
     .symbol = "ExportParentCircle",
     .sentence = "the parents of the layers go in a circle",
     .meaning = "Such layers have no place in the world. Nothing is written of the scene.",
     .example = "",
     .help = "Please report it with the scene: no import makes this."},
    {.code = Code::ExportNumberTooLarge,
     .severity = Severity::Error,
     .symbol = "ExportNumberTooLarge",
     .sentence = "{0}: a number is too large for {1}",
     .meaning =
         "The format holds numbers up to a size of its own, and places in the world may be beyond what a "
         "number holds. Nothing is written of the scene.",
     .example = "",
     .help = "Bring {0} closer to the origin, or make everything smaller."},
    {.code = Code::ExportNameReplaced,
     .severity = Severity::Note,
     .symbol = "ExportNameReplaced",
     .sentence = "{0}: bytes of its name are no text, and stand as U+FFFD in the file",
     .meaning = "The format holds names in UTF-8 alone. Two such names can look alike.",
     .example = "",
     .help = "Rename {0} in the scene where another program has to find it by its name."},
    {.code = Code::ExportCameraScaled,
     .severity = Severity::Warning,
     .symbol = "ExportCameraScaled",
     .sentence = "{0}: programs that read {1} do not agree on a camera that is scaled unevenly",
     .meaning =
         "The camera, or a layer above it, is scaled by other than the same on all axes, or mirrored. "
         "The file has the scale as the composition has it. Some programs leave it out of the picture.",
     .example = "",
     .help = "Export with --bake: the camera then comes without scale."},
    {.code = Code::ExportTimesShifted,
     .severity = Severity::Note,
     .symbol = "ExportTimesShifted",
     .sentence = "the times of the file count from the first frame, not from frame 0",
     .meaning = "glTF has no times below 0, and rounds those that are far from 0. What is as long as a frame "
                "stays so; the number of the first frame is in the extras of the file's scene.",
     .example = "",
     .help =
         "Nothing has to be done for the picture. Add the first frame's number where frames are compared."},
    {.code = Code::ExportTimesTooFine,
     .severity = Severity::Error,
     .symbol = "ExportTimesTooFine",
     .sentence = "the frames are too many, or their numbers too large, for the times of {0}",
     .meaning =
         "Two frames would have the same time: glTF has times of 32 bits, USD of 64. Nothing is written "
         "of the scene.",
     .example = "",
     .help = "Export fewer frames: --frames A:B."},
    {.code = Code::ExportZoomByExtension,
     .severity = Severity::Note,
     .symbol = "ExportZoomByExtension",
     .sentence = "{0}: programs that do not know KHR_animation_pointer show its first zoom at all frames",
     .meaning = "glTF itself animates no lens. The changing field of view is in the file, by that extension.",
     .example = "",
     .help = "Export to .chan or .usda for a program that passes the extension over."},
    {.code = Code::ExportFileTooLarge,
     .severity = Severity::Error,
     .symbol = "ExportFileTooLarge",
     .sentence = "the file would be larger than 4 GiB, which .glb cannot hold",
     .meaning = "The sizes in such a file are numbers of 32 bits. Nothing is written of the scene.",
     .example = "",
     .help = "Export to .gltf, or fewer frames: --frames A:B."},
    {.code = Code::ExportDownAxisLost,
     .severity = Severity::Warning,
     .symbol = "ExportDownAxisLost",
     .sentence = "USD cannot say that y points down: other programs show the scene upside down",
     .meaning = "All numbers are in the axes that were asked for. Cameras are turned, so that they still see "
                "the same picture.",
     .example = "",
     .help = "Export in the axes of the scene."},
};

}  // namespace

std::span<const Entry> ExportCodes() { return kExportCodes; }

}  // namespace diag
