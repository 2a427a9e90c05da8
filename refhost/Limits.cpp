#include "refhost/Limits.h"

#include <algorithm>
#include <string>

#include "refhost/Call.h"

namespace refhost {

Allowance::Allowance(const HostOptions& options)
    : layers(std::max<std::int64_t>(options.mostLayers, 0)),
      keys(std::max<std::int64_t>(options.mostKeys, 0)),
      memory(std::max<std::int64_t>(options.mostMemory, 0)) {}

bool takesLayer(Call& call) {
  const HostState& host = call.host();
  if (host.allowance.layers >= 1) return true;
  call.refuse(HOST_ERR_TOO_MANY_LAYERS,
              "the host takes no more than " + std::to_string(host.options.mostLayers) + " layers");
  return false;
}

bool takesKeys(Call& call, std::int32_t keys) {
  if (call.host().allowance.keys >= keys) return true;
  call.fail(refuseKey(call.operation()));
  return false;
}

bool takesMemory(Call& call, std::int64_t bytes) {
  const HostState& host = call.host();
  if (bytes <= host.allowance.memory) return true;
  call.refuse(HOST_ERR_TOO_MUCH_MEMORY, std::to_string(bytes) + " bytes are more than the " +
                                            std::to_string(host.allowance.memory) + " that are left of " +
                                            std::to_string(host.options.mostMemory));
  return false;
}

HostError refuseKey(Operation operation) {
  return refuse(
      operation, HOST_ERR_TOO_MANY_KEYS,
      "the host takes no more than " + std::to_string(HostState::live().options.mostKeys) + " keys");
}

}  // namespace refhost
