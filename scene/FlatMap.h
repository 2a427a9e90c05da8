// A small hash table for names: open addressing, no removal, no iteration.
#pragma once

#include <cstddef>
#include <cstdint>
#include <cstring>
#include <string_view>
#include <utility>
#include <vector>

namespace scene {

// Mixes the bytes eight at a time; the same on every machine of one byte order.
inline std::uint64_t HashOf(std::string_view text, std::uint64_t seed = 0) {
  constexpr std::uint64_t kFactor = 0x9e3779b97f4a7c15u;
  std::uint64_t hash = (seed + text.size() + 1) * kFactor;
  const auto mix = [&hash](std::uint64_t bytes) {
    hash = (hash ^ bytes) * kFactor;
    hash ^= hash >> 32;
  };
  while (text.size() >= 8) {
    std::uint64_t bytes = 0;
    std::memcpy(&bytes, text.data(), 8);
    mix(bytes);
    text.remove_prefix(8);
  }
  std::uint64_t rest = 0;
  if (!text.empty()) std::memcpy(&rest, text.data(), text.size());
  mix(rest);
  return hash;
}

// Keys are pairs of a number and a name. The names' bytes must outlive the table. A value that was never set
// is Value{}.
template <typename Value>
class FlatMap {
 public:
  // Null where At was never called with the key. Valid until the next call of At.
  const Value* Find(std::uint64_t number, std::string_view name) const {
    if (entries_.empty()) return nullptr;
    const Entry& entry = entries_[SlotOf(number, name, HashOf(name, number))];
    return entry.hash != kUnused ? &entry.value : nullptr;
  }

  // The value of the key, made where there is none. Valid until the next call of At.
  Value& At(std::uint64_t number, std::string_view name) {
    if ((used_ + 1) * 3 > entries_.size() * 2) Grow();
    const std::uint64_t hash = HashOf(name, number);
    Entry& entry = entries_[SlotOf(number, name, hash)];
    if (entry.hash == kUnused) {
      entry = {name, number, Kept(hash), Value{}};
      ++used_;
    }
    return entry.value;
  }

 private:
  static constexpr std::uint32_t kUnused = 0;

  // The hash is stored so that names are rarely compared, and never when the table grows.
  struct Entry {
    std::string_view name;
    std::uint64_t number = 0;
    std::uint32_t hash = kUnused;
    Value value{};
  };

  // The part of a hash that determines the slot, made different from kUnused.
  static std::uint32_t Kept(std::uint64_t hash) { return static_cast<std::uint32_t>(hash) | 1u << 31; }

  std::size_t SlotOf(std::uint64_t number, std::string_view name, std::uint64_t hash) const {
    const std::uint32_t kept = Kept(hash);
    const std::size_t mask = entries_.size() - 1;
    std::size_t slot = kept & mask;
    for (;; slot = (slot + 1) & mask) {
      const Entry& entry = entries_[slot];
      if (entry.hash == kUnused || (entry.hash == kept && entry.number == number && entry.name == name))
        return slot;
    }
  }

  void Grow() {
    std::vector<Entry> larger(entries_.empty() ? 16 : entries_.size() * 2);
    const std::size_t mask = larger.size() - 1;
    for (const Entry& entry : entries_) {
      if (entry.hash == kUnused) continue;
      std::size_t slot = entry.hash & mask;
      while (larger[slot].hash != kUnused) slot = (slot + 1) & mask;
      larger[slot] = entry;
    }
    entries_ = std::move(larger);
  }

  std::vector<Entry> entries_;
  std::size_t used_ = 0;
};

}  // namespace scene
