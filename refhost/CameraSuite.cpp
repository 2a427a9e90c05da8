// "QZGP Camera Suite" 2: the film size.
#include <string>

#include "refhost/Call.h"
#include "refhost/SuiteRegistry.h"

namespace refhost {
namespace {

void setCameraFilmSize(Call& call, VOR_Layer* layer, std::int32_t direction, const double* filmSize) {
  Layer* camera = call.layer(layer);
  if (camera == nullptr) return;
  if (camera->kind != LayerKind::Camera) {
    call.refuse(HOST_ERR_NOT_A_CAMERA, call.host().codec.describe(layer) + " is no camera layer");
    return;
  }
  if (direction != HOST_FILM_HORIZONTAL && direction != HOST_FILM_VERTICAL) {
    call.refuse(HOST_ERR_BAD_DIRECTION, "the direction " + std::to_string(direction) + " is neither 1 nor 2");
    return;
  }
  if (!call.given(filmSize, "the film size") || !call.areFinite(filmSize, 1, "the film size")) return;
  if (*filmSize <= 0.0 && !call.host().options.permissive) {
    call.refuse(HOST_ERR_BAD_FILM_SIZE, "the film size is not positive");
    return;
  }
  ProjectEditor::setFilm(*camera, direction, *filmSize);
}

HostError SetCameraFilmSize(VOR_Layer* layer, std::int32_t direction, const double* filmSize) {
  Call call(Operation::SetCameraFilmSize);
  if (call.goesOn()) setCameraFilmSize(call, layer, direction, filmSize);
  if (TraceLine* line = call.traced()) {
    line->handle("layer", layer).integer("direction", direction).number("filmSize", filmSize);
  }
  return call.finish();
}

constexpr QZGP_CameraSuite2 table() {
  QZGP_CameraSuite2 suite{};
  suite.SetCameraFilmSize = SetCameraFilmSize;
  return suite;
}

}  // namespace

constinit const QZGP_CameraSuite2 kCameraSuite2 = table();

}  // namespace refhost
