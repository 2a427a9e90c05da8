// Loads the installed module and calls its entry with a host that offers no suite: the entry returns the code
// for that. Before it, the utility library answers.
#include <dlfcn.h>

#include <cstdio>

#include "hostapi/ErrorCodes.h"
#include "hostapi/PluginEntry.h"
#include "hostutil/HostUtilities.h"

namespace {

HostError Refuse(const char*, std::int32_t, const void** suite) {
  *suite = nullptr;
  return HOST_ERR_SUITE_REFUSED;
}

HostError Accept(const char*, std::int32_t) { return HOST_ERR_NONE; }

}  // namespace

int main() {
  double number = 0.0;
  if (HostNumberScan("23.976fps", 9, &number) != HOST_ERR_NONE || number != 23.976) return 2;

  void* const module = ::dlopen(IMPORT_MODULE, RTLD_NOW | RTLD_LOCAL);
  if (module == nullptr) {
    std::fprintf(stderr, "%s\n", ::dlerror());
    return 3;
  }
  const auto entry = reinterpret_cast<HostPluginEntry>(::dlsym(module, HOST_PLUGIN_ENTRY_SYMBOL));
  const WNBasicSuite suites{Refuse, Accept};
  const HostError code = entry == nullptr ? HOST_ERR_NONE : entry(&suites, 1, 0, 1, nullptr);
  ::dlclose(module);
  std::printf("entry: %d\n", static_cast<int>(code));
  return code == HOST_ERR_MISSING_SUITE ? 0 : 1;
}
