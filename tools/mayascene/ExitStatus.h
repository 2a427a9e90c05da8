// How a run of the tool ends.
#pragma once

#include <algorithm>
#include <string_view>

namespace mayascene {

// The numbers are the contract with scripts, and the same for every verb. A run of several scenes ends with
// the highest of theirs. A run that a signal ends has 128 and the number of the signal.
enum class ExitStatus : int {
  Done = 0,
  Refused = 1,
  WrongUsage = 2,
  Unreadable = 3,
  NoModule = 4,
  CannotWrite = 5,
};

inline constexpr int kSignalStatus = 128;  // and the signal's number

struct ExitMeaning {
  ExitStatus status;
  std::string_view meaning;  // for help and documents
};

// One row a status, in their order.
inline constexpr ExitMeaning kExitMeanings[] = {
    {ExitStatus::Done, "done, warnings included"},
    {ExitStatus::Refused,
     "an error in a scene, a file that is not taken, something asked for that was not done, memory or "
     "handles that the importer kept, or warnings with --strict"},
    {ExitStatus::WrongUsage, "wrong usage"},
    {ExitStatus::Unreadable, "a file cannot be read"},
    {ExitStatus::NoModule, "the import module cannot be loaded"},
    {ExitStatus::CannotWrite, "an output cannot be written, or the memory is exhausted"},
};

// What the table does not show.
inline constexpr std::string_view kExitRules =
    "With several scenes it is the highest of theirs. A run that a signal ends has 128 and the number of the "
    "signal.";
static_assert(kSignalStatus == 128);

inline ExitStatus worse(ExitStatus a, ExitStatus b) { return std::max(a, b); }

}  // namespace mayascene
