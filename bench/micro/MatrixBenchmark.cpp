// Composes the matrix of a transform from pivots, scale, rotations and translation, and takes it apart. The
// items are transforms, the bytes those of their matrices.
#include <array>
#include <cmath>

#include "bench/micro/MicroBenchmark.h"
#include "hostutil/HostMatrix.h"

namespace bench {
namespace {

constexpr std::size_t kTransforms = 256;

// Different from one to the next, all of them ordinary.
double angle(std::size_t i) { return std::sin(static_cast<double>(i)) * 3.0; }

TransformMatrix compose(std::size_t i) {
  const auto at = static_cast<double>(i);
  TransformMatrix matrix{};
  bool success = MatrixSetIdentity(&matrix) == 0;
  success &= MatrixTranslate(&matrix, -1.0, -2.0, 0.5) == 0;
  success &= MatrixScale(&matrix, 1.0 + at, 2.0, 0.5) == 0;
  success &= MatrixTranslate(&matrix, 1.0, 2.0, -0.5) == 0;
  success &= MatrixTranslate(&matrix, -3.0, 0.25, 4.0) == 0;
  success &= MatrixRotateAxis(&matrix, 1.0, 0.0, 0.0, angle(i)) == 0;
  success &= MatrixRotateAxis(&matrix, 0.0, 1.0, 0.0, angle(i + 1)) == 0;
  success &= MatrixRotateAxis(&matrix, 0.0, 0.0, 1.0, angle(i + 2)) == 0;
  success &= MatrixTranslate(&matrix, 3.0, -0.25, -4.0) == 0;
  success &= MatrixTranslate(&matrix, at, 10.0, -20.0) == 0;
  require(success);
  return matrix;
}

void composeAll(benchmark::State& state) {
  for (auto _ : state) {
    for (std::size_t i = 0; i < kTransforms; ++i) benchmark::DoNotOptimize(compose(i));
  }
  countWork(state, kTransforms, kTransforms * sizeof(TransformMatrix));
}

void decomposeAll(benchmark::State& state) {
  std::array<TransformMatrix, kTransforms> matrices;
  for (std::size_t i = 0; i < kTransforms; ++i) matrices[i] = compose(i);
  for (auto _ : state) {
    for (const TransformMatrix& matrix : matrices) {
      MatrixComponents components;
      require(MatrixDecompose(&matrix, &components, nullptr) == 0);
      benchmark::DoNotOptimize(components);
    }
  }
  countWork(state, kTransforms, kTransforms * sizeof(TransformMatrix));
}

BENCHMARK(composeAll)->Name("matrix/compose");
BENCHMARK(decomposeAll)->Name("matrix/decompose");

}  // namespace
}  // namespace bench
