#include "tools/mayascene/BakeOutputs.h"

#include <filesystem>
#include <set>
#include <system_error>

#include "tools/mayascene/OutputFile.h"

namespace mayascene {
namespace {

namespace fs = std::filesystem;

std::string lowered(std::string text) {
  for (char& c : text) {
    if (c >= 'A' && c <= 'Z') c = static_cast<char>(c - 'A' + 'a');
  }
  return text;
}

// The scene's own name, as a name that no other output of the run has.
std::string freeName(const fs::path& scene, const std::string& suffix, std::set<std::string>* taken) {
  const std::string stem = scene.stem().empty() ? "scene" : scene.stem().string();
  std::string name = stem + suffix;
  for (int number = 2; !taken->insert(lowered(name)).second; ++number) {
    name = stem + "_" + std::to_string(number) + suffix;
  }
  return name;
}

// The folder `output`, made where it is not there.
ExitStatus makeFolder(const std::string& output, std::string* failure) {
  std::error_code error;
  if (output == kStandardOutput) {
    *failure = "standard output cannot take the outputs of several scenes: name a folder";
    return ExitStatus::WrongUsage;
  }
  if (fs::exists(output, error)) {
    *failure = output + " is no folder: the outputs of several scenes need one";
    return ExitStatus::WrongUsage;
  }
  if (fs::create_directories(output, error) || fs::is_directory(output)) return ExitStatus::Done;
  *failure = output + " cannot be made: " + error.message();
  return ExitStatus::CannotWrite;
}

ExitStatus refuse(const std::string& place, const char* why, std::string* failure) {
  *failure = place + why;
  return ExitStatus::WrongUsage;
}

// From the root, with the links of its folders followed; what it names need not be there.
fs::path wholeName(const fs::path& path) {
  std::error_code error;
  const fs::path absolute = fs::absolute(path, error);
  const fs::path whole = fs::weakly_canonical(absolute, error);
  return error ? absolute.lexically_normal() : whole;
}

}  // namespace

bool isSameFile(const fs::path& a, const fs::path& b) {
  std::error_code ignored;
  return fs::equivalent(a, b, ignored) || wholeName(a) == wholeName(b);
}

ExitStatus placeOutputs(const std::vector<std::string>& scenes, const std::string& output,
                        const std::string& suffix, const std::string& report,
                        std::vector<std::string>* places, std::string* failure) {
  std::error_code error;
  const bool folder = output != kStandardOutput && fs::is_directory(output, error);
  if (scenes.size() == 1 && !folder && !output.ends_with('/')) {
    places->push_back(output);
  } else {
    if (!folder) {
      const ExitStatus made = makeFolder(output, failure);
      if (made != ExitStatus::Done) return made;
    }
    std::set<std::string> taken;
    for (const std::string& scene : scenes) {
      places->push_back((fs::path(output) / freeName(scene, suffix, &taken)).string());
    }
  }
  for (const std::string& place : *places) {
    if (place == kStandardOutput) continue;
    for (const std::string& scene : scenes) {
      if (isSameFile(place, scene))
        return refuse(place, " is one of the scenes and would be overwritten", failure);
    }
    if (!report.empty() && isSameFile(place, report)) return refuse(place, " is the report, too", failure);
  }
  return ExitStatus::Done;
}

}  // namespace mayascene
