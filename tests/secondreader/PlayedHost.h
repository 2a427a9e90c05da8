// A host that is only played: it keeps count of what it would hand out, refuses what the embedded host
// refuses, and writes the line that the embedded host would write for each call.
#pragma once

#include <array>
#include <cstdint>
#include <exception>
#include <map>
#include <set>
#include <string>
#include <utility>
#include <vector>

#include "hostapi/ErrorCodes.h"
#include "hostapi/HostTypes.h"
#include "tests/secondreader/FailurePlan.h"
#include "tests/secondreader/TraceComparison.h"

namespace secondreader {

// What a played handle is: the number in its name. 0 is the null handle.
using Handle = std::int64_t;

// Thrown where the process would end.
struct ProcessEnds {};

struct OpenBatch {
  Handle number = 0;
  Handle layer = 0;
  std::int32_t stream = 0;
  std::vector<T_Time> keys = {};
  std::set<std::int32_t> valued = {};  // the keys that have a value
  bool excused = false;                // the ledger does not report it: its end was made to fail
};

struct HeldStream {
  Handle number = 0;
  Handle layer = 0;
  std::int32_t stream = 0;
  bool excused = false;  // the same, or the importer keeps it by design
};

struct PlayedLayer {
  bool camera = false;
};

struct Earlier {
  bool operator()(const T_Time& a, const T_Time& b) const {
    return std::int64_t{a.value} * b.scale < std::int64_t{b.value} * a.scale;
  }
};

class PlayedHost {
 public:
  explicit PlayedHost(refhost::HostOptions given) : options(std::move(given)), plan(options) {}
  PlayedHost(const PlayedHost&) = delete;
  PlayedHost& operator=(const PlayedHost&) = delete;

  // Shows the message for a standard exception, and returns its code.
  HostError translateAndReport(const std::exception& exception);

  // Runs the work, and returns its code: 0, a thrown integer, or that of a standard exception.
  template <typename Work>
  HostError guarded(Work work) {
    try {
      work();
      return HOST_ERR_NONE;
    } catch (int code) {
      return code;
    } catch (const std::exception& exception) {
      return translateAndReport(exception);
    }
  }

  // The same where no exception may leave: an unknown one has the code of any other failure.
  template <typename Work>
  HostError atBorder(Work work) {
    try {
      return guarded(work);
    } catch (const UnknownException&) {
      return HOST_ERR_EXCEPTION_OTHER;
    }
  }

  // What the ledger reports where an unknown exception ended a callback: "stream:3", "batch:1", "mem:1".
  std::vector<std::string> leftOpen() const;

  // The ledger does not report the stream.
  void excuse(Handle stream) {
    for (HeldStream& held : heldStreams) held.excused = held.excused || held.number == stream;
  }

  // Counts a call of a utility service. True when it is to do nothing and return *code; throws when it is to
  // throw.
  bool serviceFails(const char* name, HostError* code);

  // Throws what is planned for the time after the last suite call. Asked before each call, and at the end of
  // a part of the work that ends otherwise where it fails.
  void failBetweenCalls();

  // The text of the localised string of that number, "" without the table.
  std::string localized(int id) const;

  // Reads a number as the number scanner does; throws the code of a failure.
  double scanNumber(const std::string& text);

  const refhost::HostOptions options;
  FailurePlan plan;
  std::vector<PredictedLine> lines;
  std::vector<std::string> messages;
  bool silent = false;

  bool stringTable = false;  // the table of localised strings is registered
  std::int32_t linearUnits = 0;
  bool importerUsable = false;
  bool deathHook = false;

  std::string importerName;
  std::size_t extensions = 0;
  std::map<std::pair<Handle, std::int32_t>, std::set<T_Time, Earlier>>
      keys;  // of the project, by layer and stream

  // What a failure of its own end left over; the ledger lists it as kept by design.
  std::set<std::size_t> keptSuites;
  std::size_t keptMemory = 0;
  std::size_t files = 0;  // that are there

  Handle items = 0;
  Handle comps = 0;
  std::vector<PlayedLayer> layers;  // by number - 1
  Handle memories = 0;
  Handle heldMemory = 0;
  Handle streams = 0;
  Handle batches = 0;
  std::vector<HeldStream> heldStreams;
  std::vector<OpenBatch> openBatches;
};

// Throws a code that is not 0.
inline void check(HostError code) {
  if (code != HOST_ERR_NONE) throw int{code};
}

}  // namespace secondreader
