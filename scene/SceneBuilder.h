// Makes a scene out of commands. A name in a command is looked up at once; a node that does not exist yet is
// looked up again at the end.
#pragma once

#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

#include "diag/Collector.h"
#include "scene/Scene.h"

namespace scene {

class SceneBuilder {
 public:
  // All must outlive the builder. With null as `notes` the notes are reported as diagnostics.
  SceneBuilder(std::string_view text, diag::Collector* diagnostics, std::vector<NodeNote>* notes);

  // A name as a command gives it, and where.
  struct Named {
    std::string_view text = {};
    diag::Range place = {};
  };

  // ---- nodes: SceneBuilderNodes.cpp ----

  // Makes the node, or finds a shared one that exists already. Empty texts: no name, no parent.
  NodeId CreateNode(Named type, Named name, Named parent, bool shared);

  // The node of the name or path; where there is none, a node with Origin::Elsewhere.
  NodeId Resolve(Named name);

  // The same for commands that change a node: kNoNode, and a note, where there is none.
  NodeId FindCreated(Named name, std::string_view command);

  void Rename(NodeId node, Named name);
  // kNoNode: to the top.
  void MoveUnder(NodeId node, NodeId parent, diag::Range place);
  void AddInstance(NodeId node, NodeId parent);
  void SetNameSpace(std::string_view nameSpace);  // of names to come; without ":"

  // ---- attributes ----

  // Whether a value for the attribute is kept.
  bool Keeps(NodeId node, std::string_view attribute) const;
  void Set(NodeId node, const AttributePath& path, std::uint32_t value, std::uint32_t valueLength);
  void AddAttribute(AddedAttribute attribute, NodeId node);  // where the node's attributes are kept

  // ---- connections ----

  enum class ConnectHow { Plain, Force, NextAvailable };
  void Connect(Named source, Named destination, ConnectHow how);
  void Disconnect(const Named& source, const Named& destination, bool nextAvailable);

  // ---- the head of the file ----

  void AddReference(const Reference& reference, bool read);
  void AddRequirement(const Requirement& requirement) { scene_.requirements_.push_back(requirement); }
  void AddFileInfo(const FileInfo& info) { scene_.fileInfo_.push_back(info); }
  UnitWord& linearUnit() { return scene_.linearUnit_; }
  UnitWord& angularUnit() { return scene_.angularUnit_; }
  UnitWord& timeUnit() { return scene_.timeUnit_; }

  // Stores a string that does not stand in the file as it is. The result lives as long as the scene.
  std::string_view Keep(std::string text);

  // Resolves parents and connections as far as possible and returns the scene. The builder must not be used
  // afterwards.
  Scene Finish();

 private:
  struct Counter {
    std::uint32_t next = 0;
  };

  NodeId AddNode(const Node& node);
  std::string_view OwnName(Named name);
  std::string_view FreeName(NodeId parent, std::string_view name);
  NodeId NodeFromElsewhere(Named name);
  bool IsElsewhere(NodeId id, diag::Range place, std::string_view command);
  Plug PlugOf(Named plug);
  void Index(std::uint32_t connection);
  Scene::IndexOfOne& Appended(const Plug& source, const Plug& destination);
  void Cut(std::uint32_t connection);
  void Note(const NodeNote& note);

  // ---- the end: SceneBuilderFinish.cpp ----

  std::vector<NodeId> FindForward();
  void ReplaceForward(const std::vector<NodeId>& replacement);
  void CutCircles();
  void LinkChildren();
  void LinkSettings();
  void LinkConnections();
  void ReportParents();
  void ReportReferences();
  std::string_view ReferencedFileOf(NodeId parent) const;

  diag::Collector* diagnostics_;
  std::vector<NodeNote>* notes_;  // may be null
  Scene scene_;
  std::uint64_t referencesRead_ = 0;
  Reference firstRead_;
  std::string_view nameSpace_;
  FlatMap<Scene::IndexOfOne> fromElsewhere_;  // nodes by their names
  FlatMap<Counter> counters_;                 // by parent and name without its number
  FlatMap<Counter> nextElements_;             // of arrays: the first index after all that are connected
  FlatMap<Scene::IndexOfOne> appended_;       // connections made with -na, by both ends
  FlatMap<Scene::IndexOfOne> referenceByName_;
  FlatMap<Scene::IndexOfOne> referenceBySpace_;
  FlatMap<Scene::IndexOfOne> referenceOfFoster_;  // the node that a fosterParent is connected to last
};

}  // namespace scene
