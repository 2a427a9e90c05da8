#include "motion/PlaceSteps.h"

#include <string>

#include "motion/ConstraintBinding.h"

namespace motion {
namespace {

struct PointField {
  std::string_view attribute;
  Vector Transform::*field;
};

constexpr PointField kPoints[] = {
    {"translate", &Transform::translate},
    {"rotate", &Transform::rotate},
    {"scale", &Transform::scale},
    {"rotateAxis", &Transform::rotateAxis},
    {"rotatePivot", &Transform::rotatePivot},
    {"rotatePivotTranslate", &Transform::rotatePivotTranslate},
    {"scalePivot", &Transform::scalePivot},
    {"scalePivotTranslate", &Transform::scalePivotTranslate},
};
constexpr PointField kJointPoints[] = {
    {"jointOrient", &Transform::jointOrient},
    {"inverseScale", &Transform::inverseScale},
};
constexpr std::string_view kShears[] = {"shearXY", "shearXZ", "shearYZ"};
constexpr std::string_view kRotateOrder = "rotateOrder";
constexpr std::string_view kInherits = "inheritsTransform";
constexpr std::string_view kSegmentScale = "segmentScaleCompensate";

struct LimitNames {
  Limit (Transform::*limits)[3];
  std::string_view word;
};
constexpr LimitNames kLimits[] = {{&Transform::translateLimit, "Trans"},
                                  {&Transform::rotateLimit, "Rot"},
                                  {&Transform::scaleLimit, "Scale"}};

// One bound of one channel, "minTransXLimit": false where it is not switched on.
bool ReadLimit(Binder* binder, std::string_view bound, std::string_view word, char axis, double* limit) {
  std::string name(bound);
  name += word;
  name += axis;
  name += "Limit";
  const bool on = binder->scene().Number(binder->node(), name + "Enable").value_or(0.0) != 0.0;
  if (on) binder->Number(name, limit);
  return on;
}

void ReadLimits(Binder* binder, Transform* transform) {
  for (const LimitNames& names : kLimits) {
    const double unit = names.limits == &Transform::rotateLimit ? binder->measures().radians : 1.0;
    for (const int axis : {0, 1, 2}) {
      Limit& limit = (transform->*names.limits)[axis];
      const char letter = static_cast<char>('X' + axis);
      limit.hasLeast = ReadLimit(binder, "min", names.word, letter, &limit.least);
      limit.hasMost = ReadLimit(binder, "max", names.word, letter, &limit.most);
      limit.least *= unit;
      limit.most *= unit;
    }
  }
}

// The node's own matrix, where there is one, then those above it.
class PlaceStep final : public MatrixStep {
 public:
  explicit PlaceStep(bool inverted) : inverted_(inverted) {}

  Matrix local;
  Matrix offset;
  Matrix parent;
  double inherits = 1.0;

 private:
  bool Compute(Matrix* result) override {
    const Matrix place = inherits != 0.0 ? local * offset * parent : local * offset;
    if (inverted_) return Invert(place, result);
    *result = place;
    return true;
  }

  bool inverted_;
};

}  // namespace

bool IsPlaceMatrix(std::string_view attribute) {
  return attribute == kMatrix || attribute == kInverseMatrix || attribute == kWorldMatrix ||
         attribute == kWorldInverseMatrix || attribute == kParentMatrix ||
         attribute == kParentInverseMatrix || attribute == kDagLocalMatrix;
}

bool LocalStep::Compute(Matrix* result) {
  transform.order = RotateOrderOf(CodeOf(order));
  transform.shear = {shear.x, shear.y, shear.z};
  transform.segmentScale = segmentScale != 0.0;
  *result = LocalMatrix(transform);
  return true;
}

std::unique_ptr<LocalStep> MakeLocal(Binder* binder) {
  auto step = std::make_unique<LocalStep>();
  binder->Begin(step.get());
  binder->KeepFields();
  Transform& transform = step->transform;
  transform.isJoint = binder->scene().node(binder->node()).type == "joint";
  for (const PointField& point : kPoints) {
    if (binder->Touches(point.attribute)) binder->Point(point.attribute, &(transform.*point.field));
  }
  if (binder->Touches("shear")) {
    for (const int axis : {0, 1, 2}) binder->Number(kShears[axis], &step->shear[axis]);
  }
  if (binder->Touches(kRotateOrder)) binder->Number(kRotateOrder, &step->order);
  if (transform.isJoint) {
    for (const PointField& point : kJointPoints) binder->Point(point.attribute, &(transform.*point.field));
    binder->Number(kSegmentScale, &step->segmentScale);
  }
  if (binder->Touches("min") || binder->Touches("max")) ReadLimits(binder, &transform);
  return step;
}

std::unique_ptr<MatrixStep> MakePlaceMatrix(Binder* binder, std::string_view attribute) {
  const bool inverted =
      attribute == kInverseMatrix || attribute == kWorldInverseMatrix || attribute == kParentInverseMatrix;
  auto step = std::make_unique<PlaceStep>(inverted);
  binder->Begin(step.get());
  binder->KeepFields();
  const bool ofParent = attribute == kParentMatrix || attribute == kParentInverseMatrix;
  if (!ofParent) binder->MatrixOf(kMatrix, &step->local);
  if (attribute == kInverseMatrix) return step;
  if (binder->Touches(kOffsetParentMatrix)) binder->MatrixOf(kOffsetParentMatrix, &step->offset);
  if (attribute == kDagLocalMatrix) return step;
  if (binder->Touches(kInherits)) binder->Number(kInherits, &step->inherits);
  const scene::NodeId parent = binder->scene().node(binder->node()).parent;
  if (parent != scene::kNoNode) binder->WorldOf(parent, &step->parent);
  return step;
}

}  // namespace motion
