#include "check/SetCommands.h"

#include <algorithm>
#include <string>

#include "check/Cameras.h"
#include "check/Tokens.h"
#include "scene/Cursor.h"
#include "scene/Value.h"

namespace check {
namespace {

using scene::Cursor;

constexpr ReadAttribute kTransform[] = {
    {".t", ".translate", {"translateX", "translateY", "translateZ"}, {0, 0, 0}, {0, 0, 0}, false},
    {".r", ".rotate", {"rotateX", "rotateY", "rotateZ"}, {0, 0, 0}, {0, 0, 0}, false},
    {".s", ".scale", {"scaleX", "scaleY", "scaleZ"}, {1, 1, 1}, {1, 1, 1}, false},
    {".rp", ".rotatePivot", {"rotatePivotX", "rotatePivotY", "rotatePivotZ"}, {0, 0, 0}, {0, 0, 0}, false},
    {".sp", ".scalePivot", {"scalePivotX", "scalePivotY", "scalePivotZ"}, {0, 0, 0}, {0, 0, 0}, false},
};

constexpr ReadAttribute kCamera[] = {
    {".cap",
     ".cameraAperture",
     {"horizontalFilmAperture", "verticalFilmAperture"},
     {1.4173, 0.9449},
     {0, 0},
     false},
    {".fl", ".focalLength", {"focalLength"}, {35}, {35}, true},
    {".ff", ".filmFit", {"filmFit"}, {1}, {1}, true},
};

bool IsCameraType(std::string_view type) {
  return SameName(type, "camera") || SameName(type, "stereoRigCamera");
}

bool IsOption(std::string_view token) {
  return token.size() > 1 && token[0] == '-' && !(token[1] >= '0' && token[1] <= '9') && token[1] != '.';
}

// What the importer reads after the attribute's name, up to the ";".
std::vector<double> ReadNumbers(Cursor* cursor) {
  std::vector<double> numbers;
  std::string_view token;
  bool quoted = false;
  while (TakeToken(cursor, &token, &quoted)) {
    if (const auto number = quoted ? std::nullopt : scene::NumberOf(token)) numbers.push_back(*number);
  }
  return numbers;
}

const ReadAttribute* FindAttribute(std::string_view name, const std::vector<const ReadAttribute*>& known) {
  for (const ReadAttribute* const one : known) {
    if (SameName(name, one->shortName) || SameName(name, one->longName)) return one;
  }
  return nullptr;
}

// From after the word "setAttr" to the ";".
SetCommand ReadSetAttr(Cursor* cursor, bool camera, const std::vector<const ReadAttribute*>& known) {
  SetCommand command;
  command.begin = cursor->offset();
  std::string_view token;
  bool quoted = false;
  std::size_t options = 0;
  bool found = TakeToken(cursor, &token, &quoted);
  while (found && !quoted && IsOption(token)) {
    ++options;
    found = TakeToken(cursor, &token, &quoted) && TakeToken(cursor, &token, &quoted);
  }
  const ReadAttribute* const attribute = FindAttribute(token, known);
  if (attribute == nullptr) {
    command.why = token.starts_with('.') ? "sets one component alone" : "names its node";
  } else if (options > (camera ? 1u : 0u)) {
    command.why = "begins with an option";
  } else if (!quoted) {
    command.why = "has its name without quotes";
  } else {
    command.attribute = attribute;
    command.numbers = ReadNumbers(cursor);
  }
  (void)cursor->FindCommandEnd(false);
  command.end = cursor->offset();
  return command;
}

}  // namespace

std::vector<const ReadAttribute*> ReadAttributesOf(std::string_view type) {
  std::vector<const ReadAttribute*> known;
  if (IsImportedTransform(type)) {
    for (const ReadAttribute& one : kTransform) known.push_back(&one);
  } else if (IsCameraType(type)) {
    for (const ReadAttribute& one : kCamera) known.push_back(&one);
  }
  return known;
}

std::vector<SetCommand> CommandsAfter(const scene::Scene& scene, scene::NodeId node) {
  const scene::Node& created = scene.node(node);
  const std::vector<const ReadAttribute*> known = ReadAttributesOf(created.type);
  Cursor cursor(scene.text());
  cursor.MoveTo(static_cast<std::uint32_t>(created.place.offset + created.place.length));
  if (cursor.Peek() == '"') cursor.Advance(1);
  std::vector<SetCommand> commands;
  (void)cursor.FindCommandEnd(false);
  for (;;) {
    if (cursor.Peek() == ';') cursor.Advance(1);
    std::uint32_t openComment = Cursor::kNone;
    cursor.SkipBlank(&openComment);
    const std::string_view word = cursor.TakeWord();
    if (word.empty() || SameName(word, "createNode") || SameName(word, "select")) return commands;
    if (SameName(word, "setAttr")) {
      commands.push_back(ReadSetAttr(&cursor, IsCameraType(created.type), known));
    } else {
      (void)cursor.FindCommandEnd(false);
    }
  }
}

std::optional<SetCommand> CommandAround(const scene::Scene& scene, scene::NodeId node, std::uint64_t value) {
  constexpr std::size_t kLongestHead = 4000;
  constexpr std::string_view kWord = "setAttr";
  const auto at = static_cast<std::size_t>(value);
  const std::size_t earliest = at > kLongestHead ? at - kLongestHead : 0;
  const std::size_t found = scene.text().substr(earliest, at - earliest).rfind(kWord);
  if (found == std::string_view::npos) return std::nullopt;
  Cursor cursor(scene.text());
  cursor.MoveTo(static_cast<std::uint32_t>(earliest + found + kWord.size()));
  const std::string_view type = scene.node(node).type;
  return ReadSetAttr(&cursor, IsCameraType(type), ReadAttributesOf(type));
}

std::optional<double> ImportedNumber(const scene::Scene& scene, scene::NodeId node,
                                     std::string_view channel) {
  for (const ReadAttribute* const attribute : ReadAttributesOf(scene.node(node).type)) {
    for (std::size_t i = 0; i < std::size(attribute->components); ++i) {
      if (attribute->components[i] == channel) return NumberRead(CommandsAfter(scene, node), *attribute, i);
    }
  }
  return std::nullopt;
}

double NumberRead(const std::vector<SetCommand>& commands, const ReadAttribute& attribute,
                  std::size_t component) {
  for (auto command = commands.rbegin(); command != commands.rend(); ++command) {
    if (command->attribute != &attribute) continue;
    const std::vector<double>& numbers = command->numbers;
    if (attribute.lastCounts && !numbers.empty()) return numbers.back();
    if (!attribute.lastCounts)
      return component < numbers.size() ? numbers[component] : attribute.start[component];
  }
  return attribute.fallback[component];
}

}  // namespace check
