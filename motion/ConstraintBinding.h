// What the constraints have in common: how the constrained node and the targets are bound.
#pragma once

#include <vector>

#include "motion/Aim.h"
#include "motion/Binder.h"

namespace motion {

// A rotate order as its code, which may be driven.
struct BoundNode {
  ConstrainedNode node;
  double order = 0.0;
  Matrix parentInverse;

  // The node as it is now. False where the parent's inverse cannot be undone.
  bool Take();
};

void BindConstrainedNode(Binder* binder, BoundNode* bound);

// The targets of the constraint, by their indices.
std::vector<std::int32_t> TargetIndices(const Binder& binder);

void BindTargetPoint(Binder* binder, std::int32_t index, TargetPoint* target);

// A code that was computed: -1 where it is no whole number of a sensible size.
int CodeOf(double number);

}  // namespace motion
