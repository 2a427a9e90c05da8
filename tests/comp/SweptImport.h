// A good import, its calls one after the other, and imports of the same scene in which something fails. What
// is expected of those is put together as text, so that thousands of them are judged by comparing bytes.
#pragma once

#include <gtest/gtest.h>

#include <cstddef>
#include <filesystem>
#include <memory>
#include <sstream>
#include <string>
#include <string_view>
#include <vector>

#include "refhost/Host.h"
#include "tests/support/FailureModel.h"

namespace testsupport {

// The names of the example scenes, and where one lies.
std::vector<std::string> ExampleNames();
std::filesystem::path ExampleScene(const std::string& name);

// Of so many calls every such one is walked: each of them where all tests are wanted, where wide ones are so
// many that no more than `share` are walked, and a tenth of that in a quick run and under a sanitizer
// (WideTests.h). Odd, so that of calls that come in pairs both are met.
inline constexpr std::size_t kShareOfCalls = 700;
inline constexpr std::size_t kSmallShare = 60;
std::size_t SweepStride(std::size_t calls, std::size_t share);

// For each of these lines whether its call is walked: every so many, and beside them the first of each
// operation.
std::vector<bool> WalkedCalls(const std::vector<std::string>& calls, std::size_t share = kShareOfCalls);

// One import; the host lives on, for looking at what it holds. One at a time.
struct SweptRun {
  std::unique_ptr<std::ostringstream> written;
  std::unique_ptr<refhost::Host> host;
  refhost::CallbackResult result;
  std::string calls;  // the lines of the suite calls, without the brackets around them
};

class SweptImport {
 public:
  explicit SweptImport(std::filesystem::path scene);

  // The calls of the good run, which is over.
  const std::vector<std::string>& good() const { return good_; }

  SweptRun Run(refhost::HostOptions options) const;

  // The first lines of the good run.
  std::string_view FirstCalls(std::size_t count) const {
    return std::string_view(text_).substr(0, ends_[count]);
  }
  std::string_view CallsFrom(std::size_t index) const { return std::string_view(text_).substr(ends_[index]); }

  // What the whole run makes and leaves when that call does nothing.
  Made MadeWithout(std::size_t index) const;

 private:
  friend class SweepCursor;

  std::filesystem::path scene_;
  std::vector<std::string> good_;
  std::vector<CallFacts> facts_;
  std::string text_;
  std::vector<std::size_t> ends_;  // where in the text the first so many lines end
};

// The state of the good run right before a call.
class SweepCursor {
 public:
  explicit SweepCursor(const SweptImport& import) : import_(import) {}

  std::size_t index() const { return index_; }
  bool isAtEnd() const { return index_ == import_.good().size(); }
  void Next();

  const HeldByCallback& held() const { return held_; }
  const std::string& line() const { return import_.good()[index_]; }

  // What exists and is held now, and after the calls that clean up.
  Made made() const { return made_.made(); }
  Made madeAfter(const std::vector<std::string>& cleanUp) const;

 private:
  const SweptImport& import_;
  std::size_t index_ = 0;
  HeldByCallback held_;
  MadeCount made_;
};

// The lines of calls without their errors, each with this one.
std::string WithErrors(const std::vector<std::string>& calls, std::string_view error);

// The project holds what is expected, the ledger what is left over (`leftOpen` of it not by design), and
// nothing is shown but by translate-and-report, which `reports` says.
void ExpectMade(const SweptRun& run, const Made& made, std::size_t reports, std::size_t leftOpen = 0);

}  // namespace testsupport
