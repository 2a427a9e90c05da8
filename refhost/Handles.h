// Handles: opaque pointers that are never addresses.
//
// A handle packs its kind, its trace number and, for what can be given back, the slot of its object. To check
// one takes a mask, a comparison and a table look-up by index. No handle is ever dereferenced, so a foreign
// pointer is recognised safely. A slot is used again after its handle was given back, with a new number: the
// old handle is still recognised as stale.
//
// With 64-bit pointers the top byte makes every handle a non-canonical address and holds the low six bits of
// the host's serial number, so that a handle of an earlier host is foreign (until 64 hosts later). With
// 32-bit pointers neither fits: a handle of an earlier host is taken for one of this host, and after 8192
// acquisitions a stale handle may be taken for a live one.
#pragma once

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <string>
#include <utility>
#include <vector>

namespace refhost {

enum class HandleKind : std::uint8_t { None, Item, Comp, Layer, Stream, Batch, Memory, Store };

const char* kindName(HandleKind kind);  // as in the trace: "item", "comp", ...

class HandleCodec {
 public:
  static constexpr bool kWide = sizeof(std::uintptr_t) == 8;
  static constexpr unsigned kKindBits = 3;
  static constexpr unsigned kSlotBits = kWide ? 21 : 16;
  static constexpr unsigned kNumberBits = kWide ? 32 : 13;
  static constexpr unsigned kMarkShift = kKindBits + kSlotBits + kNumberBits;
  static constexpr std::uintptr_t kKindMask = (std::uintptr_t{1} << kKindBits) - 1;
  static constexpr std::uintptr_t kSlotMask = (std::uintptr_t{1} << kSlotBits) - 1;
  static constexpr std::uintptr_t kNumberMask = (std::uintptr_t{1} << kNumberBits) - 1;

  explicit HandleCodec(unsigned hostSerial) {
    if constexpr (kWide) {
      constexpr std::uintptr_t kNonCanonical = 0x80;
      constexpr std::uintptr_t kSerialMask = 0x3f;
      mark_ = (kNonCanonical | (hostSerial & kSerialMask)) << kMarkShift;
    }
  }

  // For kinds that live as long as the project: the number alone.
  std::uintptr_t lasting(HandleKind kind, std::size_t number) const {
    return mark_ | (static_cast<std::uintptr_t>(number) << kKindBits) | static_cast<std::uintptr_t>(kind);
  }

  // For kinds that are given back: slot and number.
  std::uintptr_t held(HandleKind kind, std::size_t slot, std::uint32_t number) const {
    return mark_ | ((number & kNumberMask) << (kKindBits + kSlotBits)) |
           (static_cast<std::uintptr_t>(slot) << kKindBits) | static_cast<std::uintptr_t>(kind);
  }

  bool isOf(HandleKind kind, const void* handle) const {
    return (bits(handle) & tagMask()) == (mark_ | static_cast<std::uintptr_t>(kind));
  }

  // The parts of a handle of which isOf() is true.
  static std::size_t lastingNumber(const void* handle) {
    return static_cast<std::size_t>((bits(handle) & ~tagMask()) >> kKindBits);
  }
  static std::size_t heldSlot(const void* handle) {
    return static_cast<std::size_t>((bits(handle) >> kKindBits) & kSlotMask);
  }
  static std::uintptr_t heldNumber(const void* handle) {
    return (bits(handle) >> (kKindBits + kSlotBits)) & kNumberMask;
  }

  HandleKind kindOf(const void* handle) const;  // None when it is not a handle of this host

  // "layer:7"; "foreign" when it is not a handle of this host. The handle is not null.
  std::string describe(const void* handle) const;

 private:
  static std::uintptr_t bits(const void* handle) { return reinterpret_cast<std::uintptr_t>(handle); }
  static constexpr std::uintptr_t tagMask() {
    if constexpr (kWide) return kKindMask | (std::uintptr_t{0xff} << kMarkShift);
    return kKindMask;
  }

  std::uintptr_t mark_ = 0;
};

// The live objects of one kind that is handed out and given back, each in a slot. Pointers to objects are
// valid until the next add().
template <typename Object>
class HandlePool {
 public:
  HandlePool(const HandleCodec& codec, HandleKind kind) : codec_(codec), kind_(kind) {}

  Object* find(const void* handle) {
    // The slot holds the whole handle, so that one comparison checks kind, host, number and life. The handle
    // in a free slot names another slot, so it is never found.
    const std::size_t slot = HandleCodec::heldSlot(handle);
    if (slot >= slotCount_ || slots_[slot].handle != handle) [[unlikely]]
      return nullptr;
    return &slots_[slot].object;
  }

  // Whether the handle was handed out and given back since.
  bool wasGivenBack(const void* handle) {
    return codec_.isOf(kind_, handle) && find(handle) == nullptr &&
           HandleCodec::heldSlot(handle) < slots_.size() && HandleCodec::heldNumber(handle) != 0 &&
           (HandleCodec::heldNumber(handle) <= handedOut_ || !HandleCodec::kWide);
  }

  // Hands out a new handle and its object, which is blank. Null when there are no more numbers or
  // slots.
  Object* add(void** handle) { return makeFreeSlot() ? addToFreeSlot(handle) : nullptr; }

  // add() in steps: checks for a free slot; makes one, false when there are no more numbers or slots; hands
  // out the free slot, which must exist.
  bool hasFreeSlot() const { return firstFree_ != kNoSlot && handedOut_ != UINT32_MAX; }
  [[gnu::cold]] bool makeFreeSlot() {
    return handedOut_ != UINT32_MAX && (firstFree_ != kNoSlot || makeSlot());
  }
  Object* addToFreeSlot(void** handle) {
    const std::size_t index = firstFree_;
    Slot& slot = slots_[index];
    firstFree_ = slot.nextFree;
    slot.number = ++handedOut_;
    *handle = slot.handle = reinterpret_cast<void*>(codec_.held(kind_, index, handedOut_));
    return &slot.object;
  }

  // The handle is live.
  void remove(const void* handle) { release(HandleCodec::heldSlot(handle)); }

  template <typename Predicate>
  bool any(Predicate predicate) const {
    return std::any_of(slots_.begin(), slots_.end(),
                       [&](const Slot& slot) { return slot.number != 0 && predicate(slot.object); });
  }

  std::uint32_t handedOut() const { return handedOut_; }

  // The numbers and objects that are still held, in the order in which they were handed out.
  std::vector<std::pair<std::uint32_t, Object*>> held() {
    std::vector<std::pair<std::uint32_t, Object*>> all;
    for (Slot& slot : slots_) {
      if (slot.number != 0) all.emplace_back(slot.number, &slot.object);
    }
    std::sort(all.begin(), all.end(), [](const auto& a, const auto& b) { return a.first < b.first; });
    return all;
  }

  void removeAll() {
    firstFree_ = kNoSlot;
    for (std::size_t slot = slots_.size(); slot-- > 0;) release(slot);
  }

 private:
  struct Slot {
    void* handle = freeHandle();
    std::uint32_t number = 0;    // 0: free
    std::uint32_t nextFree = 0;  // of a free slot: the next one, or kNoSlot
    Object object{};
  };
  static constexpr std::uint32_t kNoSlot = UINT32_MAX;

  // Names the last slot, which no pool ever makes.
  static void* freeHandle() { return reinterpret_cast<void*>(UINTPTR_MAX); }

  bool makeSlot() {
    const std::size_t index = slots_.size();
    if (index >= HandleCodec::kSlotMask) return false;
    slots_.emplace_back().nextFree = kNoSlot;
    ++slotCount_;
    firstFree_ = static_cast<std::uint32_t>(index);
    return true;
  }

  void release(std::size_t index) {
    Slot& slot = slots_[index];
    clear(slot.object);
    slot.handle = freeHandle();
    slot.number = 0;
    slot.nextFree = firstFree_;
    firstFree_ = static_cast<std::uint32_t>(index);
  }

  // Makes an object blank. An object with clear() may keep memory for the next one in its slot.
  static void clear(Object& object) {
    if constexpr (requires { object.clear(); }) {
      object.clear();
    } else {
      object = Object{};
    }
  }

  const HandleCodec& codec_;
  HandleKind kind_;
  std::uint32_t handedOut_ = 0;
  std::vector<Slot> slots_;
  std::uint32_t slotCount_ = 0;
  std::uint32_t firstFree_ = kNoSlot;
};

}  // namespace refhost
