// Finds nodes by name and by path.
#pragma once

#include <cstdint>
#include <string_view>
#include <vector>

#include "scene/FlatMap.h"
#include "scene/Plug.h"

namespace scene {

// Knows each node by its name and by its place under its parent. Keeps no names: they must outlive it. Every
// call takes the same short time, however many nodes share a name.
class Names {
 public:
  // The node stands under the parent (kNoNode: at the top) by the name. Ids are given in rising order. A name
  // that is taken there stays with the node that has it.
  void Add(NodeId node, NodeId parent, std::string_view name);

  // Takes the node out, by the name and parent that it was added with.
  void Remove(NodeId node, NodeId parent, std::string_view name);

  // A further place of a node that is known already.
  void AddInstance(NodeId node, NodeId parent, std::string_view name);

  NodeId ChildOf(NodeId parent, std::string_view name) const;

  struct Match {
    NodeId node = kNoNode;
    bool several = false;  // others have the name too; `node` is the first of them
  };

  // "cam", "rig|cam" or "|rig|cam". A ":" before a name, which means the topmost namespace, is passed over.
  // Of nodes that share the first name of a path that does not begin with "|", kMostCandidates are looked at.
  static constexpr int kMostCandidates = 1000;
  Match Find(std::string_view nameOrPath) const;

 private:
  struct Namesakes {
    NodeId first = kNoNode;
    NodeId last = kNoNode;
  };
  struct Child {
    NodeId node = kNoNode;
  };
  // The neighbours of a node among its namesakes.
  struct Links {
    NodeId before = kNoNode;
    NodeId after = kNoNode;
  };

  NodeId Below(NodeId node, std::string_view path) const;

  FlatMap<Namesakes> byName_;
  FlatMap<Child> byPlace_;
  std::vector<Links> links_;  // by node
};

}  // namespace scene
