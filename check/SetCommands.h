// The commands that set values of a node, as the importer reads them.
#pragma once

#include <cstddef>
#include <cstdint>
#include <optional>
#include <string_view>
#include <vector>

#include "scene/Scene.h"

namespace check {

// An attribute that the importer knows, of a transform or of a camera.
struct ReadAttribute {
  std::string_view shortName;  // as they stand in the file: ".t"
  std::string_view longName;
  std::string_view components[3];  // the scene's names of them; empty beyond the last
  double fallback[3];              // what the importer takes where nothing is read
  double start[3];                 // what it takes for components that a command does not give
  bool lastCounts;                 // of several numbers it takes the last one
};

struct SetCommand {
  std::uint64_t begin = 0;                   // of what stands after the word "setAttr"
  std::uint64_t end = 0;                     // of its ";"
  const ReadAttribute* attribute = nullptr;  // null: the importer does not read the command
  std::vector<double> numbers;               // what it reads there; of a command that it does not read, none
  std::string_view why;                      // it does not read it: "begins with an option", and the like
};

// Those that the importer knows of the node's type; none where it keeps no values of the type.
std::vector<const ReadAttribute*> ReadAttributesOf(std::string_view type);

// The commands between the node's createNode and the next createNode or select. They are about the node, and
// no others are for the importer.
std::vector<SetCommand> CommandsAfter(const scene::Scene& scene, scene::NodeId node);

// The command that sets a value outside of those commands; `value` is an offset in it.
std::optional<SetCommand> CommandAround(const scene::Scene& scene, scene::NodeId node, std::uint64_t value);

// What the importer has for the component after the commands.
double NumberRead(const std::vector<SetCommand>& commands, const ReadAttribute& attribute,
                  std::size_t component);

// The number that the importer has for a channel of a transform that nothing drives. It differs from the
// scene's where the importer does not read the command that sets it. None where the importer keeps no values
// of the node's type.
std::optional<double> ImportedNumber(const scene::Scene& scene, scene::NodeId node, std::string_view channel);

}  // namespace check
