#include "tests/secondreader/FailurePlan.h"

#include <new>
#include <stdexcept>

namespace secondreader {

void FailurePlan::begin(refhost::Callback callback) {
  active_ = callback == options_.during;
  failedBetweenCalls_ = false;
  calls_ = 0;
  counts_.clear();
}

std::optional<refhost::Failure> FailurePlan::suiteCall(const std::string& operation) {
  ++calls_;
  if (!active_) return std::nullopt;
  const std::int64_t count = ++counts_[operation];
  for (const refhost::Failure& failure : options_.failures) {
    const bool byPlace =
        failure.operation.empty() && (failure.onwards ? calls_ >= failure.nth : calls_ == failure.nth);
    const bool byName = failure.operation == operation && (failure.nth == 0 || failure.nth == count);
    if (byPlace || byName) return failure;
  }
  return std::nullopt;
}

std::optional<refhost::Failure> FailurePlan::service(const std::string& name) {
  if (!active_) return std::nullopt;
  const std::int64_t count = ++counts_[name];
  for (const refhost::Failure& failure : options_.failures) {
    if (failure.operation == name && (failure.nth == 0 || failure.nth == count)) return failure;
  }
  return std::nullopt;
}

std::optional<refhost::Failure> FailurePlan::betweenCalls() {
  if (!active_ || failedBetweenCalls_) return std::nullopt;
  for (const refhost::Failure& failure : options_.failures) {
    if (failure.operation != kBetweenCalls || failure.nth != calls_) continue;
    failedBetweenCalls_ = true;
    return failure;
  }
  return std::nullopt;
}

bool FailurePlan::refuses(std::string_view suite, std::int32_t version) const {
  if (!active_) return false;
  for (const refhost::RefusedSuite& refused : options_.refusedSuites) {
    if (refused.name == suite && refused.version == version) return true;
  }
  return false;
}

const char* wordOf(refhost::Failure::Kind kind) {
  switch (kind) {
    case refhost::Failure::Kind::Code:
      break;
    case refhost::Failure::Kind::BadAlloc:
      return "bad_alloc";
    case refhost::Failure::Kind::RuntimeError:
      return "runtime_error";
    case refhost::Failure::Kind::Other:
      return "other";
  }
  return "";
}

void throwPlanned(const refhost::Failure& failure, const std::string& what) {
  if (failure.kind == refhost::Failure::Kind::BadAlloc) throw std::bad_alloc();
  if (failure.kind == refhost::Failure::Kind::RuntimeError) throw std::runtime_error(what);
  if (failure.kind == refhost::Failure::Kind::Other) throw UnknownException{};
}

}  // namespace secondreader
