#include "motion/Graph.h"

#include <algorithm>
#include <cmath>

namespace motion {

Matrix UnknownMatrix() {
  Matrix matrix;
  matrix.x.x = kUnknown;
  return matrix;
}

bool IsKnown(const Matrix& matrix) { return !std::isnan(matrix.x.x); }

bool Step::Load(const Values& values) {
  bool known = true;
  for (const NumberInput& input : numberInputs) {
    const double value = values[input.cell];
    *input.field = std::isnan(value) ? input.fallback : value * input.factor;
    known = known && !std::isnan(*input.field);
  }
  for (const MatrixInput& input : matrixInputs) {
    *input.field = values[input.cell];
    known = known && IsKnown(*input.field);
  }
  return known;
}

void NumberStep::Run(Values* values) {
  double* const outputs = &(*values)[firstOutput];
  if (!Load(*values) || !Compute(values->frame, outputs)) std::fill(outputs, outputs + outputCount, kUnknown);
}

void MatrixStep::Run(Values* values) {
  Matrix& matrix = (*values)[output];
  if (!Load(*values) || !Compute(&matrix)) matrix = UnknownMatrix();
}

}  // namespace motion
