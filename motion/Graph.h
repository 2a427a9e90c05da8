// Values that are computed from one another, frame by frame.
//
// A number or a matrix is a cell with an id. A step reads cells, computes, and writes cells of its own. An
// unknown number is NaN, an unknown matrix contains NaN; a step that reads one writes unknown values.
#pragma once

#include <cstdint>
#include <limits>
#include <vector>

#include "motion/Matrix.h"

namespace motion {

enum class NumberId : std::uint32_t {};
enum class MatrixId : std::uint32_t {};

inline constexpr double kUnknown = std::numeric_limits<double>::quiet_NaN();

Matrix UnknownMatrix();
bool IsKnown(const Matrix& matrix);

struct Values {
  double frame = 0.0;
  std::vector<double> numbers;
  std::vector<Matrix> matrices;
  std::vector<NumberId> failed;  // channels that keep their stored value since the last report

  double& operator[](NumberId id) { return numbers[static_cast<std::size_t>(id)]; }
  double operator[](NumberId id) const { return numbers[static_cast<std::size_t>(id)]; }
  Matrix& operator[](MatrixId id) { return matrices[static_cast<std::size_t>(id)]; }
  const Matrix& operator[](MatrixId id) const { return matrices[static_cast<std::size_t>(id)]; }
};

// The cell of an input, and the field of the step that receives it: the cell times the factor. Where the cell
// is unknown the field is `fallback`, which may be unknown too.
struct NumberInput {
  NumberId cell;
  double* field;
  double factor;
  double fallback = kUnknown;
};
struct MatrixInput {
  MatrixId cell;
  Matrix* field;
};

class Step {
 public:
  Step() = default;
  Step(const Step&) = delete;
  Step& operator=(const Step&) = delete;
  virtual ~Step() = default;

  virtual void Run(Values* values) = 0;

  // Makes a step that passes on a connected value give the stored value from now on, and read nothing. False
  // for other steps, which stay as they are.
  virtual bool Cut() { return false; }

  std::vector<NumberInput> numberInputs;
  std::vector<MatrixInput> matrixInputs;
  bool readsFrame = false;

 protected:
  // Copies the inputs to their fields. False where one is unknown.
  bool Load(const Values& values);
};

// A step that writes numbers, in cells that follow each other.
class NumberStep : public Step {
 public:
  void Run(Values* values) override;

  NumberId firstOutput{};
  std::uint32_t outputCount = 0;

 private:
  // Writes outputCount numbers. False where they cannot be computed: they are then unknown.
  virtual bool Compute(double frame, double* outputs) = 0;
};

// A step that writes one matrix.
class MatrixStep : public Step {
 public:
  void Run(Values* values) override;

  MatrixId output{};

 private:
  virtual bool Compute(Matrix* result) = 0;
};

}  // namespace motion
