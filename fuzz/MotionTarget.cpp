// Evaluates every driven channel and every world matrix of a scene of arbitrary bytes: it ends, and a frame
// has the same values whatever frames came in between.
#include <bit>
#include <cmath>
#include <cstdint>
#include <string_view>
#include <vector>

#include "diag/Collector.h"
#include "fuzz/Bytes.h"
#include "fuzz/Require.h"
#include "fuzz/Target.h"
#include "motion/Evaluator.h"
#include "motion/KeptBelow.h"
#include "scene/Scene.h"
#include "tests/support/GuardedMemory.h"

namespace {

constexpr double kFrames[] = {1.0, -3.5, 24.0, 1e9};

struct Asked {
  std::vector<motion::NumberId> numbers;
  std::vector<motion::MatrixId> places;
};

Asked AskForAll(const scene::Scene& read, motion::Evaluator* evaluator) {
  Asked asked;
  for (scene::NodeId node = 0; node < read.nodes().size(); ++node) {
    asked.places.push_back(evaluator->World(node));
    for (const scene::Connection* const connection : read.ConnectionsInto(node)) {
      const scene::Plug& plug = connection->destination;
      asked.numbers.push_back(evaluator->Number(node, plug.attribute, plug.index));
    }
    if (read.node(node).type.starts_with("animCurve")) {
      asked.numbers.push_back(evaluator->Number(node, "output"));
    }
  }
  return asked;
}

// The values' bits, mixed.
std::uint64_t Digest(const motion::Evaluator& evaluator, const Asked& asked) {
  std::uint64_t digest = 0;
  const auto mix = [&digest](double value) {
    constexpr int kTurn = 5;
    const std::uint64_t bits = std::isnan(value) ? 1u : std::bit_cast<std::uint64_t>(value);
    digest = std::rotl(digest, kTurn) ^ bits;
  };
  for (const motion::NumberId number : asked.numbers) mix(evaluator.Value(number));
  for (const motion::MatrixId place : asked.places) {
    const motion::Matrix& matrix = evaluator.Value(place);
    for (const motion::Vector& row : {matrix.x, matrix.y, matrix.z, matrix.origin}) {
      for (const int axis : {0, 1, 2}) mix(row[axis]);
    }
  }
  return digest;
}

}  // namespace

int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  static testsupport::GuardedMemory memory;
  const std::string_view text(memory.Hold(fuzz::TextOf(data, size), 0), size);
  diag::Collector diagnostics(text);
  const scene::Scene read = scene::Read(text, diagnostics);
  motion::Evaluator evaluator(read, &diagnostics);
  const Asked asked = AskForAll(read, &evaluator);
  std::vector<std::uint64_t> digests;
  for (const double frame : kFrames) {
    evaluator.MoveTo(frame);
    digests.push_back(Digest(evaluator, asked));
  }
  for (std::size_t i = digests.size(); i != 0; --i) {
    evaluator.MoveTo(kFrames[i - 1]);
    fuzz::Require(Digest(evaluator, asked) == digests[i - 1],
                  "a frame has its values in any order of frames");
  }
  for (const motion::Kept& kept : motion::KeptBelow(evaluator).Of(asked.numbers, asked.places)) {
    fuzz::Require(!motion::SentenceOf(evaluator, kept).empty(), "what is kept can be said");
  }
  for (const diag::Diagnostic& diagnostic : diagnostics.kept()) (void)diag::Render("fuzz", diagnostic);
  return 0;
}
