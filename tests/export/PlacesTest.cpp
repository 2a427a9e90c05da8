// Places of the plain description, held to the tests' own arithmetic.
#include "export/Places.h"

#include <gtest/gtest.h>

#include <cmath>
#include <cstddef>
#include <numbers>
#include <string>

#include "tests/export/Shots.h"
#include "tests/export/Space.h"

namespace exporttest {
namespace {

using interchange::Axes;
using interchange::Composition;
using interchange::Layer;
using interchange::Matrix;
using interchange::Vector;

Point PointOf(const Vector& a) { return {a.x, a.y, a.z}; }

// Relative to the places of these shots, which are below 2000.
constexpr double kNear = 1e-9;

void ExpectSeat(const Matrix& found, const Seat& wanted) {
  for (const Point& point : {Point{0, 0, 0}, Point{1, 0, 0}, Point{0, 1, 0}, Point{0, 0, 1}}) {
    const Vector at = TransformPoint(found, {point[0], point[1], point[2]});
    EXPECT_LT(Distance(PointOf(at), Applied(wanted, point)), kNear);
  }
}

// What the layer's place is without its parent.
Seat OwnSeat(const Composition& shot, std::size_t layer, std::size_t frame) {
  Composition alone = shot;
  alone.layers[layer].parent.reset();
  return WorldSeat(alone, layer, frame);
}

TEST(Places, LayersStandWhereTheirPositionsTurnsAndScalesPutThem) {
  for (const Axes axes : {Axes::Scene, Axes::Host}) {
    for (const NamedShot& shot : AllShots(axes)) {
      interchange::Worlds worlds(shot.composition);
      for (std::size_t frame = 0; frame < shot.composition.frames; ++frame) {
        worlds.GoTo(frame);
        for (std::size_t layer = 0; layer < shot.composition.layers.size(); ++layer) {
          SCOPED_TRACE(shot.name + ", layer " + std::to_string(layer) + ", frame " + std::to_string(frame));
          ExpectSeat(worlds.Of(layer), WorldSeat(shot.composition, layer, frame));
          const Seat own = OwnSeat(shot.composition, layer, frame);
          const Layer& one = shot.composition.layers[layer];
          ExpectSeat(LocalAt(shot.composition, one, frame), own);
          const interchange::Place place = LocalPlaceAt(shot.composition, one, frame);
          const auto& q = place.rotation;
          ExpectSeat(LocalAt(shot.composition, one, frame),
                     {Scaled(TurnedBy({q.x, q.y, q.z, q.w}), PointOf(place.scale)), PointOf(place.position)});
        }
      }
    }
  }
}

// Computed by hand: a boom 7 above the ground, a quarter turn about y and twice as wide; the camera 2.5 to
// its side, 30 degrees down.
TEST(Places, ACameraOnABoomStandsWhereTheCalculationByHandPutsIt) {
  Composition shot = StillShot();
  Layer& camera = shot.layers[0];
  Layer& boom = shot.layers[1];
  boom = Layer();
  boom.position[1] = 7;
  boom.rotation[1] = 90;
  boom.scale[0] = 2;
  camera.parent = 1;
  const double own[] = {2.5, 0, 0};
  const double turns[] = {-30, 0, 0};
  for (int i = 0; i < 3; ++i) {
    camera.position[i] = own[i];
    camera.rotation[i] = turns[i];
  }
  interchange::Worlds worlds(shot, true);
  worlds.GoTo(0);
  const Matrix view = worlds.ViewOf(0);
  EXPECT_LT(Distance(PointOf(view.Column(3)), {0, 7, -5}), kNear);
  const double half = 0.5, rest = std::sqrt(3.0) / 2;
  EXPECT_LT(Distance(PointOf(view.Column(0)), {0, 0, -1}), kNear);
  EXPECT_LT(Distance(PointOf(view.Column(1)), {-half, rest, 0}), kNear);
  EXPECT_LT(Distance(PointOf(view.Column(2)), {rest, half, 0}), kNear);
}

TEST(Places, ALensHasTheAngleOfHalfThePictureAboveItsMiddle) {
  const Composition shot = RigShot();
  for (std::size_t frame = 0; frame < shot.frames; ++frame) {
    const double zoom = 2000 + 45.5 * static_cast<double>(frame);
    const double degrees = VerticalAngleAt(shot, *shot.layers[1].lens, frame);
    EXPECT_NEAR(std::tan(degrees * std::numbers::pi / 360), 540 / zoom, 1e-12) << frame;
  }
}

}  // namespace
}  // namespace exporttest
