// What the module does when the host loads it.
#pragma once

#include <cstdint>

#include "hostapi/HostTypes.h"
#include "hostapi/WNBasicSuite.h"

namespace mayaimport {

// Remembers the host, registers the localised strings and the death hook, reads the preference, and registers
// the importer. Returns the string table's code when that could not be registered, else the first failure in
// registering the importer, 13 for a missing suite, or 0.
HostError MayaImportEntry(const WNBasicSuite* basicSuite, std::int32_t hostMajor, std::int32_t hostMinor,
                          std::int32_t pluginId, void* reserved);

// Gives the localised strings back. Returns 0.
HostError DeathHook(std::intptr_t refcon);

}  // namespace mayaimport
