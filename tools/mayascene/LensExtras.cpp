#include "tools/mayascene/LensExtras.h"

#include <cmath>

#include "bake/Selection.h"
#include "diag/Collector.h"

namespace mayascene {
namespace {

// The same length as in a bake's report.
constexpr std::size_t kLongestPath = 1000;

// None where something drives it, or where it is not finite.
std::optional<double> stillNumber(const scene::Scene& scene, scene::NodeId camera, const char* attribute,
                                  double otherwise) {
  if (scene.SourceOf(scene.PlugOf(camera, attribute))) return std::nullopt;
  const double number = scene.Number(camera, attribute).value_or(otherwise);
  return std::isfinite(number) ? std::optional(number) : std::nullopt;
}

LensExtras extrasOf(const scene::Scene& scene, scene::NodeId camera) {
  LensExtras extras;
  const auto x = stillNumber(scene, camera, "horizontalFilmOffset", 0.0);
  const auto y = stillNumber(scene, camera, "verticalFilmOffset", 0.0);
  if (x && y && (*x != 0.0 || *y != 0.0)) {
    extras.filmOffsetX = x;
    extras.filmOffsetY = y;
  }
  const auto squeeze = stillNumber(scene, camera, "lensSqueezeRatio", 1.0);
  if (squeeze && *squeeze != 1.0) extras.squeeze = squeeze;
  return extras;
}

template <typename Name>
LensExtrasByCamera extrasBy(const scene::Scene& scene, const Name& name) {
  diag::Collector ignored(scene.text());
  LensExtrasByCamera all;
  for (const scene::NodeId camera : bake::Select(scene, {}, &ignored).cameras) {
    addLens(name(camera), extrasOf(scene, camera), &all);
  }
  return all;
}

}  // namespace

void addLens(const std::string& camera, const LensExtras& extras, LensExtrasByCamera* all) {
  const auto [place, fresh] = all->try_emplace(camera, extras);
  if (!fresh) place->second = {};
}

LensExtrasByCamera lensExtrasByName(const scene::Scene& scene) {
  return extrasBy(scene, [&](scene::NodeId camera) { return std::string(scene.node(camera).name); });
}

LensExtrasByCamera lensExtrasByPath(const scene::Scene& scene) {
  return extrasBy(scene, [&](scene::NodeId camera) { return scene.PathOf(camera, kLongestPath); });
}

}  // namespace mayascene
