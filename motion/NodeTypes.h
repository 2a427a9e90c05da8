// The types of nodes that compute numbers.
#pragma once

#include <memory>
#include <span>
#include <string_view>

#include "motion/Binder.h"
#include "motion/Graph.h"

namespace motion {

struct NodeType {
  std::string_view name;
  std::span<const std::string_view>
      outputs;  // attributes by their long names, in the order of the step's numbers
  // The step of one node, bound; null where the node cannot be computed.
  std::unique_ptr<NumberStep> (*make)(Binder* binder);
};

// Null where the type computes nothing, or nothing that is supported.
const NodeType* FindNodeType(std::string_view name);

// The place of an output among those of its type, or -1.
int OutputOf(const NodeType& type, std::string_view attribute);

// One file each.
std::unique_ptr<NumberStep> MakeAim(Binder* binder);
std::unique_ptr<NumberStep> MakeAdditiveBlend(Binder* binder);
std::unique_ptr<NumberStep> MakeCurve(Binder* binder);
std::unique_ptr<NumberStep> MakeOrient(Binder* binder);
std::unique_ptr<NumberStep> MakePairBlend(Binder* binder);
std::unique_ptr<NumberStep> MakeParent(Binder* binder);
std::unique_ptr<NumberStep> MakePoint(Binder* binder);
std::unique_ptr<NumberStep> MakeScale(Binder* binder);
std::unique_ptr<NumberStep> MakeStereo(Binder* binder);
std::unique_ptr<NumberStep> MakeTime(Binder* binder);
std::unique_ptr<NumberStep> MakeUnitConversion(Binder* binder);
std::unique_ptr<NumberStep> MakeWeightedBlend(Binder* binder);

}  // namespace motion
