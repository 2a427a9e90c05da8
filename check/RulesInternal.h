// What the rules look at, and where they report. One topic a file.
#pragma once

#include <initializer_list>
#include <string_view>
#include <vector>

#include "check/CameOver.h"
#include "check/Cameras.h"
#include "diag/Collector.h"
#include "motion/Measures.h"
#include "scene/Scene.h"
#include "scene/Settings.h"

namespace check {

struct Subject {
  const scene::Scene& scene;
  const scene::Settings& settings;
  const motion::Measures& measures;
  const CameOver& cameOver;
  const std::vector<Camera>& cameras;
  diag::Collector& diagnostics;
};

// Why the import stopped, and where: Stops.cpp. Needs no scene: the file may be none.
void ReportStop(std::string_view text, const CameOver& cameOver, diag::Collector* diagnostics);

}  // namespace check
