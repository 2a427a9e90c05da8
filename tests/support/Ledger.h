// The objects that the host's utility library still holds, and its rehearsal of failures, in forms for tests.
#pragma once

#include <cstdint>
#include <string>
#include <vector>

#include "hostapi/HostTypes.h"

namespace testsupport {

// One line for each file and list that is still held.
std::vector<std::string> HeldObjects();

// Makes the nth call (from 1; 0 is every call) of one service (HOST_UTILITY_...) fail while it lives: it
// returns the code, or throws the standard exception (HOST_THROW_...). A rehearsal of no failure only counts.
class UtilityRehearsal {
 public:
  UtilityRehearsal();
  UtilityRehearsal(std::int32_t service, std::int64_t nth, HostError code, std::int32_t thrown = 0);
  ~UtilityRehearsal();
  UtilityRehearsal(const UtilityRehearsal&) = delete;
  UtilityRehearsal& operator=(const UtilityRehearsal&) = delete;
};

// The calls of all list services in the rehearsal that runs or ran last.
std::int64_t ListCallCount();

}  // namespace testsupport
