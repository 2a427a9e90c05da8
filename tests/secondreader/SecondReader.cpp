// The callbacks, from the calls that the host makes to the calls that it gets.
#include "tests/secondreader/SecondReader.h"

#include <optional>

#include "tests/secondreader/Builder.h"
#include "tests/secondreader/PlayedFile.h"
#include "tests/secondreader/PlayedHost.h"
#include "tests/secondreader/SceneReader.h"
#include "tests/secondreader/SuiteUser.h"

namespace secondreader {
namespace {

constexpr std::size_t kLongestMessage = 1023;
constexpr std::size_t kHeaderBytes = 10;
constexpr std::string_view kHeader = "//Maya";
constexpr int kImporterName = 0;
constexpr int kOnlyMayaMessage = 1;

// Shows the message of the header test, unless it cannot be copied.
void showOnlyMaya(SuiteUser& suites) {
  HostError code = HOST_ERR_NONE;
  const bool nothing = suites.host().serviceFails("StringCopy", &code);
  const std::string text = nothing ? "" : suites.host().localized(kOnlyMayaMessage);
  if (code == HOST_ERR_NONE && text.size() <= kLongestMessage) suites.showMessage(text);
}

class Callbacks {
 public:
  Callbacks(const refhost::HostOptions& options, const std::string& path, std::string_view scene)
      : host_(options), path_(path), bytes_(scene) {}

  Prediction predict(int imports);

 private:
  template <typename Work>
  PredictedCallback run(refhost::Callback callback, Work work);

  void enter();
  void verify();
  void import();
  std::optional<PlayedFile> makeFile();
  HostError testHeader(SuiteUser& suites, std::optional<PlayedFile>& file, bool quiet, bool* isMaya);
  HostError readScene(SuiteUser& suites, std::optional<PlayedFile>& file, Handle* buffer, std::string* text);
  void parseAndBuild(bool hasFile, const std::string& text);
  HostError giveBack(SuiteUser& suites, Handle buffer);
  std::string fileName() const { return path_.substr(path_.rfind('/') + 1); }

  PlayedHost host_;
  std::string path_;
  std::string_view bytes_;
  Handle folder_ = 0;
  bool canImport_ = false;
};

const char* nameOf(refhost::Callback callback) {
  switch (callback) {
    case refhost::Callback::Entry:
      return "GPMain_MayaImport";
    case refhost::Callback::Verify:
      return "VerifyFileCallback";
    case refhost::Callback::Import:
      return "ImportFileCallback";
    case refhost::Callback::Death:
      break;
  }
  return "DeathHook";
}

// One callback between its two lines. The work's exceptions become its code.
template <typename Work>
PredictedCallback Callbacks::run(refhost::Callback callback, Work work) {
  const bool verifying = callback == refhost::Callback::Verify;
  const bool importing = callback == refhost::Callback::Import;
  PlayedLine entered("enter");
  entered.text("callback", nameOf(callback));
  if (verifying || importing) entered.text("path", path_);
  if (importing) {
    folder_ = ++host_.items;
    entered.handle("folder", "item", folder_);
  }
  host_.lines.push_back({entered.ended()});
  host_.plan.begin(callback);
  HostError code = HOST_ERR_EXCEPTION_OTHER;
  std::vector<std::string> leftBehind;
  try {
    code = host_.guarded(work);
  } catch (const UnknownException&) {
    leftBehind = host_.leftOpen();
  }
  host_.plan.end();
  PlayedLine left("leave");
  left.text("callback", nameOf(callback));
  if (verifying) left.plain("canImport", canImport_ ? "true" : "false");
  host_.lines.push_back({left.integer("error", code).ended()});
  PredictedCallback result{code,
                           canImport_,
                           std::move(host_.messages),
                           std::move(leftBehind),
                           host_.heldStreams.size() + host_.openBatches.size() +
                               (host_.heldMemory != 0 ? 1 : 0) + host_.keptSuites.size() + host_.keptMemory +
                               host_.files,
                           static_cast<int>(host_.plan.suiteCalls()),
                           host_.plan.counts()};
  host_.messages.clear();
  host_.silent = false;
  host_.heldStreams.clear();
  host_.openBatches.clear();
  host_.heldMemory = 0;
  host_.keptSuites.clear();
  host_.keptMemory = host_.files = 0;
  canImport_ = false;
  return result;
}

Prediction Callbacks::predict(int imports) {
  Prediction prediction;
  // What the host itself says while no importer is registered.
  prediction.verify.code = HOST_ERR_REGISTRATION;
  prediction.imports.assign(static_cast<std::size_t>(imports), prediction.verify);
  try {
    prediction.entry = run(refhost::Callback::Entry, [&] { enter(); });
    if (host_.importerUsable) prediction.verify = run(refhost::Callback::Verify, [&] { verify(); });
    for (PredictedCallback& result : prediction.imports) {
      if (host_.importerUsable) result = run(refhost::Callback::Import, [&] { import(); });
    }
    if (host_.deathHook) prediction.death = run(refhost::Callback::Death, [] {});
  } catch (const ProcessEnds&) {
    prediction.processEnds = true;
  }
  std::size_t keys = 0;
  for (const auto& [stream, times] : host_.keys) keys += times.size();
  prediction.made = {host_.importerName,
                     host_.extensions,
                     static_cast<std::size_t>(host_.comps),
                     host_.layers.size(),
                     keys,
                     host_.linearUnits,
                     host_.stringTable && !host_.deathHook};
  prediction.trace = std::move(host_.lines);
  return prediction;
}

void Callbacks::enter() {
  withSuites(host_, [&](SuiteUser& suites) {
    HostError table = HOST_ERR_NONE;
    host_.stringTable = !host_.serviceFails("RegisterStringTable", &table);
    bool store = false;
    suites.getAppPrefsBlob(&store);
    suites.getPrefLong(store);
    suites.registerDeathHook();
    check(table);
    Handle importer = 0;
    check(suites.registerImporterName(host_.localized(kImporterName), &importer));
    check(suites.registerImporterTypes(importer));
    check(suites.registerImporterCallbacks(importer));
  });
}

// Nothing when there is none although the code is 0.
std::optional<PlayedFile> Callbacks::makeFile() {
  HostError code = HOST_ERR_NONE;
  const bool noText = host_.serviceFails("StringMake", &code);
  check(code);
  const bool noFile = host_.serviceFails("FileCreate", &code);
  check(code);
  if (noFile) return std::nullopt;
  check(noText ? HOST_ERR_UTILITY_NULL : HOST_ERR_NONE);
  ++host_.files;
  return PlayedFile(host_, bytes_);
}

HostError Callbacks::testHeader(SuiteUser& suites, std::optional<PlayedFile>& file, bool quiet,
                                bool* isMaya) {
  if (!file) return HOST_ERR_NULL_ARGUMENT;
  *isMaya = false;
  std::string header;
  const HostError code = file->readFromStart(kHeaderBytes, &header);
  if (code != HOST_ERR_NONE) return code;
  *isMaya = same(std::string_view(header).substr(0, kHeader.size()), kHeader);
  if (!*isMaya && !quiet) showOnlyMaya(suites);
  return HOST_ERR_NONE;
}

void Callbacks::verify() {
  withSuites(host_, [&](SuiteUser& suites) {
    check(suites.beginSilentErrors());
    std::optional<PlayedFile> file;
    HostError kept = host_.atBorder([&] {
      file = makeFile();
      if (file) check(testHeader(suites, file, true, &canImport_));
    });
    const auto keepFirst = [&](auto work) {
      const HostError code = host_.atBorder([&] { check(work()); });
      if (kept == HOST_ERR_NONE) kept = code;
    };
    keepFirst([&] { return suites.endSilentErrors(); });
    if (file) keepFirst([&] { return file->dispose(); });
    check(kept);
  });
}

HostError Callbacks::readScene(SuiteUser& suites, std::optional<PlayedFile>& file, Handle* buffer,
                               std::string* text) {
  constexpr std::int64_t kTerminators = 2;
  bool isMaya = false;
  std::size_t size = 0;
  HostError code = testHeader(suites, file, false, &isMaya);
  if (code == HOST_ERR_NONE && isMaya) code = file->size(&size);
  check(code);
  check(suites.newMemHandle(static_cast<std::int64_t>(size) + kTerminators, buffer));
  if (*buffer == 0) return HOST_ERR_NONE;
  bool address = false;
  check(suites.lockMemHandle(*buffer, &address));
  std::string read;
  code = file->readFromStart(size, address ? &read : nullptr);
  if (code == HOST_ERR_NONE) *text = read;
  return code;
}

void Callbacks::parseAndBuild(bool hasFile, const std::string& text) {
  withSuites(host_, [&](SuiteUser& suites) {
    HostError code = HOST_ERR_NONE;
    std::string name;
    if (hasFile && !host_.serviceFails("FileName", &code)) name = fileName();
    check(code);
    const auto show = [&](int message) { suites.showMessage(host_.localized(message)); };
    SceneReader reader(host_, text, show);
    reader.read();
    if (host_.serviceFails("StripExtension", &code)) name.clear();
    check(code);
    Builder(suites, reader.scene(), show).build(folder_, name.substr(0, name.rfind('.')));
  });
}

HostError Callbacks::giveBack(SuiteUser& suites, Handle buffer) {
  if (buffer == 0) return HOST_ERR_NONE;
  const HostError kept = host_.guarded([&] { suites.unlockMemHandle(buffer); });
  const HostError freed = host_.guarded([&] { suites.freeMemHandle(buffer); });
  return kept != HOST_ERR_NONE ? kept : freed;
}

void Callbacks::import() {
  withSuites(host_, [&](SuiteUser& suites) {
    std::optional<PlayedFile> file;
    Handle buffer = 0;
    std::string text;
    HostError read = host_.guarded([&] { file = makeFile(); });
    if (read == HOST_ERR_NONE) {
      read = host_.guarded([&] { check(readScene(suites, file, &buffer, &text)); });
    }
    HostError kept = host_.guarded([&] { parseAndBuild(file.has_value(), text); });
    const HostError released = giveBack(suites, buffer);
    if (kept == HOST_ERR_NONE) kept = read;
    if (kept == HOST_ERR_NONE) kept = released;
    check(kept);
  });
}

}  // namespace

Prediction predict(const refhost::HostOptions& options, const std::string& path, std::string_view scene,
                   int imports) {
  return Callbacks(options, path, scene).predict(imports);
}

}  // namespace secondreader
