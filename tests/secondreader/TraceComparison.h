// Two traces of the same run, line by line.
#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace secondreader {

struct TraceDifference {
  std::size_t line = 0;   // from 1
  std::string predicted;  // "(nothing)" where one of them has ended
  std::string traced;
};

// Whether two lines say the same: the doubles of values, centres and film sizes to 1e-9 relative, everything
// else exactly.
bool linesAgree(std::string_view predicted, std::string_view traced);

std::optional<TraceDifference> firstDifference(const std::vector<std::string>& predicted,
                                               const std::vector<std::string>& traced);

// The lines of a text, without their ends.
std::vector<std::string> linesOf(std::string_view text);

}  // namespace secondreader
