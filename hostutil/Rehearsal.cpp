// Rehearsal of failures: which call of which service is to fail, and how often each was called.
#include <algorithm>
#include <array>
#include <cstdint>
#include <new>
#include <stdexcept>
#include <vector>

#include "hostapi/ErrorCodes.h"
#include "hostutil/HostSetup.h"
#include "hostutil/RehearsalInternal.h"

namespace hostutil {

constinit bool rehearsalRunning = false;
constinit bool failuresPlanned = false;
constinit std::array<std::int64_t, HOST_UTILITY_COUNT> callCounts{};

namespace {

constexpr std::int64_t kEveryCall = 0;

std::array<std::vector<HostUtilityFailure>, HOST_UTILITY_COUNT> failures;
bool IsService(std::int32_t service) { return service >= 0 && service < HOST_UTILITY_COUNT; }

bool IsSound(const HostUtilityFailure& failure) {
  return IsService(failure.service) && failure.nth >= kEveryCall && failure.thrown >= HOST_THROW_NOTHING &&
         failure.thrown <= HOST_THROW_OTHER;
}

// No code outside this file can name it in a catch.
struct OtherException {};

}  // namespace

bool IsPlannedToFail(std::int32_t service, HostError* code) {
  const auto slot = static_cast<std::size_t>(service);
  const std::int64_t call = callCounts[slot];
  for (const HostUtilityFailure& failure : failures[slot]) {
    if (failure.nth != kEveryCall && failure.nth != call) continue;
    if (failure.thrown == HOST_THROW_BAD_ALLOC) throw std::bad_alloc();
    if (failure.thrown == HOST_THROW_RUNTIME_ERROR) throw std::runtime_error("rehearsed failure");
    if (failure.thrown == HOST_THROW_OTHER) throw OtherException();
    *code = failure.code;
    return true;
  }
  return false;
}

std::int64_t CallsBeforePlanned(std::int32_t service, std::int64_t calls) {
  const auto slot = static_cast<std::size_t>(service);
  for (const HostUtilityFailure& failure : failures[slot]) {
    if (failure.nth == kEveryCall) return 0;
    const std::int64_t before = failure.nth - callCounts[slot] - 1;
    if (before >= 0) calls = std::min(calls, before);
  }
  return calls;
}

}  // namespace hostutil

HostError HostAddUtilityFailure(const HostUtilityFailure* failure) {
  if (failure == nullptr || !hostutil::IsSound(*failure)) return HOST_ERR_UTILITY_NULL;
  try {
    hostutil::failures[static_cast<std::size_t>(failure->service)].push_back(*failure);
    hostutil::failuresPlanned = true;
  } catch (const std::bad_alloc&) {
    return HOST_ERR_EXCEPTION_MEMORY;
  }
  return HOST_ERR_NONE;
}

void HostClearUtilityFailures(void) {
  for (auto& list : hostutil::failures) list.clear();
  hostutil::failuresPlanned = false;
}

void HostBeginRehearsal(void) {
  hostutil::callCounts.fill(0);
  hostutil::rehearsalRunning = true;
}

void HostEndRehearsal(void) { hostutil::rehearsalRunning = false; }

std::int64_t HostUtilityCallCount(std::int32_t service) {
  return hostutil::IsService(service) ? hostutil::callCounts[static_cast<std::size_t>(service)] : 0;
}
