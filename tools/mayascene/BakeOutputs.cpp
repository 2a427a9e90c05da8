#include "tools/mayascene/BakeOutputs.h"

#include <filesystem>
#include <map>
#include <set>
#include <system_error>

#include "text/Letters.h"
#include "tools/mayascene/FileSet.h"
#include "tools/mayascene/OutputFile.h"

namespace mayascene {
namespace {

namespace fs = std::filesystem;

// Names that no other output of the run has.
class FreeNames {
 public:
  // The scene's own name, with a number where it is taken.
  std::string nameOf(const fs::path& scene, const std::string& suffix) {
    const std::string stem = scene.stem().empty() ? "scene" : scene.stem().string();
    std::string name = stem + suffix;
    int& number = numbers_.try_emplace(text::Lowered(stem), 1).first->second;
    while (!taken_.insert(text::Lowered(name)).second) name = stem + '_' + std::to_string(++number) + suffix;
    return name;
  }

 private:
  std::set<std::string> taken_;         // without regard to case
  std::map<std::string, int> numbers_;  // by stem, the last one that was tried
};

// The folder `output`, made where it is not there.
ExitStatus makeFolder(const std::string& output, std::string* failure) {
  std::error_code error;
  if (output == kStandardOutput) {
    *failure = "standard output cannot take the outputs of several scenes: name a folder";
    return ExitStatus::WrongUsage;
  }
  if (fs::exists(output, error)) {
    *failure = output + " is not a folder: the outputs of several scenes need one";
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

}  // namespace

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
    FreeNames names;
    for (const std::string& scene : scenes) {
      places->push_back((fs::path(output) / names.nameOf(scene, suffix)).string());
    }
  }
  FileSet read, reported;
  for (const std::string& scene : scenes) read.add(scene);
  if (!report.empty()) reported.add(report);
  for (const std::string& place : *places) {
    if (place == kStandardOutput) continue;
    if (read.contains(place)) return refuse(place, " is one of the scenes and would be overwritten", failure);
    if (reported.contains(place)) return refuse(place, " is the report, too", failure);
  }
  return ExitStatus::Done;
}

}  // namespace mayascene
