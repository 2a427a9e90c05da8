#include "tools/mayascene/CheckChildren.h"

#include <algorithm>
#include <iostream>
#include <thread>
#include <utility>

#include "tools/mayascene/HostSession.h"
#include "tools/mayascene/OutputFile.h"
#include "tools/mayascene/SceneCheck.h"

namespace mayascene {
namespace {

constexpr const char* kOwnProgram = "/proc/self/exe";

// No limit under the sanitizers, which reserve terabytes of address space.
#if defined(__SANITIZE_ADDRESS__)
constexpr std::uint64_t kMemory = 0;
#elif defined(__has_feature)
#if __has_feature(address_sanitizer)
constexpr std::uint64_t kMemory = 0;
#else
constexpr std::uint64_t kMemory = std::uint64_t{8} << 30;
#endif
#else
constexpr std::uint64_t kMemory = std::uint64_t{8} << 30;
#endif

// Whether a child ended as it should; *result is then what it handed over.
bool finished(const ChildEnd& end, CheckResult* result) {
  return end.kind == ChildEnd::Kind::Exited && handedOver(end.out, result) &&
         static_cast<int>(result->status) == end.number;
}

bool foundNoModule(const ChildEnd& end) {
  return end.kind == ChildEnd::Kind::Exited && end.number == static_cast<int>(ExitStatus::NoModule);
}

}  // namespace

ExitStatus runCheckChild(const CheckArguments& arguments, Diagnostics& diagnostics) {
  HostSession session(arguments.host, refhost::Callback::Import, nullptr, diagnostics);
  const ExitStatus started = session.start();
  if (started > ExitStatus::Refused) return started;
  CheckedScene scene = checkScene(arguments.scenes.front(), arguments, session, diagnostics);
  if (arguments.strict && scene.report.warnings != 0) scene.status = worse(scene.status, ExitStatus::Refused);
  scene.status = worse(worse(scene.status, started), session.finish());
  handOver(std::cout, resultOf(scene, arguments));
  return scene.status;
}

std::vector<std::string> childWords(const CheckArguments& arguments, const std::string& scene) {
  std::vector<std::string> words = {kOwnProgram, "check", "--child"};
  const auto flag = [&words](bool wanted, const char* name) {
    if (wanted) words.emplace_back(name);
  };
  flag(arguments.twoThreads, "--two-threads");
  flag(arguments.options.all, "--all");
  flag(arguments.strict, "--strict");
  flag(arguments.quiet, "--quiet");
  flag(arguments.colourReport, "--colour-report");
  flag(arguments.colourComplaints, "--colour-complaints");
  for (const diag::Code code : arguments.options.only) {
    words.insert(words.end(), {"--only", diag::NameOf(code)});
  }
  if (!arguments.json.empty()) words.insert(words.end(), {"--json", kStandardOutput});
  if (arguments.host.linearUnits) {
    words.push_back("--linear-units=" + std::to_string(*arguments.host.linearUnits));
  }
  if (!arguments.host.preferences.empty()) {
    words.push_back("--preferences=" + arguments.host.preferences);
  }
  words.insert(words.end(), {"--", scene});
  return words;
}

PoolLimits childLimits(const CheckArguments& arguments) {
  PoolLimits limits;
  limits.jobs = arguments.jobs.value_or(std::max(1U, std::thread::hardware_concurrency()));
  limits.timeout = std::chrono::duration<double>(arguments.timeout);
  limits.memory = kMemory;
  return limits;
}

ExitStatus checkInChildren(const CheckArguments& arguments, const std::vector<std::string>& scenes,
                           const ShowResult& show, const ProcessPool::Watch& watch) {
  const PoolLimits limits = childLimits(arguments);
  ExitStatus status = ExitStatus::Done;
  bool noModule = false;
  const auto take = [&](std::size_t number, ChildEnd end) {
    const std::string& scene = scenes.at(number);
    CheckResult result;
    noModule = foundNoModule(end);
    if (noModule) {
      result.status = ExitStatus::NoModule;
    } else if (!finished(end, &result)) {
      result = resultOf(unfinishedCheck(scene, end, limits), arguments);
    }
    status = worse(status, result.status);
    show(scene, end.err, result);
    return !noModule;
  };
  CheckArguments each = arguments;
  each.twoThreads = limits.jobs > scenes.size();
  const auto command = [&](std::size_t number) { return childWords(each, scenes.at(number)); };
  ProcessPool(limits).run(scenes.size(), command, take, watch);
  return noModule ? ExitStatus::NoModule : status;
}

}  // namespace mayascene
