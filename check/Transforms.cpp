// What of a transform the importer does not take.
#include <algorithm>
#include <array>
#include <cmath>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "check/Difference.h"
#include "check/RulesInternal.h"

namespace check {
namespace {

using diag::Code;
using scene::NodeId;

constexpr std::array<std::string_view, 6> kOrders = {"xyz", "yzx", "zxy", "xzy", "yxz", "zyx"};
constexpr std::array<std::string_view, 3> kRotate = {"rotateX", "rotateY", "rotateZ"};
constexpr std::array<std::string_view, 3> kRotateAxis = {"rotateAxisX", "rotateAxisY", "rotateAxisZ"};
constexpr std::array<std::string_view, 3> kShear = {"shearXY", "shearXZ", "shearYZ"};
constexpr std::array<std::string_view, 6> kPivotTranslations = {
    "rotatePivotTranslateX", "rotatePivotTranslateY", "rotatePivotTranslateZ",
    "scalePivotTranslateX",  "scalePivotTranslateY",  "scalePivotTranslateZ"};
constexpr std::array<std::string_view, 3> kRotatePivot = {"rotatePivotX", "rotatePivotY", "rotatePivotZ"};
constexpr std::array<std::string_view, 3> kScalePivot = {"scalePivotX", "scalePivotY", "scalePivotZ"};
constexpr std::array<std::string_view, 3> kScale = {"scaleX", "scaleY", "scaleZ"};

class TransformRules {
 public:
  TransformRules(const Subject& subject, const Link& link) : subject_(subject), link_(link) {}

  void Report() {
    const Touched touched = FindTouched();
    if (touched.order) ReportOrder();
    if (touched.rotateAxis) ReportFirst(Code::RotateAxisLost, kRotateAxis, 0.0);
    if (touched.shear) ReportFirst(Code::ShearLost, kShear, 0.0);
    if (touched.offsetMatrix) ReportOffsetMatrix();
    if (touched.pivots) ReportAimedPivot();
    if (touched.pivotTranslations) ReportFirst(Code::PivotTranslationLost, kPivotTranslations, 0.0);
    if (touched.inheritance) ReportInheritance();
    if (touched.scale) ReportScale();
  }

 private:
  const scene::Scene& scene() const { return subject_.scene; }
  std::string_view name() const { return scene().node(link_.node).name; }

  // The attributes that the file mentions. Most nodes have few, and this look is cheaper than the rules.
  struct Touched {
    bool order = false;
    bool rotateAxis = false;
    bool shear = false;
    bool pivotTranslations = false;
    bool pivots = false;
    bool offsetMatrix = false;
    bool inheritance = false;
    bool scale = false;
  };

  Touched FindTouched() const {
    Touched touched;
    scene().ForEachTouched(link_.node, [&](std::string_view attribute) {
      touched.order |= attribute == "rotateOrder";
      touched.rotateAxis |= attribute.starts_with("rotateAxis");
      touched.shear |= attribute.starts_with("shear");
      touched.pivotTranslations |= attribute.find("PivotTranslate") != std::string_view::npos;
      touched.pivots |= attribute.starts_with("rotatePivot") || attribute.starts_with("scalePivot");
      touched.offsetMatrix |= attribute == "offsetParentMatrix";
      touched.inheritance |= attribute == "inheritsTransform";
      touched.scale |= attribute.starts_with("scale");
    });
    return touched;
  }

  std::optional<diag::Range> Differs(std::string_view attribute, double neutral) const {
    const auto difference = DifferenceFrom(subject_, link_.node, attribute, neutral);
    return difference ? std::optional(difference->place) : std::nullopt;
  }

  template <std::size_t kCount>
  std::optional<diag::Range> FirstOf(const std::array<std::string_view, kCount>& attributes,
                                     double neutral) const {
    for (const std::string_view attribute : attributes) {
      if (const auto place = Differs(attribute, neutral)) return place;
    }
    return std::nullopt;
  }

  template <std::size_t kCount>
  void ReportFirst(Code code, const std::array<std::string_view, kCount>& attributes, double neutral) {
    if (const auto place = FirstOf(attributes, neutral)) subject_.diagnostics.Report(code, *place, {name()});
  }

  // An order matters only where two of the axes that turn come in another sequence.
  void ReportOrder() {
    const auto written = scene().Written(link_.node, "rotateOrder");
    const auto number = written ? written->Number() : std::nullopt;
    if (!number || !(*number >= 1.0) || !(*number < static_cast<double>(kOrders.size()))) return;
    const std::string_view order = kOrders[static_cast<std::size_t>(*number)];
    std::string turns;  // the axes that it turns about, as they come in the order
    for (const char axis : order) {
      if (Differs(kRotate[static_cast<std::size_t>(axis - 'x')], 0.0)) turns += axis;
    }
    if (std::is_sorted(turns.begin(), turns.end())) return;
    subject_.diagnostics.Report(Code::RotateOrderLost, written->range(), {name(), order});
  }

  void ReportOffsetMatrix() {
    constexpr std::size_t kNumbers = 16;
    if (const auto driver = scene().SourceOf(scene().PlugOf(link_.node, "offsetParentMatrix"))) {
      return subject_.diagnostics.Report(Code::OffsetMatrixLost, driver->connection->destinationPlace,
                                         {name()});
    }
    const auto written = scene().Written(link_.node, "offsetParentMatrix");
    if (!written) return;
    const std::vector<double> numbers = written->Numbers(kNumbers);
    for (std::size_t i = 0; i < numbers.size(); ++i) {
      const double neutral = i % 5 == 0 ? 1.0 : 0.0;  // the diagonal of four rows
      if (std::fabs(numbers[i] - neutral) <= 1e-9) continue;
      return subject_.diagnostics.Report(Code::OffsetMatrixLost, written->range(), {name()});
    }
  }

  // A pivot of the scale matters where there is one.
  void ReportAimedPivot() {
    if (!link_.own || !link_.ofCamera || !IsAimed()) return;
    auto place = FirstOf(kRotatePivot, 0.0);
    if (!place && FirstOf(kScale, 1.0)) place = FirstOf(kScalePivot, 0.0);
    if (place) subject_.diagnostics.Report(Code::AimedPivotLost, *place, {name()});
  }

  bool IsAimed() const {
    const auto& cameras = subject_.cameras;  // in the order of their shapes
    const auto camera = std::lower_bound(cameras.begin(), cameras.end(), link_.shape,
                                         [](const Camera& one, NodeId shape) { return one.shape < shape; });
    const bool found = camera != cameras.end() && camera->shape == link_.shape;
    return found && camera->layer != nullptr && camera->layer->aimed;
  }

  void ReportInheritance() {
    if (scene().node(link_.node).parent == scene::kNoNode) return;
    if (const auto place = Differs("inheritsTransform", 1.0)) {
      subject_.diagnostics.Report(Code::InheritanceOff, *place, {name()});
    }
  }

  void ReportScale() {
    if (link_.own || !link_.ofCamera) return;
    if (const auto place = FirstOf(kScale, 1.0)) {
      subject_.diagnostics.Report(Code::ChainScaled, *place, {name(), scene().node(link_.shape).name});
    }
  }

  const Subject& subject_;
  const Link& link_;
};

}  // namespace

void ReportTransforms(const Subject& subject) {
  for (const Link& link : subject.links) {
    if (!link.target) TransformRules(subject, link).Report();
  }
}

}  // namespace check
