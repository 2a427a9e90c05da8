#include "refhost/ProjectEditor.h"

#include <cstdint>
#include <set>
#include <utility>

#include "hostapi/LayerSuite.h"

namespace refhost {

const Stream* Layer::findStream(std::int32_t id) const {
  for (const Stream& stream : streams) {
    if (stream.id == id) return &stream;
  }
  return nullptr;
}

Folder& ProjectEditor::addFolder() {
  Folder& folder = project_.folders_.emplace_back();
  items_.push_back({&folder, nullptr});
  folder.itemNumber = static_cast<std::int32_t>(items_.size());
  return folder;
}

Composition& ProjectEditor::addComposition(Folder& folder, CompositionSettings settings) {
  Composition& composition = project_.compositions_.emplace_back();
  composition.number = static_cast<std::int32_t>(project_.compositions_.size());
  composition.name = std::move(settings.name);
  composition.width = settings.width;
  composition.height = settings.height;
  composition.pixelAspect = settings.pixelAspect;
  composition.duration = settings.duration;
  composition.frameRate = settings.frameRate;
  folder.compositions.push_back(&composition);
  return composition;
}

void ProjectEditor::makeItem(Composition& composition) {
  if (composition.itemNumber != 0) return;
  items_.push_back({nullptr, &composition});
  composition.itemNumber = static_cast<std::int32_t>(items_.size());
}

Layer& ProjectEditor::addLayer(Composition& composition, LayerKind kind, std::string name) {
  Layer& layer = project_.layers_.emplace_back();
  layers_.push_back(&layer);
  layer.number = static_cast<std::int32_t>(project_.layers_.size());
  layer.kind = kind;
  layer.name = std::move(name);
  layer.composition = &composition;
  composition.layers.push_back(&layer);
  layer.streams = makeStreams(kind);
  return layer;
}

Layer& ProjectEditor::addCameraLayer(Composition& composition, const char* name, const double (&interest)[2],
                                     std::int32_t zoomKeys) {
  Layer& layer = addLayer(composition, LayerKind::Camera, name);
  for (Stream& stream : layer.streams) {
    if (stream.id == HOST_STREAM_ANCHOR_POINT) {
      stream.value[0] = interest[0];
      stream.value[1] = interest[1];
    } else if (stream.id == HOST_STREAM_ZOOM) {
      stream.value[0] = composition.width;
      if (zoomKeys < 1) continue;
      std::vector<T_Time> times;
      times.reserve(static_cast<std::size_t>(zoomKeys));
      for (std::int32_t key = 0; key < zoomKeys; ++key) times.push_back({key, 1});
      const std::vector<double> values(times.size(), stream.value[0]);
      stream.keys = std::make_unique<KeyColumns>(KeyColumns{KeyTimes(std::move(times)), values});
    }
  }
  return layer;
}

Layer& ProjectEditor::addNullLayer(Composition& composition, const char* name) {
  return addLayer(composition, LayerKind::Null, name);
}

Layer& ProjectEditor::addCompositionLayer(Composition& composition, Composition& source) {
  Layer& layer = addLayer(composition, LayerKind::Composition, source.name);
  layer.source = &source;
  return layer;
}

void ProjectEditor::setParent(Layer& layer, Layer& parent) {
  if (layer.parent != nullptr) --layer.parent->childCount;
  layer.parent = &parent;
  ++parent.childCount;
}

void ProjectEditor::setFlag(Layer& layer, std::int32_t flag, bool on) {
  if ((flag & HOST_LAYER_FLAG_3D) != 0) layer.threeDimensional = on;
  if ((flag & HOST_LAYER_FLAG_AIMED) != 0) layer.aimed = on;
}

void ProjectEditor::setFilm(Layer& camera, std::int32_t direction, double size) {
  camera.filmDirection = direction;
  camera.filmSize = size;
}

void ProjectEditor::commit(Batch& batch) { commitKeys(batch, batch.stream->keys, &lastTimes_); }

void ProjectEditor::setValue(Stream& stream, const double* value) {
  for (std::int32_t i = 0; i < stream.dimension; ++i) stream.value[i] = value[i];
}

bool ProjectEditor::isSameOrAbove(const Layer& layer, const Layer& other) {
  if (&layer == &other) return true;
  if (layer.childCount == 0) return false;
  for (const Layer* above = other.parent; above != nullptr; above = above->parent) {
    if (above == &layer) return true;
  }
  return false;
}

bool ProjectEditor::contains(const Composition& composition, const Composition& other) {
  std::vector<const Composition*> open{&composition};
  std::set<const Composition*> seen{&composition};
  while (!open.empty()) {
    const Composition* current = open.back();
    open.pop_back();
    if (current == &other) return true;
    for (const Layer* layer : current->layers) {
      if (layer->source != nullptr && seen.insert(layer->source).second) open.push_back(layer->source);
    }
  }
  return false;
}

}  // namespace refhost
