// Reads texts as scenes, each at the edge of memory that nobody may read.
#pragma once

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <memory>
#include <string>
#include <string_view>
#include <vector>

#include "diag/Collector.h"
#include "scene/Scene.h"
#include "tests/support/GuardedMemory.h"

namespace scene {

inline void PrintTo(const Plug& plug, std::ostream* out) {
  *out << plug.node << '.' << plug.attribute << '[' << plug.index << ']';
}

class SceneTest : public testing::Test {
 protected:
  // The text's last byte is the last one that may be read: no NUL follows.
  const Scene& Read(std::string_view text) {
    guarded_ = std::make_unique<testsupport::GuardedText>(text.substr(0, text.empty() ? 0 : text.size() - 1));
    if (!text.empty()) *const_cast<char*>(guarded_->end()) = text.back();
    const std::string_view held(guarded_->begin(), text.size());
    diagnostics_ = std::make_unique<diag::Collector>(held);
    scene_ = scene::Read(held, *diagnostics_);
    return scene_;
  }

  // "line:column: sentence [code]" of every diagnostic.
  std::vector<std::string> Diagnostics() const {
    std::vector<std::string> shown;
    for (const diag::Diagnostic& diagnostic : diagnostics_->kept()) {
      shown.push_back(std::to_string(diagnostic.place.line) + ':' + std::to_string(diagnostic.place.column) +
                      ": " + diag::SentenceOf(diagnostic) + " [" + diag::NameOf(diagnostic.code) + ']');
    }
    return shown;
  }

  // The paths of the nodes that are created, in order.
  std::vector<std::string> Paths() const {
    std::vector<std::string> paths;
    for (NodeId id = 0; id < scene_.nodes().size(); ++id) {
      if (scene_.node(id).origin == Origin::Created) paths.push_back(scene_.PathOf(id));
    }
    return paths;
  }

  // The node of the name or path, which must be there.
  NodeId At(std::string_view name) const {
    const NodeId node = scene_.Find(name);
    EXPECT_NE(node, kNoNode) << name;
    return node;
  }

  // The bytes of a range, and the line and the column of its first.
  std::string TextAt(const diag::Range& range) const {
    return std::string(scene_.text().substr(range.offset, range.length));
  }
  std::string PlaceOf(const diag::Range& range) {
    const diag::LineAndColumn place = diagnostics_->lines().At(range.offset);
    return std::to_string(place.line) + ':' + std::to_string(place.column);
  }

  // "node.attribute" with an index where there is one; empty where nothing drives the plug.
  std::string Show(const Plug& plug) const {
    std::string text = std::string(scene_.node(plug.node).name) + '.' + std::string(plug.attribute);
    if (plug.index != kNoIndex) text += '[' + std::to_string(plug.index) + ']';
    return text;
  }
  std::string SourceOf(std::string_view node, std::string_view attribute) const {
    const std::optional<Driver> driver = scene_.SourceOf(scene_.PlugOf(At(node), attribute));
    if (!driver) return {};
    return Show(driver->plug) + (driver->component < 0 ? "" : "/" + std::to_string(driver->component));
  }
  std::vector<std::string> DestinationsOf(std::string_view node, std::string_view attribute) const {
    std::vector<std::string> shown;
    for (const Plug& plug : scene_.DestinationsOf(scene_.PlugOf(At(node), attribute)))
      shown.push_back(Show(plug));
    return shown;
  }

  diag::Collector& collector() { return *diagnostics_; }

 private:
  std::unique_ptr<testsupport::GuardedText> guarded_;
  std::unique_ptr<diag::Collector> diagnostics_;

 protected:
  Scene scene_;
};

}  // namespace scene
