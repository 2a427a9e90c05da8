// Imports and checks a scene of arbitrary bytes: the report agrees with the import, it is bounded, and
// nothing of the scene reaches a terminal or a document unescaped.
#include <cstdint>
#include <map>
#include <nlohmann/json.hpp>
#include <sstream>
#include <string>
#include <string_view>

#include "check/Check.h"
#include "fuzz/Bytes.h"
#include "fuzz/LoadedModule.h"
#include "fuzz/MemoryFile.h"
#include "fuzz/Require.h"
#include "fuzz/Target.h"
#include "refhost/Host.h"
#include "tests/check/StopContradictions.h"
#include "tests/support/GuardedMemory.h"
#include "text/JsonWriter.h"
#include "tools/mayascene/CheckJson.h"
#include "tools/mayascene/CheckText.h"
#include "tools/mayascene/ImportedLayers.h"

namespace {

using fuzz::Require;

// An excerpt, two arguments of 200 bytes and a help, each escaped.
constexpr std::size_t kLongestFinding = 8000;

// The head grows with the cameras and their chains, which are bounded by the text.
constexpr std::size_t kShortestReport = 20'000;

check::CameOver Import(const std::filesystem::path& path) {
  refhost::HostOptions options;
  options.linearUnits = 0;
  options.mostLayers = 10'000;
  refhost::Host host(std::move(options));
  refhost::CallbackResult loaded;
  Require(host.load(fuzz::LoadedModule(), &loaded) && loaded.code == 0, "the module can be loaded");
  const refhost::CallbackResult result = host.importScene(path);
  return mayascene::whatCameOver(mayascene::lookAtScene(path), result, false);
}

void CheckBounds(const check::Report& report) {
  std::map<diag::Code, std::size_t> counts;
  for (const check::Finding& finding : report.findings) {
    Require(++counts[finding.diagnostic.code] <= diag::Collector::kFullPerCode,
            "at most 20 of one code in full");
    Require(finding.excerpt.size() < kLongestFinding, "an excerpt is short");
  }
  for (const auto& [code, times] : report.notInFull) {
    Require(times != 0 && counts[code] == diag::Collector::kFullPerCode, "the rest of a code is counted");
  }
}

void CheckOutputs(const mayascene::CheckedScene& scene, std::size_t size) {
  std::ostringstream text;
  mayascene::printCheck(text, scene, {}, mayascene::Style(false));
  for (const char c : text.str()) {
    const auto byte = static_cast<unsigned char>(c);
    Require(byte == '\n' || (byte >= 0x20 && byte != 0x7f), "no control reaches a terminal");
  }
  Require(text.str().size() < kShortestReport + scene.report.findings.size() * kLongestFinding + 200 * size,
          "a report does not grow faster than its scene");
  std::ostringstream object, document;
  text::JsonWriter writer(object);
  mayascene::writeCheckedScene(writer, scene);
  mayascene::CheckJson json(document);
  json.add(object.str());
  json.end();
  Require(nlohmann::json::accept(document.str()), "the document is JSON");
}

}  // namespace

int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  static fuzz::MemoryFile file;
  static testsupport::GuardedMemory memory;
  const std::string_view text(memory.Hold(fuzz::TextOf(data, size), 0), size);
  file.Write(text);
  const check::CameOver cameOver = Import(file.path());
  mayascene::CheckedScene scene;
  scene.path = "fuzz";
  scene.report = check::Check(text, cameOver);
  const std::string wrong = check_test::StopContradictionIn(cameOver, scene.report, false);
  Require(wrong.empty(), wrong.c_str());
  CheckBounds(scene.report);
  CheckOutputs(scene, size);
  return 0;
}
