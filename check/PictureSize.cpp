// The composition against what the scene means: size, rate, unit.
#include <cmath>
#include <optional>
#include <string>

#include "check/RulesInternal.h"
#include "text/Numbers.h"

namespace check {
namespace {

using diag::Code;

diag::Range PlaceOr(const std::optional<diag::Range>& place, const scene::Scene& scene) {
  if (place) return *place;
  const scene::NodeId node = scene.Find("defaultResolution");
  return node == scene::kNoNode ? diag::Range{} : scene.node(node).place;
}

void Compare(const Subject& subject, const char* what, double made, const scene::Said<double>& meant,
             double tolerance) {
  if (std::fabs(made - meant.value) <= tolerance) return;
  subject.diagnostics.Report(Code::PictureSizeAssumed, PlaceOr(meant.place, subject.scene),
                             {what, text::RoundedNumber(made), text::RoundedNumber(meant.value)});
}

void CompareRate(const Subject& subject, double made) {
  const double meant = subject.settings.rate.value.perSecond();
  if (std::fabs(made - meant) <= 1e-3 * meant) return;
  subject.diagnostics.Report(Code::RateDiffers, subject.settings.rate.place.value_or(diag::Range{}),
                             {text::RoundedNumber(meant), text::RoundedNumber(made)});
}

}  // namespace

void ReportPicture(const Subject& subject) {
  const scene::Settings& settings = subject.settings;
  if (settings.centimetersPerUnit.value != 1.0 && !subject.cameOver.distancesConverted) {
    subject.diagnostics.Report(Code::OtherLengthUnit,
                               settings.centimetersPerUnit.place.value_or(diag::Range{}),
                               {subject.scene.linearUnit().word});
  }
  if (!subject.cameOver.composition) return;
  const CameOverComposition& composition = *subject.cameOver.composition;
  // The importer takes whole pixels.
  Compare(subject, "width", composition.width, settings.width, 0.999);
  Compare(subject, "height", composition.height, settings.height, 0.999);
  Compare(subject, "pixel aspect", composition.pixelAspect,
          {settings.pixelAspect(), settings.deviceAspect.place}, 0.01);
  CompareRate(subject, composition.framesPerSecond);
}

}  // namespace check
