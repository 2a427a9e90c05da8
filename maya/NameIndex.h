// Finds the first record of a name in a list without walking it.
#pragma once

#include <cstdint>
#include <string_view>
#include <vector>

#include "hostutil/RecordList.h"

// Knows, for one list of records that begin with their name, the first record of every name. Names are taken
// without regard to case. Records may change in place as long as their names stay equal in this sense.
class NameIndex {
 public:
  // Takes in the record that was just appended to the list at `index`. Returns the first record of its name,
  // which is the new one where the name is new. May throw std::bad_alloc; the index is then unchanged.
  std::int32_t Append(const RecordList* list, std::int32_t index, std::string_view name);

  // The first record of that name, or kNoIndex.
  std::int32_t Find(const RecordList* list, std::string_view name) const;

 private:
  struct Entry {
    std::uint32_t hash;
    std::int32_t index;  // kNoIndex: free
  };

  std::size_t Locate(const RecordList* list, std::string_view name, std::uint32_t hash) const;
  void Grow();

  std::vector<Entry> entries_;  // open addressing; a power of two, at most half full
  std::size_t used_ = 0;
};
