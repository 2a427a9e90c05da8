// The module's entry, with a memory suite between it and the host whose blocks end at a forbidden page.
#pragma once

#include <cstdint>

#include "hostapi/PluginEntry.h"

namespace fuzz {

// Sets the entry that GuardedEntry() calls.
void SetModuleEntry(HostPluginEntry entry);

// Calls the module's entry with the host's suites, except that a lock of a memory handle hands out other
// memory: of the size asked for, filled anew, right before a page that cannot be read or written. For one
// block at a time.
HostError GuardedEntry(const WNBasicSuite* basicSuite, std::int32_t hostMajor, std::int32_t hostMinor,
                       std::int32_t pluginId, void* reserved);

}  // namespace fuzz
