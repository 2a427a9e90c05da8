// The transform with pivots gives what eleven matrix services give one after the other.
#include <cstring>

#include "MatrixTestSupport.h"
#include "UtilityTest.h"
#include "tests/support/SplitMix.h"

namespace hostutil_tests {
namespace {

class HostMatrixPivotedTest : public UtilityTest {
 protected:
  double Pick() {
    const auto bits = testsupport::SplitMix(&state_);
    const double kept[] = {0.0, -0.0, 1.0, -1.0, 90 * kPi / 180, kPi};
    if (bits % 3 == 0) return kept[(bits >> 8) % 6];
    return static_cast<double>(static_cast<std::int64_t>(bits) >> 20) / 1e10;
  }

  PivotedTransform Next() {
    PivotedTransform from{};
    for (auto* field :
         {&from.scalePivot, &from.scale, &from.rotatePivot, &from.rotation, &from.translation}) {
      for (double& value : *field) value = Pick();
    }
    return from;
  }

  static HostError Singly(const PivotedTransform& from, MatrixComponents* components) {
    const auto& [sp, s, rp, r, t] = from;
    TransformMatrix m{};
    EXPECT_EQ(MatrixSetIdentity(&m), 0);
    EXPECT_EQ(MatrixTranslate(&m, -sp[0], -sp[1], -sp[2]), 0);
    EXPECT_EQ(MatrixScale(&m, s[0], s[1], s[2]), 0);
    EXPECT_EQ(MatrixTranslate(&m, sp[0], sp[1], sp[2]), 0);
    EXPECT_EQ(MatrixTranslate(&m, -rp[0], -rp[1], -rp[2]), 0);
    EXPECT_EQ(MatrixRotateAxis(&m, 1, 0, 0, r[0]), 0);
    EXPECT_EQ(MatrixRotateAxis(&m, 0, 1, 0, r[1]), 0);
    EXPECT_EQ(MatrixRotateAxis(&m, 0, 0, 1, r[2]), 0);
    EXPECT_EQ(MatrixTranslate(&m, rp[0], rp[1], rp[2]), 0);
    EXPECT_EQ(MatrixTranslate(&m, t[0], t[1], t[2]), 0);
    return MatrixDecompose(&m, components, nullptr);
  }

  std::uint64_t state_ = 11;
};

TEST_F(HostMatrixPivotedTest, IsTheServicesOneAfterTheOtherToTheLastBit) {
  for (int i = 0; i < 20000; ++i) {
    const PivotedTransform from = Next();
    MatrixComponents whole{};
    MatrixComponents singly{};
    ASSERT_EQ(MatrixDecomposePivoted(&from, &whole), Singly(from, &singly));
    ASSERT_EQ(std::memcmp(&whole, &singly, sizeof whole), 0) << i;
  }
}

TEST_F(HostMatrixPivotedTest, WhatIsNullOrNotFiniteHandsOutZeros) {
  PivotedTransform from = Next();
  MatrixComponents components{};
  components.scale[0] = 5;
  EXPECT_EQ(MatrixDecomposePivoted(nullptr, &components), HOST_ERR_UTILITY_NULL);
  EXPECT_EQ(components.scale[0], 0);
  EXPECT_EQ(MatrixDecomposePivoted(&from, nullptr), HOST_ERR_UTILITY_NULL);
  from.translation[2] = std::nan("");
  components.scale[0] = 5;
  EXPECT_EQ(MatrixDecomposePivoted(&from, &components), HOST_ERR_MATRIX_NOT_FINITE);
  EXPECT_EQ(components.scale[0], 0);
}

}  // namespace
}  // namespace hostutil_tests
