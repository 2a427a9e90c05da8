// The registry of live objects, and the ledger that the host reads from it.
#include <cstdint>
#include <new>
#include <string>

#include "hostutil/HostSetup.h"
#include "hostutil/RegistryInternal.h"

namespace hostutil {
namespace {

// Objects in the order in which they were made.
struct Chain {
  LiveObject* first = nullptr;
  LiveObject* last = nullptr;
};

// Texts are not part of the ledger. They have a chain of their own, so that a ledger need not pass over them.
constinit Chain held;
constinit Chain texts;

Chain& ChainOf(LiveObject::Kind kind) { return kind == LiveObject::Kind::Text ? texts : held; }

void DestroyAll(const Chain& chain) {
  while (chain.first != nullptr) {
    // An object takes itself out of its chain when it goes.
    // NOLINTNEXTLINE(clang-analyzer-cplusplus.NewDelete)
    delete chain.first;
  }
}

// Without the memory for a description, the ledger still names the kind.
std::string DescribeOrName(const LiveObject& object) {
  try {
    return object.Describe();
  } catch (const std::bad_alloc&) {
    return object.GetKind() == LiveObject::Kind::File ? "file" : "list";
  }
}

}  // namespace

LiveObject::LiveObject(Kind kind) : previous_(ChainOf(kind).last), kind_(kind) {
  Chain& chain = ChainOf(kind);
  (previous_ != nullptr ? previous_->next_ : chain.first) = this;
  chain.last = this;
}

LiveObject::~LiveObject() {
  Chain& chain = ChainOf(kind_);
  (previous_ != nullptr ? previous_->next_ : chain.first) = next_;
  (next_ != nullptr ? next_->previous_ : chain.last) = previous_;
}

}  // namespace hostutil

void HostVisitLedger(HostLedgerVisitor visitor, void* context) {
  if (visitor == nullptr) return;
  for (const hostutil::LiveObject* object = hostutil::held.first; object != nullptr;
       object = object->Next()) {
    const std::string description = hostutil::DescribeOrName(*object);
    visitor(context, static_cast<std::int32_t>(object->GetKind()), description.c_str(),
            object->ReleaseFailed() ? 1 : 0);
  }
}

void HostReleaseLeftovers(void) {
  hostutil::DestroyAll(hostutil::held);
  hostutil::DestroyAll(hostutil::texts);
}
