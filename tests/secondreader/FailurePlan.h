// Which calls of a callback a rehearsal makes fail, counted as the embedded host counts them.
#pragma once

#include <cstdint>
#include <map>
#include <optional>
#include <string>
#include <string_view>

#include "refhost/Host.h"

namespace secondreader {

// In place of an operation's name: a failure after the nth suite call, outside of all calls.
inline constexpr const char* kBetweenCalls = "(between calls)";

class FailurePlan {
 public:
  // The options outlive the plan.
  explicit FailurePlan(const refhost::HostOptions& options) : options_(options) {}

  // The counts begin anew; failures are planned only within the callback that the options name.
  void begin(refhost::Callback callback);
  void end() { active_ = false; }

  // Counts a suite call or a call of a utility service; what is planned for it, if anything.
  std::optional<refhost::Failure> suiteCall(const std::string& operation);
  std::optional<refhost::Failure> service(const std::string& name);

  // What is planned for the time after the suite calls so far: once, in place of the next one.
  std::optional<refhost::Failure> betweenCalls();

  bool refuses(std::string_view suite, std::int32_t version) const;

  // In the callback that runs or ran last.
  std::int64_t suiteCalls() const { return calls_; }
  const std::map<std::string, std::int64_t>& counts() const { return counts_; }

 private:
  const refhost::HostOptions& options_;
  bool active_ = false;
  bool failedBetweenCalls_ = false;
  std::int64_t calls_ = 0;
  std::map<std::string, std::int64_t> counts_;
};

// The word for a kind of exception in a trace.
const char* wordOf(refhost::Failure::Kind kind);

// A planned exception that is not a standard one.
struct UnknownException {};

// Throws the exception of a planned failure; nothing when it is a code.
void throwPlanned(const refhost::Failure& failure, const std::string& what);

}  // namespace secondreader
