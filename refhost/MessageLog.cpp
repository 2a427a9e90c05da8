#include "refhost/MessageLog.h"

#include <utility>

namespace refhost {

void MessageLog::show(std::string text) {
  (spans_.empty() ? shown_ : spans_.back().kept).push_back(std::move(text));
}

void MessageLog::beginSilence(const HostSilentErrorState* state) { spans_.push_back({state, {}}); }

bool MessageLog::endSilence(const HostSilentErrorState* state, bool report) {
  if (spans_.empty() || spans_.back().state != state) return false;
  std::vector<std::string> kept = std::move(spans_.back().kept);
  spans_.pop_back();
  if (!report) return true;
  for (std::string& text : kept) show(std::move(text));
  return true;
}

std::vector<std::string> MessageLog::takeShown() {
  spans_.clear();
  return std::exchange(shown_, {});
}

}  // namespace refhost
