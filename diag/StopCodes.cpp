// MA0701 to MA0799: what stops an import.
#include "diag/TableInternal.h"

namespace diag {
namespace {

constexpr Entry kStopCodes[] = {
    {.code = Code::ImportStopped,
     .severity = Severity::Error,
     .symbol = "ImportStopped",
     .sentence = "the import stops with code {0}: {1}",
     .meaning =
         "The importer, or its host, cannot go on here. What was made before stays, and nothing of what "
         "follows comes over.",
     .example = "select -ne :defaultResolution;\n  setAttr \".w\" 0;",
     .help = "Correct what the sentence says in the scene, or write the scene anew: mayascene bake SCENE -o "
             "OUT."},
    {.code = Code::NotMayaAscii,
     .severity = Severity::Error,
     .symbol = "NotMayaAscii",
     .sentence = "this is no Maya ASCII scene",
     .meaning =
         "A Maya ASCII scene is a text that begins with \"//Maya\". This file begins otherwise, so the "
         "importer does not read it.",
     .example = "#usda 1.0",
     .help = "Save the scene as Maya ASCII (.ma), and give that file."},
};

}  // namespace

std::span<const Entry> StopCodes() { return kStopCodes; }

}  // namespace diag
