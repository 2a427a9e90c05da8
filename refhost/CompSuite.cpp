// "QZGP Comp Suite" 21 and 9: compositions and the layers made in them.
#include <algorithm>
#include <cstdint>
#include <string>

#include "refhost/Call.h"
#include "refhost/ShownText.h"
#include "refhost/SuiteRegistry.h"

namespace refhost {
namespace {

struct CompArguments {
  VOR_Item* folder;
  const HostUTF16Unit* name;
  std::int32_t width;
  std::int32_t height;
  const HostRatio* pixelAspect;
  const T_Time* duration;
  const HostRatio* frameRate;
};

bool isPositive(const HostRatio& ratio) { return ratio.numerator > 0 && ratio.denominator > 0; }

std::string shown(const HostRatio& ratio) {
  return std::to_string(ratio.numerator) + "/" + std::to_string(ratio.denominator);
}

std::string shown(const T_Time& time) {
  return std::to_string(time.value) + "/" + std::to_string(time.scale);
}

// False after a refusal.
bool areHoldable(Call& call, const CompArguments& given) {
  if (call.host().options.permissive) return true;
  if (given.width < 1 || given.height < 1) {
    call.refuse(HOST_ERR_BAD_SIZE, "a size of " + std::to_string(given.width) + " x " +
                                       std::to_string(given.height) + " is below 1 x 1");
  } else if (!isPositive(*given.pixelAspect)) {
    call.refuse(HOST_ERR_BAD_RATIO, "a pixel aspect of " + shown(*given.pixelAspect) + " is not positive");
  } else if (!isPositive(*given.frameRate)) {
    call.refuse(HOST_ERR_BAD_RATIO, "a frame rate of " + shown(*given.frameRate) + " is not positive");
  } else if (given.duration->scale == 0) {
    call.refuse(HOST_ERR_BAD_TIME, "a duration of " + shown(*given.duration) + " has scale 0");
  } else if (given.duration->value < 0) {
    call.refuse(HOST_ERR_BAD_TIME, "a duration of " + shown(*given.duration) + " is negative");
  }
  return !call.failed();
}

void createComp(Call& call, const CompArguments& given, VOR_CompItem** comp) {
  Item* folder = call.item(given.folder, "the folder");
  if (folder == nullptr) return;
  if (folder->folder == nullptr) {
    call.refuse(HOST_ERR_NOT_A_FOLDER, call.host().codec.describe(given.folder) + " is no folder");
    return;
  }
  if (!call.given(given.name, "the name") || !call.given(given.pixelAspect, "the pixel aspect") ||
      !call.given(given.duration, "the duration") || !call.given(given.frameRate, "the frame rate") ||
      !call.given(comp, "the place for the composition") || !areHoldable(call, given)) {
    return;
  }
  const Composition& made = call.host().editor.addComposition(
      *folder->folder, {shownUnits(given.name), given.width, given.height, *given.pixelAspect,
                        *given.duration, *given.frameRate});
  *comp = reinterpret_cast<VOR_CompItem*>(
      call.host().codec.lasting(HandleKind::Comp, static_cast<std::size_t>(made.number)));
}

HostError CreateComp(VOR_Item* folder, const HostUTF16Unit* name, std::int32_t width, std::int32_t height,
                     const HostRatio* pixelAspect, const T_Time* duration, const HostRatio* frameRate,
                     VOR_CompItem** comp) {
  Call call(Operation::CreateComp);
  if (call.goesOn(comp)) {
    createComp(call, {folder, name, width, height, pixelAspect, duration, frameRate}, comp);
  }
  if (TraceLine* line = call.traced()) {
    line->handle("folder", folder).units("name", name).integer("width", width).integer("height", height);
    line->ratio("pixelAspect", pixelAspect).time("duration", duration).ratio("frameRate", frameRate);
    line->handed("comp", comp);
  }
  return call.finish();
}

HostError GetItemFromComp(VOR_CompItem* comp, VOR_Item** item) {
  Call call(Operation::GetItemFromComp);
  if (call.goesOn(item)) {
    Composition* found = call.composition(comp);
    if (found != nullptr && call.given(item, "the place for the item")) {
      call.host().editor.makeItem(*found);
      *item = reinterpret_cast<VOR_Item*>(
          call.host().codec.lasting(HandleKind::Item, static_cast<std::size_t>(found->itemNumber)));
    }
  }
  if (TraceLine* line = call.traced()) line->handle("comp", comp).handed("item", item);
  return call.finish();
}

VOR_Layer* handleOf(Call& call, const Layer& layer) {
  return reinterpret_cast<VOR_Layer*>(
      call.host().codec.lasting(HandleKind::Layer, static_cast<std::size_t>(layer.number)));
}

void newCameraLayer(Call& call, const char* name, VOR_CompItem* comp, const double (&center)[2],
                    VOR_Layer** layer) {
  HostState& host = call.host();
  const std::int32_t zoomKeys = std::max(host.options.zoomKeys, 0);
  Composition* found = call.composition(comp);
  if (found == nullptr || !call.given(name, "the name") || !call.given(layer, "the place for the layer") ||
      !call.areFinite(center, 2, "the centre") || !takesLayer(call) || !takesKeys(call, zoomKeys)) {
    return;
  }
  double interest[2] = {center[0], center[1]};
  if (center[0] == HOST_CAMERA_CENTER_ANYWHERE && center[1] == HOST_CAMERA_CENTER_ANYWHERE) {
    interest[0] = found->width / 2.0;
    interest[1] = found->height / 2.0;
  }
  *layer = handleOf(call, host.editor.addCameraLayer(*found, name, interest, zoomKeys));
  --host.allowance.layers;
  host.allowance.keys -= zoomKeys;
}

HostError NewCameraLayer(const char* name, VOR_CompItem* comp, double centerX, double centerY,
                         VOR_Layer** layer) {
  Call call(Operation::NewCameraLayer);
  const double center[2] = {centerX, centerY};
  if (call.goesOn(layer)) newCameraLayer(call, name, comp, center, layer);
  if (TraceLine* line = call.traced()) {
    line->text("name", name).handle("comp", comp).numbers("center", center, 2).handed("layer", layer);
  }
  return call.finish();
}

// 0 over 0 stands for the composition's own length, so a scale of 0 is no refusal by itself.
bool isLength(const T_Time& time) {
  if (time.scale == 0) return time.value == 0;
  return time.value >= 0;
}

void newNullLayer(Call& call, const char* name, VOR_CompItem* comp, const T_Time* time, VOR_Layer** layer) {
  Composition* found = call.composition(comp);
  if (found == nullptr || !call.given(name, "the name") || !call.given(time, "the time") ||
      !call.given(layer, "the place for the layer")) {
    return;
  }
  if (!call.host().options.permissive && !isLength(*time)) {
    call.refuse(HOST_ERR_BAD_TIME, "a time of " + shown(*time) + " is no length");
    return;
  }
  if (!takesLayer(call)) return;
  *layer = handleOf(call, call.host().editor.addNullLayer(*found, name));
  --call.host().allowance.layers;
}

HostError NewNullLayer(const char* name, VOR_CompItem* comp, const T_Time* time, VOR_Layer** layer) {
  Call call(Operation::NewNullLayer);
  if (call.goesOn(layer)) newNullLayer(call, name, comp, time, layer);
  if (TraceLine* line = call.traced()) {
    line->text("name", name).handle("comp", comp).time("time", time).handed("layer", layer);
  }
  return call.finish();
}

constexpr QZGP_CompSuite21 table21() {
  QZGP_CompSuite21 suite{};
  suite.CreateComp = CreateComp;
  return suite;
}

constexpr QZGP_CompSuite9 table9() {
  QZGP_CompSuite9 suite{};
  suite.GetItemFromComp = GetItemFromComp;
  suite.NewCameraLayer = NewCameraLayer;
  suite.NewNullLayer = NewNullLayer;
  return suite;
}

}  // namespace

constinit const QZGP_CompSuite21 kCompSuite21 = table21();
constinit const QZGP_CompSuite9 kCompSuite9 = table9();

}  // namespace refhost
