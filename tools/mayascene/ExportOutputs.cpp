#include "tools/mayascene/ExportOutputs.h"

#include <filesystem>

#include "text/Letters.h"

namespace mayascene {

namespace fs = std::filesystem;

std::ostream* ExportFiles::Main() {
  main_ = OutputFile::open(place_, &failure_);
  if (main_ == nullptr) return nullptr;
  written_.push_back(place_);
  return &main_->stream();
}

std::ostream* ExportFiles::Beside(std::string_view part, std::string_view suffix, std::string* name) {
  if (place_ == kStandardOutput) {
    failure_ = "standard output cannot take the several files that this scene is written as";
    return nullptr;
  }
  const fs::path folder = fs::path(place_).parent_path();
  const std::string stem = fs::path(place_).stem().string() + std::string(part);
  fs::path place;
  for (int number = 1;; ++number) {
    *name = stem + (number == 1 ? "" : '_' + std::to_string(number)) + std::string(suffix);
    place = folder / *name;
    if (taken_->outputs.insert(text::Lowered(place.lexically_normal().string())).second) break;
  }
  if (taken_->untouchable.contains(place.string())) {
    failure_ = place.string() + " is a scene or the report, and would be overwritten";
    return nullptr;
  }
  auto output = OutputFile::open(place.string(), &failure_);
  if (output == nullptr) return nullptr;
  written_.push_back(place.string());
  return &beside_.emplace_back(std::move(output))->stream();
}

bool ExportFiles::commit() {
  std::vector<OutputFile*> all;
  for (const auto& output : beside_) all.push_back(output.get());
  if (main_ != nullptr) all.push_back(main_.get());
  return OutputFile::commitAll(all, &failure_);
}

}  // namespace mayascene
