#include "tools/mayascene/CheckHeadJson.h"

#include <string_view>

#include "tools/mayascene/JsonMembers.h"

namespace mayascene {
namespace {

void writePlace(text::JsonWriter& json, const diag::LineAndColumn& place) {
  json.beginObject();
  writeCount(json, "line", place.line);
  writeCount(json, "column", place.column);
  json.endObject();
}

void writeWhere(text::JsonWriter& json, const check::Where& where) {
  json.beginObject();
  writeCount(json, "offset", where.range.offset);
  writeCount(json, "length", where.range.length);
  writeCount(json, "line", where.place.line);
  writeCount(json, "column", where.place.column);
  json.endObject();
}

void writeValue(text::JsonWriter& json, double value) { json.number(value); }
void writeValue(text::JsonWriter& json, const std::string& value) { json.text(value); }

// A value and its place in the file; a null place where the file does not set the value.
template <typename T>
void writeGiven(text::JsonWriter& json, std::string_view key, const check::Given<T>& given) {
  json.key(key);
  json.beginObject();
  json.key("value");
  writeValue(json, given.value);
  json.key("where");
  given.where ? writeWhere(json, *given.where) : json.null();
  json.endObject();
}

void writeDrives(text::JsonWriter& json, const std::vector<check::Drive>& drives) {
  json.key("drivenBy");
  json.beginArray();
  for (const check::Drive& drive : drives) {
    json.beginObject();
    writeText(json, "channel", drive.channel);
    writeText(json, "node", drive.node);
    writeText(json, "type", drive.type);
    json.key("keys");
    drive.keys ? json.integer(static_cast<std::int64_t>(*drive.keys)) : json.null();
    json.key("where");
    writeWhere(json, drive.where);
    json.endObject();
  }
  json.endArray();
}

void writeChain(text::JsonWriter& json, const check::ShapeHead& shape) {
  json.key("chain");
  json.beginArray();
  for (const check::ChainLink& link : shape.chain) {
    json.beginObject();
    writeText(json, "name", link.name);
    writeDrives(json, link.drives);
    json.endObject();
  }
  json.endArray();
  writeTruth(json, "chainGoesOn", shape.chainGoesOn);
}

// `zoomKeys` is null for a locator.
void writeLayer(text::JsonWriter& json, const check::ShapeHead& shape, const std::size_t* zoomKeys) {
  json.key("layer");
  if (!shape.cameOver) return json.null();
  json.beginObject();
  writeCount(json, "keys", shape.keys);
  if (zoomKeys != nullptr) writeCount(json, "zoomKeys", *zoomKeys);
  writeCount(json, "parents", shape.parents);
  json.endObject();
}

// Null where the picture was not measured.
void writeShift(text::JsonWriter& json, const std::optional<check::LargestShift>& shift) {
  json.key("shift");
  if (!shift) return json.null();
  json.beginObject();
  writeNumber(json, "pixels", shift->pixels);
  writeNumber(json, "frame", shift->frame);
  json.endObject();
}

void writeSpan(text::JsonWriter& json, std::string_view key, const std::optional<check::Span>& span) {
  if (!span) return;
  json.key(key);
  json.beginObject();
  writeNumber(json, "least", span->least);
  writeNumber(json, "largest", span->largest);
  json.endObject();
}

// Leaves out values that are not driven, and values that cannot be computed.
void writeOverFrames(text::JsonWriter& json, const std::optional<check::LensOverFrames>& over) {
  if (!over) return;
  json.key("overFrames");
  json.beginObject();
  writeNumber(json, "first", over->first);
  writeNumber(json, "last", over->last);
  writeSpan(json, "focalLength", over->focalLength);
  writeSpan(json, "horizontalAperture", over->horizontalAperture);
  writeSpan(json, "verticalAperture", over->verticalAperture);
  writeSpan(json, "orthographicWidth", over->orthographicWidth);
  writeSpan(json, "angleOfView", over->angleOfView);
  json.endObject();
}

void beginShape(text::JsonWriter& json, const check::ShapeHead& shape) {
  json.beginObject();
  writeText(json, "path", shape.path);
  json.key("where");
  writeWhere(json, shape.where);
}

void writeCamera(text::JsonWriter& json, const check::CameraHead& camera) {
  beginShape(json, camera);
  writeGiven(json, "focalLength", camera.focalLength);
  writeGiven(json, "horizontalAperture", camera.horizontalAperture);
  writeGiven(json, "verticalAperture", camera.verticalAperture);
  writeGiven(json, "fit", camera.fit);
  writeNumber(json, "angleOfView", camera.angleOfView);
  if (camera.orthographicWidth) writeGiven(json, "orthographicWidth", *camera.orthographicWidth);
  writeDrives(json, camera.drives);
  writeOverFrames(json, camera.overFrames);
  writeChain(json, camera);
  writeLayer(json, camera, &camera.zoomKeys);
  writeShift(json, camera.shift);
  json.endObject();
}

void writeLocator(text::JsonWriter& json, const check::ShapeHead& locator) {
  beginShape(json, locator);
  writeChain(json, locator);
  writeLayer(json, locator, nullptr);
  json.endObject();
}

void writeNameOrNull(text::JsonWriter& json, std::string_view key, const std::string& name) {
  json.key(key);
  name.empty() ? json.null() : json.text(name);
}

void writeLookAt(text::JsonWriter& json, const check::LookAtHead& lookAt) {
  json.beginObject();
  writeText(json, "name", lookAt.name);
  json.key("where");
  writeWhere(json, lookAt.where);
  writeNameOrNull(json, "turns", lookAt.turns);
  writeNameOrNull(json, "camera", lookAt.camera);
  writeNameOrNull(json, "target", lookAt.target);
  json.endObject();
}

// An array, and the number of those that it does not show.
template <typename T>
void writeList(text::JsonWriter& json, std::string_view key, const std::vector<T>& things,
               void (*write)(text::JsonWriter&, const T&), std::size_t notShown) {
  json.key(key);
  json.beginArray();
  for (const T& thing : things) write(json, thing);
  json.endArray();
  writeCount(json, std::string(key) + "NotShown", notShown);
}

// Null where the import made none.
void writeComposition(text::JsonWriter& json, const std::optional<check::CameOverComposition>& made) {
  json.key("composition");
  if (!made) return json.null();
  json.beginObject();
  writeNumber(json, "width", made->width);
  writeNumber(json, "height", made->height);
  writeNumber(json, "pixelAspect", made->pixelAspect);
  writeNumber(json, "framesPerSecond", made->framesPerSecond);
  writeNumber(json, "seconds", made->seconds);
  json.endObject();
}

void writeRanges(text::JsonWriter& json, const check::Head& head) {
  json.key("ranges");
  json.beginArray();
  for (const check::NamedFrames& range : head.ranges) {
    json.beginObject();
    writeText(json, "what", range.what);
    writeNumber(json, "first", range.first);
    writeNumber(json, "last", range.last);
    json.key("where");
    writeWhere(json, range.where);
    json.endObject();
  }
  json.endArray();
}

}  // namespace

void writeRange(text::JsonWriter& json, const diag::Range& range, const diag::LineAndColumn& begin,
                const diag::LineAndColumn& end) {
  json.beginObject();
  writeCount(json, "offset", range.offset);
  writeCount(json, "length", range.length);
  json.key("begin");
  writePlace(json, begin);
  json.key("end");
  writePlace(json, end);
  json.endObject();
}

void writeHead(text::JsonWriter& json, const check::Head& head) {
  if (!head.isScene) return json.null();
  json.beginObject();
  writeText(json, "product", head.product);
  writeGiven(json, "linearUnit", head.linearUnit);
  writeGiven(json, "angularUnit", head.angularUnit);
  writeGiven(json, "timeUnit", head.timeUnit);
  writeNumber(json, "framesPerSecond", head.framesPerSecond);
  writeRanges(json, head);
  writeGiven(json, "width", head.width);
  writeGiven(json, "height", head.height);
  writeGiven(json, "pixelAspect", head.pixelAspect);
  writeCount(json, "camerasThatCame", head.camerasThatCame);
  writeCount(json, "nullsThatCame", head.nullsThatCame);
  writeComposition(json, head.composition);
  writeList(json, "cameras", head.cameras, writeCamera, head.camerasNotShown);
  writeList(json, "locators", head.locators, writeLocator, head.locatorsNotShown);
  writeList(json, "lookAts", head.lookAts, writeLookAt, head.lookAtsNotShown);
  json.endObject();
}

}  // namespace mayascene
