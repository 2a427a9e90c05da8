// Runs the reader of the whole scene on arbitrary bytes: its result is consistent, and no text keeps the
// commands after it from being read.
#include <algorithm>
#include <cstdint>
#include <string>
#include <string_view>

#include "diag/Collector.h"
#include "fuzz/Bytes.h"
#include "fuzz/Require.h"
#include "fuzz/Target.h"
#include "scene/Scene.h"
#include "scene/Settings.h"
#include "tests/scene/CheckedScene.h"
#include "tests/support/GuardedMemory.h"

namespace {

using fuzz::Require;

constexpr std::string_view kLastName = "afterAllOfThis";
constexpr std::string_view kLastCommand = "\ncreateNode transform -n \"afterAllOfThis\";";

void CheckSettings(const scene::Scene& read, diag::Collector& diagnostics) {
  const scene::Settings settings = scene::ReadSettings(read, diagnostics);
  Require(settings.rate.value.frames > 0 && settings.rate.value.seconds > 0, "a frame rate is positive");
  Require(settings.pixelAspect() > 0.0, "a pixel aspect is positive");
}

bool HasLastNode(const scene::Scene& read) {
  return std::any_of(read.nodes().begin(), read.nodes().end(), [](const scene::Node& node) {
    return node.origin == scene::Origin::Created && node.name.find(kLastName) != std::string_view::npos;
  });
}

}  // namespace

int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  static testsupport::GuardedMemory memory;
  const std::string_view text(memory.Hold(fuzz::TextOf(data, size), 0), size);
  diag::Collector diagnostics(text);
  const scene::Scene read = scene::Read(text, diagnostics);
  CheckSettings(read, diagnostics);
  const std::string broken = testsupport::BrokenPromise(read, diagnostics);
  Require(broken.empty(), broken.c_str());
  for (const diag::Diagnostic& diagnostic : diagnostics.kept()) (void)diag::Render("fuzz", diagnostic);

  const std::string longer = std::string(text) + std::string(kLastCommand);
  diag::Collector others(longer);
  const scene::Scene again = scene::Read(longer, others);
  Require(HasLastNode(again), "no text keeps the commands after it from being read");
  Require(diagnostics.count() <= 2 * size, "there are no more diagnostics than bytes, nearly");
  return 0;
}
