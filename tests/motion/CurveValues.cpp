// curve-values FIRST COUNT: writes generated curves and the values that they have. model/compare_curves.py
// reads it.
//
//   curve SEED weighted UNITS PRE POST
//   key TIME VALUE INTYPE OUTTYPE INX INY OUTX OUTY   (- - for a tangent that is not written)
//   value TIME VALUE
#include <cinttypes>
#include <cstdio>
#include <cstdlib>

#include "motion/Curve.h"
#include "motion/CurveTangents.h"
#include "tests/motion/CurveGenerator.h"

namespace {

using motion::CurveData;
using motion::CurveSide;

void WriteTangent(const CurveSide& side, std::size_t key) {
  const bool held = key >= side.firstTangent && key - side.firstTangent < side.tangents.size();
  if (held && side.tangents[key - side.firstTangent].Written()) {
    const motion::Tangent& tangent = side.tangents[key - side.firstTangent];
    std::printf(" %.17g %.17g", tangent.x, tangent.y);
  } else {
    std::printf(" - -");
  }
}

void WriteCurve(std::uint64_t seed) {
  testmotion::GeneratedCurve generated = testmotion::GenerateCurve(seed);
  const CurveData& data = generated.data;
  std::printf("curve %" PRIu64 " %d %.17g %d %d\n", seed, data.weighted ? 1 : 0, data.internalUnits,
              data.preInfinity, data.postInfinity);
  for (std::size_t key = 0; key < data.keys.size(); ++key) {
    std::printf("key %.17g %.17g %d %d", data.keys[key].time, data.keys[key].value,
                motion::TangentType(data, motion::Side::kIn, key),
                motion::TangentType(data, motion::Side::kOut, key));
    WriteTangent(data.in, key);
    WriteTangent(data.out, key);
    std::printf("\n");
  }
  const motion::Curve curve(data);
  motion::CurveCursor cursor;
  for (const double time : generated.times) std::printf("value %.17g %.17g\n", time, curve.At(time, &cursor));
}

}  // namespace

int main(int argc, char** argv) {
  if (argc != 3) {
    std::fprintf(stderr, "usage: curve-values FIRST COUNT\n");
    return 2;
  }
  const std::uint64_t first = std::strtoull(argv[1], nullptr, 10);
  const std::uint64_t count = std::strtoull(argv[2], nullptr, 10);
  for (std::uint64_t seed = first; seed < first + count; ++seed) WriteCurve(seed);
  return std::fflush(stdout) == 0 ? 0 : 1;
}
