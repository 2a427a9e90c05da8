#include "tests/docs/SceneImport.h"

#include <gtest/gtest.h>

#include <utility>

namespace docs_test {
SceneImport::SceneImport(const std::string& text, refhost::HostOptions options)
    : host_(std::move(options)), result_(host_.Import(text)) {}

const refhost::Layer* SceneImport::Layer(const std::string& name) const {
  for (const refhost::Layer& layer : project().layers()) {
    if (layer.name == name) return &layer;
  }
  ADD_FAILURE() << "there is no layer " << name;
  return nullptr;
}

std::size_t SceneImport::LayersNamed(const std::string& name) const {
  std::size_t count = 0;
  for (const refhost::Layer& layer : project().layers()) count += layer.name == name ? 1 : 0;
  return count;
}

const refhost::Stream* SceneImport::Stream(const std::string& layer, std::int32_t streamId) const {
  const refhost::Layer* const found = Layer(layer);
  return found == nullptr ? nullptr : found->findStream(streamId);
}

double SceneImport::Value(const std::string& layer, std::int32_t streamId, int component) const {
  const refhost::Stream* const stream = Stream(layer, streamId);
  if (stream != nullptr) return stream->value[component];
  ADD_FAILURE() << layer << " has no stream " << streamId;
  return 0.0;
}

double SceneImport::KeyValue(const std::string& layer, std::int32_t streamId, std::size_t key,
                             int component) const {
  const refhost::Stream* const stream = Stream(layer, streamId);
  if (stream != nullptr && key < stream->keyCount()) {
    const std::size_t first = key * static_cast<std::size_t>(stream->dimension);
    return stream->keys->values.at(first + static_cast<std::size_t>(component));
  }
  ADD_FAILURE() << layer << " has no key " << key << " on stream " << streamId;
  return 0.0;
}

T_Time SceneImport::KeyTime(const std::string& layer, std::int32_t streamId, std::size_t key) const {
  const refhost::Stream* const stream = Stream(layer, streamId);
  if (stream != nullptr && key < stream->keyCount()) return stream->keys->times[key];
  ADD_FAILURE() << layer << " has no key " << key << " on stream " << streamId;
  return {};
}

std::size_t SceneImport::KeyCount(const std::string& layer, std::int32_t streamId) const {
  const refhost::Stream* const stream = Stream(layer, streamId);
  return stream == nullptr ? 0 : stream->keyCount();
}

std::string Scene(const std::string& commands) {
  return "//Maya ASCII 2024 scene\n"
         "currentUnit -l centimeter -a degree -t film;\n"
         "select -ne :defaultResolution;\n"
         "  setAttr \".w\" 640;\n  setAttr \".h\" 480;\n  setAttr \".pa\" 1;\n" +
         commands + "\n";
}

std::string Camera(const std::string& transformAttributes) {
  return "createNode transform -n \"cam\";\n" + transformAttributes +
         "createNode camera -n \"camShape\" -p \"cam\";\n";
}

std::string Curve(const std::string& name, const std::string& keys) {
  return "createNode animCurveTL -n \"" + name + "\";\n  setAttr \".ktv\" " + keys + ";\n";
}

std::string Drive(const std::string& curve, const std::string& plug) {
  return "connectAttr \"" + curve + ".o\" \"" + plug + "\";\n";
}

}  // namespace docs_test
