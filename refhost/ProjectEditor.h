// The only writer of the Project. Its callers check the arguments; it refuses nothing itself.
#pragma once

#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

#include "refhost/Batches.h"
#include "refhost/Project.h"
#include "refhost/StreamTable.h"

namespace refhost {

// What a project item is: exactly one of the two is not null.
struct Item {
  Folder* folder = nullptr;
  Composition* composition = nullptr;
};

struct CompositionSettings {
  std::string name;
  std::int32_t width = 0;
  std::int32_t height = 0;
  HostRatio pixelAspect{};
  T_Time duration{};
  HostRatio frameRate{};
};

class ProjectEditor {
 public:
  const Project& project() const { return project_; }

  // Objects by number, from 1; null when there is none of that number.
  Item* item(std::size_t number) { return number - 1 < items_.size() ? &items_[number - 1] : nullptr; }
  Composition* composition(std::size_t number) {
    return number - 1 < project_.compositions_.size() ? &project_.compositions_[number - 1] : nullptr;
  }
  Layer* layer(std::size_t number) { return number - 1 < layers_.size() ? layers_[number - 1] : nullptr; }

  Folder& addFolder();
  Composition& addComposition(Folder& folder, CompositionSettings settings);
  void makeItem(Composition& composition);  // gives it an item number if it has none

  // The layers have their streams from the start, with their defaults. `interest` is the camera's point of
  // interest, x and y in pixels; `zoomKeys` keys are on its zoom stream.
  Layer& addCameraLayer(Composition& composition, const char* name, const double (&interest)[2],
                        std::int32_t zoomKeys);
  Layer& addNullLayer(Composition& composition, const char* name);
  Layer& addCompositionLayer(Composition& composition, Composition& source);

  static void setParent(Layer& layer, Layer& parent);
  static void setFlag(Layer& layer, std::int32_t flag, bool on);  // ignores flags that the host does not know
  static void setFilm(Layer& camera, std::int32_t direction, double size);
  static void setValue(Stream& stream, const double* value);
  void commit(Batch& batch);

  // Null when the layer has none of that id.
  static Stream* findStream(Layer& layer, std::int32_t id) {
    const std::size_t place = streamPlace(id);
    if (place == kNoStreamPlace) return nullptr;
    Stream* const found = layer.streams.data() + place;  // after the last one for the zoom of another layer
    return found != layer.streams.data() + layer.streams.size() ? found : nullptr;
  }

  // Whether the layer is the other one or stands above it.
  static bool isSameOrAbove(const Layer& layer, const Layer& other);

  // Whether the composition is the other one or shows it in a nested layer, at any depth.
  static bool contains(const Composition& composition, const Composition& other);

 private:
  Layer& addLayer(Composition& composition, LayerKind kind, std::string name);

  Project project_;
  std::vector<Item> items_;
  std::vector<Layer*> layers_;  // by number - 1
  KeyTimes lastTimes_;          // of the keys that were committed last
};

}  // namespace refhost
