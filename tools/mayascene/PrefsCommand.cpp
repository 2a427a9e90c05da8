#include "tools/mayascene/PrefsCommand.h"

#include <cstdint>
#include <filesystem>
#include <memory>
#include <string>

#include "hostapi/PersistentDataSuite.h"
#include "refhost/Preferences.h"
#include "tools/mayascene/HostSession.h"
#include "tools/mayascene/OutputFile.h"
#include "tools/mayascene/TerminalText.h"

namespace mayascene {
namespace {

constexpr const char* kNoPlace =
    "there is no place for the preference store: neither XDG_CONFIG_HOME nor HOME is set; name one with "
    "--preferences FILE";

const char* meaningOf(std::int32_t linearUnits) {
  return linearUnits == 0 ? "distances are taken as they stand"
                          : "distances are converted from the scene's linear unit to points";
}

}  // namespace

ExitStatus runPrefs(const PrefsArguments& arguments, Diagnostics& diagnostics) {
  const std::filesystem::path file = preferenceFile(arguments.preferences);
  if (file.empty()) {
    diagnostics.complain("", kNoPlace);
    return ExitStatus::CannotWrite;
  }
  refhost::Preferences store(file);
  std::string failure;
  if (arguments.linearUnits) {
    store.set(HOST_PREF_SECTION, HOST_PREF_LINEAR_UNITS, *arguments.linearUnits);
    if (!store.write(&failure)) {
      diagnostics.complain("", failure);
      return ExitStatus::CannotWrite;
    }
  }
  const std::int32_t value = store.find(HOST_PREF_SECTION, HOST_PREF_LINEAR_UNITS).value_or(0);
  const bool kept = store.fileExists() || arguments.linearUnits.has_value();
  const std::unique_ptr<OutputFile> out = OutputFile::open(kStandardOutput, &failure);
  out->stream() << "linear-units  " << value << "  (" << meaningOf(value) << ")\n"
                << "store         " << terminalText(file.string()) << (kept ? "" : "  (not made yet)")
                << '\n';
  if (out->commit(&failure)) return ExitStatus::Done;
  diagnostics.complain("", failure);
  return ExitStatus::CannotWrite;
}

}  // namespace mayascene
