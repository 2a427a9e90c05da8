#include "motion/Evaluator.h"

#include <optional>

#include "motion/NodeTypes.h"
#include "motion/PlaceSteps.h"

namespace motion {

Evaluator::Evaluator(const scene::Scene& scene, diag::Collector* diagnostics)
    : scene_(scene), diagnostics_(diagnostics), measures_(MeasuresOf(scene)) {}

Evaluator::~Evaluator() = default;

NumberId Evaluator::Number(scene::NodeId node, std::string_view attribute, std::int32_t index) {
  const NumberId id = Reserve(scene_.PlugOf(node, attribute, index));
  Settle();
  return id;
}

MatrixId Evaluator::Local(scene::NodeId node) {
  const MatrixId id = ReserveMatrix(scene_.PlugOf(node, kMatrix));
  Settle();
  return id;
}

MatrixId Evaluator::InParent(scene::NodeId node) {
  const MatrixId id = ReserveMatrix(scene_.PlugOf(node, kDagLocalMatrix));
  Settle();
  return id;
}

MatrixId Evaluator::World(scene::NodeId node) {
  const MatrixId id = ReserveMatrix(scene_.PlugOf(node, kWorldMatrix));
  Settle();
  return id;
}

bool Evaluator::Moves(NumberId number) const {
  const std::uint32_t step = numbers_[static_cast<std::size_t>(number)].step;
  return step != kNone && moves_[step];
}

bool Evaluator::Moves(MatrixId matrix) const {
  const std::uint32_t step = matrices_[static_cast<std::size_t>(matrix)].step;
  return step != kNone && moves_[step];
}

const Transform& Evaluator::TransformOf(MatrixId local) const {
  return locals_[static_cast<std::size_t>(local)]->transform;
}

double Evaluator::DefaultOf(NumberId number) const {
  const scene::Plug& plug = numbers_[static_cast<std::size_t>(number)].plug;
  return scene_.Default(plug.node, plug.attribute).value_or(0.0);
}

void Evaluator::MoveTo(double frame) {
  values_.frame = frame;
  for (const std::uint32_t step : moving_) steps_[step]->Run(&values_);
  if (!values_.failed.empty()) ReportFailures();
}

void Evaluator::ReportFailures() {
  for (const NumberId number : values_.failed) {
    Cell& cell = numbers_[static_cast<std::size_t>(number)];
    if (IsInput(cell.plug)) continue;
    cell.standing = Standing::kFailed;
    const std::optional<scene::Driver> driver = scene_.SourceOf(cell.plug);
    if (!driver) continue;
    const std::vector<std::string> names = NamesOfDriver(cell.plug, *driver);
    diagnostics_->Report(diag::Code::DriverWithoutAnswer, driver->connection->destinationPlace,
                         {names[0], names[1]});
  }
  values_.failed.clear();
}

// Whether the plug is an input of a computing node, and not a channel with a stored value. An unknown value
// there makes the node's outputs unknown, and the channels that they drive keep their values.
bool Evaluator::IsInput(const scene::Plug& plug) const {
  const bool channel = scene::FindAttribute("transform", plug.attribute) != nullptr;
  return !channel && FindNodeType(scene_.node(plug.node).type) != nullptr && std::isnan(StoredNumber(plug));
}

}  // namespace motion
