#include "refhost/RehearsalRunner.h"

#include <numeric>
#include <stdexcept>

#include "hostutil/HostSetup.h"

namespace refhost {
namespace {

std::int32_t thrownBy(Failure::Kind kind) {
  switch (kind) {
    case Failure::Kind::Code:
      break;
    case Failure::Kind::BadAlloc:
      return HOST_THROW_BAD_ALLOC;
    case Failure::Kind::RuntimeError:
      return HOST_THROW_RUNTIME_ERROR;
    case Failure::Kind::Other:
      return HOST_THROW_OTHER;
  }
  return HOST_THROW_NOTHING;
}

}  // namespace

RehearsalRunner::RehearsalRunner(const HostOptions& options)
    : during_(options.during), refused_(options.refusedSuites) {
  HostClearUtilityFailures();
  for (const Failure& failure : options.failures) {
    if (failure.operation.empty()) {
      planned_.push_back({std::nullopt, failure});
    } else if (const auto operation = findOperation(failure.operation)) {
      planned_.push_back({operation, failure});
    } else if (const auto service = findUtilityService(failure.operation)) {
      planUtilityFailure(*service, failure);
    } else {
      throw std::invalid_argument("the host has no operation " + failure.operation);
    }
  }
}

RehearsalRunner::~RehearsalRunner() {
  HostEndRehearsal();
  HostClearUtilityFailures();
}

void RehearsalRunner::planUtilityFailure(std::int32_t service, const Failure& failure) {
  const HostUtilityFailure planned{service, failure.nth, failure.code, thrownBy(failure.kind)};
  if (HostAddUtilityFailure(&planned) != 0) {
    throw std::invalid_argument("the utility library cannot rehearse " + failure.operation);
  }
}

void RehearsalRunner::begin(Callback callback) {
  active_ = callback == during_;
  watching_ = active_ && !planned_.empty();
  tally_ = active_ ? &counts_ : &others_;
  tally_->fill(0);
  if (active_) HostBeginRehearsal();
}

void RehearsalRunner::end() {
  calls_ = callsSoFar();
  if (active_) HostEndRehearsal();
  active_ = watching_ = false;
  tally_ = &others_;
}

std::int64_t RehearsalRunner::callsSoFar() const {
  return std::accumulate(tally_->begin(), tally_->end(), std::int64_t{0});
}

Verdict RehearsalRunner::judge(Operation operation) const {
  const std::int64_t ofOperation = counts_[static_cast<std::size_t>(operation)];
  for (const Planned& planned : planned_) {
    const Failure& failure = planned.failure;
    bool hit = false;
    if (!planned.operation) {
      hit = failure.onwards ? callsSoFar() >= failure.nth : callsSoFar() == failure.nth;
    } else if (*planned.operation == operation) {
      hit = failure.nth == 0 || ofOperation == failure.nth;
    }
    if (hit) return {true, failure.kind, failure.code};
  }
  return {};
}

bool RehearsalRunner::refuses(std::string_view suite, std::int32_t version) const {
  if (!active_) return false;
  for (const RefusedSuite& refused : refused_) {
    if (refused.name == suite && refused.version == version) return true;
  }
  return false;
}

std::int64_t RehearsalRunner::callCount(std::string_view operation) const {
  if (const auto found = findOperation(operation)) return counts_[static_cast<std::size_t>(*found)];
  if (const auto service = findUtilityService(operation)) return HostUtilityCallCount(*service);
  return 0;
}

}  // namespace refhost
