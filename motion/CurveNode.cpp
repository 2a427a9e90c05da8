// The types of animation curves: a curve at the frame, or at the number that drives it.
#include "motion/Curve.h"
#include "motion/CurveReader.h"
#include "motion/NodeTypes.h"

namespace motion {
namespace {

class CurveStep final : public NumberStep {
 public:
  CurveStep(CurveData data, double unitsPerInput) : curve(std::move(data)), unitsPerInput_(unitsPerInput) {}

  const Curve curve;
  double input = 0.0;

 private:
  bool Compute(double frame, double* outputs) override {
    outputs[0] = curve.At((readsFrame ? frame : input) / unitsPerInput_, &cursor_);
    return true;
  }

  CurveCursor cursor_;
  double unitsPerInput_;  // frames in a second, or 1
};

struct DoubtCode {
  CurveDoubt doubt;
  diag::Code code;
};

constexpr DoubtCode kDoubtCodes[] = {
    {CurveDoubt::kTangentType, diag::Code::UnknownTangentType},
    {CurveDoubt::kStepInTangent, diag::Code::StepIntoKey},
    {CurveDoubt::kAutoMix, diag::Code::AutoMixTangent},
    {CurveDoubt::kFixedWithoutTangent, diag::Code::FixedWithoutTangent},
    {CurveDoubt::kFixedEmptyOutTangent, diag::Code::EmptyFixedTangent},
    {CurveDoubt::kInfinityCode, diag::Code::UnknownInfinity},
    {CurveDoubt::kInfinityOfOneKey, diag::Code::InfinityOfOneKey},
    {CurveDoubt::kLinearInfinityAtLinear, diag::Code::LinearInfinityAtLinearKey},
    {CurveDoubt::kPlateauBesideOvershoot, diag::Code::PlateauBesideOvershoot},
    {CurveDoubt::kRotationInterpolation, diag::Code::QuaternionCurve},
};

bool SetsKeysByComponent(const scene::Scene& scene, scene::NodeId node) {
  return !scene.Pieces(node, "keyTime").empty() || !scene.Pieces(node, "keyValue").empty();
}

}  // namespace

std::unique_ptr<NumberStep> MakeCurve(Binder* binder) {
  const scene::Plug input = binder->scene().PlugOf(binder->node(), "input");
  const bool byTime = KindOf(binder->scene(), input) == Kind::kTime;
  CurveData data = ReadCurve(binder->scene(), binder->node(), binder->measures());
  auto step = std::make_unique<CurveStep>(std::move(data), byTime ? binder->measures().framesPerSecond : 1.0);
  binder->Begin(step.get());
  binder->Number("input", &step->input);
  step->readsFrame = byTime && step->numberInputs.empty();
  const unsigned doubts = step->curve.Doubts();
  for (const DoubtCode& entry : kDoubtCodes) {
    if ((doubts & static_cast<unsigned>(entry.doubt)) != 0) binder->ReportNode(entry.code);
  }
  if (SetsKeysByComponent(binder->scene(), binder->node())) binder->ReportNode(diag::Code::KeysByComponent);
  return step;
}

}  // namespace motion
