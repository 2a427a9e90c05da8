// The commands that make, name and move nodes, and the one that makes a node current.
#include "scene/Reader.h"

namespace scene {

// createNode TYPE -n NAME -p PARENT -s
void Reader::ReadCreateNode() {
  // After a command that cannot be read, attributes must not go to the node before.
  current_ = kNoNode;
  currentIsLost_ = true;
  if (!ReadArguments()) return;
  Named type, name, parent;
  bool shared = false;
  for (std::size_t i = 0; i < arguments_.size(); ++i) {
    const Token& token = arguments_[i];
    const bool follows = i + 1 < arguments_.size() && IsValue(arguments_[i + 1]);
    if (Is(token, "n", "name") && follows) {
      name = NameOf(arguments_[++i]);
    } else if (Is(token, "p", "parent") && follows) {
      parent = NameOf(arguments_[++i]);
    } else if (Is(token, "s", "shared")) {
      shared = true;
    } else if (IsValue(token) && type.text.empty()) {
      type = NameOf(token);
    }
  }
  if (type.text.empty()) return Lacks("a node type");
  current_ = builder_.CreateNode(type, name, parent, shared);
  currentIsLost_ = false;
}

// rename [NODE] NAME; with -uid it sets a node's identifier, which is ignored.
void Reader::ReadRename() {
  if (!ReadArguments()) return;
  std::vector<Named> names;
  for (const Token& token : arguments_) {
    if (Is(token, "uid", "uuid")) return;
    if (IsValue(token)) names.push_back(NameOf(token));
  }
  if (names.empty()) return Lacks("a name");
  const NodeId node = names.size() == 1 ? current_ : builder_.FindCreated(names[0], command_);
  if (node != kNoNode) builder_.Rename(node, names.back());
}

// parent NODE ... PARENT, or parent -w NODE ...; with -add the node is in both places. Values stay as they
// are: a scene writes those that hold under the new parent.
void Reader::ReadParent() {
  if (!ReadArguments()) return;
  std::vector<Named> names;
  bool toTop = false;
  bool instance = false;
  for (const Token& token : arguments_) {
    if (Is(token, "rm", "removeObject")) return;
    toTop = toTop || Is(token, "w", "world");
    instance = instance || Is(token, "add", "addObject");
    if (IsValue(token)) names.push_back(NameOf(token));
  }
  if (names.empty()) return Lacks("a node");
  NodeId parent = kNoNode;
  const diag::Range place = names.back().place;
  if (!toTop) {
    parent = builder_.Resolve(names.back());
    names.pop_back();
  }
  if (names.empty()) {
    if (current_ != kNoNode) builder_.MoveUnder(current_, parent, place);
    return;
  }
  for (const Named& name : names) {
    const NodeId node = builder_.FindCreated(name, command_);
    if (node == kNoNode) continue;
    if (instance) {
      builder_.AddInstance(node, parent);
    } else {
      builder_.MoveUnder(node, parent, name.place);
    }
  }
}

// select -ne NODE ...: the last node is current.
void Reader::ReadSelect() {
  current_ = kNoNode;
  currentIsLost_ = true;
  if (!ReadArguments()) return;
  currentIsLost_ = false;
  const Token* last = nullptr;
  for (const Token& token : arguments_) {
    if (IsValue(token)) last = &token;
  }
  if (last != nullptr) current_ = builder_.Resolve(NameOf(*last));
}

// namespace -set NAME: the names of nodes that follow are in it.
void Reader::ReadNamespace() {
  if (!ReadArguments()) return;
  for (std::size_t i = 0; i + 1 < arguments_.size(); ++i) {
    if (Is(arguments_[i], "set", "setNamespace") && IsValue(arguments_[i + 1])) {
      builder_.SetNameSpace(arguments_[i + 1].text);
    }
  }
}

}  // namespace scene
