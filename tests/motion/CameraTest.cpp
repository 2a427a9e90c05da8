#include "motion/Camera.h"

#include "tests/motion/Near.h"

namespace {

using motion::Camera;
using motion::FilmWindow;
using motion::Picture;
using motion::PicturePoint;
using motion::Vector;
namespace filmfit = motion::filmfit;

constexpr double kRounding = 1e-14;

Picture Pixels(double width, double height) { return {width, height, width / height}; }

// Aspect 1.5.
Camera Film(int fit) {
  Camera camera;
  camera.horizontalAperture = 1.2;
  camera.verticalAperture = 0.8;
  camera.filmFit = fit;
  return camera;
}

TEST(Camera, ThePixelAspectFollowsFromThePicturesOwn) {
  EXPECT_NEAR(motion::PixelAspect({720.0, 576.0, 1.3333333}), 1.06666664, 1e-12);
  EXPECT_NEAR(motion::DeviceAspect({720.0, 576.0, 1.3333333}), 1.3333333, 1e-12);
}

TEST(Camera, ANearlySquarePixelIsSquare) {
  const Picture nearly{1000.0, 500.0, 2.0 * 1.0099};
  EXPECT_EQ(PixelAspect(nearly), 1.0);
  EXPECT_EQ(DeviceAspect(nearly), 2.0);
  EXPECT_NE(motion::PixelAspect({1000.0, 500.0, 2.0 * 1.0101}), 1.0);
}

TEST(Camera, ByDefaultTheHorizontalApertureFillsTheWidth) {
  const FilmWindow window = FilmWindowOf(Camera{}, Picture{});
  EXPECT_EQ(window.width, 1.41732);
  EXPECT_NEAR(window.height, 1.41732 * 540.0 / 960.0, kRounding);
  EXPECT_EQ(window.centreX, 0.0);
  EXPECT_EQ(window.centreY, 0.0);
}

TEST(Camera, AVerticalFitFillsTheHeight) {
  const FilmWindow window = FilmWindowOf(Film(filmfit::kVertical), Pixels(200.0, 100.0));
  EXPECT_EQ(window.height, 0.8);
  EXPECT_NEAR(window.width, 1.6, kRounding);
}

TEST(Camera, AFillShowsNothingBesideTheFilm) {
  EXPECT_EQ(ResolvedFit(Film(filmfit::kFill), Pixels(160.0, 90.0)), filmfit::kHorizontal);
  EXPECT_EQ(ResolvedFit(Film(filmfit::kFill), Pixels(400.0, 300.0)), filmfit::kVertical);
  EXPECT_EQ(ResolvedFit(Film(filmfit::kFill), Pixels(150.0, 100.0)), filmfit::kHorizontal);
}

TEST(Camera, AnOverscanShowsAllOfTheFilm) {
  EXPECT_EQ(ResolvedFit(Film(filmfit::kOverscan), Pixels(160.0, 90.0)), filmfit::kVertical);
  EXPECT_EQ(ResolvedFit(Film(filmfit::kOverscan), Pixels(400.0, 300.0)), filmfit::kHorizontal);
}

TEST(Camera, AnUnknownFitIsHorizontal) {
  EXPECT_EQ(ResolvedFit(Film(7), Pixels(100.0, 100.0)), filmfit::kHorizontal);
}

TEST(Camera, ASqueezeWidensTheFilm) {
  Camera camera = Film(filmfit::kFill);
  camera.lensSqueeze = 2.0;  // aspect 3
  EXPECT_EQ(ResolvedFit(camera, Pixels(200.0, 100.0)), filmfit::kVertical);
  camera.filmFit = filmfit::kHorizontal;
  EXPECT_EQ(FilmWindowOf(camera, Pixels(200.0, 100.0)).width, 2.4);
  EXPECT_EQ(FilmWindowOf(camera, Pixels(200.0, 100.0)).height, 1.2);
}

TEST(Camera, AShakeOverscanEnlargesTheFilmWhereItIsOn) {
  Camera camera = Film(filmfit::kHorizontal);
  camera.shakeOverscan = 1.5;
  EXPECT_EQ(FilmWindowOf(camera, Pixels(100.0, 100.0)).width, 1.2);
  camera.hasShakeOverscan = true;
  EXPECT_NEAR(FilmWindowOf(camera, Pixels(100.0, 100.0)).width, 1.8, kRounding);
  camera.filmFit = filmfit::kVertical;
  EXPECT_NEAR(FilmWindowOf(camera, Pixels(100.0, 100.0)).height, 1.2, kRounding);
}

TEST(Camera, OffsetAndShakeMoveTheWindow) {
  Camera camera = Film(filmfit::kHorizontal);
  camera.horizontalOffset = 0.1;
  camera.verticalOffset = 0.2;
  camera.horizontalShake = 0.03;
  camera.verticalShake = 0.04;
  EXPECT_EQ(FilmWindowOf(camera, Picture{}).centreX, 0.1);
  EXPECT_EQ(FilmWindowOf(camera, Picture{}).centreY, 0.2);
  camera.hasShake = true;
  EXPECT_NEAR(FilmWindowOf(camera, Picture{}).centreX, 0.13, kRounding);
  EXPECT_NEAR(FilmWindowOf(camera, Picture{}).centreY, 0.24, kRounding);
}

TEST(Projection, APointLandsWhereItsRayMeetsTheFilm) {
  Camera camera = Film(filmfit::kHorizontal);
  camera.focalLength = 25.4;  // an inch
  PicturePoint at{};
  ASSERT_TRUE(Project(camera, Pixels(200.0, 100.0), {3.0, 1.0, -10.0}, &at));
  EXPECT_NEAR(at.u, 0.5 + 0.3 / 1.2, kRounding);
  EXPECT_NEAR(at.v, 0.5 + 0.1 / 0.6, kRounding);
}

TEST(Projection, AnOffsetMovesThePictureTheOtherWay) {
  Camera camera = Film(filmfit::kHorizontal);
  camera.horizontalOffset = 0.12;
  camera.verticalOffset = 0.06;
  PicturePoint at{};
  ASSERT_TRUE(Project(camera, Pixels(200.0, 100.0), {0.0, 0.0, -10.0}, &at));
  EXPECT_NEAR(at.u, 0.4, kRounding);
  EXPECT_NEAR(at.v, 0.4, kRounding);
}

TEST(Projection, ACameraScaleShortensTheFocalLength) {
  Camera camera = Film(filmfit::kHorizontal);
  camera.focalLength = 50.8;
  camera.cameraScale = 2.0;
  EXPECT_EQ(EffectiveFocalLength(camera), 25.4);
  PicturePoint at{};
  ASSERT_TRUE(Project(camera, Pixels(200.0, 100.0), {3.0, 0.0, -10.0}, &at));
  EXPECT_NEAR(at.u, 0.75, kRounding);
}

TEST(Projection, FailsBesideAndBehindTheCamera) {
  PicturePoint at{7.0, 8.0};
  EXPECT_FALSE(Project(Camera{}, Picture{}, {1.0, 1.0, 0.0}, &at));
  EXPECT_FALSE(Project(Camera{}, Picture{}, {1.0, 1.0, 5.0}, &at));
  EXPECT_EQ(at.u, 7.0);
  EXPECT_EQ(at.v, 8.0);
}

TEST(Projection, FailsWhereThereIsNoPicture) {
  PicturePoint at{};
  Camera camera;
  camera.horizontalAperture = 0.0;
  EXPECT_FALSE(Project(camera, Picture{}, {1.0, 1.0, -5.0}, &at));
  EXPECT_FALSE(Project(Camera{}, {960.0, 0.0, 0.0}, {1.0, 1.0, -5.0}, &at));
}

}  // namespace
