// The commands that connect attributes.
#include "scene/Reader.h"

namespace scene {

// connectAttr SOURCE DESTINATION [-na] [-f] [-l on]
void Reader::ReadConnectAttr() {
  if (!ReadArguments()) return;
  std::vector<Named> plugs;
  auto how = SceneBuilder::ConnectHow::Plain;
  for (std::size_t i = 0; i < arguments_.size(); ++i) {
    const Token& token = arguments_[i];
    if (Is(token, "na", "nextAvailable")) {
      how = SceneBuilder::ConnectHow::NextAvailable;
    } else if (Is(token, "f", "force")) {
      how = SceneBuilder::ConnectHow::Force;
    } else if (Is(token, "l", "lock") || Is(token, "rd", "referenceDest")) {
      ++i;
    } else if (IsValue(token)) {
      plugs.push_back(NameOf(token));
    }
  }
  if (plugs.size() < 2) return Lacks(plugs.empty() ? "two attributes" : "a second attribute");
  builder_.Connect(plugs[0], plugs[1], how);
}

// disconnectAttr SOURCE DESTINATION [-na]
void Reader::ReadDisconnectAttr() {
  if (!ReadArguments()) return;
  std::vector<Named> plugs;
  bool nextAvailable = false;
  for (const Token& token : arguments_) {
    nextAvailable = nextAvailable || Is(token, "na", "nextAvailable");
    if (IsValue(token)) plugs.push_back(NameOf(token));
  }
  if (plugs.size() < 2) return Lacks(plugs.empty() ? "two attributes" : "a second attribute");
  builder_.Disconnect(plugs[0], plugs[1], nextAvailable);
}

}  // namespace scene
