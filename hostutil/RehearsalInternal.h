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

// What every service in HOST_UTILITY_TABLE begins with. Counts the call while a rehearsal runs; true when it
// is to do nothing and return *code. Costs a few loads and predicted branches where nothing is planned to
// fail.
inline bool Rehearsed(std::int32_t service, HostError* code) {
  if (!rehearsalRunning) return false;
  ++callCounts[static_cast<std::size_t>(service)];
  return failuresPlanned && IsPlannedToFail(service, code);
}

// The same in two steps, for the services that are called most: whether the call, which is counted, is to be
// asked for with IsPlannedToFail. They do that apart from their work, which then needs no stack.
inline bool MayBePlanned(std::int32_t service) {
  if (!rehearsalRunning) return false;
  ++callCounts[static_cast<std::size_t>(service)];
  return failuresPlanned;
}

// Counts so many calls at once, none of which is planned to fail.
inline void CountCalls(std::int32_t service, std::int64_t calls) {
  if (rehearsalRunning) callCounts[static_cast<std::size_t>(service)] += calls;
}

// For a service that stands for many calls: how many of the next ones nothing is planned for, at most
// `calls`. It makes so many at once and counts them with CountCalls; the one after them asks Rehearsed.
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
