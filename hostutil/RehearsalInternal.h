// The fault points of the services.
#pragma once

#include <array>
#include <cstddef>
#include <cstdint>

#include "hostutil/HostSetup.h"

namespace hostutil {

extern constinit bool rehearsalRunning;
extern constinit bool failuresPlanned;
extern constinit std::array<std::int64_t, HOST_UTILITY_COUNT> callCounts;

// Whether the call that was counted last is to do nothing and return *code; throws when it is to throw.
bool IsPlannedToFail(std::int32_t service, HostError* code);

// Every service in HOST_UTILITY_TABLE begins with this. Counts the call while a rehearsal runs; true when it
// is to do nothing and return *code. Costs a few loads and predicted branches where nothing is planned.
inline bool Rehearsed(std::int32_t service, HostError* code) {
  if (!rehearsalRunning) return false;
  ++callCounts[static_cast<std::size_t>(service)];
  return failuresPlanned && IsPlannedToFail(service, code);
}

// The first half of Rehearsed, for the services that are called most: counts the call; true when
// IsPlannedToFail has to be asked. They do that in a function of their own, so that their work needs no
// stack.
inline bool MayBePlanned(std::int32_t service) {
  if (!rehearsalRunning) return false;
  ++callCounts[static_cast<std::size_t>(service)];
  return failuresPlanned;
}

// Counts `calls` calls at once, none of which is planned to fail.
inline void CountCalls(std::int32_t service, std::int64_t calls) {
  if (rehearsalRunning) callCounts[static_cast<std::size_t>(service)] += calls;
}

// For a service that stands for many calls: how many of the next calls, at most `calls`, come before one that
// is planned to fail. The service makes these at once and counts them with CountCalls; for the call after
// them it asks Rehearsed.
std::int64_t CallsBeforePlanned(std::int32_t service, std::int64_t calls);
inline std::int64_t CallsBeforeFailure(std::int32_t service, std::int64_t calls) {
  return rehearsalRunning && failuresPlanned ? CallsBeforePlanned(service, calls) : calls;
}

// Hands out null or zero, where the caller gave a place for it.
template <typename Value>
inline void HandOutNothing(Value* place) {
  if (place != nullptr) *place = Value{};
}

}  // namespace hostutil
