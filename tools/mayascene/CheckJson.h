// The reports of checks as JSON. docs/check-report.schema.json describes it.
#pragma once

#include <ostream>

#include "tools/mayascene/JsonWriter.h"
#include "tools/mayascene/SceneCheck.h"

namespace mayascene {

// One scene's object.
void writeCheckedScene(JsonWriter& json, const CheckedScene& scene);

// Writes one object for all scenes of a run, each scene as it comes.
class CheckJson {
 public:
  explicit CheckJson(std::ostream& out);  // the stream outlives the object

  void add(const CheckedScene& scene) { writeCheckedScene(json_, scene); }
  void end();  // once, at the end

 private:
  std::ostream& out_;
  JsonWriter json_;
};

}  // namespace mayascene
