#include "refhost/Handles.h"

namespace refhost {
namespace {

constexpr const char* kKindNames[] = {"foreign", "item", "comp", "layer", "stream", "batch", "mem", "store"};
constexpr std::uintptr_t kLastKind = static_cast<std::uintptr_t>(HandleKind::Store);

bool isGivenBack(HandleKind kind) {
  return kind == HandleKind::Stream || kind == HandleKind::Batch || kind == HandleKind::Memory;
}

}  // namespace

const char* kindName(HandleKind kind) { return kKindNames[static_cast<std::size_t>(kind)]; }

HandleKind HandleCodec::kindOf(const void* handle) const {
  if ((bits(handle) & tagMask() & ~kKindMask) != mark_) return HandleKind::None;
  const std::uintptr_t kind = bits(handle) & kKindMask;
  static_assert(kLastKind == kKindMask, "every value of the kind's bits is a kind");
  return static_cast<HandleKind>(kind);
}

std::string HandleCodec::describe(const void* handle) const {
  const HandleKind kind = kindOf(handle);
  if (kind == HandleKind::None) return kindName(kind);
  const std::uintptr_t number = isGivenBack(kind) ? heldNumber(handle) : lastingNumber(handle);
  return std::string(kindName(kind)) + ":" + std::to_string(number);
}

}  // namespace refhost
