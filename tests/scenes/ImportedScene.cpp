#include "tests/scenes/ImportedScene.h"

#include <algorithm>
#include <utility>

namespace scenes {

ImportedScene::ImportedScene(const std::filesystem::path& path, bool linearUnits)
    : ImportedScene(path, testsupport::WithUnits(linearUnits)) {}

ImportedScene::ImportedScene(const std::filesystem::path& path, refhost::HostOptions options)
    : host_(std::move(options)), result_(host_.Import(path)) {}

const refhost::Layer* ImportedScene::layer(const std::string& name) const {
  const refhost::Layer* found = nullptr;
  for (const refhost::Layer& layer : project().layers()) {
    if (layer.name != name) continue;
    if (found != nullptr) return nullptr;
    found = &layer;
  }
  return found;
}

std::size_t ImportedScene::layers(refhost::LayerKind kind) const {
  const auto& all = project().layers();
  return static_cast<std::size_t>(
      std::count_if(all.begin(), all.end(), [&](const refhost::Layer& layer) { return layer.kind == kind; }));
}

std::size_t ImportedScene::aimedCameras() const {
  const auto& all = project().layers();
  return static_cast<std::size_t>(
      std::count_if(all.begin(), all.end(), [](const refhost::Layer& layer) { return layer.aimed; }));
}

std::size_t ImportedScene::keys() const {
  std::size_t count = 0;
  for (const refhost::Layer& layer : project().layers()) {
    for (const refhost::Stream& stream : layer.streams) count += stream.keyCount();
  }
  return count;
}

std::multiset<std::string> ImportedScene::names(refhost::LayerKind kind) const {
  std::multiset<std::string> names;
  for (const refhost::Layer& layer : project().layers()) {
    if (layer.kind == kind) names.insert(layer.name);
  }
  return names;
}

}  // namespace scenes
