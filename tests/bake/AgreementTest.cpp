// Where the nodes of a bake stand at its frames, beside where those of its scene stand at theirs.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <string>

#include "motion/Evaluator.h"
#include "tests/bake/BakeFixture.h"

namespace {

using bake_test::Baked;
using bake_test::CurveOf;

constexpr double kRounding = 1e-11;

// The rig's own lines, and what is said of the camera's transform under it.
struct Rig {
  const char* name;
  const char* rig;
  const char* camera;
};

std::string TextOf(const Rig& rig) {
  std::string text = "currentUnit -l centimeter -a degree -t film;\ncreateNode transform -n \"rig\";\n";
  text += "\tsetAttr \".t\" -type \"double3\" 5 -3 2 ;\n\tsetAttr \".r\" -type \"double3\" 20 30 -40 ;\n";
  text += rig.rig;
  text += "createNode transform -n \"shotCam\" -p \"rig\";\n\tsetAttr \".t\" -type \"double3\" 1 2 3 ;\n";
  text += rig.camera;
  text += "createNode camera -n \"shotCamShape\" -p \"shotCam\";\n";
  text += CurveOf("animCurveTL", "drift", "11 0 15 8", "rig.tz");
  text += CurveOf("animCurveTA", "turn", "11 0 15 400", "rig.ry");
  return text + CurveOf("animCurveTA", "nod", "11 -80 15 80", "shotCam.rx");
}

double Largest(const motion::Vector& a, const motion::Vector& b) {
  return std::max({std::fabs(a.x - b.x), std::fabs(a.y - b.y), std::fabs(a.z - b.z)});
}

double Difference(const motion::Matrix& a, const motion::Matrix& b) {
  return std::max({Largest(a.x, b.x), Largest(a.y, b.y), Largest(a.z, b.z), Largest(a.origin, b.origin)});
}

// The largest difference of the camera's matrices at any frame.
double Difference(const std::string& text, const bake::Options& options) {
  diag::Collector ignored(text);
  const scene::Scene read = scene::Read(text, ignored);
  motion::Evaluator before(read, &ignored);
  const Baked baked(text, options);
  motion::Evaluator after(baked.scene(), &ignored);
  const motion::MatrixId from = before.World(read.Find("shotCam"));
  const motion::MatrixId to = after.World(baked.scene().Find("shotCam"));
  double largest = 0.0;
  const bake::FrameRange& frames = baked.report().frames.value();
  for (std::size_t frame = 0; frame < frames.count; ++frame) {
    before.MoveTo(frames.Frame(frame));
    after.MoveTo(static_cast<double>(frame) * frames.step);
    largest = std::max(largest, Difference(before.Value(from), after.Value(to)));
  }
  return largest;
}

class Agreement : public testing::TestWithParam<Rig> {};

TEST_P(Agreement, InTheHierarchyAndInTheWorld) {
  const std::string text = TextOf(GetParam());
  bake::Options options;
  options.step = 0.5;
  EXPECT_LT(Difference(text, options), kRounding);
  options.world = true;
  EXPECT_LT(Difference(text, options), kRounding);
}

constexpr Rig kRigs[] = {
    {"Plain", "", ""},
    {"RotateOrders", "\tsetAttr \".ro\" 3;\n", "\tsetAttr \".ro\" 5;\n"},
    {"Pivots", "\tsetAttr \".rp\" -type \"double3\" 1 2 3 ;\n\tsetAttr \".sp\" -type \"double3\" 3 2 1 ;\n",
     "\tsetAttr \".rp\" -type \"double3\" -1 4 2 ;\n\tsetAttr \".rpt\" -type \"double3\" 7 0 1 ;\n"},
    {"RotateAxes", "\tsetAttr \".ra\" -type \"double3\" 10 20 30 ;\n",
     "\tsetAttr \".ra\" -type \"double3\" 0 0 90 ;\n"},
    {"OffsetMatrices", "\tsetAttr \".opm\" -type \"matrix\" 0 1 0 0 -1 0 0 0 0 0 1 0 5 6 7 1;\n",
     "\tsetAttr \".opm\" -type \"matrix\" 1 0 0 0 0 1 0 0 0 0 1 0 10 0 0 1;\n"},
    {"OffsetWithoutTheParent", "",
     "\tsetAttr \".opm\" -type \"matrix\" 1 0 0 0 0 1 0 0 0 0 1 0 10 0 0 1;\n"
     "\tsetAttr \".it\" no;\n"},
    {"Limits", "\tsetAttr \".mxrx\" 10;\n\tsetAttr \".xrxe\" yes;\n",
     "\tsetAttr \".mnrx\" -45;\n\tsetAttr \".mrxe\" yes;\n"},
};

INSTANTIATE_TEST_SUITE_P(Rigs, Agreement, testing::ValuesIn(kRigs),
                         [](const auto& rig) { return std::string(rig.param.name); });

// A rig that now stands under its parent and now does not.
TEST(AgreementOfOne, ACameraWhoseInheritanceIsDriven) {
  const std::string text = TextOf({"", "", ""}) + CurveOf("animCurveTU", "free", "12 1 13 0", "shotCam.it");
  EXPECT_LT(Difference(text, {}), kRounding);
}

}  // namespace
