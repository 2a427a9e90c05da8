// What of a camera's lens and film the importer does not take.
#include <array>
#include <optional>
#include <string>

#include "check/Difference.h"
#include "check/RulesInternal.h"
#include "motion/Camera.h"
#include "motion/SceneCamera.h"

namespace check {
namespace {

using diag::Code;
using scene::NodeId;

struct Field {
  std::string_view attribute;
  double neutral;
};

constexpr std::array kOffsets = {Field{"horizontalFilmOffset", 0.0}, Field{"verticalFilmOffset", 0.0}};
constexpr std::array kShakes = {Field{"horizontalShake", 0.0}, Field{"verticalShake", 0.0}};
constexpr std::array kEffects = {Field{"postScale", 1.0}, Field{"preScale", 1.0},
                                 Field{"filmTranslateH", 0.0}, Field{"filmTranslateV", 0.0},
                                 Field{"filmRollValue", 0.0}};

// These change the picture only together with other values of the camera.
constexpr std::array kChanges = {Field{"filmFitOffset", 0.0}, Field{"filmRollControl", 0.0},
                                 Field{"horizontalPan", 0.0}, Field{"verticalPan", 0.0}, Field{"zoom", 1.0}};

class Lens {
 public:
  Lens(const Subject& subject, NodeId camera) : subject_(subject), camera_(camera) {}

  void ReportChange() {
    if (FirstThatDiffers(kEffects)) return;
    const auto change = FirstThatDiffers(kChanges);
    Say(Code::PictureEffectLost, change ? change->place : scene().node(camera_).place);
  }

  void Report() {
    auto offset = FirstThatDiffers(kOffsets);
    if (!offset && Number("shakeEnabled", 0.0) != 0.0) offset = FirstThatDiffers(kShakes);
    if (offset) Say(Code::FilmOffsetLost, offset->place);
    ReportShakeOverscan();
    if (const auto effect = FirstThatDiffers(kEffects)) Say(Code::PictureEffectLost, effect->place);
    ReportFactor("lensSqueezeRatio", Code::LensSqueezeLost);
    ReportFactor("cameraScale", Code::CameraScaleLost);
    ReportFit();
    ReportMotion({"horizontalFilmAperture", motion::Camera().horizontalAperture}, Code::ApertureMotionLost);
    ReportMotion({"verticalFilmAperture", motion::Camera().verticalAperture}, Code::ApertureMotionLost);
    ReportMotion({"filmFit", motion::filmfit::kHorizontal}, Code::FitMotionLost);
  }

 private:
  const scene::Scene& scene() const { return subject_.scene; }
  std::string_view name() const { return scene().node(camera_).name; }
  double Number(std::string_view attribute, double otherwise) const {
    return scene().Number(camera_, attribute).value_or(otherwise);
  }

  void Say(Code code, const diag::Range& place) { subject_.diagnostics.Report(code, place, {name()}); }

  std::optional<Difference> Differs(const Field& field) const {
    return DifferenceFrom(subject_, camera_, field.attribute, field.neutral);
  }

  template <std::size_t kCount>
  std::optional<Difference> FirstThatDiffers(const std::array<Field, kCount>& fields) const {
    for (const Field& field : fields) {
      if (auto difference = Differs(field)) return difference;
    }
    return std::nullopt;
  }

  void ReportShakeOverscan() {
    if (Number("shakeOverscanEnabled", 0.0) == 0.0) return;
    if (const auto overscan = Differs({"shakeOverscan", 1.0})) Say(Code::PictureEffectLost, overscan->place);
  }

  void ReportFactor(std::string_view attribute, Code code) {
    if (const auto factor = Differs({attribute, 1.0})) {
      subject_.diagnostics.Report(code, factor->place, {name(), factor->what});
    }
  }

  // The importer takes the stored value, whatever drives the attribute.
  void ReportMotion(const Field& field, Code code) {
    const auto driver = scene().SourceOf(scene().PlugOf(camera_, field.attribute));
    if (!driver) return;
    const auto difference = Differs({field.attribute, Number(field.attribute, field.neutral)});
    if (!difference) return;
    if (subject_.driversSaid != nullptr) subject_.driversSaid->insert(difference->place.offset);
    subject_.diagnostics.Report(code, difference->place, {name(), difference->what});
  }

  void ReportFit() {
    motion::Camera camera;
    camera.horizontalAperture = Number("horizontalFilmAperture", camera.horizontalAperture);
    camera.verticalAperture = Number("verticalFilmAperture", camera.verticalAperture);
    camera.lensSqueeze = Number("lensSqueezeRatio", 1.0);
    const double fit = Number("filmFit", motion::filmfit::kHorizontal);
    if (!(fit >= motion::filmfit::kFill && fit <= motion::filmfit::kOverscan))
      return;  // any number can be written
    camera.filmFit = static_cast<int>(fit);
    if (camera.filmFit != motion::filmfit::kFill && camera.filmFit != motion::filmfit::kOverscan) return;
    if (motion::ResolvedFit(camera, motion::PictureOf(subject_.settings)) != motion::filmfit::kVertical)
      return;
    const auto written = scene().Written(camera_, "filmFit");
    subject_.diagnostics.Report(Code::FitDiffers, written ? written->range() : scene().node(camera_).place,
                                {name(), camera.filmFit == motion::filmfit::kFill ? "fill" : "overscan"});
  }

  const Subject& subject_;
  NodeId camera_;
};

}  // namespace

void ReportLenses(const Subject& subject) {
  for (const Camera& camera : subject.cameras) {
    if (camera.taken) Lens(subject, camera.shape).Report();
  }
}

void ReportPictureChange(const Subject& subject, NodeId camera) { Lens(subject, camera).ReportChange(); }

}  // namespace check
