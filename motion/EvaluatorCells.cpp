// The cells of an evaluator: the step that writes each of them follows from the driver of its plug.
#include <optional>

#include "motion/Evaluator.h"
#include "motion/NodeTypes.h"
#include "motion/PlaceSteps.h"
#include "motion/StoredStep.h"

namespace motion {
namespace {

using scene::NodeId;
using scene::Plug;

std::uint64_t KeyOf(const Plug& plug) {
  return std::uint64_t{plug.node} << 32 | static_cast<std::uint32_t>(plug.index);
}

}  // namespace

std::uint32_t Evaluator::AddStep(std::unique_ptr<Step> step) {
  steps_.push_back(std::move(step));
  written_.emplace_back();
  moves_.push_back(false);
  return static_cast<std::uint32_t>(steps_.size() - 1);
}

NumberId Evaluator::AddNumber(const Plug& plug) {
  numbers_.push_back({plug});
  values_.numbers.push_back(kUnknown);
  const auto id = static_cast<NumberId>(numbers_.size() - 1);
  numberOfPlug_.At(KeyOf(plug), plug.attribute).plusOne = static_cast<std::uint32_t>(numbers_.size());
  return id;
}

NumberId Evaluator::Reserve(const Plug& plug) {
  if (const CellOfPlug* const cell = numberOfPlug_.Find(KeyOf(plug), plug.attribute)) {
    if (cell->plusOne != 0) return static_cast<NumberId>(cell->plusOne - 1);
  }
  if (const NodeType* const type = TypeOfOutput(plug)) {
    MakeNode(*type, plug.node);
    return static_cast<NumberId>(numberOfPlug_.At(KeyOf(plug), plug.attribute).plusOne - 1);
  }
  const NumberId id = AddNumber(WithLastingName(plug));
  pendingNumbers_.push_back(id);
  return id;
}

// The name of an attribute that is not known comes from the caller, and may be temporary: the evaluator keeps
// a copy.
Plug Evaluator::WithLastingName(const Plug& plug) {
  if (scene::FindAttribute(scene_.node(plug.node).type, plug.attribute) != nullptr) return plug;
  if (scene_.Added(plug.node, plug.attribute) != nullptr) return plug;
  return {plug.node, unknownNames_.emplace_back(plug.attribute), plug.index};
}

// Null where no node computes the plug.
const NodeType* Evaluator::TypeOfOutput(const Plug& plug) const {
  if (plug.index != scene::kNoIndex) return nullptr;
  const NodeType* const type = FindNodeType(scene_.node(plug.node).type);
  return type != nullptr && OutputOf(*type, plug.attribute) >= 0 ? type : nullptr;
}

// A node's step and the cells of all its outputs.
void Evaluator::MakeNode(const NodeType& type, NodeId node) {
  Binder binder(this, node);
  std::unique_ptr<NumberStep> step = type.make(&binder);
  step->firstOutput = static_cast<NumberId>(numbers_.size());
  step->outputCount = static_cast<std::uint32_t>(type.outputs.size());
  const std::uint32_t index = AddStep(std::move(step));
  computingNodes_.push_back(node);
  for (const std::string_view output : type.outputs) {
    Cell& cell = numbers_[static_cast<std::size_t>(AddNumber({node, output}))];
    cell.step = index;
    cell.standing = Standing::kDriven;
  }
}

MatrixId Evaluator::ReserveMatrix(Plug plug) {
  if (IsPlaceMatrix(plug.attribute)) plug.index = scene::kNoIndex;  // of the first instance
  CellOfPlug& cell = matrixOfPlug_.At(KeyOf(plug), plug.attribute);
  if (cell.plusOne != 0) return static_cast<MatrixId>(cell.plusOne - 1);
  matrices_.push_back({plug});
  values_.matrices.emplace_back();
  locals_.push_back(nullptr);
  cell.plusOne = static_cast<std::uint32_t>(matrices_.size());
  const auto id = static_cast<MatrixId>(matrices_.size() - 1);
  pendingMatrices_.push_back(id);
  return id;
}

void Evaluator::Settle() {
  while (!pendingNumbers_.empty() || !pendingMatrices_.empty()) {
    if (!pendingNumbers_.empty()) {
      const NumberId id = pendingNumbers_.back();
      pendingNumbers_.pop_back();
      Expand(id);
    } else {
      const MatrixId id = pendingMatrices_.back();
      pendingMatrices_.pop_back();
      ExpandMatrix(id);
    }
  }
  Order();
}

// Whether the node is in the hierarchy and so has the attributes of a transform.
bool Evaluator::IsPlaced(NodeId id) const {
  const scene::Node& node = scene_.node(id);
  return node.parent != scene::kNoNode || node.firstChild != scene::kNoNode ||
         scene::KeepsAttributes(node.type);
}

// Whether the number of a source is available: as a computed output, or as a value of the scene.
bool Evaluator::CanGive(const scene::Driver& driver) const {
  const Plug& plug = driver.plug;
  const scene::Node& node = scene_.node(plug.node);
  if (driver.component >= 0 || plug.attribute == "distanceBetween") return false;
  if (TypeOfOutput(plug) != nullptr) return true;
  if (scene_.Written(plug.node, plug.attribute, plug.index) || scene_.SourceOf(plug)) return true;
  if (scene_.Added(plug.node, plug.attribute) != nullptr) return true;
  return node.origin != scene::Origin::Elsewhere && IsPlaced(plug.node) &&
         scene_.Default(plug.node, plug.attribute).has_value();
}

// The value that the scene writes for a driven channel: the one at the time of saving. Unknown without one.
double Evaluator::StoredNumber(const Plug& plug) const {
  const auto written = scene_.Written(plug.node, plug.attribute, plug.index);
  return written ? written->Number().value_or(kUnknown) : kUnknown;
}

void Evaluator::Expand(NumberId id) {
  const Plug plug = numbers_[static_cast<std::size_t>(id)].plug;
  const std::optional<scene::Driver> driver = scene_.SourceOf(plug);
  if (!driver) {
    values_[id] = scene_.Number(plug.node, plug.attribute, plug.index).value_or(kUnknown);
    return;
  }
  if (!CanGive(*driver)) {
    ReportUnsupported(plug, *driver);
    values_[id] = StoredNumber(plug);
    numbers_[static_cast<std::size_t>(id)].standing = Standing::kUnsupported;
    return;
  }
  const Kind from = KindOf(scene_, driver->plug);
  const Kind to = KindOf(scene_, plug);
  auto step = std::make_unique<StoredStep>(StoredNumber(plug));
  step->output = id;
  const double factor = from == to ? 1.0 : InternalUnits(measures_, from) / InternalUnits(measures_, to);
  step->numberInputs.push_back({Reserve(driver->plug), &step->input, factor});
  Cell& cell = numbers_[static_cast<std::size_t>(id)];
  cell.step = AddStep(std::move(step));
  cell.standing = Standing::kDriven;
  written_[cell.step].number = static_cast<std::uint32_t>(id);
}

// ---- matrices ----

bool Evaluator::CanGiveMatrix(const Plug& plug) const {
  const scene::Node& node = scene_.node(plug.node);
  return IsPlaceMatrix(plug.attribute) && node.origin != scene::Origin::Elsewhere && IsPlaced(plug.node);
}

Matrix Evaluator::StoredMatrix(const Plug& plug) const {
  const auto written = scene_.Written(plug.node, plug.attribute, plug.index);
  if (!written) return {};
  constexpr std::size_t kNumbers = 16;
  const std::vector<double> m = written->Numbers(kNumbers);
  if (m.size() < kNumbers) return {};
  return {{m[0], m[1], m[2]}, {m[4], m[5], m[6]}, {m[8], m[9], m[10]}, {m[12], m[13], m[14]}};
}

void Evaluator::ExpandMatrix(MatrixId id) {
  const auto cell = static_cast<std::size_t>(id);
  const Plug plug = matrices_[cell].plug;
  const std::optional<scene::Driver> driver = scene_.SourceOf(plug);
  if (IsPlaceMatrix(plug.attribute)) {
    Binder binder(this, plug.node);
    std::unique_ptr<MatrixStep> step;
    if (plug.attribute == kMatrix) {
      std::unique_ptr<LocalStep> local = MakeLocal(&binder);
      locals_[cell] = local.get();
      step = std::move(local);
    } else {
      step = MakePlaceMatrix(&binder, plug.attribute);
    }
    step->output = id;
    matrices_[cell].step = AddStep(std::move(step));
    return;
  }
  if (!driver) {
    values_[id] = StoredMatrix(plug);
    return;
  }
  const Matrix stored = plug.attribute == kOffsetParentMatrix ? StoredMatrix(plug) : UnknownMatrix();
  if (!CanGiveMatrix(driver->plug)) {
    ReportUnsupported(plug, *driver);
    values_[id] = stored;
    matrices_[cell].standing = Standing::kUnsupported;
    return;
  }
  auto step = std::make_unique<StoredMatrixStep>(stored);
  step->output = id;
  step->matrixInputs.push_back({ReserveMatrix(driver->plug), &step->input});
  matrices_[cell].step = AddStep(std::move(step));
  matrices_[cell].standing = Standing::kDriven;
  written_[matrices_[cell].step].matrix = static_cast<std::uint32_t>(id);
}

// ---- reports ----

std::string Evaluator::NameOf(const Plug& plug) const {
  std::string name = scene_.PathOf(plug.node, diag::Collector::kLongestArgument);
  name += '.';
  name += plug.attribute;
  if (plug.index != scene::kNoIndex) name += '[' + std::to_string(plug.index) + ']';
  return name;
}

std::vector<std::string> Evaluator::NamesOfDriver(const Plug& plug, const scene::Driver& driver) const {
  const std::string_view type = scene_.node(driver.plug.node).type;
  return {NameOf(plug), NameOf(driver.plug), type.empty() ? "unknown" : std::string(type)};
}

void Evaluator::ReportUnsupported(const Plug& plug, const scene::Driver& driver) {
  const std::vector<std::string> names = NamesOfDriver(plug, driver);
  diagnostics_->Report(diag::Code::UnsupportedDriver, driver.connection->destinationPlace,
                       {names[0], names[1], names[2]});
}

}  // namespace motion
