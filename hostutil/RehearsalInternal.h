// The fault points of the services.
#pragma once

#include "hostutil/HostSetup.h"

namespace hostutil {

extern constinit bool rehearsalRunning;

// Counts a call of the service in the rehearsal that runs. True when the call is to do nothing and return
// *code; throws when it is to throw.
bool CountCall(int32_t service, HostError* code);

// What every service in HOST_UTILITY_TABLE begins with. While no rehearsal runs it costs one load and one
// predicted branch.
inline bool Rehearsed(int32_t service, HostError* code) {
  if (!rehearsalRunning) [[likely]] {
    return false;
  }
  return CountCall(service, code);
}

// Hands out null or zero, where the caller gave a place for it.
template <typename Value>
inline void HandOutNothing(Value* place) {
  if (place != nullptr) *place = Value{};
}

}  // namespace hostutil
