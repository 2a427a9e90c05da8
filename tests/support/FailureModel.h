// What a callback owes the host after a failure, derived from the calls that it made before.
#pragma once

#include <cstddef>
#include <map>
#include <set>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "hostapi/ErrorCodes.h"
#include "refhost/Host.h"
#include "tests/support/BuilderRun.h"

namespace testsupport {

// The name of a line's call.
std::string CallName(std::string_view line);

// A line without its error and what follows; the calls that clean up hand nothing out.
std::string WithoutError(const std::string& line);
std::vector<std::string> WithoutErrors(const std::vector<std::string>& lines);

// Whether the call gave back 0.
bool Succeeded(std::string_view line);

// A way to fail, the code that it becomes, and how a trace writes it.
struct Way {
  refhost::Failure::Kind kind;
  HostError code;
  const char* error;
};

// Standard exceptions, which are reported.
inline constexpr Way kExceptions[] = {
    {refhost::Failure::Kind::BadAlloc, HOST_ERR_EXCEPTION_MEMORY, "\"bad_alloc\""},
    {refhost::Failure::Kind::RuntimeError, HOST_ERR_EXCEPTION_OTHER, "\"runtime_error\""},
};

// An exception of a type that nobody knows, which is not.
inline constexpr Way kOther = {refhost::Failure::Kind::Other, HOST_ERR_EXCEPTION_OTHER, "\"other\""};

// Follows a trace line by line and knows what is held.
class HeldByCallback {
 public:
  // A call that did nothing counts as failed, whatever its code.
  void Take(std::string_view line, bool failed);

  // The calls, in order, that end a callback that fails now: the silence, the stream in use, open batches,
  // the zoom stream, the parser's suites, the text, the driver's suites.
  std::vector<std::string> CleanUp() const;

  // The same where an exception of an unknown type passes: the silence, the stream in use, and the suites.
  // All else stays open.
  std::vector<std::string> Unwinding() const;

  // How much then stays open that is reported as left behind: batches, the zoom stream and the text.
  std::size_t LeftOpen() const;

 private:
  struct Stream {
    std::string handle;
    bool unguarded;
    bool zoom;
    bool left;  // kept because its stream already had keys
  };
  using Suite = std::pair<std::size_t, std::string>;  // its place in the order of release, its line

  void TakeStream(std::string_view line);
  std::vector<std::string> EndsOfSilenceAndStream() const;

  std::set<Suite> driverSuites_;
  std::set<Suite> parserSuites_;
  bool reading_ = true;  // until the text is locked
  bool silent_ = false;
  std::string memory_;
  bool unlocked_ = false;
  std::set<std::string> cameraLayers_;
  std::map<std::pair<std::string, std::string>, int> acquisitions_;  // by layer and stream number
  std::vector<Stream> streams_;
  std::vector<std::string> batches_;
};

// What is held after the first `count` calls of the trace; with `lastFailed` the last of them had failed.
HeldByCallback HeldAfter(const std::vector<std::string>& trace, std::size_t count, bool lastFailed);

// How many of the leftovers of a callback are not kept by design.
std::size_t LeftOpen(const refhost::CallbackResult& result);

struct Made {
  std::size_t compositions = 0;
  std::size_t layers = 0;
  std::size_t keys = 0;
  std::size_t leftovers = 0;  // on the ledger, but for the file object

  bool operator==(const Made&) const = default;
};

// A line of a trace, as far as it says what was made and what is held.
struct CallFacts {
  explicit CallFacts(std::string_view line);

  std::string call;
  std::string batch;
  std::string held;   // the suite, stream, batch or memory that it takes or gives back
  std::string index;  // of a key
};

// Counts what succeeding calls make and hold.
class MadeCount {
 public:
  void Take(const CallFacts& call);
  Made made() const;

 private:
  Made made_;
  std::multiset<std::string> held_;
  std::map<std::string, std::set<std::string>> keyed_;  // indices of the keys with a value, by batch
};

// What a trace says that the host has made, but for the call `idle` (from 0), which did nothing.
inline constexpr std::size_t kNoCall = static_cast<std::size_t>(-1);
Made MadeBy(const std::vector<std::string>& trace, std::size_t idle = kNoCall);

}  // namespace testsupport
