#include "tests/export/Shots.h"

#include <cmath>
#include <functional>
#include <memory>

namespace exporttest {
namespace {

using interchange::Axes;
using interchange::Channel;
using interchange::Composition;
using interchange::Layer;
using interchange::LayerKind;

Channel PerFrame(std::size_t frames, const std::function<double(double)>& value) {
  std::vector<double> values;
  for (std::size_t frame = 0; frame < frames; ++frame) values.push_back(value(static_cast<double>(frame)));
  return Channel(values);
}

void Set(Channel (&channels)[3], const Channel& x, const Channel& y, const Channel& z) {
  channels[0] = x;
  channels[1] = y;
  channels[2] = z;
}

Layer Null(const std::string& name) {
  Layer layer;
  layer.name = name;
  return layer;
}

Layer Camera(const std::string& name, const Channel& zoom) {
  Layer layer;
  layer.name = name;
  layer.kind = LayerKind::Camera;
  layer.lens.emplace();
  layer.lens->zoom = zoom;
  return layer;
}

Composition Shot(const std::string& name, std::size_t frames, Axes axes) {
  Composition shot;
  shot.name = name;
  shot.width = 1998;
  shot.height = 1080;
  shot.pixelAspect = 2;
  shot.framesPerSecond = 23.976023976023978;
  shot.firstFrame = 1001;
  shot.frames = frames;
  shot.metersPerUnit = 0.01;
  shot.axes = axes;
  return shot;
}

}  // namespace

Composition RigShot(Axes axes) {
  Composition shot = Shot("rig", 31, axes);
  Layer rig = Null("rig");
  Set(rig.position, PerFrame(31, [](double f) { return 12.5 * f - 200; }), 140.25,
      PerFrame(31, [](double f) { return 900 - f * f; }));
  Set(rig.rotation, 11.5, PerFrame(31, [](double f) { return 170 * f - 700; }),
      PerFrame(31, [](double f) { return 9 * std::sin(f); }));
  Set(rig.scale, 1.5, PerFrame(31, [](double f) { return 1 + f / 40; }), 0.75);
  Layer arm = Null("arm");
  arm.parent = 3;
  Set(arm.position, 3.25, -40.5, 7.125);
  Set(arm.rotation, 1, 2, 3);
  Layer camera = Camera("shot_cam", PerFrame(31, [](double f) { return 2000 + 45.5 * f; }));
  camera.parent = 0;
  Set(camera.position, 4, PerFrame(31, [](double f) { return std::cos(f / 3) * 20; }), 60);
  Set(camera.rotation, PerFrame(31, [](double f) { return -5 + f / 7; }), 90,
      PerFrame(31, [](double f) { return f * 0.01; }));
  camera.lens->filmWidth = 24.89;
  camera.lens->filmHeight = 24.89 * 1080 / 1998;
  camera.lens->filmOffsetX = 0.031;
  camera.lens->filmOffsetY = -0.017;
  camera.lens->squeeze = 1.95;
  Layer marker = Null("marker_null");
  marker.parent = 2;
  Set(marker.position, -6, 2, PerFrame(31, [](double f) { return -150 - f; }));
  shot.layers = {arm, camera, Null("between"), rig, marker};
  shot.layers[2].parent = 3;
  return shot;
}

Composition AimedShot(Axes axes) {
  Composition shot = Shot("aimed", 24, axes);
  shot.firstFrame = 0;
  shot.metersPerUnit = 1;
  Layer dolly = Null("dolly");
  Set(dolly.position, PerFrame(24, [](double f) { return f / 4; }), 1.7, -30);
  Set(dolly.rotation, 0, PerFrame(24, [](double f) { return 25 * std::sin(f / 5); }), 0);
  Layer camera = Camera("dance_cam", 2400);
  camera.parent = 0;
  camera.aimed = true;
  Set(camera.position, PerFrame(24, [](double f) { return 8 * std::cos(f / 2); }), 1.5,
      PerFrame(24, [](double f) { return 8 * std::sin(f / 2); }));
  Set(camera.interest, 0.5, PerFrame(24, [](double f) { return std::sin(f); }), -0.25);
  Set(camera.rotation, 0, 0, PerFrame(24, [](double f) { return f * 12; }));
  Layer still = Camera("still_cam", PerFrame(24, [](double f) { return f < 12 ? 1500 : 1600; }));
  still.aimed = true;
  Set(still.position, 20, 30, 40);
  Set(still.interest, 1, 2, 3);
  shot.layers = {dolly, camera, still};
  return shot;
}

Composition StillShot(Axes axes) {
  Composition shot = Shot("still", 1, axes);
  Layer camera = Camera("cam", 1234.5);
  Set(camera.position, 1, 2, 3);
  Set(camera.rotation, 4, 5, 6);
  Layer marker = Null("null1");
  marker.parent = 0;
  Set(marker.position, 0.5, -0.25, -9);
  Set(marker.scale, 2, 3, -4);
  shot.layers = {camera, marker};
  return shot;
}

Composition KeyedShot(Axes axes) {
  Composition shot = Shot("keyed", 20, axes);
  shot.firstFrame = 7.5;
  const auto places = std::make_shared<const std::vector<double>>(std::vector<double>{-2.5, 0.25, 6, 31});
  Layer camera = Camera("cam", Channel(places, {1000, 1500, 2200, 900}));
  Set(camera.position, Channel(places, {0, 10, -5, 80}), 15, Channel(places, {1, 2, 3, 5}));
  Set(camera.rotation, 0, Channel(places, {0, 720, -300, 10}), 0);
  shot.layers = {camera};
  return shot;
}

std::vector<NamedShot> AllShots(Axes axes) {
  return {{"rig", RigShot(axes)},
          {"aimed", AimedShot(axes)},
          {"still", StillShot(axes)},
          {"keyed", KeyedShot(axes)}};
}

std::vector<Point> PointsBefore(const Composition& composition, std::size_t camera, std::size_t frame) {
  const Seat seat = WorldSeat(composition, camera, frame);
  const double ahead = composition.axes == Axes::Host ? 1 : -1;
  std::vector<Point> points;
  for (const Point& step : {Point{0, 0, 10}, Point{3, -2, 12}, Point{-4, 1, 25}, Point{60, 35, 800}}) {
    points.push_back(Applied(seat, {step[0], step[1], step[2] * ahead}));
  }
  return points;
}

}  // namespace exporttest
