// Connects the attributes of a node with the fields of its step.
#pragma once

#include <cstdint>
#include <span>
#include <string_view>
#include <vector>

#include "diag/Codes.h"
#include "motion/Graph.h"
#include "motion/Measures.h"
#include "scene/Scene.h"

namespace motion {

class Evaluator;

// Binds the attributes of one node to the fields of its step. A stored value is put into the field at once, a
// driven one each time before the step runs. An attribute that the scene does not write and that has no
// default leaves its field as it is.
class Binder {
 public:
  Binder(Evaluator* evaluator, scene::NodeId node) : evaluator_(evaluator), node_(node) {}

  // The step that the following bindings belong to. The fields must stay at their addresses while it lives.
  void Begin(Step* step) { step_ = step; }

  // From here on a driven number that is unknown leaves its field as it is.
  void KeepFields() { keepsFields_ = true; }

  scene::NodeId node() const { return node_; }
  const scene::Scene& scene() const;
  const Measures& measures() const;

  // Whether the scene sets or drives the attribute, or one of its components. If not, its field need not be
  // bound, which saves most of the many look-ups for a transform.
  bool Touches(std::string_view attribute);

  // Angles as radians, all else in the scene's units.
  void Number(std::string_view attribute, double* field, std::int32_t index = scene::kNoIndex);
  // The attribute's X, Y and Z.
  void Point(std::string_view attribute, Vector* field, std::int32_t index = scene::kNoIndex);
  // In internal units.
  void Internal(std::string_view attribute, double* field, std::int32_t index = scene::kNoIndex);
  void MatrixOf(std::string_view attribute, Matrix* field, std::int32_t index = scene::kNoIndex);

  // The world matrix of another node.
  void WorldOf(scene::NodeId node, Matrix* field);

  // A diagnostic at the node, whose path is its one argument.
  void ReportNode(diag::Code code);

  // The elements of arrays that are written or driven, ascending.
  std::vector<std::int32_t> Indices(std::span<const std::string_view> attributes) const;

 private:
  void Bind(const scene::Plug& plug, double* field, double factor);

  Evaluator* evaluator_;
  scene::NodeId node_;
  Step* step_ = nullptr;
  bool keepsFields_ = false;
  std::vector<std::string_view> touched_;
  bool hasTouched_ = false;
};

}  // namespace motion
