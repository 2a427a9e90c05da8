#include "tests/support/Ledger.h"

#include "hostutil/HostSetup.h"

namespace testsupport {

std::vector<std::string> HeldObjects() {
  std::vector<std::string> lines;
  HostVisitLedger(
      [](void* context, std::int32_t, const char* description, std::int32_t) {
        static_cast<std::vector<std::string>*>(context)->emplace_back(description);
      },
      &lines);
  return lines;
}

UtilityRehearsal::UtilityRehearsal() {
  HostClearUtilityFailures();
  HostBeginRehearsal();
}

UtilityRehearsal::UtilityRehearsal(std::int32_t service, std::int64_t nth, HostError code,
                                   std::int32_t thrown) {
  HostClearUtilityFailures();
  const HostUtilityFailure failure{service, nth, code, thrown};
  HostAddUtilityFailure(&failure);
  HostBeginRehearsal();
}

UtilityRehearsal::~UtilityRehearsal() {
  HostEndRehearsal();
  HostClearUtilityFailures();
}

std::int64_t ListCallCount() {
  std::int64_t count = 0;
  for (const std::int32_t service : {HOST_UTILITY_ListCreate, HOST_UTILITY_ListAppend, HOST_UTILITY_ListGet,
                                     HOST_UTILITY_ListLock, HOST_UTILITY_ListUnlock, HOST_UTILITY_ListCount})
    count += HostUtilityCallCount(service);
  return count;
}

}  // namespace testsupport
