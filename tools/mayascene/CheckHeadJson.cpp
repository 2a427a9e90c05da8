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

// A value and where the file says it; null where it does not.
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

void writeChain(text::JsonWriter& json, const check::CameraHead& camera) {
  json.key("chain");
  json.beginArray();
  for (const check::ChainLink& link : camera.chain) {
    json.beginObject();
    writeText(json, "name", link.name);
    writeDrives(json, link.drives);
    json.endObject();
  }
  json.endArray();
  writeTruth(json, "chainGoesOn", camera.chainGoesOn);
}

void writeLayer(text::JsonWriter& json, const check::CameraHead& camera) {
  json.key("layer");
  if (!camera.cameOver) return json.null();
  json.beginObject();
  writeCount(json, "keys", camera.keys);
  writeCount(json, "zoomKeys", camera.zoomKeys);
  writeCount(json, "parents", camera.parents);
  json.endObject();
}

void writeCamera(text::JsonWriter& json, const check::CameraHead& camera) {
  json.beginObject();
  writeText(json, "path", camera.path);
  json.key("where");
  writeWhere(json, camera.where);
  writeGiven(json, "focalLength", camera.focalLength);
  writeGiven(json, "horizontalAperture", camera.horizontalAperture);
  writeGiven(json, "verticalAperture", camera.verticalAperture);
  writeGiven(json, "fit", camera.fit);
  writeNumber(json, "angleOfView", camera.angleOfView);
  writeDrives(json, camera.drives);
  writeChain(json, camera);
  writeLayer(json, camera);
  json.endObject();
}

void writeRanges(text::JsonWriter& json, const check::Head& head) {
  json.key("ranges");
  json.beginArray();
  for (const check::Range& range : head.ranges) {
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
  json.key("cameras");
  json.beginArray();
  for (const check::CameraHead& camera : head.cameras) writeCamera(json, camera);
  json.endArray();
  writeCount(json, "camerasNotShown", head.camerasNotShown);
  json.endObject();
}

}  // namespace mayascene
