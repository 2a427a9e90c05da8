// Scenes beside the source folder, where they are there, against what the program that made them computed.
#include <algorithm>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <sstream>

#include "motion/SceneCamera.h"
#include "tests/motion/EvaluatorFixture.h"
#include "tests/support/LeftOut.h"

namespace {

using motion::NumberId;
using motion::Vector;

class OutsideShotsTest : public testmotion::EvaluatorTest {
 protected:
  static std::filesystem::path Shots() {
    return std::filesystem::path(MAYASCENE_SOURCE_DIR) / ".." / "shared" / "shots";
  }

  static std::string TextOf(const std::filesystem::path& path) {
    std::ifstream in(path, std::ios::binary);
    EXPECT_TRUE(in) << path;
    return {std::istreambuf_iterator<char>(in), {}};
  }

  void SetUp() override {
    if (std::filesystem::exists(Shots())) return;
    GTEST_SKIP() << testsupport::kLeftOut
                 << "1,010 values of curves and 808 points of ../shared/shots, beside the source folder";
  }
};

// Twelve significant digits are written.
TEST_F(OutsideShotsTest, CurvesHaveTheValuesThatWereWritten) {
  constexpr double kWritten = 6e-12;
  constexpr char kEnd[] = "_raw.chan";
  Read(TextOf(Shots() / "curves" / "example_curves.ma"));
  int compared = 0;
  for (const auto& entry : std::filesystem::directory_iterator(Shots() / "curves")) {
    const std::string name = entry.path().filename().string();
    if (!name.ends_with(kEnd)) continue;
    const NumberId id = evaluator().Number(At(name.substr(0, name.size() - std::size(kEnd) + 1)), "ty");
    std::istringstream lines(TextOf(entry.path()));
    for (double frame = 0.0, value = 0.0; lines >> frame >> value; ++compared) {
      evaluator().MoveTo(frame);
      EXPECT_NEAR(evaluator().Value(id), value, kWritten * std::max(1.0, std::abs(value)))
          << name << ' ' << frame;
    }
  }
  EXPECT_EQ(compared, 1010);
}

// The tracks count over the whole film back, so the picture has its aspect.
TEST_F(OutsideShotsTest, PointsLandWhereTheyWereSeen) {
  constexpr double kWidth = 960.0;
  constexpr double kHeight = 640.0;
  constexpr double kPixels = 1e-6;
  Read(TextOf(Shots() / "cube_a.ma"));
  const motion::SceneCamera shape(&evaluator(), At("cameraShape1"));
  const motion::MatrixId camera = evaluator().World(At("camera1"));
  std::istringstream lines(TextOf(Shots() / "cube_a.uv"));
  int tracks = 0;
  int compared = 0;
  lines >> tracks;
  for (int track = 1; track <= tracks; ++track) {
    const motion::MatrixId locator = evaluator().World(At("locator" + std::to_string(track)));
    std::string name;
    int rows = 0;
    lines >> name >> rows;
    for (int row = 0; row < rows; ++row, ++compared) {
      double frame = 0.0;
      double u = 0.0;
      double v = 0.0;
      double weight = 0.0;
      lines >> frame >> u >> v >> weight;
      evaluator().MoveTo(frame);
      motion::Matrix toCamera;
      ASSERT_TRUE(Invert(evaluator().Value(camera), &toCamera));
      const Vector point = TransformPoint(evaluator().Value(locator).origin, toCamera);
      motion::PicturePoint seen{};
      ASSERT_TRUE(Project(shape.Now(), {kWidth, kHeight, kWidth / kHeight}, point, &seen));
      EXPECT_NEAR(seen.u * kWidth, u * kWidth, kPixels) << name << ' ' << frame;
      EXPECT_NEAR(seen.v * kHeight, v * kHeight, kPixels) << name << ' ' << frame;
    }
  }
  EXPECT_EQ(compared, 808);
}

}  // namespace
