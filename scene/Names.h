// Finds nodes by name and by path.
#pragma once

#include <cstdint>
#include <string_view>
#include <vector>

#include "scene/FlatMap.h"
#include "scene/Plug.h"

namespace scene {

// Finds each node by its name and by its place under its parent. Does not copy names: they must outlive it.
// The time of a call is bounded, however many nodes share a name.
class Names {
 public:
  // Adds a node under the parent (kNoNode: at the top) with the name. A name that is taken there stays with
  // the node that has it.
  void Add(NodeId node, NodeId parent, std::string_view name);

  // Removes the node; name and parent are those that it was added with.
  void Remove(NodeId node, NodeId parent, std::string_view name);

  // Adds another place of a node that was added before.
  void AddInstance(NodeId node, NodeId parent, std::string_view name);

  // kNoNode where there is none.
  NodeId ChildOf(NodeId parent, std::string_view name) const;

  struct Match {
    NodeId node = kNoNode;
    bool several = false;  // others have the name too; `node` is the first of them
  };

  // Finds "cam", "rig|cam" or "|rig|cam". A ":" before a name, which means the topmost namespace, is ignored.
  // The search begins with the name of the path that the fewest nodes have, and examines at most
  // kMostCandidates of them.
  static constexpr std::uint32_t kMostCandidates = 64;
  Match Find(std::string_view nameOrPath) const;

 private:
  struct Namesakes {
    NodeId first = kNoNode;
    NodeId last = kNoNode;
    std::uint32_t count = 0;
  };
  struct Child {
    NodeId node = kNoNode;
  };
  // Where a node was added, and its neighbours among its namesakes.
  struct Entry {
    std::string_view name = {};
    NodeId parent = kNoNode;
    NodeId before = kNoNode;
    NodeId after = kNoNode;
  };

  // A name of a path.
  struct Part {
    const Namesakes* namesakes = nullptr;  // null: no node has the name
    std::string_view above = {};           // the path up to the name and with it
    std::string_view below = {};           // what follows
  };

  NodeId Below(NodeId node, std::string_view path) const;
  bool IsAt(NodeId node, std::string_view path) const;
  Part RarestPart(std::string_view path) const;
  template <typename Fits>
  Match FindAmong(const Namesakes* namesakes, Fits fits) const;

  FlatMap<Namesakes> byName_;
  FlatMap<Child> byPlace_;
  std::vector<Entry> entries_;  // by node
};

}  // namespace scene
