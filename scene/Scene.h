// A whole scene, as its author wrote it: nodes, attributes, connections, references, each with its place in
// the file.
//
// Nothing is evaluated and no other file is read. Names and values refer to the text, which must outlive the
// scene. A scene does not change after it is read; its const members may be called from several threads.
#pragma once

#include <array>
#include <cstdint>
#include <deque>
#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <vector>

#include "diag/Collector.h"
#include "scene/Attributes.h"
#include "scene/FlatMap.h"
#include "scene/Names.h"
#include "scene/Plug.h"
#include "scene/SettingIndex.h"
#include "scene/Value.h"

namespace scene {

enum class Origin : std::uint8_t {
  Created,    // by createNode
  Program,    // exists in every scene (":time1"), and is named here
  Elsewhere,  // named, but not created: in a referenced file, or nowhere
  Forward,    // named before it was created; the created node has all its attributes and connections
};

struct Node {
  std::string_view type;  // as it is written; may be empty where the node was not created here
  std::string_view name;  // its own, with its namespace; of a node from elsewhere, as this file writes it
  NodeId parent = kNoNode;
  NodeId firstChild = kNoNode;  // children in the order of the file
  NodeId nextSibling = kNoNode;
  diag::Range place;  // of its name, or of its type where it has none
  Origin origin = Origin::Created;
  bool shared = false;  // created with -s: one of those that every scene begins with
};

struct Connection {
  Plug source;
  Plug destination;
  diag::Range sourcePlace;
  diag::Range destinationPlace;
};

// What drives a plug.
struct Driver {
  Plug plug;           // the source, or the component of it that belongs to the plug
  int component = -1;  // the component's number, where the source's components are not known; else -1
  const Connection* connection = nullptr;
};

// An attribute that addAttr made.
struct AddedAttribute {
  NodeId node = kNoNode;
  std::string_view longName;
  std::string_view shortName;
  std::string_view type = {};      // -at: "double", "doubleAngle", "double3" …; empty where it is not given
  std::string_view compound = {};  // -p: the long name of the attribute of which it is a component
  int component = 0;               // its place in the compound, from 0
  std::optional<double> fallback;  // -dv
  diag::Range place;
  std::vector<std::uint32_t> components = {};  // of a compound, in order: in Scene::addedAttributes()
};

// Part of an array: the values of the elements first to last.
struct Piece {
  std::int32_t first;
  std::int32_t last;
  Value value;
};

struct Reference {
  std::string_view node;       // -rfn: the reference's name
  std::string_view nameSpace;  // -ns: the prefix of its names
  std::string_view file;
  diag::Range place;
};

struct Requirement {
  std::string_view name;  // "maya", or a plug-in's
  std::string_view version;
  diag::Range place;
};

struct FileInfo {
  std::string_view key;
  std::string_view value;
  diag::Range place;
};

// A word of currentUnit; empty where the scene does not set the unit.
struct UnitWord {
  std::string_view word;
  diag::Range place;
};

class Scene {
 public:
  Scene() = default;
  Scene(Scene&&) = default;
  Scene& operator=(Scene&&) = default;

  std::string_view text() const { return text_; }

  // In the order in which the file names them.
  std::span<const Node> nodes() const { return nodes_; }
  const Node& node(NodeId id) const { return nodes_[id]; }

  // The node of a name or path, the first of several; kNoNode where there is none.
  NodeId Find(std::string_view nameOrPath) const { return names_.Find(nameOrPath).node; }

  // "|rig|cam", without the first "|" where the topmost node is from elsewhere. A path of more than `longest`
  // bytes becomes "..." and the names at its end that fit: a rig can be as deep as its file is long.
  std::string PathOf(NodeId id, std::size_t longest = static_cast<std::size_t>(-1)) const;

  // A plug by a long or a short name, or a path of attributes ("tg[0].tt").
  Plug PlugOf(NodeId node, std::string_view attribute) const;
  Plug PlugOf(NodeId node, std::string_view attribute, std::int32_t index) const;

  // The value that the file sets last for the attribute or its compound; with an index, for that element.
  // None where it sets none. The time grows with the logarithm of the number of settings on the node.
  std::optional<Value> Written(NodeId node, std::string_view attribute, std::int32_t index = kNoIndex) const;

  // The number that is written, or the attribute's default. None where what is written cannot be read, and
  // where nothing is written and there is no default.
  std::optional<double> Number(NodeId node, std::string_view attribute, std::int32_t index = kNoIndex) const;

  // The attributes that are set or driven, with the names that they have in Plug; each as often as the file
  // sets or connects it.
  std::vector<std::string_view> TouchedAttributes(NodeId node) const;

  // Hands each of them to `take`.
  template <typename Take>
  void ForEachTouched(NodeId node, Take take) const {
    for (std::uint32_t at = lists_[node].firstSetting; at != kNone; at = settings_[at].next) {
      take(settings_[at].attribute);
    }
    for (std::uint32_t at = lists_[node].firstInto; at != kNone; at = connectionLinks_[at].nextInto) {
      take(connections_[at].destination.attribute);
    }
  }

  // The default: that of addAttr, or that of the node's type. None where there is none.
  std::optional<double> Default(NodeId node, std::string_view attribute) const;

  // All pieces of an array, in the order of the file.
  std::vector<Piece> Pieces(NodeId node, std::string_view attribute) const;

  // Whether anything is connected into the node. Cheaper than SourceOf.
  bool IsDriven(NodeId node) const { return lists_[node].firstInto != kNone; }

  // The driver of the plug or of its compound. None where nothing drives it.
  std::optional<Driver> SourceOf(const Plug& plug) const;

  // The plugs that are driven by the plug, by its compound or by its components.
  std::vector<Plug> DestinationsOf(const Plug& plug) const;

  // All connections into a node, or out of it, in the order of the file.
  std::vector<const Connection*> ConnectionsInto(NodeId node) const;
  std::vector<const Connection*> ConnectionsFrom(NodeId node) const;

  std::span<const AddedAttribute> addedAttributes() const { return added_; }

  // The added attribute of that long or short name; null where addAttr made none.
  const AddedAttribute* Added(NodeId node, std::string_view name) const;

  std::span<const Reference> references() const { return references_; }
  std::span<const Requirement> requirements() const { return requirements_; }
  std::span<const FileInfo> fileInfo() const { return fileInfo_; }
  const UnitWord& linearUnit() const { return linearUnit_; }
  const UnitWord& angularUnit() const { return angularUnit_; }
  const UnitWord& timeUnit() const { return timeUnit_; }

 private:
  friend class SceneBuilder;

  static constexpr std::uint32_t kNone = Setting::kNone;

  // The ends of a node's lists.
  struct Lists {
    std::uint32_t firstSetting = kNone;
    std::uint32_t lastSetting = kNone;
    std::uint32_t firstInto = kNone;
    std::uint32_t lastInto = kNone;
    std::uint32_t firstFrom = kNone;
    std::uint32_t lastFrom = kNone;
  };
  struct ConnectionLinks {
    std::uint32_t nextInto = kNone;
    std::uint32_t nextFrom = kNone;
    bool cut = false;  // by disconnectAttr, or by a later connection with -f
  };
  struct IndexOfOne {
    std::uint32_t plusOne = 0;  // 0: none
  };

  // Compound and width of an attribute, of the node's type or of addAttr.
  struct Form {
    std::string_view compound = {};  // of which it is a component; empty where it is none
    int component = 0;
    std::size_t width = 1;  // how many numbers an element has
  };
  Form FormOf(NodeId node, std::string_view attribute) const;
  static Form FormOf(const AttributeInfo& info);
  const AttributeInfo* InfoOf(NodeId node, std::string_view attribute) const {
    return FindAttribute(types_[node], attribute);
  }
  std::string_view ComponentOf(NodeId node, std::string_view compound, int component) const;
  Value ValueOf(const Setting& setting, std::size_t component) const;
  const Connection* ConnectionTo(const Plug& plug) const;

  std::string_view text_;
  std::vector<Node> nodes_;
  std::vector<TypeNumber> types_;  // by node
  std::vector<Lists> lists_;       // by node
  std::vector<Setting> settings_;
  SettingIndex settingIndex_;
  std::vector<Connection> connections_;
  std::vector<ConnectionLinks> connectionLinks_;
  std::vector<AddedAttribute> added_;
  FlatMap<IndexOfOne> addedByName_;       // node and name, long or short
  FlatMap<IndexOfOne> connectionByName_;  // destination node and attribute with index
  Names names_;
  std::vector<Reference> references_;
  std::vector<Requirement> requirements_;
  std::vector<FileInfo> fileInfo_;
  UnitWord linearUnit_;
  UnitWord angularUnit_;
  UnitWord timeUnit_;
  std::deque<std::string> made_;  // strings that do not stand in the text as they are
};

// Reads all of the text, whatever its bytes are. A command that cannot be read is reported and skipped; the
// others are not affected. Time and memory grow in proportion to the text. A text of 4,294,967,295 bytes or
// more is reported and not read: the scene is then empty.
Scene Read(std::string_view text, diag::Collector& diagnostics);

// A diagnostic about one node, which the caller can drop when it does not need the node.
struct NodeNote {
  diag::Code code;
  NodeId node;
  diag::Range place;
  std::array<std::string_view, 3> arguments;  // as many as the code has; they live as long as the scene
};

// The same, but ParentInReference and AlreadyConnected are appended to `notes` instead of being reported.
// With null as `notes` they are reported.
Scene Read(std::string_view text, diag::Collector& diagnostics, std::vector<NodeNote>* notes);

void Report(const NodeNote& note, diag::Collector* diagnostics);

}  // namespace scene
