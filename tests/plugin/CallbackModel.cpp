#include "tests/plugin/CallbackModel.h"

#include <utility>

#include "hostapi/ErrorCodes.h"
#include "tests/support/BuilderRun.h"

namespace testsupport {
namespace {

using refhost::Failure;

std::string WithError(const std::string& line, const std::string& error) {
  return WithoutError(line) + ",\"error\":" + error + "}";
}

std::string With(std::string line, std::string_view key, std::string_view replacement) {
  const std::string_view value = Field(line, key);
  if (value.empty()) return line;
  return line.replace(static_cast<std::size_t>(value.data() - line.data()), value.size(), replacement);
}

std::string WithNull(const std::string& line, std::string_view key) { return With(line, key, "null"); }

bool IsReported(const Way& way) {
  return way.kind == Failure::Kind::BadAlloc || way.kind == Failure::Kind::RuntimeError;
}

// The line of a call that fails: it hands nothing out.
std::string Failed(const std::string& line, const std::string& error) {
  const std::string call = CallName(line);
  std::string failed = WithError(line, error);
  if (call == "GetAppPrefsBlob") return WithNull(failed, "store");
  if (call == "GetPrefLong") return WithNull(failed, "value");
  if (call == "RegisterImporterName") return WithNull(failed, "importer");
  return failed;
}

// Without a store the host answers with the default.
void LoseTheStore(std::vector<std::string>* calls) {
  bool lost = false;
  for (std::string& line : *calls) {
    const std::string call = CallName(line);
    if (call == "GetAppPrefsBlob") lost = !Succeeded(line);
    if (call != "GetPrefLong" || !lost) continue;
    if (Succeeded(line)) line = With(line, "value", Field(line, "default"));
    line = WithNull(line, "store");
  }
}

}  // namespace

CallbackModel::CallbackModel(std::vector<std::string> calls, HostError code, bool canImport)
    : good_(std::move(calls)), goodCode_(code), canImport_(canImport) {}

// A failure after that of the good run changes nothing of its code.
HostError CallbackModel::CodeAfter(const Way& way) const { return goodCode_ != 0 ? goodCode_ : way.code; }

Outcome CallbackModel::WhereCallsFail(std::size_t index, const Way& way, bool onwards) const {
  const bool thrown = way.kind != Failure::Kind::Code;
  Outcome outcome;
  outcome.calls = FirstCalls(index);
  std::size_t end = index;  // of the good run: the call whose failure ends it
  while (end < good_.size() && !thrown && IsCodeIgnored(good_, end)) ++end;
  const std::size_t lastFailed = onwards ? end : index;
  if (!onwards && end != index) end = good_.size();
  for (std::size_t i = index; i < end; ++i) {
    outcome.calls.push_back(i <= lastFailed ? Failed(good_[i], way.error) : good_[i]);
  }
  outcome.code = goodCode_;
  outcome.canImport = canImport_;
  if (end < good_.size()) {
    const bool endsSilence = CallName(good_[end]) == "EndSilentErrors";
    outcome.calls.push_back(Failed(good_[end], way.error));
    for (const std::string& call : HeldAfter(good_, end + 1, true).CleanUp()) {
      outcome.calls.push_back(WithError(call, onwards ? way.error : "0"));
    }
    outcome.code = endsSilence ? CodeAfter(way) : way.code;
    if (!thrown && CallName(good_[end]) == "AcquireSuite") outcome.code = HOST_ERR_MISSING_SUITE;
    outcome.canImport = endsSilence && canImport_;
    const bool shown = IsReported(way) && !endsSilence;  // what is shown while silent is not shown
    outcome.reported = shown ? way.code : 0;
  }
  LoseTheStore(&outcome.calls);
  return outcome;
}

Outcome CallbackModel::WhereAServiceFails(std::string_view service, std::size_t place, const Way& way) const {
  const bool thrown = way.kind != Failure::Kind::Code;
  const bool disposal = service == "FileDispose";
  Outcome outcome;
  outcome.calls = FirstCalls(place);
  const HeldByCallback held = HeldAfter(good_, place, false);
  for (const std::string& call : held.CleanUp()) outcome.calls.push_back(WithError(call, "0"));
  const bool late = disposal || (service == "FileClose" && !thrown);
  outcome.code = late ? CodeAfter(way) : way.code;
  outcome.canImport = disposal && canImport_;
  outcome.files = disposal ? 1 : 0;
  outcome.reported = IsReported(way) && !held.IsSilent() ? way.code : 0;
  if (service == "RegisterStringTable" && !thrown) outcome.calls = CallsWithoutImporter();
  return outcome;
}

// Without its texts the plug-in registers no importer.
std::vector<std::string> CallbackModel::CallsWithoutImporter() const {
  std::vector<std::string> calls = good_;
  std::erase_if(calls, [](const std::string& line) {
    return Field(line, "suite") == "\"QZGP File Import Manager Suite\"";
  });
  return calls;
}

std::vector<std::string> CallbackModel::FirstCalls(std::size_t count) const {
  return {good_.begin(), good_.begin() + static_cast<std::ptrdiff_t>(count)};
}

}  // namespace testsupport
