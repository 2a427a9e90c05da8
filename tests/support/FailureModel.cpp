#include "tests/support/FailureModel.h"

#include <algorithm>

namespace testsupport {
namespace {

// The suites in the order in which they are released.
constexpr std::string_view kReleaseOrder[] = {
    "\"QZGP Utility Suite\"7",
    "\"QZGP Memory Suite\"1",
    "\"QZGP Persistent Data Suite\"3",
    "\"QZGP Register Suite\"6",
    "\"QZGP File Import Manager Suite\"3",
    "\"QZGP Comp Suite\"21",
    "\"QZGP Comp Suite\"9",
    "\"QZGP Layer Suite\"10",
    "\"QZGP Camera Suite\"2",
    "\"QZGP Stream Suite\"7",
    "\"QZGP Stream Suite\"8",
    "\"QZGP Keyframe Suite\"3",
    "\"QZGP Keyframe Suite\"4",
};

std::string SuiteKey(std::string_view line) {
  return std::string(Field(line, "suite")) + std::string(Field(line, "version"));
}

std::size_t ReleasePlace(std::string_view line) {
  return static_cast<std::size_t>(
      std::find(std::begin(kReleaseOrder), std::end(kReleaseOrder), SuiteKey(line)) -
      std::begin(kReleaseOrder));
}

std::string Line(std::string_view call, std::string_view suite, int version, std::string_view rest) {
  return "{\"call\":\"" + std::string(call) + "\",\"suite\":\"" + std::string(suite) +
         "\",\"version\":" + std::to_string(version) + std::string(rest);
}

std::string ReleaseStreamLine(const std::string& stream) {
  return Line("ReleaseStream", "QZGP Stream Suite", 7, ",\"stream\":" + stream);
}

}  // namespace

std::string CallName(std::string_view line) {
  const std::string_view quoted = Field(line, "call");
  return std::string(quoted.substr(1, quoted.size() - 2));
}

std::string WithoutError(const std::string& line) { return line.substr(0, line.rfind(",\"error\":")); }

std::vector<std::string> WithoutErrors(const std::vector<std::string>& lines) {
  std::vector<std::string> stripped;
  for (const std::string& line : lines) stripped.push_back(WithoutError(line));
  return stripped;
}

bool Succeeded(std::string_view line) { return Field(line, "error") == "0"; }

void HeldByCallback::Take(std::string_view line, bool failed) {
  const std::string call = CallName(line);
  const std::string suite = std::string("{\"call\":\"ReleaseSuiteByName\",\"suite\":") +
                            std::string(Field(line, "suite")) +
                            ",\"version\":" + std::string(Field(line, "version"));
  if (call == "AcquireSuite") {
    if (!failed) (reading_ ? driverSuites_ : parserSuites_).emplace(ReleasePlace(line), suite);
  } else if (call == "ReleaseSuiteByName") {
    // The parser gives its suites back before the driver does.
    if (parserSuites_.erase({ReleasePlace(line), suite}) == 0) {
      driverSuites_.erase({ReleasePlace(line), suite});
    }
  } else if (call == "BeginSilentErrors") {
    silent_ = !failed;
  } else if (call == "EndSilentErrors") {
    silent_ = false;
  } else if (call == "NewMemHandle") {
    if (!failed) memory_ = Field(line, "handle");
  } else if (call == "LockMemHandle") {
    reading_ = false;
  } else if (call == "UnlockMemHandle") {
    unlocked_ = true;
  } else if (call == "FreeMemHandle") {
    memory_.clear();
  } else if (call == "NewCameraLayer") {
    if (!failed) cameraLayers_.emplace(Field(line, "layer"));
  } else if (call == "AcquireLayerStream") {
    if (!failed) TakeStream(line);
  } else if (call == "ReleaseStream") {
    std::erase_if(streams_, [&](const Stream& held) { return held.handle == Field(line, "stream"); });
  } else if (call == "GetStreamKeyframeCount") {
    if (!failed && Field(line, "count") != "0") streams_.back().left = true;
  } else if (call == "BeginKeyframeBatch") {
    if (!failed) batches_.emplace_back(Field(line, "batch"));
  } else if (call == "EndKeyframeBatch") {
    std::erase(batches_, Field(line, "batch"));
  }
}

void HeldByCallback::TakeStream(std::string_view line) {
  const std::string handle(Field(line, "stream"));
  const std::string layer(Field(line, "layer"));
  const std::string id(Field(line, "streamId"));
  const int before = acquisitions_[{layer, id}]++;
  const bool camera = cameraLayers_.count(layer) != 0;
  const bool unguarded = camera && before == 0 && (id == "1" || id == "11");
  streams_.push_back({handle, unguarded, id == "11" && !unguarded, false});
}

std::vector<std::string> HeldByCallback::EndsOfSilenceAndStream() const {
  std::vector<std::string> calls;
  if (silent_) calls.push_back(Line("EndSilentErrors", "QZGP Utility Suite", 7, ",\"report\":0"));
  for (const Stream& stream : streams_) {
    if (!stream.unguarded && !stream.zoom) calls.push_back(ReleaseStreamLine(stream.handle));
  }
  return calls;
}

std::vector<std::string> HeldByCallback::Unwinding() const {
  std::vector<std::string> calls = EndsOfSilenceAndStream();
  for (const Suite& suite : parserSuites_) calls.push_back(suite.second);
  for (const Suite& suite : driverSuites_) calls.push_back(suite.second);
  return calls;
}

std::size_t HeldByCallback::LeftOpen() const {
  const auto zooms = std::count_if(streams_.begin(), streams_.end(),
                                   [](const Stream& held) { return held.zoom && !held.left; });
  return batches_.size() + static_cast<std::size_t>(zooms) + (memory_.empty() ? 0 : 1);
}

std::vector<std::string> HeldByCallback::CleanUp() const {
  std::vector<std::string> calls = EndsOfSilenceAndStream();
  for (const std::string& batch : batches_) {
    calls.push_back(Line("EndKeyframeBatch", "QZGP Keyframe Suite", 3, ",\"commit\":1,\"batch\":" + batch));
  }
  for (const Stream& stream : streams_) {
    if (stream.zoom && !stream.left) calls.push_back(ReleaseStreamLine(stream.handle));
  }
  for (const Suite& suite : parserSuites_) calls.push_back(suite.second);
  if (!memory_.empty()) {
    const std::string handle = ",\"handle\":" + memory_;
    if (!unlocked_) calls.push_back(Line("UnlockMemHandle", "QZGP Memory Suite", 1, handle));
    calls.push_back(Line("FreeMemHandle", "QZGP Memory Suite", 1, handle));
  }
  for (const Suite& suite : driverSuites_) calls.push_back(suite.second);
  return calls;
}

std::size_t LeftOpen(const refhost::CallbackResult& result) {
  const auto& leftovers = result.leftovers;
  return static_cast<std::size_t>(
      std::count_if(leftovers.begin(), leftovers.end(), [](const auto& left) { return !left.keptByDesign; }));
}

HeldByCallback HeldAfter(const std::vector<std::string>& trace, std::size_t count, bool lastFailed) {
  HeldByCallback held;
  for (std::size_t i = 0; i < count; ++i) held.Take(trace[i], lastFailed && i + 1 == count);
  return held;
}

CallFacts::CallFacts(std::string_view line) : call(CallName(line)), batch(Field(line, "batch")) {
  if (call == "AcquireSuite" || call == "ReleaseSuiteByName") held = SuiteKey(line);
  if (call == "AcquireLayerStream" || call == "ReleaseStream") held = Field(line, "stream");
  if (call == "BeginKeyframeBatch" || call == "EndKeyframeBatch") held = batch;
  if (call == "NewMemHandle" || call == "FreeMemHandle") held = Field(line, "handle");
  if (call == "SetBatchKeyframeValue") index = Field(line, "index");
}

void MadeCount::Take(const CallFacts& facts) {
  const std::string& call = facts.call;
  if (call == "CreateComp") ++made_.compositions;
  if (call == "NewCameraLayer" || call == "NewNullLayer" || call == "AddLayerFromItem") ++made_.layers;
  if (call == "SetBatchKeyframeValue") keyed_[facts.batch].insert(facts.index);
  if (call == "EndKeyframeBatch") made_.keys += keyed_[facts.batch].size();
  if (facts.held.empty()) return;
  const bool takes = call == "AcquireSuite" || call == "AcquireLayerStream" || call == "BeginKeyframeBatch" ||
                     call == "NewMemHandle";
  if (takes) {
    held_.insert(facts.held);
  } else if (const auto found = held_.find(facts.held); found != held_.end()) {
    held_.erase(found);
  }
}

Made MadeCount::made() const {
  Made made = made_;
  made.leftovers = std::set<std::string>(held_.begin(), held_.end()).size();
  return made;
}

Made MadeBy(const std::vector<std::string>& trace, std::size_t idle) {
  MadeCount count;
  for (std::size_t i = 0; i < trace.size(); ++i) {
    if (i != idle && Succeeded(trace[i])) count.Take(CallFacts(trace[i]));
  }
  return count.made();
}

}  // namespace testsupport
