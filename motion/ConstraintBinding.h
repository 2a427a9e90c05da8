// The bindings that all constraints need: those of the constrained node and of the targets.
#pragma once

#include <vector>

#include "motion/Aim.h"
#include "motion/Binder.h"

namespace motion {

// A constrained node whose rotate order is bound as its code, because it may be driven.
struct BoundNode {
  ConstrainedNode node;
  double order = 0.0;
  Matrix parentInverse;

  // Updates `node` from the bound fields. False where the parent's inverse matrix has no inverse.
  bool Take();
};

void BindConstrainedNode(Binder* binder, BoundNode* bound);

// The targets of the constraint, by their indices.
std::vector<std::int32_t> TargetIndices(const Binder& binder);

void BindTargetPoint(Binder* binder, std::int32_t index, TargetPoint* target);

// A computed number as a code, truncated; -1 where it is not finite or beyond 1000.
int CodeOf(double number);

}  // namespace motion
