// Large scenes cost a number of list calls that grows with the scene and no faster.
#include <fstream>
#include <string>

#if defined(__linux__)
#include <unistd.h>
#endif

#include "hostutil/HostSetup.h"
#include "tests/support/ReaderFixture.h"

namespace testsupport {
namespace {

constexpr int kNodes = 200000;
constexpr int kKeys = 1000000;
constexpr int kLines = 200000;

// Keys that stand one after the other are appended so many at once.
constexpr int kKeysOfARun = 256;

// Creating, writing back and connecting a node each take a handful of list calls.
constexpr std::int64_t kCallsPerNode = 12;

class ScaleTest : public ReaderTest {
 protected:
  void ExpectLinear(const std::string& text, std::int64_t count) {
    const UtilityRehearsal counting;
    ASSERT_EQ(Read(text), 0);
    EXPECT_LE(ListCallCount(), kCallsPerNode * count);
    EXPECT_GE(HostUtilityCallCount(HOST_UTILITY_ListAppend), count);
  }

  static std::string Nodes(std::string (*name)(int)) {
    std::string text;
    for (int number = 0; number < kNodes; ++number)
      text += "createNode transform" + name(number) + ";\nsetAttr \".t\" 1 2 3;\n";
    return text;
  }
};

TEST_F(ScaleTest, ManyNodesOfDistinctNames) {
  ExpectLinear(Nodes([](int number) { return " -n \"node" + std::to_string(number) + "\""; }), kNodes);
  EXPECT_EQ(TransformCount(), kNodes);
  EXPECT_DOUBLE_EQ(TransformAt(kNodes - 1).translate[2], 3.0);
}

TEST_F(ScaleTest, ManyNodesOfOneName) {
  ExpectLinear(Nodes([](int) { return std::string(" -n \"node\""); }), kNodes);
  EXPECT_EQ(TransformCount(), kNodes);
  EXPECT_DOUBLE_EQ(TransformAt(0).translate[0], 1.0);
  EXPECT_DOUBLE_EQ(TransformAt(kNodes - 1).translate[0], 0.0);
}

TEST_F(ScaleTest, ManyUnnamedNodes) {
  ExpectLinear(Nodes([](int) { return std::string(); }), kNodes);
  EXPECT_EQ(TransformCount(), kNodes);
}

#if defined(__linux__) && !MAYASCENE_SANITIZED
// The bytes of addresses that the process has taken.
std::size_t AddressSpace() {
  std::size_t pages = 0;
  std::ifstream("/proc/self/statm") >> pages;
  return pages * static_cast<std::size_t>(sysconf(_SC_PAGESIZE));
}

TEST_F(ScaleTest, AKeyCountThatLiesReservesNoMoreThanItsCommandCouldHold) {
  constexpr int kCurves = 2000;
  constexpr int kKeysOfACurve = 300;  // the count is looked at after a first run of 256
  // Two records of half a kilobyte, a list, and its keys; those that could still follow are no more than
  // there are.
  constexpr std::size_t kBytesPerCurve = 4096 + 2 * kKeysOfACurve * sizeof(MAYA_Key);
  std::string keys;
  for (int key = 0; key < kKeysOfACurve; ++key) keys += " " + std::to_string(key) + " 5";
  std::string text;
  for (int number = 0; number < kCurves; ++number) {
    text += "createNode animCurveTL -n \"c" + std::to_string(number) +
            "\";\nsetAttr -s 999999999 \".ktv[0:299]\"" + keys + ";\n";
  }
  const std::size_t before = AddressSpace();
  ASSERT_EQ(Read(text), 0);
  const std::size_t held = AddressSpace() - before;
  EXPECT_LT(held, kCurves * kBytesPerCurve);
  EXPECT_GT(held, kCurves * sizeof(MAYA_AnimCurve));
}
#endif

TEST_F(ScaleTest, ManyConnections) {
  std::string text;
  for (int number = 0; number < kNodes / 2; ++number) {
    const std::string digits = std::to_string(number);
    text += "createNode transform -n \"t" + digits + "\";\ncreateNode animCurveTL -n \"c" + digits + "\";\n";
  }
  for (int number = 0; number < kNodes / 2; ++number) {
    const std::string digits = std::to_string(number);
    text += "connectAttr \"c" + digits + ".o\" \"t" + digits + ".tx\";\n";
  }
  ExpectLinear(text, kNodes);
  EXPECT_EQ(TransformAt(kNodes / 2 - 1).curve[0], kNodes / 2 - 1);
}

TEST_F(ScaleTest, ManyCurvesOfOneNameWithKeys) {
  std::string text;
  for (int number = 0; number < kNodes; ++number)
    text += "createNode animCurveTL -n \"a\";\nsetAttr \".ktv\" 1 " + std::to_string(number) + ";\n";
  ExpectLinear(text, kNodes);
  EXPECT_EQ(KeysOf(0), (Keys{{1, kNodes - 1}}));
  EXPECT_EQ(HeldObjects().size(), 2u);
}

TEST_F(ScaleTest, OneCurveOfManyKeys) {
  std::string text = "createNode animCurveTL -n \"a\";\nsetAttr \".ktv\"";
  for (int number = 0; number < kKeys; ++number) text += " " + std::to_string(number) + " 1";
  text += ";\n";
  const UtilityRehearsal counting;
  ASSERT_EQ(Read(text), 0);
  EXPECT_EQ(Count(CurveAt(0).keys), kKeys);
  EXPECT_LE(ListCallCount(), kKeys / kKeysOfARun + 100);
}

TEST_F(ScaleTest, ManyTokensThatNothingReads) {
  std::string text;
  for (int number = 0; number < kLines; ++number) text += "word -x 12 ( \"s\" /**/ //\n";
  const UtilityRehearsal counting;
  ASSERT_EQ(Read(text), 0);
  EXPECT_EQ(ListCallCount(), 0);
  EXPECT_EQ(scene().line, 0);
}

TEST_F(ScaleTest, OneVeryLongTokenOfEachKind) {
  const std::string megabyte(1u << 20, 'x');
  ASSERT_EQ(Read(megabyte + " -" + megabyte + " 1" + megabyte + " \"" + megabyte + "\" /*" + megabyte +
                 "*/ //" + megabyte + "\n"),
            0);
  EXPECT_EQ(Read(megabyte), 1289986);
}

}  // namespace
}  // namespace testsupport
