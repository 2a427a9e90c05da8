#include "maya/NameIndex.h"

#include <algorithm>
#include <chrono>
#include <cstring>

#include "maya/SceneRecords.h"
#include "maya/Words.h"

namespace {

constexpr std::size_t kFirstCapacity = 64;

// Lower case for the ASCII letters among eight bytes at once.
std::uint64_t FoldEight(std::uint64_t bytes) {
  constexpr std::uint64_t kEach = 0x0101010101010101u;
  const std::uint64_t low = bytes & (kEach * 0x7f);
  const std::uint64_t fromA = low + kEach * (0x80 - 'A');
  const std::uint64_t beyondZ = low + kEach * (0x7f - 'Z');
  const std::uint64_t upper = (fromA ^ beyondZ) & ~bytes & (kEach * 0x80);
  return bytes | (upper >> 2);
}

// Differs from run to run, so that no scene can bring names that all meet in one place.
std::uint64_t Seed() {
  static const std::uint64_t seed =
      (static_cast<std::uint64_t>(std::chrono::steady_clock::now().time_since_epoch().count()) ^
       reinterpret_cast<std::uintptr_t>(&kFirstCapacity)) *
          0x9e3779b97f4a7c15u |
      1;
  return seed;
}

std::uint64_t Mix(std::uint64_t state, std::uint64_t bytes) {
  state = (state ^ bytes) * 0xff51afd7ed558ccdu;
  return state ^ (state >> 32);
}

std::uint32_t HashName(std::string_view name) {
  const std::uint64_t seed = Seed();
  std::uint64_t state = seed + name.size();
  std::size_t at = 0;
  for (; at < name.size(); at += sizeof(std::uint64_t)) {
    std::uint64_t bytes = 0;
    std::memcpy(&bytes, name.data() + at, std::min(sizeof bytes, name.size() - at));
    state = Mix(state + seed, FoldEight(bytes));
  }
  return static_cast<std::uint32_t>(Mix(state, seed) >> 16);
}

std::uint64_t LoadEight(const char* at) {
  std::uint64_t bytes = 0;
  std::memcpy(&bytes, at, sizeof bytes);
  return bytes;
}

// Whether the record that begins with `field`, a name filled up with NULs, is one of that name.
bool IsNamed(const char* field, std::string_view name) {
  constexpr std::size_t kEight = sizeof(std::uint64_t);
  if (name.size() >= kNameCapacity || field[name.size()] != '\0') return false;
  std::size_t at = 0;
  for (; at + kEight <= name.size(); at += kEight) {
    if (FoldEight(LoadEight(field + at)) != FoldEight(LoadEight(name.data() + at))) return false;
  }
  return SameWord({field + at, name.size() - at}, name.substr(at));
}

bool IsNamed(const RecordList* list, std::int32_t index, std::string_view name) {
  const auto* field = static_cast<const char*>(RecordListPeek(list, index));
  return field != nullptr && IsNamed(field, name);
}

}  // namespace

std::int32_t NameIndex::Append(const RecordList* list, std::int32_t index, std::string_view name) {
  if (entries_.size() < 2 * (used_ + 1)) Grow();
  const std::uint32_t hash = HashName(name);
  Entry& entry = entries_[Locate(list, name, hash)];
  if (entry.index == kNoIndex) {
    entry = {hash, index};
    ++used_;
  }
  return entry.index;
}

std::int32_t NameIndex::Find(const RecordList* list, std::string_view name) const {
  if (entries_.empty()) return kNoIndex;
  return entries_[Locate(list, name, HashName(name))].index;
}

// The entry of the name, or the free one where it belongs.
std::size_t NameIndex::Locate(const RecordList* list, std::string_view name, std::uint32_t hash) const {
  const std::size_t mask = entries_.size() - 1;
  std::size_t at = hash & mask;
  while (entries_[at].index != kNoIndex) {
    if (entries_[at].hash == hash && IsNamed(list, entries_[at].index, name)) break;
    at = (at + 1) & mask;
  }
  return at;
}

void NameIndex::Grow() {
  std::vector<Entry> old(std::max(kFirstCapacity, entries_.size() * 2), Entry{0, kNoIndex});
  old.swap(entries_);
  const std::size_t mask = entries_.size() - 1;
  for (const Entry& entry : old) {
    if (entry.index == kNoIndex) continue;
    std::size_t at = entry.hash & mask;
    while (entries_[at].index != kNoIndex) at = (at + 1) & mask;
    entries_[at] = entry;
  }
}
