// The state of the one live Host. The suites' thunks find it through a static pointer, because their tables
// have no context argument.
#pragma once

#include <cstdint>
#include <memory>
#include <optional>
#include <string>
#include <vector>

#include "hostapi/FileImportManagerSuite.h"
#include "hostapi/HostTypes.h"
#include "hostapi/RegisterSuite.h"
#include "refhost/Handles.h"
#include "refhost/Host.h"
#include "refhost/Limits.h"
#include "refhost/MessageLog.h"
#include "refhost/ModuleLoader.h"
#include "refhost/Preferences.h"
#include "refhost/ProjectEditor.h"
#include "refhost/RehearsalRunner.h"
#include "refhost/SuiteRegistry.h"
#include "refhost/Trace.h"

namespace refhost {

// One acquisition of a stream.
struct HeldStream {
  Layer* layer = nullptr;
  Stream* stream = nullptr;
  bool valueSet = false;       // the last SetStreamValue on this handle succeeded
  bool valueFailed = false;    // the last SetStreamValue on this handle failed or threw
  bool heldKeys = false;       // GetStreamKeyframeCount gave at least one key
  bool releaseFailed = false;  // a rehearsal made its ReleaseStream fail
};

struct FreeDelete {
  void operator()(void* memory) const { ::operator delete(memory); }
};

struct MemoryBlock {
  std::string name;
  std::int64_t size = 0;
  std::unique_ptr<void, FreeDelete> memory;
  std::int64_t locks = 0;
  std::int64_t failedLocks = 0;  // each allows one unlock more
  bool freeFailed = false;       // a rehearsal made its FreeMemHandle fail
};

// What a plug-in registered under one name.
struct Importer {
  std::string name;
  std::vector<std::string> extensions;
  HostImporterCallbacks callbacks{};
};

// Hidden, so that every call reaches the static pointer directly, without the table of exported symbols.
class [[gnu::visibility("hidden")]] HostState {
 public:
  explicit HostState(HostOptions given);
  ~HostState();
  HostState(const HostState&) = delete;
  HostState& operator=(const HostState&) = delete;

  static HostState& live() { return *live_; }

  VOR_Item* begin(Callback callback, const std::string& path);
  // canImport is written to the trace for verify only.
  CallbackResult end(HostError code, bool canImport);

  // Whether a call may be rehearsed or has to be traced. Set when a callback begins and ends.
  bool watched() const { return watched_; }

  // Null when there is none of that handle.
  Layer* layer(VOR_Layer * handle) {
    if (!codec.isOf(HandleKind::Layer, handle)) [[unlikely]]
      return nullptr;
    return editor.layer(HandleCodec::lastingNumber(handle));
  }

  // Whether the numbers are finite, or the host takes any.
  bool takesNumbers(const double* values, std::int32_t count) const {
    double zero = 0.0;  // 0 times a value that is not finite is NaN
    for (std::int32_t i = 0; i < count; ++i) zero += 0.0 * values[i];
    return zero == 0.0 || options.permissive;
  }

  // The same for a stream's value: as many numbers as it has dimensions. The others are 0 as a rule.
  bool takesValue(const StreamValueRecord& record, std::int32_t dimension) const {
    const double* const value = record.value;
    if (0.0 * value[0] + 0.0 * value[1] + 0.0 * value[2] == 0.0) [[likely]]
      return true;
    return takesNumbers(value, dimension);
  }

  void refuse(std::string sentence) { result.refusals.push_back(std::move(sentence)); }

  // An importer with callbacks, the first registered; null when there is none.
  const Importer* usableImporter() const;

  const HostOptions options;
  const HandleCodec codec;
  ProjectEditor editor;
  Allowance allowance;
  HandlePool<HeldStream> streams{codec, HandleKind::Stream};
  HandlePool<Batch> batches{codec, HandleKind::Batch};
  HandlePool<MemoryBlock> memory{codec, HandleKind::Memory};
  SuiteRegistry suites;
  RehearsalRunner rehearsal;
  Trace trace;
  std::optional<TraceLine> traceLine;  // of the call that runs; calls do not nest
  Preferences preferences;
  MessageLog messages;
  std::vector<Importer> importers;  // by id - 1
  HostDeathHook deathHook = nullptr;
  std::intptr_t deathHookRefcon = 0;
  ModuleLoader module;
  bool loaded = false;  // the entry was called

  Callback callback = Callback::Entry;  // the one that runs or ran last
  CallbackResult result;                // of the callback that runs, filled in as it goes

  // The number of the last stream that was handed out before version 8 of the stream suite could not be
  // acquired: from then on no stream up to this one could get a value.
  std::uint32_t streamsWithoutValueSuite = 0;
  std::int32_t linearUnits = 0;   // the preference "Use Linear Units" as handed out last; 0: never
  bool silenceEndFailed = false;  // a rehearsal made an EndSilentErrors of this callback fail

 private:
  bool watched_ = trace.on();

  static HostState* live_;
};

}  // namespace refhost
