// A whole scene, as its author wrote it: nodes, attributes, connections, references, each with its place in
// the file.
//
// Nothing is evaluated and no other file is read. The text stays where it is: names and values refer to it,
// and it must outlive the scene. A scene does not change once it is read; its const members may be called
// from several threads.
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
  Program,    // one that every scene has (":time1"), named here
  Elsewhere,  // named, but not created: in a referenced file, or nowhere
  Forward,    // named before it was created: all that is said of it is with the created node
};

struct Node {
  std::string_view type;  // as it is written; may be empty where the node was not created here
  std::string_view name;  // its own, with its namespace; of a node from elsewhere, what it is called here
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
  Plug plug;           // the source, or its component that fits
  int component = -1;  // which one of the source it is, where the source's components are not known; else -1
  const Connection* connection = nullptr;
};

// An attribute that addAttr made.
struct AddedAttribute {
  NodeId node = kNoNode;
  std::string_view longName;
  std::string_view shortName;
  std::string_view type = {};      // -at: "double", "doubleAngle", "double3" …; empty where it is not said
  std::string_view compound = {};  // -p: the long name of the attribute of which it is a component
  int component = 0;               // which, from 0
  std::optional<double> fallback;  // -dv
  diag::Range place;
  std::vector<std::uint32_t> components = {};  // of a compound, in order: in Scene::addedAttributes()
};

// A piece of an array: the values of the elements first to last.
struct Piece {
  std::int32_t first;
  std::int32_t last;
  Value value;
};

struct Reference {
  std::string_view node;       // -rfn: the reference's name
  std::string_view nameSpace;  // -ns: what its names begin with
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

// A word of currentUnit; empty where the scene does not say it.
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

  // By name or path; kNoNode where there is none. Of several the first is found.
  NodeId Find(std::string_view nameOrPath) const { return names_.Find(nameOrPath).node; }

  // "|rig|cam". Without the first "|" where the topmost node is from elsewhere. Of a path of more than
  // `longest` bytes the names at its end that fit, after "...": a rig can be as deep as its file is long.
  std::string PathOf(NodeId id, std::size_t longest = static_cast<std::size_t>(-1)) const;

  // A plug by a long or a short name, or a path of attributes ("tg[0].tt").
  Plug PlugOf(NodeId node, std::string_view attribute) const;
  Plug PlugOf(NodeId node, std::string_view attribute, std::int32_t index) const;

  // What the file sets: the last value for the attribute, its compound included. With an index, that
  // element's. The time does not depend on how much is set on the node, but for its logarithm.
  std::optional<Value> Written(NodeId node, std::string_view attribute, std::int32_t index = kNoIndex) const;

  // The number that is written, or the attribute's default. None where what is written cannot be read, and
  // where nothing is written and there is no default.
  std::optional<double> Number(NodeId node, std::string_view attribute, std::int32_t index = kNoIndex) const;

  // The attributes of which something is set or driven, by their long names as they stand in Plug; each as
  // often as it is said.
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

  // The default alone: that of addAttr, or that of the node's type.
  std::optional<double> Default(NodeId node, std::string_view attribute) const;

  // All pieces of an array, in the order of the file.
  std::vector<Piece> Pieces(NodeId node, std::string_view attribute) const;

  // Whether anything is connected into the node. Cheaper than to ask for a plug.
  bool IsDriven(NodeId node) const { return lists_[node].firstInto != kNone; }

  // What drives the plug: itself, or its compound, of which it is then the component.
  std::optional<Driver> SourceOf(const Plug& plug) const;

  // What the plug drives: itself, its compound or, of a compound, its components.
  std::vector<Plug> DestinationsOf(const Plug& plug) const;

  // All connections into a node, or out of it, in the order of the file.
  std::vector<const Connection*> ConnectionsInto(NodeId node) const;
  std::vector<const Connection*> ConnectionsFrom(NodeId node) const;

  std::span<const AddedAttribute> addedAttributes() const { return added_; }

  // By its long or short name; null where addAttr made none of the name.
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

  // How an attribute is made up, whether its type has it or addAttr made it.
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
  std::deque<std::string> made_;  // names that do not stand in the text as they are
};

// Reads all of the text, whatever its bytes are. What cannot be read is passed over to the end of its command
// and reported; it costs nothing else. Time and memory grow in proportion to the text. A text of 4 GiB or
// more is not read: the scene is then empty.
Scene Read(std::string_view text, diag::Collector& diagnostics);

// What is to be said of one node, where it may be that nobody asks for the node.
struct NodeNote {
  diag::Code code;
  NodeId node;
  diag::Range place;
  std::array<std::string_view, 3> arguments;  // as many as the code has; they last as long as the scene
};

// The same, but ParentInReference and AlreadyConnected are put into `notes`, and not reported.
Scene Read(std::string_view text, diag::Collector& diagnostics, std::vector<NodeNote>* notes);

void Report(const NodeNote& note, diag::Collector* diagnostics);

}  // namespace scene
