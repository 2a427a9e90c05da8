// The expected outcome of an import of a scene, and the check against it.
#pragma once

#include <cstddef>
#include <filesystem>
#include <iosfwd>
#include <string>
#include <vector>

#include "hostapi/HostTypes.h"

namespace scenes {

struct SceneOutcome {
  const char* name;  // of the scene's file, without folder and ".ma"
  HostError code = 0;
  std::size_t compositions = 0;
  std::vector<std::string> cameras = {};  // names of layers, sorted
  std::vector<std::string> nulls = {};
  std::size_t keys = 0;
  std::size_t aimed = 0;
};

void PrintTo(const SceneOutcome& outcome, std::ostream* out);

// The test's name, for a suite that takes each outcome of a table.
std::string nameOf(const SceneOutcome& outcome);

// The messages that the user sees after an import that ended with the code.
std::vector<std::string> messagesOf(HostError code);

// The folder's scene, imported: what is created, the code with its message, no refusal, and nothing left
// behind.
void expectOutcome(const std::filesystem::path& folder, const SceneOutcome& outcome);

// The folder's scenes, without ".ma".
std::vector<std::string> scenesIn(const std::filesystem::path& folder);

// tests/scenes/FOLDER
std::filesystem::path ownFolder(const char* folder);

}  // namespace scenes
