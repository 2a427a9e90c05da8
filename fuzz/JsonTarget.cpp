// Writes an invented run with the tool's writers: every name, number and tree of layers that a host can hold.
// What they write is read back.
#include <bit>
#include <cmath>
#include <cstdint>
#include <deque>
#include <iterator>
#include <memory>
#include <nlohmann/json.hpp>
#include <sstream>
#include <string>
#include <string_view>
#include <vector>

#include "fuzz/Bytes.h"
#include "fuzz/Require.h"
#include "fuzz/Target.h"
#include "refhost/ShownText.h"
#include "tools/mayascene/CompositionJson.h"
#include "tools/mayascene/Outline.h"

namespace {

using fuzz::Bytes;
using fuzz::Require;
using nlohmann::json;

constexpr std::size_t kMostLayers = 40;
constexpr std::size_t kMostKeys = 6;

struct Scene {
  std::deque<refhost::Layer> layers;
  std::deque<refhost::Composition> compositions;
  refhost::Folder folder;
  mayascene::RunReport run;
};

std::vector<std::string> TakeTexts(Bytes& bytes) {
  std::vector<std::string> texts;
  for (std::size_t count = bytes.TakeBelow(4); count > 0; --count) texts.push_back(bytes.TakeText());
  return texts;
}

// Keys as the host keeps them: sorted by time.
std::unique_ptr<refhost::KeyColumns> TakeKeys(Bytes& bytes, std::size_t count, std::size_t dimension) {
  auto keys = std::make_unique<refhost::KeyColumns>();
  auto time = static_cast<std::int32_t>(bytes.Take<std::int16_t>());
  const auto scale = bytes.Take<std::uint32_t>();
  std::vector<T_Time> times;
  for (; count > 0; --count) {
    times.push_back({time, scale});
    time += 1 + bytes.Take<std::uint8_t>();
    for (std::size_t i = 0; i < dimension; ++i) keys->values.push_back(bytes.Take<double>());
  }
  keys->times = refhost::KeyTimes(std::move(times));
  return keys;
}

refhost::Stream TakeStream(Bytes& bytes, std::int32_t id) {
  refhost::Stream stream;
  stream.id = id;
  stream.dimension = id <= HOST_STREAM_SCALE ? 3 : 1;
  const auto dimension = static_cast<std::size_t>(stream.dimension);
  for (std::size_t i = 0; i < dimension; ++i) stream.value[i] = bytes.Take<double>();
  const std::size_t keys = bytes.TakeBelow(4 * kMostKeys);
  if (keys > 0 && keys <= kMostKeys) stream.keys = TakeKeys(bytes, keys, dimension);
  return stream;
}

// With one of the layers before it as its parent, so that there is no circle.
void TakeLayer(Bytes& bytes, Scene* scene, refhost::Composition* composition) {
  const auto& siblings = composition->layers;
  refhost::Layer& layer = scene->layers.emplace_back();
  layer.number = static_cast<std::int32_t>(scene->layers.size());
  layer.kind = static_cast<refhost::LayerKind>(bytes.TakeBelow(3));
  layer.name = bytes.TakeText();
  layer.composition = composition;
  const std::size_t parent = bytes.TakeBelow(siblings.size() + 1);
  if (parent > 0) layer.parent = siblings[siblings.size() - parent];
  if (layer.kind == refhost::LayerKind::Composition) layer.source = &scene->compositions.front();
  const auto flags = bytes.Take<std::uint8_t>();
  layer.threeDimensional = (flags & 1) != 0;
  layer.aimed = (flags & 2) != 0;
  layer.filmDirection = (flags >> 2) % 3;
  if (layer.filmDirection != refhost::kFilmNeverSet) layer.filmSize = bytes.Take<double>();
  constexpr std::int32_t kStreams[] = {
      HOST_STREAM_ANCHOR_POINT, HOST_STREAM_POSITION,   HOST_STREAM_SCALE, HOST_STREAM_ROTATION_Z,
      HOST_STREAM_ROTATION_X,   HOST_STREAM_ROTATION_Y, HOST_STREAM_ZOOM};
  const auto streams = bytes.Take<std::uint8_t>();
  for (std::size_t i = 0; i < std::size(kStreams); ++i) {
    if ((streams >> i & 1) != 0) layer.streams.push_back(TakeStream(bytes, kStreams[i]));
  }
  composition->layers.push_back(&layer);
}

void TakeComposition(Bytes& bytes, Scene* scene) {
  refhost::Composition& composition = scene->compositions.emplace_back();
  composition.number = static_cast<std::int32_t>(scene->compositions.size());
  // The host has made a composition's name readable when it took it.
  composition.name = refhost::shownText(bytes.TakeText());
  composition.width = bytes.Take<std::int32_t>();
  composition.height = bytes.Take<std::int32_t>();
  composition.pixelAspect = bytes.Take<HostRatio>();
  composition.duration = bytes.Take<T_Time>();
  composition.frameRate = bytes.Take<HostRatio>();
  while (!bytes.empty() && scene->layers.size() < kMostLayers && bytes.TakeBelow(8) != 0)
    TakeLayer(bytes, scene, &composition);
  scene->folder.compositions.push_back(&composition);
}

void TakeScene(Bytes bytes, Scene* scene) {
  mayascene::SceneReport report;
  report.path = bytes.TakeText();
  report.outcome = mayascene::Outcome::Imported;
  report.status = mayascene::ExitStatus::Done;
  report.result.code = bytes.Take<HostError>();
  report.result.messages = TakeTexts(bytes);
  report.result.refusals = TakeTexts(bytes);
  for (std::string& text : TakeTexts(bytes)) report.result.leftovers.push_back({std::move(text), false});
  do {
    TakeComposition(bytes, scene);
  } while (!bytes.empty() && scene->compositions.size() < 3);
  report.result.folder = &scene->folder;
  scene->run.scenes.push_back(std::move(report));
}

// The document has the same bits for a number, or a word where JSON has no number.
void CheckNumber(const json& found, double expected) {
  if (!std::isfinite(expected)) {
    const char* const word = std::isnan(expected) ? "nan" : expected > 0.0 ? "inf" : "-inf";
    return Require(found == word, "a number that is not finite is written as a word");
  }
  Require(found.is_number(), "a number is written as one");
  const bool same =
      std::bit_cast<std::uint64_t>(found.get<double>()) == std::bit_cast<std::uint64_t>(expected);
  Require(same, "a number that is read back has the same bits");
}

void CheckKeys(const json& found, const refhost::Stream& stream) {
  if (stream.keyCount() == 0) return Require(found.is_null(), "a stream without keys says so");
  const auto dimension = static_cast<std::size_t>(stream.dimension);
  Require(found.at("times").size() == stream.keyCount(), "every key is written");
  Require(found.at("values").size() == stream.keyCount(), "every key is written with its value");
  for (std::size_t key = 0; key < stream.keyCount(); ++key) {
    Require(found.at("times").at(key).at(0) == stream.keys->times[key].value,
            "a key's time can be read back");
    const json& value = found.at("values").at(key);
    for (std::size_t axis = 0; axis < dimension; ++axis)
      CheckNumber(value.at(axis), stream.keys->values[key * dimension + axis]);
  }
}

void CheckLayer(const json& found, const refhost::Layer& layer) {
  Require(found.at("name") == refhost::shownText(layer.name), "a layer's name can be read back");
  Require(found.at("streams").size() == layer.streams.size(), "every stream is written");
  for (std::size_t i = 0; i < layer.streams.size(); ++i) {
    const refhost::Stream& stream = layer.streams[i];
    const json& value = found.at("streams").at(i).at("value");
    for (std::size_t axis = 0; axis < static_cast<std::size_t>(stream.dimension); ++axis)
      CheckNumber(value.at(axis), stream.value[axis]);
    CheckKeys(found.at("streams").at(i).at("keys"), stream);
  }
}

void CheckJson(const std::string& text, const Scene& scene) {
  for (const char c : text) Require(c == '\n' || (c >= ' ' && c <= '~'), "a document is plain ASCII");
  const json document = json::parse(text, nullptr, false);
  Require(!document.is_discarded(), "a document is valid JSON");
  const json& found = document.at("scenes").at(0);
  Require(found.at("path") == refhost::shownText(scene.run.scenes.front().path), "a path can be read back");
  for (std::size_t i = 0; i < scene.compositions.size(); ++i) {
    const json& composition = found.at("compositions").at(i);
    const auto& layers = scene.compositions[i].layers;
    Require(composition.at("name") == scene.compositions[i].name, "a composition's name can be read back");
    Require(composition.at("layers").size() == layers.size(), "every layer is written");
    for (std::size_t layer = 0; layer < layers.size(); ++layer)
      CheckLayer(composition.at("layers").at(layer), *layers[layer]);
  }
}

void CheckOutline(const std::string& text) {
  for (const char c : text) {
    const auto byte = static_cast<unsigned char>(c);
    Require(c == '\n' || (byte >= 0x20 && byte != 0x7f), "an outline holds no control characters");
  }
  Require(refhost::shownText(text) == text, "an outline is valid UTF-8");
  // The controls from U+0080 to U+009F, which some terminals obey.
  for (std::size_t at = text.find('\xc2'); at != std::string::npos; at = text.find('\xc2', at + 1))
    Require(static_cast<unsigned char>(text[at + 1]) >= 0xa0, "an outline holds no second set of controls");
}

}  // namespace

int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  Scene scene;
  TakeScene(Bytes(data, size), &scene);
  std::ostringstream written;
  mayascene::writeCompositionJson(written, scene.run);
  CheckJson(written.str(), scene);
  for (const auto detail : {mayascene::Detail::Layers, mayascene::Detail::Properties}) {
    std::ostringstream outline;
    mayascene::printOutline(outline, scene.run.scenes.front(), detail, mayascene::Style(false));
    CheckOutline(outline.str());
  }
  return 0;
}
