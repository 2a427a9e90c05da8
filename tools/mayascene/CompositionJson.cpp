#include "tools/mayascene/CompositionJson.h"

#include <string>
#include <string_view>
#include <vector>

#include "hostapi/CameraSuite.h"
#include "text/JsonWriter.h"
#include "tools/mayascene/JsonMembers.h"
#include "tools/mayascene/StreamWords.h"

namespace mayascene {
namespace {

using refhost::CallbackResult;
using refhost::Composition;
using refhost::Layer;
using refhost::LayerKind;
using refhost::Stream;

constexpr std::string_view kFormat = "mayascene-composition";
constexpr std::int64_t kVersionOfForm = 1;

std::string_view outcomeWord(Outcome outcome) {
  switch (outcome) {
    case Outcome::Imported:
      return "imported";
    case Outcome::Nothing:
      return "nothing";
    case Outcome::Refused:
      return "refused";
    case Outcome::Failed:
      return "failed";
    case Outcome::Unreadable:
      break;
  }
  return "unreadable";
}

std::string_view kindWord(LayerKind kind) {
  switch (kind) {
    case LayerKind::Camera:
      return "camera";
    case LayerKind::Composition:
      return "composition";
    case LayerKind::Null:
      break;
  }
  return "null";
}

void writePair(text::JsonWriter& json, std::int64_t first, std::int64_t second) {
  json.beginRow();
  json.integer(first);
  json.integer(second);
  json.endArray();
}

void writeVector(text::JsonWriter& json, const double* values, std::size_t count) {
  json.beginRow();
  for (std::size_t i = 0; i < count; ++i) json.number(values[i]);
  json.endArray();
}

// What is written of every callback.
void writeCallback(text::JsonWriter& json, const CallbackResult& result) {
  json.key("error");
  if (result.code == 0) {
    json.null();
  } else {
    json.beginObject();
    json.key("code");
    json.integer(result.code);
    json.key("name");
    json.text(refhost::errorName(result.code));
    json.key("meaning");
    json.text(refhost::errorSentence(result.code));
    json.key("line");
    if (result.line == 0) {
      json.null();
    } else {
      json.integer(result.line);
    }
    json.endObject();
  }
  writeTexts(json, "messages", result.messages);
  writeTexts(json, "refusals", result.refusals);
  json.key("leftovers");
  json.beginArray();
  for (const refhost::Leftover& leftover : result.leftovers) {
    json.beginObject();
    json.key("description");
    json.text(leftover.description);
    json.key("keptByDesign");
    json.boolean(leftover.keptByDesign);
    json.endObject();
  }
  json.endArray();
}

void writeKeys(text::JsonWriter& json, const Stream& stream) {
  json.key("keys");
  if (stream.keyCount() == 0) return json.null();
  json.beginObject();
  json.key("times");
  json.beginRow();
  for (const T_Time& time : stream.keys->times) writePair(json, time.value, time.scale);
  json.endArray();
  json.key("values");
  json.beginRow();
  const auto dimension = static_cast<std::size_t>(stream.dimension);
  const double* values = stream.keys->values.data();
  for (std::size_t key = 0; key < stream.keyCount(); ++key) {
    writeVector(json, values + key * dimension, dimension);
  }
  json.endArray();
  json.endObject();
}

void writeStream(text::JsonWriter& json, const Stream& stream, LayerKind kind) {
  json.beginObject();
  json.key("id");
  json.integer(stream.id);
  for (const StreamWords& words : kStreamWords) {
    if (words.id != stream.id) continue;
    json.key("name");
    json.text(kind == LayerKind::Camera ? words.cameraName : words.name);
    json.key("unit");
    json.text(words.unit);
  }
  json.key("value");
  writeVector(json, stream.value, static_cast<std::size_t>(stream.dimension));
  writeKeys(json, stream);
  json.endObject();
}

void writeFilmSize(text::JsonWriter& json, const Layer& layer) {
  json.key("filmSize");
  if (layer.filmDirection == refhost::kFilmNeverSet) return json.null();
  json.beginObject();
  json.key("direction");
  json.text(layer.filmDirection == HOST_FILM_VERTICAL ? "vertical" : "horizontal");
  json.key("points");
  json.number(layer.filmSize);
  json.endObject();
}

void writeLayer(text::JsonWriter& json, const Layer& layer) {
  json.beginObject();
  json.key("number");
  json.integer(layer.number);
  json.key("kind");
  json.text(kindWord(layer.kind));
  json.key("name");
  json.text(layer.name);
  json.key("parent");
  layer.parent == nullptr ? json.null() : json.integer(layer.parent->number);
  json.key("source");
  layer.source == nullptr ? json.null() : json.integer(layer.source->number);
  json.key("threeDimensional");
  json.boolean(layer.threeDimensional);
  json.key("aimed");
  json.boolean(layer.aimed);
  writeFilmSize(json, layer);
  json.key("streams");
  json.beginArray();
  for (const Stream& stream : layer.streams) writeStream(json, stream, layer.kind);
  json.endArray();
  json.endObject();
}

void writeComposition(text::JsonWriter& json, const Composition& composition) {
  json.beginObject();
  json.key("number");
  json.integer(composition.number);
  json.key("name");
  json.text(composition.name);
  json.key("width");
  json.integer(composition.width);
  json.key("height");
  json.integer(composition.height);
  json.key("pixelAspect");
  writePair(json, composition.pixelAspect.numerator, composition.pixelAspect.denominator);
  json.key("frameRate");
  writePair(json, composition.frameRate.numerator, composition.frameRate.denominator);
  json.key("duration");
  writePair(json, composition.duration.value, composition.duration.scale);
  json.key("layers");
  json.beginArray();
  for (const Layer* layer : composition.layers) writeLayer(json, *layer);
  json.endArray();
  json.endObject();
}

void writeNumbers(text::JsonWriter& json, const SceneNumbers& numbers) {
  if (numbers.firstFrame) writeNumber(json, "firstFrame", *numbers.firstFrame);
  if (numbers.lastFrame) writeNumber(json, "lastFrame", *numbers.lastFrame);
  writeText(json, "linearUnit", numbers.linearUnit);
}

void writeScene(text::JsonWriter& json, const SceneReport& scene) {
  json.beginObject();
  json.key("path");
  json.text(scene.path);
  json.key("outcome");
  json.text(outcomeWord(scene.outcome));
  json.key("status");
  json.integer(static_cast<int>(scene.status));
  writeCallback(json, scene.result);
  if (scene.numbers) writeNumbers(json, *scene.numbers);
  json.key("compositions");
  json.beginArray();
  if (scene.result.folder != nullptr) {
    for (const Composition* composition : scene.result.folder->compositions)
      writeComposition(json, *composition);
  }
  json.endArray();
  json.endObject();
}

}  // namespace

void writeCompositionJson(std::ostream& out, const RunReport& run) {
  text::JsonWriter json(out);
  beginReport(json, kFormat, kVersionOfForm);
  json.key("linearUnits");
  json.integer(run.linearUnits);
  json.key("scenes");
  json.beginArray();
  for (const SceneReport& scene : run.scenes) writeScene(json, scene);
  json.endArray();
  json.key("entry");
  json.beginObject();
  writeCallback(json, run.entry);
  json.endObject();
  json.key("deathHook");
  json.beginObject();
  writeCallback(json, run.deathHook);
  json.endObject();
  json.endObject();
}

}  // namespace mayascene
