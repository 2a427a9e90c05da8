// The known node types and their attributes: long and short names, compounds, defaults.
#pragma once

#include <array>
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace scene {

// One attribute of a node type. Lives as long as the program.
struct AttributeInfo {
  std::string longName;
  std::string shortName;
  std::optional<double> fallback;                // the default, in the scene's units; of a flag 0 or 1
  const AttributeInfo* compound = nullptr;       // of which it is a component; null: it is none
  int component = 0;                             // its place in the compound, from 0
  std::vector<const AttributeInfo*> components;  // of a compound, in order
};

// The channels that give a transform its place, in the order in which the importer takes keys of them.
inline constexpr std::array<std::string_view, 9> kPlaceChannels = {
    "translateX", "translateY", "translateZ", "rotateX", "rotateY", "rotateZ", "scaleX", "scaleY", "scaleZ"};

// A node type as a number: callers with many look-ups for one node find the type by its name only once.
enum class TypeNumber : std::uint32_t { Unknown = 0 };
TypeNumber TypeNumberOf(std::string_view nodeType);

// The attribute of that long or short name; null where the type has no known attribute of the name. A type
// that is not known has the attributes of a transform, because it may be a transform of some plug-in.
const AttributeInfo* FindAttribute(TypeNumber nodeType, std::string_view name);
const AttributeInfo* FindAttribute(std::string_view nodeType, std::string_view name);

// Whether a scene keeps all attributes of nodes of the type. Of other types it keeps only those that all
// transforms have.
bool KeepsAttributes(std::string_view nodeType);

// The type of a node that every scene has without creating it ("time1", "defaultResolution" …), or empty.
std::string_view TypeOfProgramNode(std::string_view name);

}  // namespace scene
