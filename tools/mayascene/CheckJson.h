// The reports of checks as JSON. docs/check-report.schema.json describes it.
#pragma once

#include <ostream>
#include <string_view>

#include "text/JsonWriter.h"
#include "tools/mayascene/SceneCheck.h"

namespace mayascene {

// One scene's object.
void writeCheckedScene(text::JsonWriter& json, const CheckedScene& scene);

// Writes one object for all scenes of a run, each scene as it comes.
class CheckJson {
 public:
  explicit CheckJson(std::ostream& out);  // the stream outlives the object

  // A scene's object, as writeCheckedScene wrote it.
  void add(std::string_view scene) { json_.written(scene); }
  void end();  // once, at the end

 private:
  std::ostream& out_;
  text::JsonWriter json_;
};

}  // namespace mayascene
