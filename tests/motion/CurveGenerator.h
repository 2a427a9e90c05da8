// Curves of every kind, the same on every platform for the same seed.
#pragma once

#include <cstdint>
#include <vector>

#include "motion/CurveData.h"

namespace testmotion {

struct GeneratedCurve {
  motion::CurveData data;
  std::vector<double> times;  // seconds: on keys and beside them, between, before and after, in no order
};

GeneratedCurve GenerateCurve(std::uint64_t seed);

}  // namespace testmotion
