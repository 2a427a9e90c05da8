#include "tools/mayascene/CheckCommand.h"

#include <unistd.h>

#include <chrono>
#include <filesystem>
#include <iostream>
#include <memory>
#include <optional>
#include <string>
#include <system_error>
#include <utility>
#include <vector>

#include "tools/mayascene/CheckChildren.h"
#include "tools/mayascene/CheckJson.h"
#include "tools/mayascene/OutputFile.h"
#include "tools/mayascene/Progress.h"
#include "tools/mayascene/SceneSearch.h"

namespace mayascene {
namespace {

using Clock = std::chrono::steady_clock;

constexpr auto kBetweenDrawings = std::chrono::milliseconds(100);

// The outputs of a run; each is null where there is none.
struct Outputs {
  std::unique_ptr<OutputFile> report, json;

  bool open(const CheckArguments& arguments, std::string* failure) {
    if (arguments.json != kStandardOutput) report = OutputFile::open(kStandardOutput, failure);
    if (arguments.json != kStandardOutput && report == nullptr) return false;
    if (!arguments.json.empty()) json = OutputFile::open(arguments.json, failure);
    return arguments.json.empty() || json != nullptr;
  }

  ExitStatus commit(Diagnostics& diagnostics) {
    ExitStatus status = ExitStatus::Done;
    for (OutputFile* output : {report.get(), json.get()}) {
      std::string failure;
      if (output == nullptr || output->commit(&failure)) continue;
      diagnostics.complain("", failure);
      status = ExitStatus::CannotWrite;
    }
    return status;
  }
};

// Shows the results of a run as they come, and its progress.
class Showing {
 public:
  Showing(const CheckArguments& arguments, std::size_t scenes, Outputs& outputs, Diagnostics& diagnostics)
      : arguments_(arguments), scenes_(scenes), outputs_(outputs), diagnostics_(diagnostics) {
    if (outputs_.json) json_.emplace(outputs_.json->stream());
    const std::size_t width = terminalWidth(STDERR_FILENO);
    if (width != 0 && scenes > 1 && !arguments.quiet) progress_.emplace(std::cerr, width);
  }

  void show(const std::string& scene, const std::string& complaints, const CheckResult& result) {
    if (progress_) progress_->clear();
    std::cerr << complaints << std::flush;
    if (result.status == ExitStatus::NoModule) return;
    if (outputs_.report && !result.report.empty()) {
      std::ostream& out = outputs_.report->stream();
      if (std::exchange(shown_, true) && !arguments_.quiet) out << '\n';
      out << result.report << std::flush;
    }
    if (json_) json_->add(result.json);
    if (arguments_.verbose && !result.totals.empty()) diagnostics_.remark(scene, result.totals);
  }

  void watch(const PoolState& state) {
    const Clock::time_point now = Clock::now();
    if (!progress_ || now - drawn_ < kBetweenDrawings) return;
    drawn_ = now;
    progress_->draw({scenes_, state.ended, state.failed, now - begin_});
  }

  void end() {
    if (progress_) progress_->clear();
    if (json_) json_->end();
  }

 private:
  const CheckArguments& arguments_;
  std::size_t scenes_;
  Outputs& outputs_;
  Diagnostics& diagnostics_;
  std::optional<CheckJson> json_;
  std::optional<Progress> progress_;
  bool shown_ = false;  // a report
  Clock::time_point begin_ = Clock::now();
  Clock::time_point drawn_;
};

// The scenes to check. *status is Unreadable where a folder cannot be searched.
std::vector<std::string> scenesOf(const CheckArguments& arguments, Diagnostics& diagnostics,
                                  ExitStatus* status) {
  FoundScenes found = findScenes(arguments.scenes);
  for (const UnreadFolder& folder : found.unread) {
    diagnostics.complain(folder.path, folder.sentence);
    *status = worse(*status, ExitStatus::Unreadable);
  }
  for (const std::string& folder : found.empty) diagnostics.remark(folder, "holds no scene");
  return std::move(found.scenes);
}

// Whether the JSON would overwrite a scene that was found in a folder.
bool overwritesScene(const std::string& json, const std::vector<std::string>& scenes) {
  std::error_code failure;
  if (json.empty() || json == kStandardOutput || !std::filesystem::is_regular_file(json, failure))
    return false;
  for (const std::string& scene : scenes) {
    if (std::filesystem::equivalent(json, scene, failure)) return true;
  }
  return false;
}

}  // namespace

ExitStatus runCheck(const CheckArguments& asked, Diagnostics& diagnostics) {
  if (asked.child) return runCheckChild(asked, diagnostics);
  CheckArguments arguments = asked;
  arguments.colourReport = colourAllowed(STDOUT_FILENO);
  arguments.colourComplaints = colourAllowed(STDERR_FILENO);
  ExitStatus status = ExitStatus::Done;
  const std::vector<std::string> scenes = scenesOf(arguments, diagnostics, &status);
  if (overwritesScene(arguments.json, scenes)) {
    diagnostics.complain(arguments.json, "is one of the scenes and would be overwritten");
    return ExitStatus::WrongUsage;
  }
  Outputs outputs;
  std::string failure;
  if (!outputs.open(arguments, &failure)) {
    diagnostics.complain("", failure);
    return ExitStatus::CannotWrite;
  }
  Showing showing(arguments, scenes.size(), outputs, diagnostics);
  const ExitStatus checked = checkInChildren(
      arguments, scenes,
      [&](const std::string& scene, const std::string& complaints, const CheckResult& result) {
        showing.show(scene, complaints, result);
      },
      [&](const PoolState& state) { showing.watch(state); });
  showing.end();
  if (checked == ExitStatus::NoModule) return checked;
  return worse(worse(status, checked), outputs.commit(diagnostics));
}

}  // namespace mayascene
