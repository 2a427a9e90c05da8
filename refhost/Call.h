// One suite call, from its count to its line in the trace.
//
// A thunk makes a Call, does its work when goesOn() says so, describes itself when traced() says so, and
// returns finish(). The work refuses what breaks a promise: each refusal has a code and a sentence. finish()
// throws when the rehearsal asked for an exception, so nothing that has to happen may come after it.
#pragma once

#include <cstddef>
#include <cstdint>
#include <string>

#include "hostapi/ErrorCodes.h"
#include "refhost/HostState.h"
#include "refhost/Operations.h"

namespace refhost {

// The number of the one preference store, in its handle.
inline constexpr std::size_t kStoreNumber = 1;

class Call {
 public:
  explicit Call(Operation operation) : host_(HostState::live()), operation_(operation) {
    if (host_.rehearsal.count(operation)) [[unlikely]]
      judge();
  }
  Call(const Call&) = delete;
  Call& operator=(const Call&) = delete;

  HostState& host() { return host_; }

  // False when the rehearsal has the call do nothing. A call that then returns 0 hands out null and 0.
  template <typename... Outs>
  bool goesOn(Outs*... outs) {
    if (!rehearsed_) return true;
    if (!throws() && error_ == 0) ((outs != nullptr ? void(*outs = Outs{}) : void()), ...);
    return false;
  }

  // Whether the call did what it was asked for.
  bool didItsWork() const { return !rehearsed_ && error_ == 0; }
  bool failed() const { return throws() || error_ != 0; }

  [[gnu::cold]] void refuse(HostError code, const std::string& sentence);

  // A refusal with a code of its own that is nobody's broken promise.
  void fail(HostError code) { error_ = code; }

  // The objects behind handles. Null after a refusal that says what is wrong; `what` names the handle's part
  // in the call, such as "the parent".
  Composition* composition(VOR_CompItem* handle, const char* what = "the composition");
  Item* item(VOR_Item* handle, const char* what);
  Layer* layer(VOR_Layer* handle, const char* what = "the layer") {
    if (host_.codec.isOf(HandleKind::Layer, handle)) [[likely]] {
      Layer* found = host_.editor.layer(HandleCodec::lastingNumber(handle));
      if (found != nullptr) [[likely]]
        return found;
    }
    refuseHandle(handle, HandleKind::Layer, what);
    return nullptr;
  }
  HeldStream* stream(VOR_Stream* handle, const char* what = "the stream") {
    HeldStream* found = host_.streams.find(handle);
    if (found == nullptr) [[unlikely]]
      refuseHandle(handle, HandleKind::Stream, what);
    return found;
  }
  Batch* batch(VOR_AddKeyframesInfo* handle) {
    Batch* found = host_.batches.find(handle);
    if (found == nullptr) [[unlikely]]
      refuseHandle(handle, HandleKind::Batch, "the batch");
    return found;
  }
  MemoryBlock* memory(HostMemHandle* handle);
  bool isStore(HostPrefsStore* handle);

  // False after a refusal.
  bool given(const void* pointer, const char* what) {
    if (pointer == nullptr) [[unlikely]]
      refuseNull(what);
    return pointer != nullptr;
  }
  bool isPluginId(std::int32_t pluginId) {
    if (pluginId != host_.options.pluginId) [[unlikely]]
      refusePluginId(pluginId);
    return pluginId == host_.options.pluginId;
  }
  bool areFinite(const double* values, std::int32_t count, const char* what) {
    double zero = 0.0;  // 0 times what is not finite is not a number
    for (std::int32_t i = 0; i < count; ++i) zero += 0.0 * values[i];
    if (zero == 0.0 || host_.options.permissive) [[likely]]
      return true;
    refuseNotFinite(what);
    return false;
  }

  // The line to describe the arguments in, null when there is no trace.
  TraceLine* traced() { return host_.trace.on() ? &startLine() : nullptr; }
  // The same for the basic suite's operations, whose suite is an argument.
  TraceLine* traced(const char* suite, std::int32_t version);

  HostError finish() {
    if (line_ != nullptr || rehearsed_) [[unlikely]]
      conclude();
    return error_;
  }

 private:
  bool throws() const { return kind_ != Failure::Kind::Code; }
  void judge();
  [[gnu::cold]] TraceLine& startLine();
  [[gnu::cold]] void refuseHandle(const void* handle, HandleKind wanted, const char* what);
  [[gnu::cold]] void refuseNull(const char* what);
  [[gnu::cold]] void refusePluginId(std::int32_t pluginId);
  [[gnu::cold]] void refuseNotFinite(const char* what);
  [[gnu::cold]] void conclude();

  HostState& host_;
  TraceLine* line_ = nullptr;  // the host's, while this call writes it
  HostError error_ = 0;
  Operation operation_;
  Failure::Kind kind_ = Failure::Kind::Code;  // any other is thrown at the end
  bool rehearsed_ = false;
};

}  // namespace refhost
