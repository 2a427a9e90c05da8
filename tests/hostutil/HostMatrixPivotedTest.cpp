// The transform with pivots is its eleven services in one.
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
    HostError code = MatrixSetIdentity(&m);
    if (code == 0) code = MatrixTranslate(&m, -sp[0], -sp[1], -sp[2]);
    if (code == 0) code = MatrixScale(&m, s[0], s[1], s[2]);
    if (code == 0) code = MatrixTranslate(&m, sp[0], sp[1], sp[2]);
    if (code == 0) code = MatrixTranslate(&m, -rp[0], -rp[1], -rp[2]);
    if (code == 0) code = MatrixRotateAxis(&m, 1, 0, 0, r[0]);
    if (code == 0) code = MatrixRotateAxis(&m, 0, 1, 0, r[1]);
    if (code == 0) code = MatrixRotateAxis(&m, 0, 0, 1, r[2]);
    if (code == 0) code = MatrixTranslate(&m, rp[0], rp[1], rp[2]);
    if (code == 0) code = MatrixTranslate(&m, t[0], t[1], t[2]);
    return code == 0 ? MatrixDecompose(&m, components, nullptr) : code;
  }

  static std::vector<int64_t> Counts() {
    std::vector<int64_t> counts;
    for (int32_t service = 0; service < HOST_UTILITY_COUNT; ++service)
      counts.push_back(HostUtilityCallCount(service));
    return counts;
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

TEST_F(HostMatrixPivotedTest, CountsAndFailsAsTheServices) {
  constexpr int32_t kServices[] = {HOST_UTILITY_MatrixSetIdentity, HOST_UTILITY_MatrixTranslate,
                                   HOST_UTILITY_MatrixScale, HOST_UTILITY_MatrixRotateAxis,
                                   HOST_UTILITY_MatrixDecompose};
  const PivotedTransform from = Next();
  for (const int32_t service : kServices) {
    for (int64_t nth = 0; nth <= 6; ++nth) {
      for (const HostError code : {0, 4711}) {
        const HostUtilityFailure failure{service, nth, code, HOST_THROW_NOTHING};
        ASSERT_EQ(HostAddUtilityFailure(&failure), 0);
        MatrixComponents whole{};
        MatrixComponents singly{};
        HostBeginRehearsal();
        const HostError wholeCode = MatrixDecomposePivoted(&from, &whole);
        const std::vector<int64_t> wholeCounts = Counts();
        HostBeginRehearsal();
        EXPECT_EQ(wholeCode, Singly(from, &singly)) << service << " " << nth;
        EXPECT_EQ(wholeCounts, Counts()) << service << " " << nth;
        EXPECT_EQ(std::memcmp(&whole, &singly, sizeof whole), 0) << service << " " << nth;
        HostClearUtilityFailures();
      }
    }
  }
  MatrixComponents components{};
  HostBeginRehearsal();
  ASSERT_EQ(MatrixDecomposePivoted(&from, &components), 0);
  const std::vector<int64_t> unplanned = Counts();
  HostBeginRehearsal();
  ASSERT_EQ(Singly(from, &components), 0);
  EXPECT_EQ(unplanned, Counts());
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
