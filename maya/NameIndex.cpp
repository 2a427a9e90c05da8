#include "maya/NameIndex.h"

#include <algorithm>
#include <array>
#include <chrono>
#include <cstring>
#include <random>

#include "maya/SceneRecords.h"
#include "plugin/Guarded.h"

namespace mayaimport {

namespace {

constexpr std::size_t kFirstCapacity = 64;
constexpr std::size_t kWordSize = sizeof(std::uint64_t);

// Lower case for the ASCII letters among eight bytes at once.
std::uint64_t FoldEight(std::uint64_t bytes) {
  constexpr std::uint64_t kEach = 0x0101010101010101u;
  const std::uint64_t low = bytes & (kEach * 0x7f);
  const std::uint64_t fromA = low + kEach * (0x80 - 'A');
  const std::uint64_t beyondZ = low + kEach * (0x7f - 'Z');
  const std::uint64_t upper = (fromA ^ beyondZ) & ~bytes & (kEach * 0x80);
  return bytes | (upper >> 2);
}

// The first eight bytes, the first in the lowest bits on most processors; zeros where there are fewer.
std::uint64_t LoadUpToEight(std::string_view text) {
  std::uint64_t bytes = 0;
  if (text.size() >= kWordSize) {
    std::memcpy(&bytes, text.data(), kWordSize);
    return bytes;
  }
  char* at = reinterpret_cast<char*>(&bytes);
  for (const char c : text) *at++ = c;
  return bytes;
}

// The parts of a hash: the halves of the words of a name, and its length.
constexpr std::size_t kMostParts = kNameCapacity / sizeof(std::uint32_t) + 1;
using Multipliers = std::array<std::uint64_t, kMostParts>;

// Drawn anew in every run.
Multipliers DrawMultipliers() {
  std::uint64_t seed =
      static_cast<std::uint64_t>(std::chrono::steady_clock::now().time_since_epoch().count()) ^
      reinterpret_cast<std::uintptr_t>(&kFirstCapacity);
  // Without a source of random numbers the time and the address have to suffice.
  Unreported([&] {
    std::random_device device;
    seed ^= (std::uint64_t{device()} << 32) | device();
  });
  std::mt19937_64 random(seed);
  Multipliers multipliers;
  for (std::uint64_t& multiplier : multipliers) multiplier = random();
  return multipliers;
}

// A hash is the upper half of the sum of the parts, each times a random multiplier. Two names collide with a
// probability of about 2^-31, whatever they are. So no scene can hold names that all collide, as it could if
// the hash were known beforehand.
const Multipliers& MultipliersOfThisRun() {
  static const Multipliers kMultipliers = DrawMultipliers();
  return kMultipliers;
}

// A bijection that spreads the sums of names which differ only in a number.
std::uint32_t Scatter(std::uint32_t sum) {
  sum = (sum ^ (sum >> 16)) * 0x85ebca6bu;
  sum = (sum ^ (sum >> 13)) * 0xc2b2ae35u;
  return sum ^ (sum >> 16);
}

}  // namespace

// A name as the index keeps it, with its hash.
class NameIndex::FoldedName {
 public:
  explicit FoldedName(std::string_view name) : length_(static_cast<std::uint32_t>(name.size())) {
    const std::uint64_t* multiplier = MultipliersOfThisRun().data();
    std::uint64_t sum = *multiplier++ * length_;
    for (std::size_t at = 0; at < name.size(); at += kWordSize) {
      const std::uint64_t folded = FoldEight(LoadUpToEight(name.substr(at)));
      words_[at / kWordSize] = folded;
      sum += *multiplier++ * static_cast<std::uint32_t>(folded);
      sum += *multiplier++ * (folded >> 32);
    }
    hash_ = Scatter(static_cast<std::uint32_t>(sum >> 32));
  }

  std::uint32_t hash() const { return hash_; }
  std::uint32_t length() const { return length_; }

  // Whether these are its words. A loop of its own, because names are a few words long.
  bool Is(const std::uint64_t* words) const {
    std::uint64_t difference = 0;
    for (const std::uint64_t* own = begin(); own != end(); ++own, ++words) difference |= *own ^ *words;
    return difference == 0;
  }
  const std::uint64_t* begin() const { return words_; }
  const std::uint64_t* end() const { return words_ + (length_ + kWordSize - 1) / kWordSize; }

 private:
  std::uint32_t hash_ = 0;
  std::uint32_t length_;
  std::uint64_t words_[kNameCapacity / kWordSize];
};

std::int32_t NameIndex::Append(std::int32_t index, std::string_view name) {
  if (entries_.size() < 2 * (used_ + 1)) Grow();
  const FoldedName folded(name);
  Entry& entry = entries_[Locate(folded)];
  if (entry.index == kNoIndex) {
    const auto firstWord = static_cast<std::uint32_t>(words_.size());
    words_.insert(words_.end(), folded.begin(), folded.end());
    entry = {folded.hash(), index, firstWord, folded.length()};
    ++used_;
  }
  return entry.index;
}

std::int32_t NameIndex::Find(std::string_view name) const {
  if (entries_.empty() || name.size() >= kNameCapacity) return kNoIndex;
  return entries_[Locate(FoldedName(name))].index;
}

std::uint32_t NameIndex::Hash(std::string_view name) { return FoldedName(name).hash(); }

void NameIndex::PrefetchEntry(std::uint32_t hash) const {
  if (!entries_.empty()) __builtin_prefetch(&entries_[hash & (entries_.size() - 1)]);
}

void NameIndex::PrefetchName(std::uint32_t hash) const {
  if (entries_.empty()) return;
  const Entry& entry = entries_[hash & (entries_.size() - 1)];
  if (entry.hash == hash && entry.index != kNoIndex) __builtin_prefetch(words_.data() + entry.firstWord);
}

// The entry of the name, or the free one where it belongs.
std::size_t NameIndex::Locate(const FoldedName& name) const {
  const std::size_t mask = entries_.size() - 1;
  std::size_t at = name.hash() & mask;
  for (; entries_[at].index != kNoIndex; at = (at + 1) & mask) {
    const Entry& entry = entries_[at];
    if (entry.hash == name.hash() && entry.length == name.length() &&
        name.Is(words_.data() + entry.firstWord)) {
      break;
    }
  }
  return at;
}

void NameIndex::Grow() {
  std::vector<Entry> old(std::max(kFirstCapacity, entries_.size() * 2), Entry{0, kNoIndex, 0, 0});
  old.swap(entries_);
  const std::size_t mask = entries_.size() - 1;
  for (const Entry& entry : old) {
    if (entry.index == kNoIndex) continue;
    std::size_t at = entry.hash & mask;
    while (entries_[at].index != kNoIndex) at = (at + 1) & mask;
    entries_[at] = entry;
  }
}

}  // namespace mayaimport
