// stereoRigTransform: where the two eyes of a stereo rig stand and how they look. Half of the separation to
// each side; converged eyes are turned to the point of zero parallax, those off the axis have their film
// moved instead.
#include <cmath>

#include "motion/Camera.h"
#include "motion/ConstraintBinding.h"
#include "motion/NodeTypes.h"

namespace motion {
namespace {

constexpr int kOff = 0;
constexpr int kConverged = 1;
constexpr int kOffAxis = 2;

class StereoStep final : public NumberStep {
 public:
  explicit StereoStep(double radians) : radians_(radians) {}

  double mode = kOffAxis;
  double separation = 6.35;
  double zeroParallax = 254.0;
  double focalLength = 35.0;

 private:
  bool Compute(double, double* outputs) override {
    const int code = CodeOf(mode);
    const double half = code == kOff ? 0.0 : separation / 2.0;
    const double turn = code == kConverged ? std::atan2(half, zeroParallax) / radians_ : 0.0;
    const double shift = code == kOffAxis ? half / zeroParallax * focalLength / kMillimetresPerInch : 0.0;
    const double eyes[] = {-half, -turn, shift, half, turn, -shift};
    for (const double value : eyes) *outputs++ = value;
    return std::isfinite(shift);
  }

  double radians_;
};

}  // namespace

std::unique_ptr<NumberStep> MakeStereo(Binder* binder) {
  auto step = std::make_unique<StereoStep>(binder->measures().radians);
  binder->Begin(step.get());
  binder->Number("stereo", &step->mode);
  binder->Number("interaxialSeparation", &step->separation);
  binder->Number("zeroParallax", &step->zeroParallax);
  binder->Number("focalLengthInput", &step->focalLength);
  binder->ReportNode(diag::Code::StereoRig);
  return step;
}

}  // namespace motion
