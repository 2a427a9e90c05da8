// Looks ahead over a run of "connectAttr" commands and prefetches the names that they look up into the
// processor's caches. Gives hints to the processor and has no other effect.
#pragma once

#include <cstddef>
#include <cstdint>

#include "maya/NameIndex.h"

namespace mayaimport {

class ConnectionScout {
 public:
  // Called once for every "connectAttr", with the place after the keyword. Reads nothing from `end` on.
  void LookAhead(const char* position, const char* end, const NameIndex& curves, const NameIndex& transforms);

 private:
  // Far enough for the work between to cover the wait for memory; what is fetched earlier is evicted again.
  static constexpr std::size_t kFar = 8;   // commands ahead whose index entries are fetched
  static constexpr std::size_t kNear = 4;  // commands ahead whose names are fetched

  struct Ends {
    std::uint32_t source = 0;  // hashes
    std::uint32_t destination = 0;
  };

  bool ReadCommand(const char* end, Ends* ends);

  const char* next_ = nullptr;  // the line of the last command that was looked at; null before the first
  std::size_t read_ = 0;        // commands looked at
  std::size_t reached_ = 0;     // commands whose turn has come
  Ends ends_[kFar];
};

}  // namespace mayaimport
