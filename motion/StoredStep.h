// Steps of driven cells. They pass on the driving cell; where that is unknown they give the value that the
// scene stores, if any.
#pragma once

#include "motion/Graph.h"

namespace motion {

class StoredStep final : public Step {
 public:
  explicit StoredStep(double stored) : stored_(stored) {}

  void Run(Values* values) override {
    const bool known = Load(*values);
    if (!known && !failed_) {
      failed_ = true;
      values->failed.push_back(output);
    }
    (*values)[output] = known ? input : stored_;
  }

  bool Cut() override {
    numberInputs.clear();
    input = stored_;
    return true;
  }

  double input = 0.0;
  NumberId output{};

 private:
  double stored_;
  bool failed_ = false;
};

class StoredMatrixStep final : public Step {
 public:
  explicit StoredMatrixStep(const Matrix& stored) : stored_(stored) {}

  void Run(Values* values) override { (*values)[output] = Load(*values) ? input : stored_; }

  bool Cut() override {
    matrixInputs.clear();
    input = stored_;
    return true;
  }

  Matrix input;
  MatrixId output{};

 private:
  Matrix stored_;
};

}  // namespace motion
