#include "tests/scene/CheckedScene.h"

#include <cmath>
#include <vector>

#include "scene/Settings.h"

namespace testsupport {
namespace {

using scene::Connection;
using scene::kNoNode;
using scene::NodeId;
using scene::Scene;

class Checker {
 public:
  Checker(const Scene& scene, const diag::Collector& diagnostics)
      : scene_(scene), diagnostics_(diagnostics) {}

  std::string Check() {
    CheckTree();
    for (NodeId id = 0; id < scene_.nodes().size(); ++id) {
      CheckConnections(id);
      CheckValues(id);
    }
    for (const diag::Diagnostic& diagnostic : diagnostics_.kept()) {
      Require(InText(diagnostic.range), "a diagnostic is about the text");
      Require(diagnostic.arguments.size() == diag::ArgumentCount(diag::EntryOf(diagnostic.code)),
              "a diagnostic has the arguments of its sentence");
    }
    return broken_;
  }

 private:
  void Require(bool holds, const char* promise) {
    if (!holds && broken_.empty()) broken_ = promise;
  }

  bool InText(const diag::Range& range) const {
    return range.offset <= scene_.text().size() && range.length <= scene_.text().size() - range.offset;
  }

  // Every chain of parents ends, and every node is in its parent's list of children once.
  void CheckTree() {
    const std::size_t count = scene_.nodes().size();
    std::vector<int> listed(count, 0);
    std::vector<std::size_t> children(count, 0);
    for (NodeId id = 0; id < count; ++id) {
      const scene::Node& node = scene_.node(id);
      Require(InText(node.place), "a node has its place in the text");
      Require(node.parent == kNoNode || node.parent < count, "a parent is a node");
      NodeId before = 0;
      for (NodeId child = node.firstChild; child != kNoNode; child = scene_.node(child).nextSibling) {
        Require(child >= before, "children are in the order of the file");
        Require(scene_.node(child).parent == id, "a child knows its parent");
        if (!broken_.empty()) return;
        before = child;
        ++listed[child];
      }
    }
    // From the top downwards every node is met, so no parents form a circle.
    std::vector<NodeId> open;
    for (NodeId id = 0; id < count; ++id) {
      const bool top = scene_.node(id).parent == kNoNode;
      Require(listed[id] == (top ? 0 : 1), "a child is listed once");
      if (top) open.push_back(id);
    }
    std::size_t met = 0;
    for (; !open.empty() && met <= count; ++met) {
      const NodeId id = open.back();
      open.pop_back();
      for (NodeId child = scene_.node(id).firstChild; child != kNoNode;
           child = scene_.node(child).nextSibling) {
        open.push_back(child);
      }
    }
    Require(met == count, "parents form no circle");
  }

  void CheckPlug(const scene::Plug& plug) {
    Require(plug.node < scene_.nodes().size(), "a plug is one of a node");
    Require(plug.index >= scene::kNoIndex, "an index is one");
  }

  void CheckConnections(NodeId id) {
    for (const Connection* connection : scene_.ConnectionsInto(id)) {
      CheckPlug(connection->source);
      Require(connection->destination.node == id, "a connection into a node ends there");
      Require(InText(connection->sourcePlace) && InText(connection->destinationPlace),
              "a connection has its places in the text");
    }
    for (const Connection* connection : scene_.ConnectionsFrom(id)) {
      CheckPlug(connection->destination);
      Require(connection->source.node == id, "a connection from a node begins there");
    }
    for (const char* attribute : {"translateX", "fl"}) {
      const auto driver = scene_.SourceOf(scene_.PlugOf(id, attribute));
      if (driver) CheckPlug(driver->plug);
      for (const scene::Plug& plug : scene_.DestinationsOf(scene_.PlugOf(id, attribute))) CheckPlug(plug);
    }
  }

  void CheckValues(NodeId id) {
    for (const char* attribute : {"tx", "o", "before", "keyTimeValue"}) {
      const auto number = scene_.Number(id, attribute);
      Require(!number || std::isfinite(*number), "a number is finite");
      if (const auto written = scene_.Written(id, attribute)) {
        Require(InText(written->range()), "a value has its place in the text");
        for (const double each : written->Numbers()) Require(std::isfinite(each), "every number is finite");
        (void)written->String();
      }
      for (const scene::Piece& piece : scene_.Pieces(id, attribute)) {
        Require(piece.first >= 0 && piece.last >= piece.first,
                "a piece of an array has its indices in order");
        for (const double each : piece.value.Numbers())
          Require(std::isfinite(each), "every element is finite");
      }
    }
  }

  const Scene& scene_;
  const diag::Collector& diagnostics_;
  std::string broken_;
};

std::string Shown(const Scene& scene, const scene::Plug& plug) {
  return scene.PathOf(plug.node) + '.' + std::string(plug.attribute) + '[' + std::to_string(plug.index) + ']';
}

}  // namespace

std::string BrokenPromise(const Scene& scene, const diag::Collector& diagnostics) {
  return Checker(scene, diagnostics).Check();
}

std::string Describe(const Scene& scene) {
  std::string text;
  for (NodeId id = 0; id < scene.nodes().size(); ++id) {
    const scene::Node& node = scene.node(id);
    text += std::string(node.type) + ' ' + scene.PathOf(id) + ' ' +
            std::to_string(static_cast<int>(node.origin)) + (node.shared ? " shared\n" : "\n");
    for (const char* attribute : {"v", "tx", "ty",  "tz",  "rx",  "ry", "fl", "hfa", "vfa", "imn",
                                  "b", "ed", "ktv", "ktl", "tan", "o",  "w",  "aal", "foc", "tw"}) {
      if (const auto written = scene.Written(id, attribute))
        text += "  " + std::string(attribute) + ": " + std::string(written->text()) + '\n';
      for (const scene::Piece& piece : scene.Pieces(id, attribute)) {
        text += "  " + std::string(attribute) + std::to_string(piece.first) + ": " +
                std::string(piece.value.text()) + '\n';
      }
    }
    for (const Connection* connection : scene.ConnectionsInto(id)) {
      text += "  " + Shown(scene, connection->source) + " -> " + Shown(scene, connection->destination) + '\n';
    }
  }
  for (const auto& added : scene.addedAttributes()) {
    text += "added " + std::string(added.longName) + ' ' + std::to_string(added.fallback.value_or(-1)) + '\n';
  }
  for (const auto& reference : scene.references()) text += "reference " + std::string(reference.file) + '\n';
  for (const auto& required : scene.requirements()) text += "requires " + std::string(required.name) + '\n';
  for (const auto& info : scene.fileInfo()) text += "info " + std::string(info.value) + '\n';
  for (const auto* unit : {&scene.linearUnit(), &scene.angularUnit(), &scene.timeUnit()}) {
    text += "unit " + std::string(unit->word) + '\n';
  }
  return text;
}

}  // namespace testsupport
