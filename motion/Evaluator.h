// The values of a scene at its frames.
//
// First ask for values, then go from frame to frame:
//
//   Evaluator evaluator(scene, &diagnostics);
//   const NumberId focal = evaluator.Number(camera, "focalLength");
//   const MatrixId world = evaluator.World(transform);
//   for (double frame : frames) {
//     evaluator.MoveTo(frame);
//     ... evaluator.Value(focal), evaluator.Value(world) ...
//   }
//
// The dependencies of a value are found once and computed in their order at every frame; values that do not
// move are computed once. Time and memory grow with the values that are asked for and their dependencies;
// nothing is recursive.
#pragma once

#include <cmath>
#include <cstdint>
#include <deque>
#include <memory>
#include <span>
#include <string>
#include <string_view>
#include <vector>

#include "diag/Collector.h"
#include "motion/Graph.h"
#include "motion/Measures.h"
#include "motion/Ordering.h"
#include "motion/Transform.h"
#include "scene/FlatMap.h"
#include "scene/Scene.h"

namespace motion {

class LocalStep;
struct NodeType;

// Where a value comes from.
enum class Standing : std::uint8_t {
  kStored,       // nothing drives it
  kDriven,       // computed
  kUnsupported,  // its driver cannot be computed: the stored value is kept
  kCircle,       // it would drive itself: the stored value is kept
  kFailed,       // its driver has no value at some frame: the stored value is kept there
};

// A channel that keeps its stored value, although something drives it.
struct Kept {
  scene::Plug plug;
  Standing standing;
};

class Evaluator {
 public:
  // Both must outlive the evaluator. It reports diagnostics about the values that are asked for and their
  // dependencies.
  Evaluator(const scene::Scene& scene, diag::Collector* diagnostics);
  ~Evaluator();
  Evaluator(const Evaluator&) = delete;
  Evaluator& operator=(const Evaluator&) = delete;

  // ---- asking; values are there after the next MoveTo ----

  // A number in the scene's units. Where nothing drives it, it is exactly the number that is written.
  NumberId Number(scene::NodeId node, std::string_view attribute, std::int32_t index = scene::kNoIndex);

  // Lengths are in the scene's unit. `Local` is the matrix of the channels; with the node's offset matrix it
  // is `InParent`, from the node's space to its parent's. `World` goes from the node's space to the world.
  MatrixId Local(scene::NodeId node);
  MatrixId InParent(scene::NodeId node);
  MatrixId World(scene::NodeId node);

  // Whether the value can change from frame to frame.
  bool Moves(NumberId number) const;
  bool Moves(MatrixId matrix) const;

  // The nodes that compute the values asked for so far and their dependencies: curves, constraints …
  const std::vector<scene::NodeId>& computingNodes() const { return computingNodes_; }

  // ---- frames ----

  // Any frame after any other; ascending ones are fastest.
  void MoveTo(double frame);

  // Divides what the sets need and what moves into parts that do not depend on each other. Returns, for each
  // set of values, the part that computes it; kStill for a set that does not move. Valid until more values
  // are asked for.
  struct Wanted {
    std::vector<NumberId> numbers;
    std::vector<MatrixId> matrices;
  };
  static constexpr std::uint32_t kStill = 0;
  std::vector<std::uint32_t> Split(std::span<const Wanted> wanted);
  std::size_t partCount() const { return parts_.size(); }
  // Moves one part only; the values of the others stay as they are.
  void MoveTo(double frame, std::uint32_t part);

  // Where a number is unknown, the attribute's default, or 0 where it has none.
  double Value(NumberId number) const {
    const double value = values_[number];
    return std::isnan(value) ? DefaultOf(number) : value;
  }
  const Matrix& Value(MatrixId matrix) const { return values_[matrix]; }

  // The channels that the local matrix of a node was made from: lengths in the scene's unit, radians.
  const Transform& TransformOf(MatrixId local) const;

  const Measures& measures() const { return measures_; }
  const scene::Scene& scene() const { return scene_; }

 private:
  friend class Binder;
  friend class KeptBelow;
  friend std::string SentenceOf(const Evaluator& evaluator, const Kept& kept);
  static constexpr std::uint32_t kNone = Ordering::kNone;

  // A value, and the step that writes it.
  struct Cell {
    scene::Plug plug;
    std::uint32_t step = kNone;
    Standing standing = Standing::kStored;

    bool AsDriven() const { return standing == Standing::kStored || standing == Standing::kDriven; }
  };
  // The cell of a step that passes on what is connected.
  struct Written {
    std::uint32_t number = kNone;
    std::uint32_t matrix = kNone;
  };
  struct CellOfPlug {
    std::uint32_t plusOne = 0;  // 0: none
  };

  // ---- cells and what writes them: EvaluatorCells.cpp ----

  NumberId Reserve(const scene::Plug& plug);
  scene::Plug WithLastingName(const scene::Plug& plug);
  const NodeType* TypeOfOutput(const scene::Plug& plug) const;
  MatrixId ReserveMatrix(scene::Plug plug);
  void Settle();
  void Expand(NumberId number);
  void ExpandMatrix(MatrixId matrix);
  void MakeNode(const NodeType& type, scene::NodeId node);
  bool CanGive(const scene::Driver& driver) const;
  bool CanGiveMatrix(const scene::Plug& plug) const;
  bool IsPlaced(scene::NodeId node) const;
  bool IsInput(const scene::Plug& plug) const;
  double DefaultOf(NumberId number) const;
  double StoredNumber(const scene::Plug& plug) const;
  Matrix StoredMatrix(const scene::Plug& plug) const;
  void ReportUnsupported(const scene::Plug& plug, const scene::Driver& driver);
  std::uint32_t AddStep(std::unique_ptr<Step> step);
  NumberId AddNumber(const scene::Plug& plug);
  std::string NameOf(const scene::Plug& plug) const;
  // The plug, what drives it, and the type of that node.
  std::vector<std::string> NamesOfDriver(const scene::Plug& plug, const scene::Driver& driver) const;
  const Cell& CellOf(NumberId id) const { return numbers_[static_cast<std::size_t>(id)]; }
  const Cell& CellOf(MatrixId id) const { return matrices_[static_cast<std::size_t>(id)]; }

  // ---- the order of the steps: EvaluatorOrder.cpp ----

  Ordering::Graph GraphOfSteps();
  void Order();
  std::uint32_t StepOfInput(const Step& step, std::size_t input) const;
  void CutCircle(std::span<const std::uint32_t> circle);
  void Place(std::uint32_t step);
  void ReportFailures();

  const scene::Scene& scene_;
  diag::Collector* diagnostics_;
  Measures measures_;
  std::vector<Cell> numbers_;
  std::vector<Cell> matrices_;
  std::deque<std::string> unknownNames_;
  scene::FlatMap<CellOfPlug> numberOfPlug_;
  scene::FlatMap<CellOfPlug> matrixOfPlug_;
  std::vector<std::unique_ptr<Step>> steps_;
  std::vector<Written> written_;                   // by step
  std::vector<bool> moves_;                        // by step
  std::vector<const LocalStep*> locals_;           // by matrix; null where it is not a local one
  std::vector<std::uint32_t> moving_;              // in the order in which they are run
  std::vector<std::vector<std::uint32_t>> parts_;  // the same by part
  std::vector<scene::NodeId> computingNodes_;
  std::vector<NumberId> pendingNumbers_;
  std::vector<MatrixId> pendingMatrices_;
  Ordering ordering_{GraphOfSteps()};
  std::size_t ordered_ = 0;            // the steps before it are in order
  std::vector<std::uint32_t> placed_;  // each after those that it reads
  Values values_;
};

}  // namespace motion
