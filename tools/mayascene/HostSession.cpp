#include "tools/mayascene/HostSession.h"

#include <string>
#include <system_error>
#include <utility>

#include "refhost/Preferences.h"
#include "refhost/Translations.h"

namespace mayascene {
namespace {

constexpr const char* kModuleBesideTool = "../lib/MayaImport.so";

// The module is found relative to the tool, so that a build can be moved and run from any folder.
std::filesystem::path moduleBesideTool() {
  std::error_code failed;
  const std::filesystem::path self = std::filesystem::read_symlink("/proc/self/exe", failed);
  return (self.parent_path() / kModuleBesideTool).lexically_normal();
}

}  // namespace

std::filesystem::path preferenceFile(const std::string& named) {
  return named.empty() ? refhost::Preferences::userFile() : std::filesystem::path(named);
}

HostSession::HostSession(const HostArguments& arguments, refhost::Callback own, std::ostream* trace,
                         Diagnostics& diagnostics)
    : arguments_(arguments), own_(own), trace_(trace), diagnostics_(diagnostics) {}

ExitStatus HostSession::start() {
  refhost::HostOptions options;
  options.module = arguments_.module.empty() ? moduleBesideTool() : std::filesystem::path(arguments_.module);
  options.pluginId = arguments_.pluginId;
  options.preferences = preferenceFile(arguments_.preferences);
  options.linearUnits = arguments_.linearUnits;
  options.trace = trace_;
  options.failures = arguments_.failures;
  options.refusedSuites = arguments_.refusedSuites;
  options.during = arguments_.during.value_or(own_);
  options.zoomKeys = arguments_.zoomKeys;
  options.permissive = arguments_.permissive;
  options.mostLayers = arguments_.mostLayers.value_or(options.mostLayers);
  options.mostKeys = arguments_.mostKeys.value_or(options.mostKeys);
  options.mostMemory = arguments_.mostMemory.value_or(options.mostMemory);
  std::string complaint;
  if (!arguments_.translations.empty()) {
    auto translations = refhost::readTranslations(arguments_.translations, &complaint);
    if (!translations) {
      diagnostics_.complain("", complaint);
      return ExitStatus::Unreadable;
    }
    options.translations = std::move(*translations);
  }

  host_ = std::make_unique<refhost::Host>(std::move(options));
  if (!host_->load(&entry_, &complaint)) {
    diagnostics_.complain("", complaint);
    return ExitStatus::NoModule;
  }
  const ExitStatus status = diagnostics_.judge("the module's entry", entry_);
  if (entry_.code == 0) return status;
  diagnostics_.messages("the module's entry", entry_);
  return ExitStatus::NoModule;
}

ExitStatus HostSession::finish() {
  deathHook_ = host_->unload();
  return diagnostics_.judge("the module's death hook", deathHook_);
}

}  // namespace mayascene
