// One played suite call: counted, judged by the plan, refused where the embedded host would, and written
// down.
#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

#include "tests/secondreader/PlayedHost.h"
#include "tests/secondreader/TraceComparison.h"

namespace secondreader {

struct SuiteName {
  const char* name;
  std::int32_t version;
};

// A line of the trace, built in the order of its keys.
class PlayedLine {
 public:
  explicit PlayedLine(const char* call);

  PlayedLine& text(const char* key, const std::string& bytes);
  PlayedLine& integer(const char* key, std::int64_t value);
  PlayedLine& number(const char* key, double value);
  PlayedLine& numbers(const char* key, const std::vector<double>& values);
  PlayedLine& pair(const char* key, std::int64_t first, std::int64_t second);
  PlayedLine& handle(const char* key, const char* kind, Handle number);  // null for 0
  PlayedLine& plain(const char* key, const std::string& json);

  std::string ended() const { return line_ + "}"; }

 private:
  void appendNumber(double value);

  std::string line_;
};

class PlayedCall {
 public:
  PlayedCall(PlayedHost& host, const char* operation, SuiteName suite);

  // False when the plan has the call do nothing, or it was refused.
  bool goesOn() const { return !failure_ && error_ == HOST_ERR_NONE; }
  void refuse(HostError code) { error_ = code; }
  // Refuses and gives false unless the condition holds.
  bool demand(bool condition, HostError code);

  PlayedLine& line() { return line_; }

  // How well the doubles of the line are known; exactly, if this is not called.
  void rounded(Rounding rounding) { rounding_ = rounding; }

  // What the call hands out, null unless it went on.
  void handed(const char* key, const char* kind, Handle number) {
    line_.handle(key, kind, goesOn() ? number : 0);
  }
  void handedInteger(const char* key, std::int64_t value);

  // Writes the line; the code, or the planned exception.
  HostError finish();

 private:
  PlayedHost& host_;
  std::string operation_;
  std::optional<refhost::Failure> failure_;
  HostError error_ = HOST_ERR_NONE;
  PlayedLine line_;
  Rounding rounding_ = Rounding::None;
};

}  // namespace secondreader
