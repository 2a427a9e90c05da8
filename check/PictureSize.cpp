// The composition against what the scene means: size, rate, unit.
#include <cmath>
#include <optional>
#include <string>
#include <string_view>

#include "check/PointsPerUnit.h"
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

// What of the size differs, in words, and where the file says the first of it.
struct SizeDifference {
  std::string made;
  std::string meant;
  std::optional<diag::Range> place;

  void Compare(const char* what, double madeValue, const scene::Said<double>& said, double tolerance) {
    if (std::fabs(madeValue - said.value) <= tolerance) return;
    if (!made.empty()) {
      made += ", ";
      meant += ", ";
    }
    made.append(what).append(" ").append(text::RoundedNumber(madeValue));
    meant += text::RoundedNumber(said.value);
    if (!place) place = said.place;
  }
};

void CompareSize(const Subject& subject, const CameOverComposition& composition) {
  const scene::Settings& settings = subject.settings;
  SizeDifference difference;
  // The importer takes whole pixels.
  difference.Compare("width", composition.width, settings.width, 0.999);
  difference.Compare("height", composition.height, settings.height, 0.999);
  difference.Compare("pixel aspect", composition.pixelAspect,
                     {settings.pixelAspect(), settings.deviceAspect.place}, 0.01);
  if (difference.made.empty()) return;
  subject.diagnostics.Report(Code::PictureSizeAssumed, PlaceOr(difference.place, subject.scene),
                             {difference.made, difference.meant});
}

void CompareRate(const Subject& subject, double made) {
  const double meant = subject.settings.rate.value.perSecond();
  if (std::fabs(made - meant) <= 1e-3 * meant) return;
  subject.diagnostics.Report(Code::RateDiffers, subject.settings.rate.place.value_or(diag::Range{}),
                             {text::RoundedNumber(meant), text::RoundedNumber(made)});
}

// Reports a unit in which lengths come over in another size than in centimetres.
void CompareLengths(const Subject& subject) {
  const auto& unit = subject.settings.centimetersPerUnit;
  if (unit.value == 1.0) return;
  const std::string_view word = subject.scene.linearUnit().word;
  std::string what = "one unit becomes a point of the composition";
  if (subject.cameOver.distancesConverted) {
    const double times = PointsPerUnit(word) / (unit.value * PointsPerUnit("centimeter"));
    if (std::fabs(times - 1.0) < 1e-6) return;
    what = "distances come over " + text::RoundedNumber(times) + " times too large";
  }
  subject.diagnostics.Report(Code::OtherLengthUnit, unit.place.value_or(diag::Range{}), {word, what});
}

}  // namespace

void ReportPicture(const Subject& subject) {
  // Without a layer nothing is shown that could look otherwise.
  if (!subject.cameOver.composition || subject.cameOver.layers.empty()) return;
  CompareLengths(subject);
  const CameOverComposition& composition = *subject.cameOver.composition;
  CompareSize(subject, composition);
  CompareRate(subject, composition.framesPerSecond);
}

}  // namespace check
