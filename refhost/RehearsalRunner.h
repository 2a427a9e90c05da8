// Counts the calls of a callback and decides which of them fail.
#pragma once

#include <array>
#include <cstdint>
#include <optional>
#include <string_view>
#include <vector>

#include "refhost/Host.h"
#include "refhost/Operations.h"

namespace refhost {

// What a rehearsal does with one call.
struct Verdict {
  bool rehearsed = false;
  Failure::Kind kind = Failure::Kind::Code;
  HostError code = 0;
};

class RehearsalRunner {
 public:
  // Hands the failures of utility services on to the utility library. Throws std::invalid_argument for an
  // operation that the host does not have.
  explicit RehearsalRunner(const HostOptions& options);
  ~RehearsalRunner();
  RehearsalRunner(const RehearsalRunner&) = delete;
  RehearsalRunner& operator=(const RehearsalRunner&) = delete;

  void begin(Callback callback);
  void end();

  // Counts a call. True when the caller has to ask for its verdict; other calls go on.
  bool count(Operation operation) {
    ++(*tally_)[static_cast<std::size_t>(operation)];
    return watching_;
  }

  bool watches() const { return watching_; }

  // The verdict on the call that was counted last.
  Verdict judge(Operation operation) const;

  bool refuses(std::string_view suite, std::int32_t version) const;

  std::int64_t calls() const { return calls_; }  // suite calls between begin() and end()
  std::int64_t callCount(std::string_view operation) const;

 private:
  struct Planned {
    std::optional<Operation> operation;  // nothing: counted over all calls
    Failure failure;
  };

  std::int64_t callsSoFar() const;
  void planUtilityFailure(std::int32_t service, const Failure& failure);

  Callback during_;
  const std::vector<RefusedSuite> refused_;
  std::vector<Planned> planned_;
  bool active_ = false;
  std::int64_t calls_ = 0;
  using Tally = std::array<std::int64_t, kOperationCount>;
  Tally counts_{};           // of the callback that the rehearsal is for
  Tally others_{};           // of the other callbacks
  Tally* tally_ = &others_;  // where the calls of the callback that runs are counted
  bool watching_ = false;    // whether any call of the callback that runs may be rehearsed
};

}  // namespace refhost
