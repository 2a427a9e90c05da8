// The module's one exported symbol.
#include "hostapi/PluginEntry.h"
#include "plugin/Entry.h"

extern "C" __attribute__((visibility("default"))) HostError GPMain_MayaImport(const WNBasicSuite* basicSuite,
                                                                              std::int32_t hostMajor,
                                                                              std::int32_t hostMinor,
                                                                              std::int32_t pluginId,
                                                                              void* reserved) {
  return mayaimport::MayaImportEntry(basicSuite, hostMajor, hostMinor, pluginId, reserved);
}
