// Messages to the user, and the spans in which they are kept back.
#pragma once

#include <string>
#include <vector>

#include "hostapi/UtilitySuite.h"

namespace refhost {

class MessageLog {
 public:
  void show(std::string text);

  void beginSilence(const HostSilentErrorState* state);
  // False, and nothing done, when the innermost span began with another state, or none is open. With `report`
  // the messages of the span are shown now, else they are dropped.
  bool endSilence(const HostSilentErrorState* state, bool report);
  bool isSilent() const { return !spans_.empty(); }

  // Takes the messages that were shown. Spans that are still open end, and what they kept back is dropped.
  std::vector<std::string> takeShown();

 private:
  struct Span {
    const HostSilentErrorState* state;
    std::vector<std::string> kept;
  };

  std::vector<std::string> shown_;
  std::vector<Span> spans_;
};

}  // namespace refhost
