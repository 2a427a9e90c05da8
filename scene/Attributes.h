// What is known of node types and their attributes: long and short names, compounds, defaults.
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
  std::optional<double>
      fallback;  // the value where a scene says none, in the scene's units; a flag is 0 or 1
  const AttributeInfo* compound = nullptr;       // of which it is a component
  int component = 0;                             // which, from 0
  std::vector<const AttributeInfo*> components;  // of a compound, in order
};

// The channels that give a transform its place, in the order in which the importer takes keys of them.
inline constexpr std::array<std::string_view, 9> kPlaceChannels = {
    "translateX", "translateY", "translateZ", "rotateX", "rotateY", "rotateZ", "scaleX", "scaleY", "scaleZ"};

// A type of nodes, for many questions about one node. It is cheaper to look up once than by name each time.
enum class TypeNumber : std::uint32_t { Unknown = 0 };
TypeNumber TypeNumberOf(std::string_view nodeType);

// The attribute by its long or short name; null where the type has none of the name that is known. Of a type
// that is not known, what all transforms have: it may be a transform that a plug-in brings.
const AttributeInfo* FindAttribute(TypeNumber nodeType, std::string_view name);
const AttributeInfo* FindAttribute(std::string_view nodeType, std::string_view name);

// Whether the type is one whose attributes are kept, all of them. Of other types those are kept that all
// transforms have.
bool KeepsAttributes(std::string_view nodeType);

// The type of a node that every scene has without creating it ("time1", "defaultResolution" …), or empty.
std::string_view TypeOfProgramNode(std::string_view name);

}  // namespace scene
