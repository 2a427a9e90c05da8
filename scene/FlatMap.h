// A small hash table for names: open addressing, no removal. Its order is never asked for.
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
  // Null where the key was never asked for by At.
  const Value* Find(std::uint64_t number, std::string_view name) const {
    if (entries_.empty()) return nullptr;
    const Entry& entry = entries_[SlotOf(entries_, number, name)];
    return entry.used ? &entry.value : nullptr;
  }

  // Valid until the next call.
  Value& At(std::uint64_t number, std::string_view name) {
    if ((used_ + 1) * 3 > entries_.size() * 2) Grow();
    Entry& entry = entries_[SlotOf(entries_, number, name)];
    if (!entry.used) {
      entry = {name, Value{}, number, true};
      ++used_;
    }
    return entry.value;
  }

 private:
  struct Entry {
    std::string_view name;
    Value value{};
    std::uint64_t number = 0;
    bool used = false;
  };

  static std::size_t SlotOf(const std::vector<Entry>& entries, std::uint64_t number, std::string_view name) {
    const std::size_t mask = entries.size() - 1;
    std::size_t slot = static_cast<std::size_t>(HashOf(name, number)) & mask;
    while (entries[slot].used && (entries[slot].number != number || entries[slot].name != name)) {
      slot = (slot + 1) & mask;
    }
    return slot;
  }

  void Grow() {
    std::vector<Entry> larger(entries_.empty() ? 16 : entries_.size() * 2);
    for (const Entry& entry : entries_) {
      if (entry.used) larger[SlotOf(larger, entry.number, entry.name)] = entry;
    }
    entries_ = std::move(larger);
  }

  std::vector<Entry> entries_;
  std::size_t used_ = 0;
};

}  // namespace scene
