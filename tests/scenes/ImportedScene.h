// One scene, imported by the module into an embedded host of its own, and what came of it in numbers.
#pragma once

#include <filesystem>
#include <set>
#include <string>

#include "tests/support/LoadedHost.h"

namespace scenes {

class ImportedScene {
 public:
  explicit ImportedScene(const std::filesystem::path& path, bool linearUnits = false);
  ImportedScene(const std::filesystem::path& path, refhost::HostOptions options);

  // False when the module could not be loaded; then nothing else may be asked.
  bool loaded() const { return host_.loaded(); }
  const refhost::CallbackResult& result() const { return result_; }
  const refhost::CallbackResult& loadResult() const { return host_.entry(); }
  refhost::CallbackResult unload() { return host_.Unload(); }

  // The only layer of that name; null when there is none, or more than one.
  const refhost::Layer* layer(const std::string& name) const;

  std::size_t compositions() const { return host_.project().compositions().size(); }
  std::size_t layers(refhost::LayerKind kind) const;
  std::size_t aimedCameras() const;
  std::size_t keys() const;  // of all streams of all layers
  std::multiset<std::string> names(refhost::LayerKind kind) const;
  const refhost::Project& project() const { return host_.project(); }

 private:
  testsupport::LoadedHost host_;
  refhost::CallbackResult result_;
};

}  // namespace scenes
