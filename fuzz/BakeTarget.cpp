// Bakes a scene of arbitrary bytes: the bake ends and is bounded, it can be read again without a diagnostic,
// and the same scene gives the same bytes.
#include <cstdint>
#include <sstream>
#include <string>
#include <string_view>

#include "bake/Bake.h"
#include "diag/Collector.h"
#include "fuzz/Bytes.h"
#include "fuzz/Require.h"
#include "fuzz/Target.h"
#include "scene/Scene.h"
#include "tests/support/GuardedMemory.h"

namespace {

// Few frames: all are computed alike, and more would only take longer.
constexpr bake::FrameSpan kFrames{-2.0, 5.5};
constexpr double kStep = 1.5;
constexpr std::size_t kCount = 6;

// A written node has at most nine channels of curves, each with a name, a connection and its keys.
constexpr std::size_t kMostBytesANode = 20'000;

struct Baked {
  bake::Report report;
  std::string text;
};

Baked BakeOf(const scene::Scene& read, const bake::Options& options, diag::Collector* diagnostics) {
  std::ostringstream out;
  Baked baked;
  baked.report = bake::Bake(read, options, {"fuzz", "fuzz.ma", ""}, diagnostics, out);
  baked.text = out.str();
  return baked;
}

// The reader has no diagnostic about a bake.
void CheckReadable(const std::string& text) {
  diag::Collector diagnostics(text);
  const scene::Scene again = scene::Read(text, diagnostics);
  if (diagnostics.count() != 0) std::fputs(diag::Render("bake", diagnostics.kept().front()).c_str(), stderr);
  fuzz::Require(diagnostics.count() == 0, "a bake is read again without a diagnostic");
}

void CheckReport(const bake::Report& report) {
  for (const bake::CameraReport& camera : report.cameras) {
    fuzz::Require(camera.written == !camera.name.empty(), "a camera that is written has a name");
  }
}

void Check(const scene::Scene& read, std::string_view text, const bake::Options& options) {
  diag::Collector diagnostics(text);
  const Baked baked = BakeOf(read, options, &diagnostics);
  fuzz::Require(baked.report.frames && baked.report.frames->count == kCount,
                "the frames are those asked for");
  fuzz::Require(baked.text.size() <= kMostBytesANode * (read.nodes().size() + 1), "a bake has a bound");
  CheckReport(baked.report);
  CheckReadable(baked.text);
  diag::Collector others(text);
  fuzz::Require(BakeOf(read, options, &others).text == baked.text, "the same scene gives the same bytes");
  for (const diag::Diagnostic& diagnostic : diagnostics.kept()) (void)diag::Render("fuzz", diagnostic);
}

}  // namespace

int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  static testsupport::GuardedMemory memory;
  const std::string_view text(memory.Hold(fuzz::TextOf(data, size), 0), size);
  diag::Collector diagnostics(text);
  const scene::Scene read = scene::Read(text, diagnostics);
  bake::Options options;
  options.frames = kFrames;
  options.step = kStep;
  options.locators = bake::Locators::kAll;
  Check(read, text, options);
  options.world = true;
  Check(read, text, options);
  // The scene's own range, which its playback and its keys give, however far away they are: it is found or
  // refused.
  options.frames.reset();
  options.cameras = {"no camera has this name"};
  options.locators = bake::Locators::kNone;
  diag::Collector ignored(text);
  (void)BakeOf(read, options, &ignored);
  return 0;
}
