// The JSON of a glTF file: nodes, cameras, and where the data of the animation lie.
#include <string>

#include "export/GltfInternal.h"
#include "export/LayerTree.h"
#include "export/Places.h"
#include "text/JsonWriter.h"

namespace interchange {
namespace {

using text::JsonWriter;

constexpr std::string_view kPointer = "KHR_animation_pointer";
// In units of the scene. Where points land in the picture does not depend on it.
constexpr double kNear = 0.1;
constexpr int kFloat = 5126;  // componentType

void Put(JsonWriter& json, std::string_view key, std::size_t value) {
  json.key(key);
  json.integer(static_cast<std::int64_t>(value));
}

void Put(JsonWriter& json, std::string_view key, double value) {
  json.key(key);
  json.number(value);
}

void Put(JsonWriter& json, std::string_view key, std::string_view value) {
  json.key(key);
  json.text(value);
}

void PutVector(JsonWriter& json, std::string_view key, const Vector& vector) {
  json.key(key);
  json.beginRow();
  for (const double part : {vector.x, vector.y, vector.z}) json.number(part);
  json.endArray();
}

void PutRotation(JsonWriter& json, const Quaternion& rotation) {
  json.key("rotation");
  json.beginRow();
  for (const double part : {rotation.x, rotation.y, rotation.z, rotation.w}) json.number(part);
  json.endArray();
}

void PutChildren(JsonWriter& json, std::string_view key, const LayerTree& tree, std::size_t first) {
  if (first == LayerTree::kNone) return;
  json.key(key);
  json.beginRow();
  for (std::size_t layer = first; layer != LayerTree::kNone; layer = tree.NextSibling(layer)) {
    json.integer(static_cast<std::int64_t>(layer));
  }
  json.endArray();
}

bool HasZoom(const GltfPlan& plan) {
  for (const GltfTrack& track : plan.tracks()) {
    if (track.path == GltfPath::Zoom) return true;
  }
  return false;
}

// Values that glTF has no place for, and those that a reader needs to count frames as the scene does.
void PutSceneExtras(JsonWriter& json, const GltfPlan& plan) {
  const Composition& composition = plan.composition();
  json.key("extras");
  json.beginObject();
  Put(json, "width", composition.width);
  Put(json, "height", composition.height);
  Put(json, "pixelAspect", composition.pixelAspect);
  Put(json, "framesPerSecond", composition.framesPerSecond);
  Put(json, "firstFrame", composition.firstFrame);
  Put(json, "frames", composition.frames);
  Put(json, "firstSeconds", plan.SecondsAt(0));
  Put(json, "metersPerUnit", composition.metersPerUnit);
  json.endObject();
}

void PutScene(JsonWriter& json, const GltfPlan& plan, const LayerTree& tree) {
  Put(json, "scene", std::size_t{0});
  json.key("scenes");
  json.beginArray();
  json.beginObject();
  if (!plan.composition().name.empty()) Put(json, "name", plan.composition().name);
  PutChildren(json, "nodes", tree, tree.FirstRoot());
  PutSceneExtras(json, plan);
  json.endObject();
  json.endArray();
}

// A node has the values of the first frame. The animation replaces those that change.
void PutNode(JsonWriter& json, const Composition& composition, const LayerTree& tree, std::size_t index,
             std::size_t camera) {
  const Layer& layer = composition.layers[index];
  const Place place = LocalPlaceAt(composition, layer, 0);
  const Vector metres = place.position * composition.metersPerUnit;
  json.beginObject();
  if (!layer.name.empty()) Put(json, "name", layer.name);
  if (layer.kind == LayerKind::Camera) Put(json, "camera", camera);
  PutChildren(json, "children", tree, tree.FirstChild(index));
  if (metres != Vector{}) PutVector(json, "translation", metres);
  if (place.rotation != Quaternion{}) PutRotation(json, place.rotation);
  if (place.scale != Vector{1.0, 1.0, 1.0}) PutVector(json, "scale", place.scale);
  json.endObject();
}

void PutNodes(JsonWriter& json, const Composition& composition, const LayerTree& tree) {
  if (composition.layers.empty()) return;
  json.key("nodes");
  json.beginArray();
  std::size_t cameras = 0;
  for (std::size_t index = 0; index < composition.layers.size(); ++index) {
    PutNode(json, composition, tree, index, cameras);
    if (composition.layers[index].kind == LayerKind::Camera) ++cameras;
  }
  json.endArray();
}

void PutLensExtras(JsonWriter& json, const Lens& lens) {
  json.key("extras");
  json.beginObject();
  Put(json, "filmWidth", lens.filmWidth);
  Put(json, "filmHeight", lens.filmHeight);
  if (lens.filmOffsetX) Put(json, "filmOffsetX", *lens.filmOffsetX);
  if (lens.filmOffsetY) Put(json, "filmOffsetY", *lens.filmOffsetY);
  if (lens.squeeze) Put(json, "squeeze", *lens.squeeze);
  json.endObject();
}

double NearPlane(const Composition& composition) {
  const double near = kNear * composition.metersPerUnit;
  constexpr double kLeast = 1e-6, kMost = 1e6;
  return near < kLeast ? kLeast : near > kMost ? kMost : near;
}

void PutCamera(JsonWriter& json, const Composition& composition, const Layer& layer) {
  json.beginObject();
  if (!layer.name.empty()) Put(json, "name", layer.name);
  Put(json, "type", std::string_view("perspective"));
  json.key("perspective");
  json.beginObject();
  Put(json, "aspectRatio", composition.width / composition.height);
  Put(json, "yfov", VerticalRadians(composition, layer.lens->zoom.at(0)));
  Put(json, "znear", NearPlane(composition));
  json.endObject();
  PutLensExtras(json, *layer.lens);
  json.endObject();
}

void PutCameras(JsonWriter& json, const Composition& composition) {
  bool begun = false;
  for (const Layer& layer : composition.layers) {
    if (layer.kind != LayerKind::Camera) continue;
    if (!begun) {
      json.key("cameras");
      json.beginArray();
      begun = true;
    }
    PutCamera(json, composition, layer);
  }
  if (begun) json.endArray();
}

void PutTarget(JsonWriter& json, const GltfTrack& track) {
  json.key("target");
  json.beginObject();
  if (track.path == GltfPath::Zoom) {
    Put(json, "path", std::string_view("pointer"));
    json.key("extensions");
    json.beginObject();
    json.key(kPointer);
    json.beginObject();
    Put(json, "pointer", "/cameras/" + std::to_string(track.camera) + "/perspective/yfov");
    json.endObject();
    json.endObject();
  } else {
    Put(json, "node", track.layer);
    Put(json, "path",
        std::string_view(track.path == GltfPath::Translation ? "translation"
                         : track.path == GltfPath::Rotation  ? "rotation"
                                                             : "scale"));
  }
  json.endObject();
}

void PutAnimation(JsonWriter& json, const GltfPlan& plan) {
  json.key("animations");
  json.beginArray();
  json.beginObject();
  if (!plan.composition().name.empty()) Put(json, "name", plan.composition().name);
  json.key("channels");
  json.beginArray();
  for (std::size_t track = 0; track < plan.tracks().size(); ++track) {
    json.beginObject();
    Put(json, "sampler", track);
    PutTarget(json, plan.tracks()[track]);
    json.endObject();
  }
  json.endArray();
  json.key("samplers");
  json.beginArray();
  for (std::size_t track = 0; track < plan.tracks().size(); ++track) {
    json.beginObject();
    Put(json, "input", std::size_t{0});
    Put(json, "interpolation", std::string_view("LINEAR"));
    Put(json, "output", track + 1);
    json.endObject();
  }
  json.endArray();
  json.endObject();
  json.endArray();
}

void BeginAccessor(JsonWriter& json, const GltfPlan& plan, std::uint64_t offset, std::string_view type) {
  json.beginObject();
  Put(json, "bufferView", std::size_t{0});
  Put(json, "byteOffset", static_cast<std::size_t>(offset));
  Put(json, "componentType", std::size_t{kFloat});
  Put(json, "count", plan.composition().frames);
  Put(json, "type", type);
}

// The first and the last time must be exactly the floats of the data.
void PutEnd(JsonWriter& json, std::string_view key, double seconds) {
  json.key(key);
  json.beginRow();
  json.number(static_cast<float>(seconds));
  json.endArray();
}

void PutAccessors(JsonWriter& json, const GltfPlan& plan) {
  json.key("accessors");
  json.beginArray();
  BeginAccessor(json, plan, 0, "SCALAR");
  PutEnd(json, "min", plan.SecondsAt(0));
  PutEnd(json, "max", plan.SecondsAt(plan.composition().frames - 1));
  json.endObject();
  std::uint64_t offset = plan.TimesSize();
  for (const GltfTrack& track : plan.tracks()) {
    BeginAccessor(json, plan, offset, track.type());
    json.endObject();
    offset += plan.SizeOf(track);
  }
  json.endArray();
}

void PutBuffer(JsonWriter& json, const GltfPlan& plan, std::string_view dataUri) {
  const auto size = static_cast<std::size_t>(plan.DataSize());
  json.key("bufferViews");
  json.beginArray();
  json.beginObject();
  Put(json, "buffer", std::size_t{0});
  Put(json, "byteLength", size);
  json.endObject();
  json.endArray();
  json.key("buffers");
  json.beginArray();
  json.beginObject();
  Put(json, "byteLength", size);
  if (!dataUri.empty()) Put(json, "uri", dataUri);
  json.endObject();
  json.endArray();
}

}  // namespace

void WriteGltfJson(const GltfPlan& plan, std::string_view dataUri, std::ostream& out) {
  const LayerTree tree(plan.composition());
  JsonWriter json(out);
  json.beginObject();
  json.key("asset");
  json.beginObject();
  Put(json, "version", std::string_view("2.0"));
  Put(json, "generator", std::string_view("mayascene"));
  json.endObject();
  if (HasZoom(plan)) {
    json.key("extensionsUsed");
    json.beginRow();
    json.text(kPointer);
    json.endArray();
  }
  PutScene(json, plan, tree);
  PutNodes(json, plan.composition(), tree);
  PutCameras(json, plan.composition());
  if (!plan.tracks().empty()) {
    PutAnimation(json, plan);
    PutAccessors(json, plan);
    PutBuffer(json, plan, dataUri);
  }
  json.endObject();
}

}  // namespace interchange
