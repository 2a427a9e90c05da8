// Bakes scenes given as text, and reads the results.
#pragma once

#include <sstream>
#include <string>
#include <string_view>
#include <vector>

#include "bake/Bake.h"
#include "diag/Collector.h"
#include "scene/Scene.h"

namespace bake_test {

// The bake of a text, read again.
class Baked {
 public:
  explicit Baked(std::string_view text, const bake::Options& options = {})
      : source_(text),
        collector_(source_),
        text_(Write(options)),
        ignored_(text_),
        scene_(scene::Read(text_, ignored_)) {}

  const std::string& text() const { return text_; }
  const bake::Report& report() const { return report_; }
  const scene::Scene& scene() const { return scene_; }

  std::uint64_t CountOf(diag::Code code) const { return collector_.CountOf(code); }

  // A value that is written once; the node is found by its name.
  double Number(std::string_view node, std::string_view attribute) const {
    return scene_.Number(scene_.Find(node), attribute).value_or(-1e300);
  }

  // The values of the curve that drives a channel, and the times of its keys; empty where none does.
  std::vector<double> Keys(std::string_view node, std::string_view attribute) const {
    return Half(node, attribute, 1);
  }
  std::vector<double> Times(std::string_view node, std::string_view attribute) const {
    return Half(node, attribute, 0);
  }

  std::string_view ParentOf(std::string_view node) const {
    const scene::NodeId parent = scene_.node(scene_.Find(node)).parent;
    return parent == scene::kNoNode ? "" : scene_.node(parent).name;
  }

  bool Has(std::string_view node) const { return scene_.Find(node) != scene::kNoNode; }

 private:
  std::string Write(const bake::Options& options) {
    std::ostringstream out;
    const scene::Scene read = scene::Read(source_, collector_);
    report_ = bake::Bake(read, options, {"tool 1", "shot.ma", "words"}, &collector_, out);
    return out.str();
  }

  std::vector<double> Half(std::string_view node, std::string_view attribute, std::size_t half) const {
    std::vector<double> numbers;
    const auto driver = scene_.SourceOf(scene_.PlugOf(scene_.Find(node), attribute));
    if (!driver) return numbers;
    for (const scene::Piece& piece : scene_.Pieces(driver->plug.node, "keyTimeValue")) {
      const std::vector<double> pairs = piece.value.Numbers();
      for (std::size_t i = half; i < pairs.size(); i += 2) numbers.push_back(pairs[i]);
    }
    return numbers;
  }

  std::string source_;
  diag::Collector collector_;
  bake::Report report_;
  std::string text_;
  diag::Collector ignored_;
  scene::Scene scene_;
};

// A camera "shotCam" with its shape, and further lines about both.
inline std::string CameraScene(std::string_view transform, std::string_view shape = "",
                               std::string_view rest = "") {
  std::string text = "//Maya ASCII 2018 scene\ncurrentUnit -l centimeter -a degree -t film;\n";
  text += "createNode transform -n \"shotCam\";\n";
  text += transform;
  text += "createNode camera -n \"shotCamShape\" -p \"shotCam\";\n";
  text += shape;
  text += rest;
  return text;
}

// A curve of the type that drives a plug.
inline std::string CurveOf(std::string_view type, std::string_view name, std::string_view keys,
                           std::string_view plug) {
  std::string text = "createNode " + std::string(type) + " -n \"" + std::string(name) + "\";\n";
  text +=
      "\tsetAttr \".tan\" 2;\n\tsetAttr \".wgt\" no;\n\tsetAttr \".ktv[0:1]\" " + std::string(keys) + ";\n";
  return text + "connectAttr \"" + std::string(name) + ".o\" \"" + std::string(plug) + "\";\n";
}

}  // namespace bake_test
