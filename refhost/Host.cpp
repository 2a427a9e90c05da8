#include "refhost/Host.h"

#include <cstddef>
#include <utility>

#include "hostapi/ErrorCodes.h"
#include "hostapi/PluginEntry.h"
#include "hostutil/HostSetup.h"
#include "refhost/HostState.h"

namespace refhost {
namespace {

// The host's own version, which it passes to the entry.
constexpr std::int32_t kHostMajor = 1;
constexpr std::int32_t kHostMinor = 0;

// No exception of any type may leave a plug-in. The host survives a plug-in that breaks this rule.
template <typename PluginCall>
HostError callPlugin(HostState& host, PluginCall pluginCall) {
  try {
    return pluginCall();
  } catch (...) {
    host.refuse("an exception left the plug-in");
    return HOST_ERR_EXCEPTION_OTHER;
  }
}

std::vector<HostUTF16Unit> unitsOf(const std::filesystem::path& path) {
  const std::int64_t length = HostPathToUnits(path.c_str(), nullptr, 0);
  std::vector<HostUTF16Unit> units(static_cast<std::size_t>(length) + 1);
  HostPathToUnits(path.c_str(), units.data(), length + 1);
  return units;
}

CallbackResult withoutImporter() {
  CallbackResult result;
  result.code = HOST_ERR_REGISTRATION;
  result.refusals.push_back("no importer is registered");
  return result;
}

}  // namespace

struct Host::State : HostState {
  using HostState::HostState;
};

bool CallbackResult::ledgerClean() const {
  for (const Leftover& leftover : leftovers) {
    if (!leftover.keptByDesign) return false;
  }
  return true;
}

Host::Host(HostOptions options) : state_(std::make_unique<State>(std::move(options))) {}

Host::~Host() { unload(); }

bool Host::load(CallbackResult* result, std::string* failure) {
  if (state_->loaded) {
    *failure = "the module is loaded already";
    return false;
  }
  const HostPluginEntry entry = state_->module.load(state_->options.module, failure);
  return entry != nullptr && load(entry, result);
}

bool Host::load(HostPluginEntry entry, CallbackResult* result) {
  if (entry == nullptr || state_->loaded) return false;
  state_->loaded = true;
  state_->linearUnits = 0;
  state_->begin(Callback::Entry, {});
  const HostError code = callPlugin(*state_, [&] {
    return entry(&kBasicSuite, kHostMajor, kHostMinor, state_->options.pluginId, nullptr);
  });
  *result = state_->end(code, false);
  if (!state_->preferences.fileExists()) {
    // A store that cannot be written is no failure of the import: the preference holds for this run.
    std::string unused;
    state_->preferences.write(&unused);
  }
  return true;
}

CallbackResult Host::importScene(const std::filesystem::path& path) {
  const Importer* importer = state_->usableImporter();
  if (importer == nullptr) return withoutImporter();
  const std::vector<HostUTF16Unit> units = unitsOf(path);
  VOR_Item* folder = state_->begin(Callback::Import, path.native());
  const HostError code =
      callPlugin(*state_, [&] { return importer->callbacks.import(units.data(), nullptr, nullptr, folder); });
  return state_->end(code, false);
}

CallbackResult Host::verifyScene(const std::filesystem::path& path) {
  const Importer* importer = state_->usableImporter();
  if (importer == nullptr) return withoutImporter();
  const std::vector<HostUTF16Unit> units = unitsOf(path);
  state_->begin(Callback::Verify, path.native());
  std::uint8_t canImport = 0;
  const HostError code =
      callPlugin(*state_, [&] { return importer->callbacks.verify(units.data(), nullptr, &canImport); });
  return state_->end(code, canImport != 0);
}

CallbackResult Host::unload() {
  CallbackResult result;
  if (const HostDeathHook hook = std::exchange(state_->deathHook, nullptr)) {
    state_->begin(Callback::Death, {});
    const HostError code = callPlugin(*state_, [&] { return hook(state_->deathHookRefcon); });
    result = state_->end(code, false);
  }
  for (Importer& importer : state_->importers) importer.callbacks = {};
  state_->module.unload();
  state_->loaded = false;
  return result;
}

const std::string& Host::importerName() const {
  static const std::string kNone;
  return state_->importers.empty() ? kNone : state_->importers.front().name;
}

const std::vector<std::string>& Host::importerExtensions() const {
  static const std::vector<std::string> kNone;
  return state_->importers.empty() ? kNone : state_->importers.front().extensions;
}

const Project& Host::project() const { return state_->editor.project(); }

std::int32_t Host::linearUnits() const { return state_->linearUnits; }

std::int64_t Host::callCount(std::string_view operation) const {
  return state_->rehearsal.callCount(operation);
}

const WNBasicSuite* Host::basicSuite() const { return &kBasicSuite; }

VOR_Item* Host::beginCallback(Callback callback, const std::filesystem::path& path) {
  return state_->begin(callback, path.native());
}

CallbackResult Host::endCallback(HostError code) { return state_->end(code, false); }

}  // namespace refhost
