// A module that registers nothing and says who called it.
#include <cstdint>

#include "hostapi/PluginEntry.h"

extern "C" __attribute__((visibility("default"))) HostError GPMain_MayaImport(const WNBasicSuite* basicSuite,
                                                                              std::int32_t, std::int32_t,
                                                                              std::int32_t pluginId,
                                                                              void* reserved) {
  constexpr HostError somethingMissing = -1;
  if (basicSuite == nullptr || reserved != nullptr) return somethingMissing;
  return pluginId;
}
