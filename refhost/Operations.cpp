#include "refhost/Operations.h"

#include "hostutil/HostSetup.h"

namespace refhost {
namespace {

constexpr OperationFacts kFacts[] = {
#define REFHOST_OPERATION_FACTS(name, suite, version) {#name, suite, version},
    REFHOST_OPERATION_TABLE(REFHOST_OPERATION_FACTS)
#undef REFHOST_OPERATION_FACTS
};

constexpr std::string_view kServices[] = {
#define REFHOST_SERVICE_NAME(name) #name,
    HOST_UTILITY_TABLE(REFHOST_SERVICE_NAME)
#undef REFHOST_SERVICE_NAME
};

}  // namespace

const OperationFacts& factsOf(Operation operation) { return kFacts[static_cast<std::size_t>(operation)]; }

std::optional<Operation> findOperation(std::string_view name) {
  for (std::size_t index = 0; index < kOperationCount; ++index) {
    if (name == kFacts[index].name) return static_cast<Operation>(index);
  }
  return std::nullopt;
}

std::optional<std::int32_t> findUtilityService(std::string_view name) {
  for (std::int32_t service = 0; service < HOST_UTILITY_COUNT; ++service) {
    if (name == kServices[service]) return service;
  }
  return std::nullopt;
}

}  // namespace refhost
