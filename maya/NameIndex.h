// Finds the first record of a name without walking the list.
#pragma once

#include <cstdint>
#include <string_view>
#include <vector>

namespace mayaimport {

// Knows, for one list of named records, the first record of every name. Names are shorter than a record's
// name field, and are compared without regard to case. The index keeps copies, close together: reading them
// from the records, half a kilobyte each, would miss the processor's caches for every name.
class NameIndex {
 public:
  // Adds the record that was just appended to the list at `index`. Returns the first record of the name,
  // which is this one when the name is new. May throw std::bad_alloc; what Find returns is then unchanged.
  std::int32_t Append(std::int32_t index, std::string_view name);

  // The first record of that name, or kNoIndex.
  std::int32_t Find(std::string_view name) const;

  // For a caller that knows which names it will look up: prefetches what Find reads first, and, a while
  // later, what it reads then. Hints; a name that is hashed is shorter than a record's name field.
  static std::uint32_t Hash(std::string_view name);
  void PrefetchEntry(std::uint32_t hash) const;
  void PrefetchName(std::uint32_t hash) const;

 private:
  struct Entry {
    std::uint32_t hash;
    std::int32_t index;       // kNoIndex: free
    std::uint32_t firstWord;  // of the name, in words_
    std::uint32_t length;     // bytes
  };
  class FoldedName;

  std::size_t Locate(const FoldedName& name) const;
  void Grow();

  std::vector<Entry> entries_;        // open addressing; a power of two, at most half full
  std::vector<std::uint64_t> words_;  // the names in lower case, each filled up with NULs
  std::size_t used_ = 0;
};

}  // namespace mayaimport
