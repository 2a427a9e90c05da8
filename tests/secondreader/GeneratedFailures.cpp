// Failures to rehearse over a generated scene.
#include "tests/secondreader/SceneGenerator.h"

namespace secondreader {
namespace {

constexpr std::string_view kSuiteCalls[] = {
    "AcquireSuite",     "ReleaseSuiteByName",     "ShowMessage",          "NewMemHandle",
    "FreeMemHandle",    "LockMemHandle",          "UnlockMemHandle",      "CreateComp",
    "GetItemFromComp",  "NewCameraLayer",         "NewNullLayer",         "AddLayerFromItem",
    "SetLayerFlag",     "SetLayerParent",         "SetCameraFilmSize",    "AcquireLayerStream",
    "ReleaseStream",    "SetStreamValue",         "AddBatchKeyframe",     "BeginKeyframeBatch",
    "EndKeyframeBatch", "GetStreamKeyframeCount", "SetBatchKeyframeValue"};
constexpr std::string_view kImportServices[] = {
    "FileCreate", "FileOpen",       "FileRead",       "FileClose",  "FileSize",
    "FileName",   "StripExtension", "StringMake",     "NumberScan", "RatioCompare",
    "StringCopy", "StringFormat",   "MatrixDecompose"};
constexpr std::string_view kVerifyCalls[] = {"BeginSilentErrors", "EndSilentErrors", "AcquireSuite",
                                             "FileCreate",        "FileOpen",        "FileRead",
                                             "FileClose",         "FileDispose",     "StringMake"};
constexpr std::string_view kEntryCalls[] = {
    "RegisterStringTable",  "GetAppPrefsBlob", "GetPrefLong",           "RegisterDeathHook",
    "RegisterImporterName", "AcquireSuite",    "RegisterImporterTypes", "RegisterImporterCallbacks"};
constexpr const char* kSuites[] = {"QZGP Utility Suite", "QZGP Memory Suite", "QZGP Comp Suite",
                                   "QZGP Layer Suite",   "QZGP Camera Suite", "QZGP Stream Suite",
                                   "QZGP Keyframe Suite"};
constexpr refhost::Failure::Kind kKinds[] = {
    refhost::Failure::Kind::BadAlloc, refhost::Failure::Kind::RuntimeError, refhost::Failure::Kind::Other};
constexpr HostError kCodes[] = {0, 0, 7321, -1, 13, 2001, 1289986};

class Planner {
 public:
  Planner(std::uint64_t seed, const RunCounts& counts) : dice_(seed), counts_(counts) {}

  refhost::Failure failure(refhost::Callback during) {
    refhost::Failure failure;
    if (dice_.chance(45)) {
      const int calls = during == refhost::Callback::Import ? counts_.suiteCalls : 12;
      failure.nth = dice_.between(1, calls + 1);
      failure.onwards = dice_.chance(30);
    } else {
      failure.operation = operation(during);
      failure.nth = nth(failure.operation);
    }
    failure.code = dice_.oneOf(kCodes);
    if (dice_.chance(30)) {
      failure.kind = dice_.oneOf(kKinds);
    }
    return failure;
  }

  refhost::RefusedSuite refusal() {
    static constexpr std::int32_t kVersions[] = {1, 2, 3, 4, 7, 8, 9, 10, 21};
    return {dice_.oneOf(kSuites), dice_.oneOf(kVersions)};
  }

  Dice& dice() { return dice_; }

 private:
  std::string operation(refhost::Callback during) {
    if (during == refhost::Callback::Verify) return std::string(dice_.oneOf(kVerifyCalls));
    if (during == refhost::Callback::Entry) return std::string(dice_.oneOf(kEntryCalls));
    return std::string(dice_.chance(50) ? dice_.oneOf(kSuiteCalls) : dice_.oneOf(kImportServices));
  }

  int nth(const std::string& operation) {
    if (operation == "NumberScan") return dice_.between(1, counts_.numberScans + 1);
    if (dice_.chance(20)) return 0;
    return dice_.chance(50) ? dice_.between(1, 3) : dice_.between(1, 40);
  }

  Dice dice_;
  const RunCounts& counts_;
};

}  // namespace

void planFailures(std::uint64_t seed, const RunCounts& counts, refhost::HostOptions* options) {
  Planner planner(seed, counts);
  options->during = refhost::Callback::Import;
  if (planner.dice().chance(8)) options->during = refhost::Callback::Verify;
  if (planner.dice().chance(8)) options->during = refhost::Callback::Entry;
  if (planner.dice().chance(15)) {
    options->refusedSuites.push_back(planner.refusal());
    if (planner.dice().chance(60)) return;
  }
  for (int count = planner.dice().chance(25) ? 2 : 1; count > 0; --count) {
    options->failures.push_back(planner.failure(options->during));
  }
}

}  // namespace secondreader
