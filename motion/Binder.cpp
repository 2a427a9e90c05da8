#include "motion/Binder.h"

#include <algorithm>
#include <optional>
#include <string>

#include "motion/Evaluator.h"
#include "motion/PlaceSteps.h"

namespace motion {

const scene::Scene& Binder::scene() const { return evaluator_->scene_; }

const Measures& Binder::measures() const { return evaluator_->measures_; }

void Binder::Bind(const scene::Plug& plug, double* field, double factor) {
  if (scene().SourceOf(plug)) {
    const double fallback = keepsFields_ ? *field : kUnknown;
    step_->numberInputs.push_back({evaluator_->Reserve(plug), field, factor, fallback});
  } else if (const std::optional<double> number = scene().Number(plug.node, plug.attribute, plug.index)) {
    *field = *number * factor;
  }
}

bool Binder::Touches(std::string_view attribute) {
  if (!hasTouched_) touched_ = scene().TouchedAttributes(node_);
  hasTouched_ = true;
  return std::any_of(touched_.begin(), touched_.end(),
                     [attribute](std::string_view name) { return name.starts_with(attribute); });
}

void Binder::Number(std::string_view attribute, double* field, std::int32_t index) {
  const scene::Plug plug = scene().PlugOf(node_, attribute, index);
  Bind(plug, field, KindOf(scene(), plug) == Kind::kAngle ? measures().radians : 1.0);
}

void Binder::Point(std::string_view attribute, Vector* field, std::int32_t index) {
  std::string name(attribute);
  name += 'X';
  for (const int axis : {0, 1, 2}) {
    name.back() = static_cast<char>('X' + axis);
    Number(name, &(*field)[axis], index);
  }
}

void Binder::Internal(std::string_view attribute, double* field, std::int32_t index) {
  const scene::Plug plug = scene().PlugOf(node_, attribute, index);
  Bind(plug, field, InternalUnits(measures(), KindOf(scene(), plug)));
}

void Binder::MatrixOf(std::string_view attribute, Matrix* field, std::int32_t index) {
  const scene::Plug plug = scene().PlugOf(node_, attribute, index);
  if (IsPlaceMatrix(attribute) || scene().SourceOf(plug)) {
    step_->matrixInputs.push_back({evaluator_->ReserveMatrix(plug), field});
  } else {
    *field = evaluator_->StoredMatrix(plug);
  }
}

void Binder::WorldOf(scene::NodeId node, Matrix* field) {
  step_->matrixInputs.push_back({evaluator_->ReserveMatrix(scene().PlugOf(node, kWorldMatrix)), field});
}

void Binder::ReportNode(diag::Code code) {
  evaluator_->diagnostics_->Report(code, scene().node(node_).place,
                                   {scene().PathOf(node_, diag::Collector::kLongestArgument)});
}

std::vector<std::int32_t> Binder::Indices(std::span<const std::string_view> attributes) const {
  std::vector<std::int32_t> indices;
  const auto wanted = [attributes](std::string_view attribute) {
    return std::find(attributes.begin(), attributes.end(), attribute) != attributes.end();
  };
  for (const scene::Connection* const connection : scene().ConnectionsInto(node_)) {
    const scene::Plug& plug = connection->destination;
    if (plug.index != scene::kNoIndex && wanted(plug.attribute)) indices.push_back(plug.index);
  }
  for (const std::string_view attribute : attributes) {
    for (const scene::Piece& piece : scene().Pieces(node_, attribute)) {
      // A range can be longer than its values: the elements beyond them are not written.
      const std::size_t longest = piece.value.text().size();
      for (std::int32_t index = piece.first; index <= piece.last; ++index) {
        if (static_cast<std::size_t>(index - piece.first) >= longest) break;
        indices.push_back(index);
      }
    }
  }
  std::sort(indices.begin(), indices.end());
  indices.erase(std::unique(indices.begin(), indices.end()), indices.end());
  return indices;
}

}  // namespace motion
