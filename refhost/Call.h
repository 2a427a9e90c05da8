// One suite call, from its count to its line in the trace.
//
// A thunk makes a Call, does its work when goesOn() says so, describes itself when traced() says so, and
// returns finish(). The work refuses what breaks the contract of the operation: each refusal has a code and a
// sentence. finish() throws when the rehearsal asks for an exception, so it comes last.
//
// The operations that an import makes for every key are Calls too, but only where one is rehearsed or traced;
// see perform() below.
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

// Refusals of the live host: each records a sentence that begins with the operation's name, and returns the
// code. `what` names the part of the call that is refused, such as "the parent".
[[gnu::cold]] HostError refuse(Operation operation, HostError code, const std::string& sentence);
[[gnu::cold]] HostError refuseHandle(Operation operation, const void* handle, HandleKind wanted,
                                     const char* what);
[[gnu::cold]] HostError refuseNull(Operation operation, const char* what);
[[gnu::cold]] HostError refusePluginId(Operation operation, std::int32_t pluginId);
[[gnu::cold]] HostError refuseNotFinite(Operation operation, const char* what);

class Call {
 public:
  explicit Call(Operation operation) : host_(HostState::live()), operation_(operation) {
    if (host_.rehearsal.count(operation)) judge();
  }
  Call(const Call&) = delete;
  Call& operator=(const Call&) = delete;

  HostState& host() { return host_; }
  Operation operation() const { return operation_; }

  // False when the rehearsal has the call do nothing. A call that then returns 0 hands out null and 0.
  template <typename... Outs>
  bool goesOn(Outs*... outs) {
    if (!rehearsed_) return true;
    handOutNothing(outs...);
    return false;
  }

  // Sets the places to null and 0, unless the call fails.
  template <typename... Outs>
  void handOutNothing(Outs*... outs) {
    if (!failed()) ((outs != nullptr ? void(*outs = Outs{}) : void()), ...);
  }

  // Whether the call did what it was asked for.
  bool didItsWork() const { return !rehearsed_ && error_ == 0; }
  bool failed() const { return throws() || error_ != 0; }

  void refuse(HostError code, const std::string& sentence) {
    error_ = refhost::refuse(operation_, code, sentence);
  }

  // Makes the call return the code, without a sentence of its own.
  void fail(HostError code) { error_ = code; }

  // The objects of handles. Null after a refusal that says what is wrong; `what` names the handle's part
  // in the call, such as "the parent".
  Composition* composition(VOR_CompItem* handle, const char* what = "the composition");
  Item* item(VOR_Item* handle, const char* what);
  Layer* layer(VOR_Layer* handle, const char* what = "the layer") {
    Layer* found = host_.layer(handle);
    if (found == nullptr) refuseHandle(handle, HandleKind::Layer, what);
    return found;
  }
  HeldStream* stream(VOR_Stream* handle, const char* what = "the stream") {
    HeldStream* found = host_.streams.find(handle);
    if (found == nullptr) refuseHandle(handle, HandleKind::Stream, what);
    return found;
  }
  Batch* batch(VOR_AddKeyframesInfo* handle) {
    Batch* found = host_.batches.find(handle);
    if (found == nullptr) refuseHandle(handle, HandleKind::Batch, "the batch");
    return found;
  }
  MemoryBlock* memory(HostMemHandle* handle);
  bool isStore(HostPrefsStore* handle);

  // False after a refusal.
  bool given(const void* pointer, const char* what) {
    if (pointer == nullptr) error_ = refuseNull(operation_, what);
    return pointer != nullptr;
  }
  bool isPluginId(std::int32_t pluginId) {
    const bool right = pluginId == host_.options.pluginId;
    if (!right) error_ = refusePluginId(operation_, pluginId);
    return right;
  }
  bool areFinite(const double* values, std::int32_t count, const char* what) {
    const bool taken = host_.takesNumbers(values, count);
    if (!taken) error_ = refuseNotFinite(operation_, what);
    return taken;
  }

  // The line to describe the arguments in, null when there is no trace.
  TraceLine* traced() { return host_.trace.on() ? &startLine() : nullptr; }
  // The same for the basic suite's operations, whose suite is an argument.
  TraceLine* traced(const char* suite, std::int32_t version);

  HostError finish() {
    if (line_ != nullptr || rehearsed_) conclude();
    return error_;
  }

 private:
  bool throws() const { return kind_ != Failure::Kind::Code; }
  void judge();
  TraceLine& startLine();
  void refuseHandle(const void* handle, HandleKind wanted, const char* what) {
    error_ = refhost::refuseHandle(operation_, handle, wanted, what);
  }
  void conclude();

  HostState& host_;
  TraceLine* line_ = nullptr;  // the host's, while this call writes it
  HostError error_ = 0;
  Operation operation_;
  Failure::Kind kind_ = Failure::Kind::Code;  // any other is thrown at the end
  bool rehearsed_ = false;
};

// perform() for an operation that is rehearsed or traced.
template <typename Task, typename... Arguments>
[[gnu::cold, gnu::noinline]] HostError performWatched(Arguments... arguments) {
  Call call(Task::kOperation);
  if (call.goesOn()) {
    call.fail(Task::work(call.host(), arguments...));
  } else {
    Task::idle(call, arguments...);
  }
  if (TraceLine* line = call.traced()) Task::describe(*line, arguments...);
  return call.finish();
}

// An operation that imports call for every key; its suite's table holds perform<Task> itself. A task has the
// operation's number and three functions: work() does the operation and returns its code, idle() is for a
// call that does nothing in a rehearsal, describe() adds the arguments to the trace. work() tail-calls its
// refusals, so that an ordinary call needs no stack.
template <typename Task, typename... Arguments>
HostError perform(Arguments... arguments) {
  HostState& host = HostState::live();
  if (host.watched()) [[unlikely]]
    return performWatched<Task>(arguments...);
  host.rehearsal.count(Task::kOperation);
  return Task::work(host, arguments...);
}

}  // namespace refhost
