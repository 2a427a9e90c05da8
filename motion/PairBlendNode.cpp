// pairBlend: between two poses by a weight.
#include <string>

#include "motion/NodeTypes.h"
#include "motion/Quaternion.h"
#include "motion/Rotation.h"

namespace motion {
namespace {

class PairBlend final : public NumberStep {
 public:
  explicit PairBlend(double radians) : radians_(radians) {}

  Vector translate1;
  Vector translate2;
  Vector rotate1;
  Vector rotate2;
  Vector translateMode;
  double rotateMode = 0.0;
  double weight = 1.0;
  double interpolation = 0.0;

 private:
  // By the mode: both, only the first, only the second.
  static double Share(double mode, double weight) { return mode == 1.0 ? 0.0 : mode == 2.0 ? 1.0 : weight; }

  static double Between(double first, double second, double share) {
    if (share == 0.0) return first;
    return share == 1.0 ? second : first + (second - first) * share;
  }

  bool Compute(double, double* outputs) override {
    for (const int axis : {0, 1, 2}) {
      outputs[axis] = Between(translate1[axis], translate2[axis], Share(translateMode[axis], weight));
    }
    const double share = Share(rotateMode, weight);
    Vector rotate;
    const bool asQuaternions = interpolation == 1.0 && share != 0.0 && share != 1.0;
    if (asQuaternions) {
      const Matrix mixed = MixRotations(RotationMatrix(rotate1, RotateOrder::kXYZ),
                                        RotationMatrix(rotate2, RotateOrder::kXYZ), share);
      rotate = NearestAngles(AnglesOf(mixed, RotateOrder::kXYZ, rotate1), RotateOrder::kXYZ, rotate1);
    } else {
      for (const int axis : {0, 1, 2}) rotate[axis] = Between(rotate1[axis], rotate2[axis], share);
    }
    for (const int axis : {0, 1, 2}) outputs[3 + axis] = rotate[axis] / radians_;
    return true;
  }

  double radians_;
};

// "inTranslateX1"
void BindPoint(Binder* binder, std::string_view words, char pose, Vector* field) {
  for (const int axis : {0, 1, 2}) {
    std::string name(words);
    name += static_cast<char>('X' + axis);
    name += pose;
    binder->Number(name, &(*field)[axis]);
  }
}

}  // namespace

std::unique_ptr<NumberStep> MakePairBlend(Binder* binder) {
  auto step = std::make_unique<PairBlend>(binder->measures().radians);
  binder->Begin(step.get());
  BindPoint(binder, "inTranslate", '1', &step->translate1);
  BindPoint(binder, "inTranslate", '2', &step->translate2);
  BindPoint(binder, "inRotate", '1', &step->rotate1);
  BindPoint(binder, "inRotate", '2', &step->rotate2);
  binder->Number("translateXMode", &step->translateMode.x);
  binder->Number("translateYMode", &step->translateMode.y);
  binder->Number("translateZMode", &step->translateMode.z);
  binder->Number("rotateMode", &step->rotateMode);
  binder->Number("weight", &step->weight);
  binder->Number("rotInterpolation", &step->interpolation);
  return step;
}

}  // namespace motion
