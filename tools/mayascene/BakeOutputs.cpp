#include "tools/mayascene/BakeOutputs.h"

#include <algorithm>
#include <filesystem>
#include <set>
#include <system_error>

namespace mayascene {
namespace {

namespace fs = std::filesystem;

std::string lowered(std::string text) {
  for (char& c : text) {
    if (c >= 'A' && c <= 'Z') c = static_cast<char>(c - 'A' + 'a');
  }
  return text;
}

// The scene's own name, as a name that no other bake of the run has.
std::string freeName(const fs::path& scene, std::set<std::string>* taken) {
  const std::string stem = scene.stem().empty() ? "scene" : scene.stem().string();
  std::string name = stem + ".ma";
  for (int number = 2; !taken->insert(lowered(name)).second; ++number) {
    name = stem + "_" + std::to_string(number) + ".ma";
  }
  return name;
}

bool isOneOf(const fs::path& file, const std::vector<std::string>& scenes) {
  std::error_code ignored;
  return std::any_of(scenes.begin(), scenes.end(), [&](const std::string& scene) {
    return file.lexically_normal() == fs::path(scene).lexically_normal() ||
           fs::equivalent(file, scene, ignored);
  });
}

}  // namespace

std::vector<std::string> placeBakes(const std::vector<std::string>& scenes, const std::string& output,
                                    std::string* failure) {
  std::error_code error;
  const bool folder = fs::is_directory(output, error);
  std::vector<std::string> places;
  if (scenes.size() == 1 && !folder) {
    places.push_back(output);
  } else {
    if (!folder && !fs::create_directories(output, error)) {
      *failure = output + " is no folder and cannot be made: " + error.message();
      return {};
    }
    std::set<std::string> taken;
    for (const std::string& scene : scenes) {
      places.push_back((fs::path(output) / freeName(scene, &taken)).string());
    }
  }
  for (const std::string& place : places) {
    if (!isOneOf(place, scenes)) continue;
    *failure = place + " is one of the scenes and would be overwritten";
    return {};
  }
  return places;
}

}  // namespace mayascene
