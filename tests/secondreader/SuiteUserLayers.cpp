// Compositions, layers and the camera, as far as the played host looks at them.
#include <cmath>

#include "hostapi/LayerStreams.h"
#include "tests/secondreader/SuiteUser.h"

namespace secondreader {
namespace {

bool isPositive(const HostRatio& ratio) { return ratio.numerator > 0 && ratio.denominator > 0; }

// The code with which the host refuses to hold the settings; 0 when it takes them.
HostError refusal(const CompSettings& settings) {
  if (settings.width < 1 || settings.height < 1) return HOST_ERR_BAD_SIZE;
  if (!isPositive(settings.pixelAspect) || !isPositive(settings.frameRate)) return HOST_ERR_BAD_RATIO;
  if (settings.duration.scale == 0 || settings.duration.value < 0) return HOST_ERR_BAD_TIME;
  return HOST_ERR_NONE;
}

PlayedLine& ratio(PlayedLine& line, const char* key, const HostRatio& ratio) {
  return line.pair(key, ratio.numerator, ratio.denominator);
}

}  // namespace

HostError SuiteUser::createComp(const CompSettings& settings, Handle* comp) {
  PlayedCall call(host_, "CreateComp", use(kComp21));
  if (call.goesOn() && !host_.options.permissive) call.refuse(refusal(settings));
  if (call.goesOn()) *comp = ++host_.comps;
  PlayedLine& line = call.line();
  line.handle("folder", "item", settings.folder).text("name", settings.name);
  line.integer("width", settings.width).integer("height", settings.height);
  ratio(line, "pixelAspect", settings.pixelAspect);
  line.pair("duration", settings.duration.value, settings.duration.scale);
  ratio(line, "frameRate", settings.frameRate);
  call.handed("comp", "comp", *comp);
  return call.finish();
}

HostError SuiteUser::getItemFromComp(Handle comp, Handle* item) {
  PlayedCall call(host_, "GetItemFromComp", use(kComp9));
  if (call.goesOn() && call.demand(comp != 0, HOST_ERR_BAD_HANDLE)) *item = ++host_.items;
  call.line().handle("comp", "comp", comp);
  call.handed("item", "item", *item);
  return call.finish();
}

HostError SuiteUser::newCameraLayer(const std::string& name, Handle comp, Handle* layer) {
  constexpr double kAnywhere = -2147483648.0;
  PlayedCall call(host_, "NewCameraLayer", use(kComp9));
  if (call.goesOn() && call.demand(comp != 0, HOST_ERR_BAD_HANDLE)) {
    host_.layers.push_back({true});
    *layer = static_cast<Handle>(host_.layers.size());
    for (std::int32_t key = 0; key < host_.options.zoomKeys; ++key) {
      host_.keys[{*layer, HOST_STREAM_ZOOM}].insert({key, 1});
    }
  }
  call.line().text("name", name).handle("comp", "comp", comp).numbers("center", {kAnywhere, kAnywhere});
  call.handed("layer", "layer", *layer);
  return call.finish();
}

HostError SuiteUser::newNullLayer(const std::string& name, Handle comp, Handle* layer) {
  PlayedCall call(host_, "NewNullLayer", use(kComp9));
  if (call.goesOn() && call.demand(comp != 0, HOST_ERR_BAD_HANDLE)) {
    host_.layers.push_back({false});
    *layer = static_cast<Handle>(host_.layers.size());
  }
  call.line().text("name", name).handle("comp", "comp", comp).pair("time", 0, 0);
  call.handed("layer", "layer", *layer);
  return call.finish();
}

HostError SuiteUser::addLayerFromItem(Handle item, Handle comp, Handle* layer) {
  PlayedCall call(host_, "AddLayerFromItem", use(kLayer10));
  if (call.goesOn() && call.demand(item != 0 && comp != 0, HOST_ERR_BAD_HANDLE)) {
    host_.layers.push_back({false});
    *layer = static_cast<Handle>(host_.layers.size());
  }
  call.line().handle("item", "item", item).handle("comp", "comp", comp);
  call.handed("layer", "layer", *layer);
  return call.finish();
}

HostError SuiteUser::setLayerFlag(Handle layer, std::int32_t flag, int value) {
  PlayedCall call(host_, "SetLayerFlag", use(kLayer10));
  if (call.goesOn()) call.demand(layer != 0, HOST_ERR_BAD_HANDLE);
  call.line().handle("layer", "layer", layer).integer("flag", flag).integer("value", value);
  return call.finish();
}

HostError SuiteUser::setLayerParent(Handle layer, Handle parent) {
  PlayedCall call(host_, "SetLayerParent", use(kLayer10));
  if (call.goesOn()) call.demand(layer != 0 && parent != 0, HOST_ERR_BAD_HANDLE);
  call.line().handle("layer", "layer", layer).handle("parent", "layer", parent);
  return call.finish();
}

HostError SuiteUser::setCameraFilmSize(Handle layer, std::int32_t direction, double filmSize) {
  PlayedCall call(host_, "SetCameraFilmSize", use(kCamera2));
  if (call.goesOn() && call.demand(layer != 0, HOST_ERR_BAD_HANDLE) && !host_.options.permissive &&
      call.demand(std::isfinite(filmSize), HOST_ERR_BAD_VALUE)) {
    call.demand(filmSize > 0.0, HOST_ERR_BAD_FILM_SIZE);
  }
  call.line().handle("layer", "layer", layer).integer("direction", direction).number("filmSize", filmSize);
  return call.finish();
}

}  // namespace secondreader
