#include "tests/export/GltfReader.h"

#include <cmath>
#include <cstdint>
#include <cstring>
#include <numbers>
#include <set>

namespace exporttest {
namespace {

using nlohmann::json;

void Ask(bool holds, const std::string& rule) {
  if (!holds) throw Broken(rule);
}

std::uint32_t WordAt(std::string_view bytes, std::size_t at) {
  Ask(at + 4 <= bytes.size(), "a number beyond the end");
  std::uint32_t word = 0;
  for (std::size_t i = 4; i-- > 0;) word = word << 8 | static_cast<unsigned char>(bytes[at + i]);
  return word;
}

struct Chunks {
  std::string_view document;
  std::string_view data;
  bool hasData = false;
};

Chunks ChunksOf(std::string_view file) {
  Ask(WordAt(file, 4) == 2, "version of the container");
  Ask(WordAt(file, 8) == file.size(), "length of the container");
  Chunks chunks;
  const std::size_t length = WordAt(file, 12);
  Ask(length % 4 == 0 && WordAt(file, 16) == 0x4e4f534a, "first chunk");
  chunks.document = file.substr(20, length);
  if (20 + length == file.size()) return chunks;
  const std::size_t rest = WordAt(file, 20 + length);
  Ask(rest % 4 == 0 && WordAt(file, 24 + length) == 0x004e4942, "second chunk");
  Ask(28 + length + rest == file.size(), "length of the second chunk");
  chunks.data = file.substr(28 + length);
  chunks.hasData = true;
  return chunks;
}

bool IsContainer(std::string_view file) { return file.starts_with("glTF"); }

// One file, its data, and what is read of both.
class Reading {
 public:
  Reading(std::string_view file, const Beside& beside) : document_(GltfJsonOf(file)) {
    Ask(document_.at("asset").at("version") == "2.0", "version");
    const bool container = IsContainer(file);
    const Chunks chunks = container ? ChunksOf(file) : Chunks{};
    if (!document_.contains("buffers")) {
      Ask(!chunks.hasData, "data of no buffer");
      return;
    }
    Ask(document_["buffers"].size() == 1, "one buffer");
    const json& buffer = document_["buffers"][0];
    Ask(buffer.contains("uri") != container, "where the data are");
    data_ = container ? std::string(chunks.data) : beside(buffer["uri"].get<std::string>());
    Ask(buffer.at("byteLength").get<std::size_t>() == data_.size() && !data_.empty(), "length of the buffer");
  }

  SeenScene Scene() {
    ReadNodes();
    ReadHierarchy();
    if (document_.contains("animations")) {
      Ask(document_["animations"].size() == 1, "one animation");
      ReadAnimation(document_["animations"][0]);
    }
    return scene_;
  }

 private:
  static std::array<double, 4> Numbers(const json& values, std::size_t count) {
    Ask(values.is_array() && values.size() == count, "count of numbers");
    std::array<double, 4> numbers{};
    for (std::size_t i = 0; i < count; ++i) {
      numbers[i] = values[i].get<double>();
      Ask(std::isfinite(static_cast<float>(numbers[i])), "number beyond a float");
    }
    return numbers;
  }

  static void AskUnit(const std::array<double, 4>& q) {
    Ask(std::fabs(std::sqrt(q[0] * q[0] + q[1] * q[1] + q[2] * q[2] + q[3] * q[3]) - 1) < 1e-6,
        "unit quaternion");
  }

  static double HalfHeight(double angle) {
    Ask(angle > 0 && angle < std::numbers::pi, "field of view");
    return std::tan(angle / 2);
  }

  void ReadNodes() {
    for (const json& node : document_.value("nodes", json::array())) {
      SeenLayer layer;
      layer.name = node.value("name", "");
      layer.quaternions = true;
      layer.rotation.values = {{0, 0, 0, 1}};
      Ask(!node.contains("matrix"), "a node that is animated has no matrix");
      if (node.contains("translation")) layer.position.values = {Numbers(node["translation"], 3)};
      if (node.contains("scale")) layer.scale.values = {Numbers(node["scale"], 3)};
      if (node.contains("rotation")) {
        layer.rotation.values = {Numbers(node["rotation"], 4)};
        AskUnit(layer.rotation.values.front());
      }
      if (node.contains("camera")) ReadCamera(node["camera"].get<std::size_t>(), layer);
      scene_.layers.push_back(layer);
    }
    Ask(!document_.contains("nodes") || !scene_.layers.empty(), "an empty list of nodes");
    Ask(cameras_.size() == document_.value("cameras", json::array()).size(), "each camera has one node");
  }

  void ReadCamera(std::size_t camera, SeenLayer& layer) {
    Ask(cameras_.insert({camera, scene_.layers.size()}).second, "a camera in two nodes");
    const json& lens = document_.at("cameras").at(camera);
    Ask(lens.at("type") == "perspective", "type of the camera");
    const json& perspective = lens.at("perspective");
    layer.camera = true;
    layer.lens.values = {{HalfHeight(perspective.at("yfov").get<double>()), 0, 0, 0}};
    layer.aspect = perspective.at("aspectRatio").get<double>();
    Ask(static_cast<float>(layer.aspect) > 0 && std::isfinite(static_cast<float>(layer.aspect)),
        "aspect ratio");
    const auto near = static_cast<float>(perspective.at("znear").get<double>());
    Ask(near > 0 && std::isfinite(near), "near plane");
  }

  void ReadHierarchy() {
    std::set<std::size_t> roots;
    const json nodes = document_.value("nodes", json::array());
    for (std::size_t index = 0; index < nodes.size(); ++index) {
      if (!nodes[index].contains("children")) continue;
      Ask(!nodes[index]["children"].empty(), "an empty list of children");
      for (const json& child : nodes[index]["children"]) {
        SeenLayer& layer = scene_.layers.at(child.get<std::size_t>());
        Ask(!layer.parent, "a node has one parent");
        layer.parent = index;
      }
    }
    const json& seen = document_.at("scenes").at(document_.at("scene").get<std::size_t>());
    for (const json& root : seen.value("nodes", json::array()))
      Ask(roots.insert(root.get<std::size_t>()).second, "root twice");
    for (std::size_t index = 0; index < nodes.size(); ++index) {
      Ask(roots.contains(index) != scene_.layers[index].parent.has_value(), "roots are what has no parent");
      std::size_t steps = 0;
      for (auto above = scene_.layers[index].parent; above; above = scene_.layers[*above].parent) {
        Ask(++steps <= nodes.size(), "a circle of nodes");
      }
    }
  }

  std::vector<std::array<double, 4>> Floats(std::size_t index, std::size_t components) {
    static const std::map<std::size_t, std::string> kTypes = {{1, "SCALAR"}, {3, "VEC3"}, {4, "VEC4"}};
    const json& accessor = document_.at("accessors").at(index);
    Ask(accessor.at("componentType") == 5126 && accessor.at("type") == kTypes.at(components),
        "type of an accessor");
    const json& view = document_.at("bufferViews").at(accessor.at("bufferView").get<std::size_t>());
    const auto count = accessor.at("count").get<std::size_t>();
    const auto inView = accessor.value("byteOffset", std::size_t{0});
    const std::size_t offset = view.value("byteOffset", std::size_t{0}) + inView;
    Ask(count > 0 && offset % 4 == 0, "place of an accessor");
    Ask(inView + count * components * 4 <= view.at("byteLength").get<std::size_t>(),
        "accessor beyond its view");
    Ask(offset + count * components * 4 <= data_.size(), "accessor beyond the data");
    std::vector<std::array<double, 4>> values(count);
    for (std::size_t i = 0; i < count * components; ++i) {
      const std::uint32_t bits = WordAt(data_, offset + 4 * i);
      float value = 0;
      std::memcpy(&value, &bits, sizeof value);
      Ask(std::isfinite(value), "a number that is not finite");
      values[i / components][i % components] = value;
    }
    read_ += count * components * 4;
    return values;
  }

  const std::vector<double>& Times(std::size_t index) {
    std::vector<double>& times = times_[index];
    if (!times.empty()) return times;
    for (const auto& value : Floats(index, 1)) {
      Ask(times.empty() ? value[0] >= 0 : value[0] > times.back(), "times rise from 0 or later");
      times.push_back(value[0]);
    }
    const json& accessor = document_["accessors"][index];
    Ask(accessor.at("min") == json::array({times.front()}) &&
            accessor.at("max") == json::array({times.back()}),
        "ends of the times");
    scene_.range = {times.front(), times.back()};
    return times;
  }

  void ReadAnimation(const json& animation) {
    std::set<std::string> targets;
    for (const json& channel : animation.at("channels")) {
      const json& target = channel.at("target");
      Ask(targets.insert(target.dump()).second, "a target twice");
      const json& sampler = animation.at("samplers").at(channel.at("sampler").get<std::size_t>());
      Ask(sampler.value("interpolation", "LINEAR") == "LINEAR", "interpolation");
      Track& track = TrackOf(target);
      track.times = Times(sampler.at("input").get<std::size_t>());
      const std::string path = target.at("path");
      track.values = Floats(sampler.at("output").get<std::size_t>(), path == "pointer"    ? 1
                                                                     : path == "rotation" ? 4
                                                                                          : 3);
      Ask(track.values.size() == track.times.size(), "a value for each time");
      if (path == "rotation") {
        for (const auto& value : track.values) AskUnit(value);
      }
      if (path == "pointer") {
        for (auto& value : track.values) value[0] = HalfHeight(value[0]);
      }
    }
    Ask(!targets.empty() && targets.size() == animation["samplers"].size(), "samplers and channels");
    Ask(read_ == data_.size(), "every byte of the data is read once");
  }

  Track& TrackOf(const json& target) {
    const std::string path = target.at("path");
    if (path == "pointer") {
      Ask(!target.contains("node"), "a pointer has no node");
      const std::string pointer = target.at("extensions").at("KHR_animation_pointer").at("pointer");
      const std::string front = "/cameras/", back = "/perspective/yfov";
      Ask(pointer.starts_with(front) && pointer.ends_with(back), "pointer");
      const json used = document_.value("extensionsUsed", json::array());
      Ask(used == json::array({"KHR_animation_pointer"}), "used extensions");
      Ask(!document_.contains("extensionsRequired"), "required extensions");
      const std::size_t camera = std::stoul(pointer.substr(front.size()));
      return scene_.layers.at(cameras_.at(camera)).lens;
    }
    SeenLayer& layer = scene_.layers.at(target.at("node").get<std::size_t>());
    Ask(path == "translation" || path == "rotation" || path == "scale", "path");
    return path == "translation" ? layer.position : path == "rotation" ? layer.rotation : layer.scale;
  }

  json document_;
  std::string data_;
  SeenScene scene_;
  std::map<std::size_t, std::size_t> cameras_;  // to their nodes
  std::map<std::size_t, std::vector<double>> times_;
  std::size_t read_ = 0;
};

}  // namespace

json GltfJsonOf(std::string_view file) {
  const std::string_view document = IsContainer(file) ? ChunksOf(file).document : file;
  json read = json::parse(document, nullptr, false);
  Ask(!read.is_discarded(), "no JSON");
  return read;
}

SeenScene ReadGltf(std::string_view file, const Beside& beside) {
  try {
    return Reading(file, beside).Scene();
  } catch (const json::exception& missing) {
    throw Broken(missing.what());
  } catch (const std::out_of_range& missing) {
    throw Broken(missing.what());
  }
}

}  // namespace exporttest
