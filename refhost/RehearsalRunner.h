// Counts the calls of a callback and says which of them are to fail.
#pragma once

#include <array>
#include <cstdint>
#include <optional>
#include <string_view>
#include <vector>

#include "refhost/Host.h"
#include "refhost/Operations.h"

namespace refhost {

// What a rehearsal has in store for one call.
struct Verdict {
  bool rehearsed = false;
  Failure::Kind kind = Failure::Kind::Code;
  HostError code = 0;

  bool throws() const { return rehearsed && kind != Failure::Kind::Code; }
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

  Verdict count(Operation operation) {
    ++calls_;
    if (!active_) return {};
    ++counts_[static_cast<std::size_t>(operation)];
    if (planned_.empty()) return {};
    return judge(operation);
  }

  bool refuses(std::string_view suite, std::int32_t version) const;

  std::int64_t calls() const { return calls_; }  // suite calls since begin()
  std::int64_t callCount(std::string_view operation) const;

 private:
  struct Planned {
    std::optional<Operation> operation;  // nothing: counted over all calls
    Failure failure;
  };

  void planUtilityFailure(std::int32_t service, const Failure& failure);
  Verdict judge(Operation operation) const;

  Callback during_;
  const std::vector<RefusedSuite> refused_;
  std::vector<Planned> planned_;
  bool active_ = false;
  std::int64_t calls_ = 0;
  std::array<std::int64_t, kOperationCount> counts_{};
};

}  // namespace refhost
