// The matrices of a node in the hierarchy: local, world, those of its parents, and their inverses.
#pragma once

#include <memory>
#include <string_view>

#include "motion/Binder.h"
#include "motion/Graph.h"
#include "motion/Transform.h"

namespace motion {

inline constexpr std::string_view kMatrix = "matrix";
inline constexpr std::string_view kInverseMatrix = "inverseMatrix";
inline constexpr std::string_view kWorldMatrix = "worldMatrix";
inline constexpr std::string_view kWorldInverseMatrix = "worldInverseMatrix";
inline constexpr std::string_view kParentMatrix = "parentMatrix";
inline constexpr std::string_view kParentInverseMatrix = "parentInverseMatrix";
inline constexpr std::string_view kDagLocalMatrix = "dagLocalMatrix";  // with the offset matrix
inline constexpr std::string_view kOffsetParentMatrix = "offsetParentMatrix";

// Whether the attribute is one of the first seven.
bool IsPlaceMatrix(std::string_view attribute);

// The matrix of one transform.
class LocalStep final : public MatrixStep {
 public:
  Transform transform;  // as it was at the last run
  Vector shear;
  double order = 0.0;
  double segmentScale = 1.0;

 private:
  bool Compute(Matrix* result) override;
};

std::unique_ptr<LocalStep> MakeLocal(Binder* binder);

// The step that computes one of the other six matrices.
std::unique_ptr<MatrixStep> MakePlaceMatrix(Binder* binder, std::string_view attribute);

}  // namespace motion
