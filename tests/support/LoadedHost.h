// The module, loaded into an embedded host: every test of whole imports imports through this one.
#pragma once

#include <gtest/gtest.h>

#include <filesystem>
#include <string>
#include <utility>

#include "refhost/Host.h"
#include "tests/support/TemporaryFolder.h"

namespace testsupport {

class LoadedHost {
 public:
  // The test fails where the module cannot be loaded. The options' module is set here.
  explicit LoadedHost(refhost::HostOptions options = {}) : host_(WithModule(std::move(options))) {
    std::string failure;
    loaded_ = host_.load(&entry_, &failure);
    EXPECT_TRUE(loaded_) << failure;
    EXPECT_EQ(entry_.code, 0);
  }

  // Imports a text, byte for byte, as the file shot.ma. The file stays until the next text of any host.
  refhost::CallbackResult Import(const std::string& text) { return Import(Folder().write("shot.ma", text)); }
  refhost::CallbackResult Import(const std::filesystem::path& scene) {
    return loaded_ ? host_.importScene(scene) : refhost::CallbackResult();
  }
  refhost::CallbackResult Unload() { return host_.unload(); }

  bool loaded() const { return loaded_ && entry_.code == 0; }
  const refhost::CallbackResult& entry() const { return entry_; }
  const refhost::Project& project() const { return host_.project(); }
  static std::filesystem::path ScenePath() { return Folder().path() / "shot.ma"; }

 private:
  // Of the process: one that it forks and that is killed leaves nothing.
  static const TemporaryFolder& Folder() {
    static const TemporaryFolder folder;
    return folder;
  }

  static refhost::HostOptions WithModule(refhost::HostOptions options) {
    options.module = MAYASCENE_MODULE;
    return options;
  }

  refhost::Host host_;
  refhost::CallbackResult entry_;
  bool loaded_ = false;
};

// Options in which distances are converted to points, or taken as they stand.
inline refhost::HostOptions WithUnits(bool converted) {
  refhost::HostOptions options;
  options.linearUnits = converted ? 1 : 0;
  return options;
}

}  // namespace testsupport
