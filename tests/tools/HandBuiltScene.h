// A report of a scene, built by hand: two nulls and a camera, every number different.
#pragma once

#include <deque>
#include <string>

#include "tools/mayascene/Report.h"

namespace mayascene_test {

struct HandBuiltScene {
  HandBuiltScene();

  // One more layer at the end of the composition, with the streams of its kind at their defaults.
  refhost::Layer* add(refhost::LayerKind kind, const std::string& name, refhost::Layer* parent);

  std::deque<refhost::Layer> layers;
  refhost::Composition composition;
  refhost::Folder folder;
  mayascene::SceneReport report;
};

}  // namespace mayascene_test
