// A scene as its author sees it, to be held against the layers of an import. It shares no code with the
// rules.
#pragma once

#include <initializer_list>
#include <string>
#include <string_view>
#include <vector>

#include "check/Check.h"
#include "motion/Evaluator.h"
#include "motion/Measures.h"
#include "scene/Scene.h"

namespace check_test {

struct Author {
  explicit Author(std::string_view whole)
      : text(whole),
        unreported(whole),
        scene(scene::Read(whole, unreported)),
        measures(motion::MeasuresOf(scene)) {}

  // The name as createNode has it.
  std::string_view WrittenName(scene::NodeId node) const;

  // Whether the first key of a node lands at time 0: the unit of time counts frames.
  bool CountsFrames() const;

  std::string_view text;
  diag::Collector unreported;
  scene::Scene scene;
  motion::Measures measures;
};

// Whether one of the codes is reported of one of the nodes: an argument names it, or the place lies in the
// text of the command that makes it or in the attributes that follow.
bool IsSaidOf(const Author& author, const check::Report& report, const std::vector<scene::NodeId>& nodes,
              std::initializer_list<diag::Code> codes);

bool SameWithoutCase(std::string_view a, std::string_view b);

}  // namespace check_test
