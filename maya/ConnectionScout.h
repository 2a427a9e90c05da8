// Looks ahead over the "connectAttr" commands that follow one another, so that the names they look up are in
// the processor's caches when their turn comes. Gives hints to the processor and has no other effect.
#pragma once

#include <cstddef>
#include <cstdint>

#include "maya/NameIndex.h"

class ConnectionScout {
 public:
  // Called once for every "connectAttr", with the place after the keyword. Reads nothing from `end` on.
  void LookAhead(const char* position, const char* end, const NameIndex& curves, const NameIndex& transforms);

 private:
  // Enough for one command's work to cover the wait for memory; more would be pushed out of the caches again.
  static constexpr std::size_t kFar = 8;   // commands ahead where an index is asked for
  static constexpr std::size_t kNear = 4;  // and where its name is

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
