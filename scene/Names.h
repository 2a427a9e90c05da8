// Finds nodes by name and by path.
#pragma once

#include <cstdint>
#include <string_view>
#include <vector>

#include "scene/FlatMap.h"
#include "scene/Plug.h"

namespace scene {

// Knows each node by its name and by its place under its parent. Keeps no names: they must outlive it. The
// time of a call has a bound, however many nodes share a name.
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
  // Nodes are looked for by the name of the path that the fewest of them have; of very many, only
  // kMostCandidates are looked at.
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
