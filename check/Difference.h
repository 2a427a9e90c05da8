// Whether an attribute is other than what the importer takes it for.
#pragma once

#include <optional>
#include <string>
#include <string_view>

#include "check/RulesInternal.h"

namespace check {

struct Difference {
  diag::Range place;
  std::string what;  // "it is 2", and the like
};

// Where the file gives the attribute another value, keys it at one, or has another node drive it. Nearer to
// the neutral value than anybody can see is no difference.
std::optional<Difference> DifferenceFrom(const Subject& subject, scene::NodeId node,
                                         std::string_view attribute, double neutral);

}  // namespace check
