#include "fuzz/LoadedModule.h"

#include <string>

#include "fuzz/Require.h"
#include "refhost/ModuleLoader.h"

namespace fuzz {
namespace {

HostPluginEntry Load() {
  static auto* const loader = new refhost::ModuleLoader;
  std::string failure;
  const HostPluginEntry entry = loader->load(MAYASCENE_MODULE, &failure);
  Require(entry != nullptr, failure.c_str());
  return entry;
}

}  // namespace

HostPluginEntry LoadedModule() {
  static const HostPluginEntry entry = Load();
  return entry;
}

}  // namespace fuzz
