// A trace that was predicted and the one that was written, line by line.
#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace secondreader {

// The precision that the doubles of a line have for a reader that computes them in another way.
enum class Rounding {
  None,      // bit for bit
  Last,      // they went through a sine or a cosine: to 1e-12 of their size
  Angle,     // degrees that went through an arc tangent: to 1e-12 of half a turn, where they are smaller
  HalfTurn,  // the same, and what lies half a turn away in both directions may lie on either side: whole
             // turns more or less are the same
};

// A line without its end.
struct PredictedLine {
  std::string text;
  Rounding rounding = Rounding::None;
};

struct TraceDifference {
  std::size_t line = 0;   // from 1
  std::string predicted;  // "(nothing)" where one of them has ended
  std::string traced;
};

// Whether two lines say the same: the doubles of values as well as they are known, everything else exactly.
bool linesAgree(const PredictedLine& predicted, std::string_view traced);

std::optional<TraceDifference> firstDifference(const std::vector<PredictedLine>& predicted,
                                               const std::vector<std::string>& traced);

// The lines of a text, without their ends.
std::vector<std::string> linesOf(std::string_view text);

}  // namespace secondreader
