// Records arguments of calls of the utility library that their results do not show: sizes, flags, and the
// order in which lists are disposed of.
//
// A program that compiles UtilityCalls.cpp calls these services through it. Each call is noted and passed on.
#pragma once

#include <cstdint>
#include <vector>

#include "hostutil/RecordList.h"

namespace testsupport {

struct CreatedList {
  std::int64_t recordSize;
  std::int64_t growth;
  std::int64_t initial;
};

inline bool operator==(const CreatedList& a, const CreatedList& b) {
  return a.recordSize == b.recordSize && a.growth == b.growth && a.initial == b.initial;
}

struct UtilityCalls {
  std::vector<CreatedList> created;
  std::vector<const RecordList*> disposed;  // null lists left out
  std::vector<std::int32_t> stripFlags;     // of the removals of an extension
};

// What was called since the last time.
UtilityCalls TakeUtilityCalls();

}  // namespace testsupport
