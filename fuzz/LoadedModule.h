// The import module in a fuzz target.
#pragma once

#include "hostapi/PluginEntry.h"

namespace fuzz {

// The module's entry. The module is loaded by the first call, and never unloaded: the fuzzer reads its
// coverage counters until the end. A module that cannot be loaded ends the process.
HostPluginEntry LoadedModule();

}  // namespace fuzz
