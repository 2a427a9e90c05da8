#include "tests/tools/HandBuiltScene.h"

#include <cstdint>
#include <memory>
#include <vector>

#include "hostapi/CameraSuite.h"
#include "hostapi/LayerStreams.h"

namespace mayascene_test {
namespace {

using refhost::Layer;
using refhost::LayerKind;
using refhost::Stream;

Stream streamOf(std::int32_t id) {
  Stream stream;
  stream.id = id;
  stream.dimension = id <= 2 ? 3 : 1;
  if (id == 2) stream.value[0] = stream.value[1] = stream.value[2] = 100.0;
  return stream;
}

Stream& streamIn(Layer& layer, std::int32_t id) {
  for (Stream& stream : layer.streams) {
    if (stream.id == id) return stream;
  }
  return layer.streams.front();
}

}  // namespace

Layer* HandBuiltScene::add(LayerKind kind, const std::string& name, Layer* parent) {
  Layer& layer = layers.emplace_back();
  layer.number = static_cast<std::int32_t>(layers.size());
  layer.kind = kind;
  layer.name = name;
  layer.composition = &composition;
  layer.parent = parent;
  std::vector<std::int32_t> ids = {0, 1, 2, 3, 8, 9};
  if (kind == LayerKind::Camera) ids.push_back(11);
  for (const std::int32_t id : ids) layer.streams.push_back(streamOf(id));
  composition.layers.push_back(&layer);
  return &layer;
}

HandBuiltScene::HandBuiltScene() {
  composition.number = 1;
  composition.name = "crane";
  composition.width = 1920;
  composition.height = 1080;
  composition.pixelAspect = {1000, 1000};
  composition.frameRate = {24, 1};
  composition.duration = {48000, 24000};
  folder.itemNumber = 1;
  folder.compositions.push_back(&composition);

  Layer* camera = add(LayerKind::Camera, "shotcamShape", nullptr);
  camera->aimed = true;
  camera->filmDirection = HOST_FILM_VERTICAL;
  camera->filmSize = 36.0;
  for (std::size_t i = 0; i < 3; ++i)
    streamIn(*camera, HOST_STREAM_ANCHOR_POINT).value[i] = 1.5 + static_cast<double>(i);
  for (std::size_t i = 0; i < 3; ++i)
    streamIn(*camera, HOST_STREAM_POSITION).value[i] = -10.25 * static_cast<double>(i);
  streamIn(*camera, HOST_STREAM_ZOOM).value[0] = 2057.38625;
  streamIn(*camera, HOST_STREAM_ZOOM).keys = std::make_unique<refhost::KeyColumns>();
  streamIn(*camera, HOST_STREAM_ZOOM).keys->times = {{0, 24000}};
  streamIn(*camera, HOST_STREAM_ZOOM).keys->values = {2100.5};

  Layer* arm = add(LayerKind::Null, "arm", nullptr);
  camera->parent = arm;
  arm->threeDimensional = true;
  streamIn(*arm, HOST_STREAM_ROTATION_X).value[0] = 12.0;
  streamIn(*arm, HOST_STREAM_ROTATION_Y).value[0] = -34.5;
  streamIn(*arm, HOST_STREAM_ROTATION_Z).value[0] = 56.0;
  streamIn(*arm, HOST_STREAM_POSITION).keys = std::make_unique<refhost::KeyColumns>();
  streamIn(*arm, HOST_STREAM_POSITION).keys->times = {{0, 24000}, {24000, 24000}, {47000, 24000}};
  streamIn(*arm, HOST_STREAM_POSITION).keys->values = {0, 1, 2, 3, 4, 5, 6, 7, 0.1};

  add(LayerKind::Null, "base", nullptr);
  arm->parent = &layers.back();

  report.path = "shots/crane.ma";
  report.outcome = mayascene::Outcome::Imported;
  report.status = mayascene::ExitStatus::Done;
  report.result.folder = &folder;
}

}  // namespace mayascene_test
