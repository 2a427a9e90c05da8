// The conversion from first principles: what a scene's own camera sees, and what the camera of the
// composition that an import makes of it sees, are the same picture.
#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <cstdint>
#include <cstdlib>
#include <string>

#include "hostapi/LayerStreams.h"
#include "tests/examples/CompositionView.h"
#include "tests/examples/ConversionScene.h"
#include "tests/support/LoadedHost.h"

namespace {

using conversion::CompositionView;
using conversion::ConversionScene;
using conversion::Pixel;
using conversion::SceneTraits;
using conversion::Vector3;

constexpr std::uint64_t kScenesOfAKind = 150;
constexpr double kPixelTolerance = 1e-6;
constexpr double kPointsPerCentimetre = 72.0 / 2.54;

class Conversion : public testing::Test {
 protected:
  void expectTheSamePicture(const SceneTraits& traits, bool linearUnits = false) {
    testsupport::LoadedHost host(testsupport::WithUnits(linearUnits));
    for (std::uint64_t seed = 1; seed <= kScenesOfAKind && !HasFatalFailure(); ++seed) {
      SCOPED_TRACE(seed);
      const ConversionScene scene(traits, seed);
      compare(scene, traits, import(host, scene), linearUnits ? kPointsPerCentimetre : 1.0);
    }
  }

 private:
  // The composition that receives the layers; null when the import failed.
  static const refhost::Composition* import(testsupport::LoadedHost& host, const ConversionScene& scene) {
    const refhost::CallbackResult result = host.Import(scene.text());
    EXPECT_EQ(result.code, 0);
    EXPECT_TRUE(result.ledgerClean());
    const bool made = result.folder != nullptr && !result.folder->compositions.empty();
    return made ? result.folder->compositions.front() : nullptr;
  }

  static void compare(const ConversionScene& scene, const SceneTraits& traits,
                      const refhost::Composition* composition, double hostUnits) {
    ASSERT_NE(composition, nullptr);
    EXPECT_EQ(composition->width, std::lround(scene.width() * traits.pixelAspect));
    EXPECT_EQ(composition->height, scene.height());
    const CompositionView view(*composition);
    ASSERT_TRUE(view.hasCamera());
    EXPECT_FALSE(view.camera()->aimed);
    for (std::size_t point = 0; point < scene.pointCount(); ++point) {
      const refhost::Layer* layer = view.layer(scene.pointName(point));
      ASSERT_NE(layer, nullptr) << scene.pointName(point);
      ASSERT_EQ(layer->findStream(HOST_STREAM_POSITION)->keyCount(), scene.keyCount());
      for (std::size_t key = 0; key < std::max<std::size_t>(1, scene.keyCount()); ++key) {
        comparePoint(scene, point, view, *layer, key, hostUnits);
      }
    }
  }

  // The point itself, and three places around it, which also see its rotation and its scale.
  static void comparePoint(const ConversionScene& scene, std::size_t point, const CompositionView& view,
                           const refhost::Layer& layer, std::size_t key, double hostUnits) {
    constexpr double arm = 0.125;
    for (const Vector3& place : {Vector3{}, {arm, 0.0, 0.0}, {0.0, arm, 0.0}, {0.0, 0.0, arm}}) {
      const Pixel expected = scene.seen(point, place, key);
      const Pixel found =
          view.seen(layer, {place.x * hostUnits, -place.y * hostUnits, -place.z * hostUnits}, key);
      EXPECT_NEAR(found.x, expected.x, kPixelTolerance) << "point " << point << " key " << key;
      EXPECT_NEAR(found.y, expected.y, kPixelTolerance) << "point " << point << " key " << key;
    }
  }
};

TEST_F(Conversion, ShowsTheSamePictureWithoutPivotsAndScale) { expectTheSamePicture({}); }

TEST_F(Conversion, ShowsTheSamePictureWithPivots) { expectTheSamePicture({.pivots = true}); }

TEST_F(Conversion, ShowsTheSamePictureWithNonUniformScale) {
  expectTheSamePicture({.nonUniformScale = true});
}

TEST_F(Conversion, ShowsTheSamePictureWithNegativeScale) { expectTheSamePicture({.negativeScale = true}); }

TEST_F(Conversion, ShowsTheSamePictureWithPivotsAndNegativeNonUniformScale) {
  expectTheSamePicture({.pivots = true, .nonUniformScale = true, .negativeScale = true});
}

TEST_F(Conversion, ShowsTheSamePictureWithVerticalFit) {
  expectTheSamePicture({.pivots = true, .nonUniformScale = true, .verticalFit = true});
}

TEST_F(Conversion, ShowsTheSamePictureOfAnamorphicPixelsInSquareOnes) {
  expectTheSamePicture({.pivots = true, .nonUniformScale = true, .pixelAspect = 2.0});
}

TEST_F(Conversion, ShowsTheSamePictureWhereTheYRotationIsAQuarterTurn) {
  expectTheSamePicture({.pivots = true, .nonUniformScale = true, .atThePole = true});
}

TEST_F(Conversion, ShowsTheSamePictureInPointsAsInCentimetres) {
  expectTheSamePicture({.pivots = true, .nonUniformScale = true}, true);
}

TEST_F(Conversion, ShowsTheSamePictureAtEveryKey) {
  expectTheSamePicture({.pivots = true, .nonUniformScale = true, .negativeScale = true, .keyCount = 5});
}

TEST_F(Conversion, ShowsTheSamePictureAtEveryKeyInPoints) {
  expectTheSamePicture({.pivots = true, .nonUniformScale = true, .keyCount = 3}, true);
}

}  // namespace
