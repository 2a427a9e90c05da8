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
};

}  // namespace

std::span<const Entry> ExportCodes() { return kExportCodes; }

}  // namespace diag
