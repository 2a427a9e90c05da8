#include "refhost/Call.h"

#include <new>
#include <stdexcept>

#include "refhost/Rehearsal.h"

namespace refhost {
namespace {

// No code outside this file can name it in a catch.
struct OtherException {};

}  // namespace

HostError refuse(Operation operation, HostError code, const std::string& sentence) {
  HostState::live().refuse(std::string(factsOf(operation).name) + ": " + sentence);
  return code;
}

HostError refuseHandle(Operation operation, const void* handle, HandleKind wanted, const char* what) {
  HostState& host = HostState::live();
  const HandleKind kind = host.codec.kindOf(handle);
  const bool stale = host.streams.wasGivenBack(handle) || host.batches.wasGivenBack(handle) ||
                     host.memory.wasGivenBack(handle);
  std::string sentence = what;
  if (handle == nullptr) {
    sentence += " is a null handle";
  } else if (kind == HandleKind::None) {
    sentence += " is no handle of this host";
  } else if (kind != wanted) {
    sentence += " is " + host.codec.describe(handle) + ", which is no " + kindName(wanted) + " handle";
  } else if (stale) {
    sentence += " is " + host.codec.describe(handle) + ", which was given back before";
  } else {
    sentence += " is " + host.codec.describe(handle) + ", which was never handed out";
  }
  return refuse(operation, HOST_ERR_BAD_HANDLE, sentence);
}

HostError refuseNull(Operation operation, const char* what) {
  return refuse(operation, HOST_ERR_BAD_POINTER, std::string(what) + " is a null pointer");
}

HostError refusePluginId(Operation operation, std::int32_t pluginId) {
  return refuse(operation, HOST_ERR_BAD_PLUGIN_ID,
                "the plug-in id " + std::to_string(pluginId) + " is not " +
                    std::to_string(HostState::live().options.pluginId));
}

HostError refuseNotFinite(Operation operation, const char* what) {
  return refuse(operation, HOST_ERR_BAD_VALUE, std::string(what) + " is not finite");
}

Composition* Call::composition(VOR_CompItem* handle, const char* what) {
  Composition* found = host_.codec.isOf(HandleKind::Comp, handle)
                           ? host_.editor.composition(HandleCodec::lastingNumber(handle))
                           : nullptr;
  if (found == nullptr) refuseHandle(handle, HandleKind::Comp, what);
  return found;
}

Item* Call::item(VOR_Item* handle, const char* what) {
  Item* found = host_.codec.isOf(HandleKind::Item, handle)
                    ? host_.editor.item(HandleCodec::lastingNumber(handle))
                    : nullptr;
  if (found == nullptr) refuseHandle(handle, HandleKind::Item, what);
  return found;
}

MemoryBlock* Call::memory(HostMemHandle* handle) {
  MemoryBlock* found = host_.memory.find(handle);
  if (found == nullptr) refuseHandle(handle, HandleKind::Memory, "the memory handle");
  return found;
}

bool Call::isStore(HostPrefsStore* handle) {
  const bool known =
      host_.codec.isOf(HandleKind::Store, handle) && HandleCodec::lastingNumber(handle) == kStoreNumber;
  if (!known) refuseHandle(handle, HandleKind::Store, "the preference store");
  return known;
}

void Call::judge() {
  const Verdict verdict = host_.rehearsal.judge(operation_);
  rehearsed_ = verdict.rehearsed;
  error_ = verdict.code;
  kind_ = verdict.kind;
}

TraceLine& Call::startLine() {
  const OperationFacts& facts = factsOf(operation_);
  return *traced(facts.suite, facts.version);
}

TraceLine* Call::traced(const char* suite, std::int32_t version) {
  if (!host_.trace.on()) return nullptr;
  line_ = &host_.traceLine.emplace(host_.codec, factsOf(operation_).name, didItsWork());
  line_->text("suite", suite).integer("version", version);
  return line_;
}

void Call::conclude() {
  if (line_ != nullptr) {
    if (throws()) {
      line_->text("error", kindName(kind_));
    } else {
      line_->integer("error", error_);
    }
    line_->end();
    host_.trace.write(*line_);
  }
  switch (kind_) {
    case Failure::Kind::Code:
      return;
    case Failure::Kind::BadAlloc:
      throw std::bad_alloc();
    case Failure::Kind::RuntimeError:
      throw std::runtime_error(std::string("rehearsed failure of ") + factsOf(operation_).name);
    case Failure::Kind::Other:
      throw OtherException();
  }
}

}  // namespace refhost
