// The module's entry between which and the host a memory suite stands whose blocks end at a forbidden page.
#pragma once

#include <cstdint>

#include "hostapi/PluginEntry.h"

namespace fuzz {

// Which entry GuardedEntry() goes on to.
void SetModuleEntry(HostPluginEntry entry);

// Calls the module's entry with the host's suites, but for what a lock of a memory handle hands out: that is
// memory of the size asked for, filled anew, right before a page that nobody may touch. For one block at a
// time.
HostError GuardedEntry(const WNBasicSuite* basicSuite, std::int32_t hostMajor, std::int32_t hostMinor,
                       std::int32_t pluginId, void* reserved);

}  // namespace fuzz
