// One attribute of one node.
#pragma once

#include <cstdint>
#include <string_view>

namespace scene {

// The index of a node in Scene::nodes().
using NodeId = std::uint32_t;
inline constexpr NodeId kNoNode = 0xffffffff;

// No index: an attribute that is not an array, or the array as a whole.
inline constexpr std::int32_t kNoIndex = -1;

// The attribute has its long name, however the scene writes it: ".t.tx", ".tx" and ".translateX" are all
// "translateX". An attribute that the node's type is not known to have keeps the name that is written. The
// index is that of the array in the path: of ".tg[2].tt" it is 2. A path with several indices is kept as it
// is written.
struct Plug {
  NodeId node = kNoNode;
  std::string_view attribute = {};
  std::int32_t index = kNoIndex;

  bool operator==(const Plug&) const = default;
};

// A path of attributes as it is written, taken apart.
struct AttributePath {
  std::string_view name;          // of the last attribute, or the whole path where it has several indices
  std::int32_t first = kNoIndex;  // "[3:5]" is 3 and 5, "[3]" is 3 and 3
  std::int32_t last = kNoIndex;
};

// Takes ".ktv[3:5]" or "tg[0].tt" apart; a "." at the front is passed over.
AttributePath ParseAttributePath(std::string_view text);

// "rig|cam.translate" as "rig|cam" and "translate". Without a ".", the second part is empty.
struct PlugText {
  std::string_view node;
  std::string_view attribute;
};
PlugText SplitPlug(std::string_view text);

}  // namespace scene
