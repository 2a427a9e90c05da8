// A project in words, every number to its last bit: two projects are the same where their texts are.
#pragma once

#include <string>

#include "refhost/Project.h"

namespace secondreader {

std::string textOf(const refhost::Project& project);

}  // namespace secondreader
