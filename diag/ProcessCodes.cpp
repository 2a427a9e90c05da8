// MA1001 to MA1099: what cuts a check short.
#include "diag/TableInternal.h"

namespace diag {
namespace {

constexpr Entry kProcessCodes[] = {
    {.code = Code::CheckTimedOut,
     .severity = Severity::Error,
     .symbol = "CheckTimedOut",
     .sentence = "the check took longer than {0} and was ended",
     .meaning =
         "Each scene is checked in a process of its own, which has a time limit. Nothing is known of the "
         "scene. The other scenes are checked.",
     .example = "$ mayascene check --timeout 1 everything.ma",
     .help = "Give it more time with --timeout. If it never ends, please report it with the scene."},
    {.code = Code::CheckBrokeOff,
     .severity = Severity::Error,
     .symbol = "CheckBrokeOff",
     .sentence = "the check broke off: {0}",
     .meaning = "The process that checked this scene ended before it had a report. That is a fault of the "
                "program, whatever the scene holds, unless somebody ended the process: a system that runs "
                "out of memory does so with signal 9. The other scenes are checked.",
     .example = "$ mayascene check shot.ma & pkill -f 'mayascene check --child'",
     .help = "Check the scene once more by itself. If it breaks off again, please report it with the scene."},
    {.code = Code::CheckOutOfMemory,
     .severity = Severity::Error,
     .symbol = "CheckOutOfMemory",
     .sentence = "the check needs more memory than there is for one scene",
     .meaning =
         "The process that checks a scene may take 8 GiB of address space, or less where the shell says "
         "so (ulimit -v). Nothing is known of the scene. The other scenes are checked.",
     .example = "$ (ulimit -v 200000; mayascene check everything.ma)",
     .help =
         "Check it where there is more memory, or take out of the scene what the composition does not need."},
    {.code = Code::ReportTooLarge,
     .severity = Severity::Error,
     .symbol = "ReportTooLarge",
     .sentence = "the report is larger than {0} and is not shown",
     .meaning = "A report that shows everything grows with the scene. Beyond this size it is dropped.",
     .example = "$ mayascene check --all --json report.json everything.ma",
     .help = "Leave out --all, or choose codes with --only."},
    {.code = Code::CheckNotStarted,
     .severity = Severity::Error,
     .symbol = "CheckNotStarted",
     .sentence = "the check could not be started: {0}",
     .meaning = "The system could not create a process, or could not give it what it needs. Nothing is known "
                "of the scene.",
     .example = "$ (ulimit -u 1; mayascene check shot.ma)",
     .help = "Try it again with fewer --jobs, or when the machine has less to do."},
};

}  // namespace

std::span<const Entry> ProcessCodes() { return kProcessCodes; }

}  // namespace diag
