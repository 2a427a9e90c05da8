#include "refhost/HostState.h"

#include <cstddef>
#include <stdexcept>
#include <utility>

#include "hostutil/HostSetup.h"
#include "refhost/LedgerReport.h"
#include "refhost/ShownText.h"

namespace refhost {
namespace {

// Throws before the new host touches anything that the living one has set up in the utility library.
HostOptions checkedOptions(HostOptions given, const HostState* living) {
  if (living != nullptr) throw std::logic_error("a second Host was made while one lives");
  return given;
}

unsigned nextHostSerial() {
  static unsigned serial = 0;
  return serial++;
}

const char* callbackName(Callback callback) {
  switch (callback) {
    case Callback::Entry:
      return HOST_PLUGIN_ENTRY_SYMBOL;
    case Callback::Import:
      return "ImportFileCallback";
    case Callback::Verify:
      return "VerifyFileCallback";
    case Callback::Death:
      break;
  }
  return "DeathHook";
}

bool takesFile(Callback callback) { return callback == Callback::Import || callback == Callback::Verify; }

void report(void* context, HostError, const char* text) {
  static_cast<HostState*>(context)->messages.show(shownText(text));
}

}  // namespace

HostState* HostState::live_ = nullptr;

HostState::HostState(HostOptions given)
    : options(checkedOptions(std::move(given), live_)),
      codec(nextHostSerial()),
      allowance(options),
      rehearsal(options),
      trace(options.trace),
      preferences(options.preferences) {
  for (const auto& [key, text] : options.translations) HostSetTranslation(key.c_str(), text.c_str());
  HostSetReporter(report, this);
  live_ = this;
}

HostState::~HostState() {
  releaseLeftovers(*this);
  HostSetReporter(nullptr, nullptr);
  HostClearTranslations();
  live_ = nullptr;
}

VOR_Item* HostState::begin(Callback which, const std::string& path) {
  callback = which;
  result = CallbackResult{};
  streamsWithoutValueSuite = 0;
  silenceEndFailed = false;
  VOR_Item* folderHandle = nullptr;
  if (which == Callback::Import) {
    const Folder& folder = editor.addFolder();
    result.folder = &folder;
    folderHandle = reinterpret_cast<VOR_Item*>(
        codec.lasting(HandleKind::Item, static_cast<std::size_t>(folder.itemNumber)));
  }
  if (trace.on()) {
    TraceLine line(codec, "enter", true);
    line.text("callback", callbackName(which));
    if (takesFile(which)) line.text("path", path);
    if (which == Callback::Import) line.handle("folder", folderHandle);
    line.end();
    trace.writeBracket(line);
  }
  rehearsal.begin(which);
  watched_ = rehearsal.watches() || trace.on();
  return folderHandle;
}

CallbackResult HostState::end(HostError code, bool canImport) {
  rehearsal.end();
  watched_ = trace.on();
  if (trace.on()) {
    TraceLine line(codec, "leave", true);
    line.text("callback", callbackName(callback));
    if (callback == Callback::Verify) line.truth("canImport", canImport);
    line.integer("error", code);
    line.end();
    trace.writeBracket(line);
  }
  if (messages.isSilent() && !silenceEndFailed) {
    refuse(std::string(callbackName(callback)) + ": silent errors had begun and were never ended");
  }
  result.code = code;
  result.line = HostTakeNotedLine(code);
  result.canImport = canImport;
  result.messages = messages.takeShown();
  result.suiteCalls = rehearsal.calls();
  result.leftovers = drawLedger(*this);
  releaseLeftovers(*this);
  return std::exchange(result, CallbackResult{});
}

const Importer* HostState::usableImporter() const {
  for (const Importer& importer : importers) {
    if (importer.callbacks.import != nullptr) return &importer;
  }
  return nullptr;
}

}  // namespace refhost
