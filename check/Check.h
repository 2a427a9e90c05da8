// Says what an import makes of a scene: for every camera what came over, what did not, why, at which line,
// and what to do.
//
// What came over is what the caller was given by the import itself. The scene is read and evaluated only to
// explain it.
#pragma once

#include <cstdint>
#include <map>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

#include "check/CameOver.h"
#include "check/Head.h"
#include "diag/Diagnostic.h"

namespace check {

struct Options {
  bool all = false;              // every diagnostic in full, and the whole head, however much there is
  std::vector<diag::Code> only;  // no others are reported, or counted; empty: all of them
};

// A diagnostic, with what is shown of the text.
struct Finding {
  diag::Diagnostic diagnostic;
  diag::LineAndColumn end;  // after the range's last byte
  std::string excerpt;      // the line and the mark under it; empty for one about the whole file
};

struct Report {
  Head head;
  std::vector<Finding> findings;                  // the worst first, then in the order of the file
  std::map<diag::Code, std::uint64_t> notInFull;  // how many of a code were counted alone
  std::uint64_t errors = 0;                       // counted alone or in full; so are the next two
  std::uint64_t warnings = 0;
  std::uint64_t notes = 0;
};

// A scene that is read without knowing what came over: while the import runs, in a thread of its own, or
// after it. The text must outlive it.
class Reading {
 public:
  explicit Reading(std::string_view text, Options options = {});
  Reading(Reading&&) noexcept;
  ~Reading();

 private:
  friend Report Check(Reading reading, const CameOver& cameOver);
  struct Parts;
  std::unique_ptr<Parts> parts_;
};

// Takes any bytes. Time and memory grow with the text, what came over, and the frames that are looked at.
// With an import that saw no scene the reading is of no use, and is not looked at.
Report Check(Reading reading, const CameOver& cameOver);

// The same in one step.
Report Check(std::string_view text, const CameOver& cameOver, const Options& options = {});

}  // namespace check
