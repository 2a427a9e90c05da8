// What is made, in which order, and what is whose parent.
#include "tests/secondreader/Builder.h"

#include <utility>

#include "hostapi/CameraSuite.h"
#include "hostapi/LayerStreams.h"
#include "hostapi/LayerSuite.h"
#include "tests/secondreader/Numbers.h"

namespace secondreader {
namespace {

constexpr int kSquareWord = 6;
constexpr int kSquarePattern = 7;

std::string formatted(const std::string& pattern, const std::string& first, const std::string& second) {
  std::string text;
  for (std::size_t i = 0; i < pattern.size(); ++i) {
    const std::string_view marker = std::string_view(pattern).substr(i, 3);
    if (marker == "^^1" || marker == "^^2") {
      text += marker == "^^1" ? first : second;
      i += 2;
    } else {
      text += pattern[i];
    }
  }
  return text;
}

bool isMarked(const std::string& name) {
  return name.find("null") != std::string::npos || name.find("NULL") != std::string::npos ||
         name.find("Null") != std::string::npos;
}

}  // namespace

Builder::Builder(SuiteUser& suites, const Scene& scene, std::function<void(int)> show)
    : suites_(suites),
      scene_(scene),
      show_(std::move(show)),
      convert_(scene, suites.host().linearUnits != 0) {}

void Builder::build(Handle folder, const std::string& name) {
  if (scene_.cameras.empty()) return;
  const Handle comp = makeComps(folder, name);
  for (const Camera& camera : scene_.cameras) {
    if (!camera.orthographic && !same(camera.name, "perspShape")) makeCamera(comp, camera);
  }
  for (const Locator& locator : scene_.locators) {
    if (isMarked(locator.name)) makeLocator(comp, locator);
  }
  suites_.host().failBetweenCalls();
}

// The composition that receives the layers.
Handle Builder::makeComps(Handle folder, const std::string& name) {
  PlayedHost& host = suites_.host();
  CompSettings display{folder,
                       name,
                       scene_.width,
                       scene_.height,
                       convert_.pixelAspect(),
                       convert_.longestAnimation(),
                       convert_.frameRate()};
  constexpr HostRatio kSquare{1, 1};
  std::int32_t order = 0;
  HostError code = HOST_ERR_NONE;
  if (!host.serviceFails("RatioCompare", &code)) {
    order = compareRatios(kSquare, display.pixelAspect);
  }
  check(code);
  Handle comp = 0;
  if (order == 0) {
    check(suites_.createComp(display, &comp));
    return comp;
  }
  CompSettings square = display;
  const bool noWord = host.serviceFails("StringMake", &code);
  check(code);
  const std::string word = noWord ? "" : host.localized(kSquareWord);
  const bool noName = host.serviceFails("StringFormat", &code);
  check(code);
  square.name = noName ? "" : formatted(host.localized(kSquarePattern), word, name);
  square.width = wholePart(static_cast<double>(display.width) * display.pixelAspect.numerator /
                               display.pixelAspect.denominator +
                           0.5);
  square.pixelAspect = kSquare;
  check(suites_.createComp(square, &comp));
  Handle outer = 0;
  Handle item = 0;
  Handle layer = 0;
  check(suites_.createComp(display, &outer));
  check(suites_.getItemFromComp(comp, &item));
  check(suites_.addLayerFromItem(item, outer, &layer));
  return comp;
}

void Builder::makeCamera(Handle comp, const Camera& camera) {
  Handle layer = 0;
  check(suites_.newCameraLayer(camera.name, comp, &layer));
  setCamera(layer, camera);
  animateCamera(layer, camera);
  makeParents(comp, layer, findNamed(scene_.transforms, camera.parent));
  for (const Transform& constraint : scene_.transforms) {
    const auto& links = constraint.curve;
    if (links[kFollowed] < 0 || links[kTarget] < 0 || links[kConstrained] < 0) continue;
    if (aim(layer, camera, constraint)) return;
  }
}

void Builder::makeLocator(Handle comp, const Locator& locator) {
  Handle layer = 0;
  check(suites_.newNullLayer(locator.name, comp, &layer));
  check(suites_.setLayerFlag(layer, HOST_LAYER_FLAG_3D, 1));
  const int transform = findNamed(scene_.transforms, locator.parent);
  if (transform >= 0) setTransformAndKeys(layer, scene_.transforms[static_cast<std::size_t>(transform)]);
  makeParents(comp, layer, transform);
}

// A null for each transform above this one, each transform once.
void Builder::makeParents(Handle comp, Handle child, int transform) {
  std::vector<bool> used(scene_.transforms.size());
  while (transform >= 0) {
    used[static_cast<std::size_t>(transform)] = true;
    const std::string& name = scene_.transforms[static_cast<std::size_t>(transform)].parent;
    if (name.empty()) return;
    transform = findNamed(scene_.transforms, name);
    if (transform >= 0 && used[static_cast<std::size_t>(transform)]) return;
    Handle null = 0;
    check(suites_.newNullLayer(name, comp, &null));
    check(suites_.setLayerFlag(null, HOST_LAYER_FLAG_3D, 1));
    check(suites_.setLayerParent(child, null));
    if (transform >= 0) setTransformAndKeys(null, scene_.transforms[static_cast<std::size_t>(transform)]);
    child = null;
  }
}

void Builder::setTransformAndKeys(Handle layer, const Transform& transform) {
  setTransform(layer, transform);
  animate(layer, transform);
}

void Builder::setCamera(Handle layer, const Camera& camera) {
  check(suites_.setLayerFlag(layer, HOST_LAYER_FLAG_AIMED, 0));
  setStreamUnguarded(layer, HOST_STREAM_POSITION, {});
  const double film = convert_.filmSize(camera);
  check(
      suites_.setCameraFilmSize(layer, camera.verticalFit ? HOST_FILM_VERTICAL : HOST_FILM_HORIZONTAL, film));
  setStreamUnguarded(layer, HOST_STREAM_ZOOM, {convert_.zoom(camera, camera.focalLength)});
  const int transform = findNamed(scene_.transforms, camera.parent);
  if (transform >= 0) setTransform(layer, scene_.transforms[static_cast<std::size_t>(transform)]);
}

// False when the constraint turns something else than this camera's transform.
bool Builder::aim(Handle layer, const Camera& camera, const Transform& constraint) {
  const auto linked = [&](std::size_t link) {
    return scene_.transforms[static_cast<std::size_t>(constraint.curve[link])];
  };
  if (!same(linked(kConstrained).name, camera.parent)) return false;
  const Transform target = linked(kTarget);
  check(suites_.setLayerFlag(layer, HOST_LAYER_FLAG_AIMED, 1));
  setAnchor(layer, target);
  animateAnchor(layer, target);
  return true;
}

}  // namespace secondreader
