// Finds what stopped an import, from the line where it stopped.
#include <algorithm>
#include <string>

#include "bake/KeyedChannel.h"
#include "bake/Loss.h"
#include "diag/Fill.h"
#include "scene/Attributes.h"
#include "scene/SpecialNames.h"

namespace bake {
namespace {

using scene::NodeId;

// The bytes of a line without its end. Empty where the text has no such line. A line ends after a line feed,
// or after a carriage return that no line feed follows.
diag::Range LineRange(std::string_view text, std::uint32_t line) {
  std::size_t start = 0;
  for (std::uint32_t at = 1; at < line; ++at) {
    const std::size_t end = text.find_first_of("\r\n", start);
    if (end == std::string_view::npos) return {text.size(), 0};
    start = end + (text.substr(end, 2) == "\r\n" ? 2 : 1);
  }
  return {start, std::min(text.find_first_of("\r\n", start), text.size()) - start};
}

// The first byte of the line, outside of quotes, that stands at the start of a word although no word can
// begin with it. 0 where there is none.
char StrangeByte(std::string_view line) {
  bool quoted = false;
  char before = ' ';
  for (const char c : line) {
    const bool begins = before == ' ' || before == '\t' || before == ';';
    if (c == '"' && before != '\\') quoted = !quoted;
    if (!quoted && begins && (c == '|' || c == '{' || c == '<' || c == '=' || c == '>')) return c;
    before = c;
  }
  return '\0';
}

Loss Reading(const scene::Scene& scene, diag::Collector* diagnostics, std::uint32_t line) {
  const diag::Range place = LineRange(scene.text(), line);
  const auto loss = [&](const char* what) {
    return Loss{.sentence = diag::Fill("{0} ends the import", {what}), .place = place};
  };
  for (const diag::Diagnostic& one : diagnostics->kept()) {
    if (one.place.line != line) continue;
    if (one.code == diag::Code::ConflictMark) return loss("the mark of a merge conflict");
    if (one.code == diag::Code::TemplateField) return loss("a template field that nobody filled in");
  }
  const std::string_view text = scene.text().substr(place.offset, place.length);
  switch (StrangeByte(text)) {
    case '|':
      return loss("a path without quotes, as edits of references have them,");
    case '{':
      return loss(text.find("attributeAlias") != std::string_view::npos ? "a list of attribute aliases"
                                                                        : "a list in braces");
    default:
      return loss("a character that no word can begin with");
  }
}

Loss End(const scene::Scene& scene, diag::Collector* diagnostics) {
  for (const diag::Diagnostic& one : diagnostics->kept()) {
    const char* what = nullptr;
    if (one.code == diag::Code::OpenString) what = "a string without its closing quote";
    if (one.code == diag::Code::OpenComment) what = "a comment without its end";
    if (one.code == diag::Code::CommandCutOff) what = "a command that the file cuts off";
    if (what != nullptr) return {.sentence = diag::Fill("{0} ends the import", {what}), .place = one.range};
  }
  const std::string_view text = scene.text();
  const std::size_t feed = text.find_last_of("\r\n");
  const std::size_t start = feed == std::string_view::npos ? 0 : feed + 1;
  const bool comment = text.substr(start).find("//") != std::string_view::npos;
  return {.sentence = comment ? "a comment in the last line, without a line end, ends the import"
                              : "a command that the file cuts off ends the import",
          .place = diag::Range{start, text.size() - start}};
}

// The transform of a layer: the parent of the camera of that name, or the transform of that name.
NodeId TransformOf(const scene::Scene& scene, std::string_view layer) {
  for (NodeId id = 0; id < scene.nodes().size(); ++id) {
    const scene::Node& node = scene.node(id);
    if (scene::ImportName(scene, node) != layer || node.origin != scene::Origin::Created) continue;
    return node.type.ends_with("amera") ? node.parent : id;
  }
  return scene::kNoNode;
}

// Whether two animated channels of the node have different numbers of keys.
std::optional<Loss> UnequalKeys(const scene::Scene& scene, NodeId node, const motion::Measures& measures) {
  std::optional<KeyedChannel> first;
  for (const std::string_view name : scene::kPlaceChannels) {
    auto channel = FindKeys(scene, node, name, measures);
    if (!channel || channel->curve.keys.size() < 2) continue;
    if (!first) {
      first = std::move(channel);
    } else if (channel->curve.keys.size() != first->curve.keys.size()) {
      return Loss{
          .sentence = diag::Fill("{0} has {1} keys on {2} and {3} keys on {4}: different numbers of "
                                 "keys end the import",
                                 {ShownNode(scene, node), std::to_string(first->curve.keys.size()),
                                  std::string(first->attribute), std::to_string(channel->curve.keys.size()),
                                  std::string(channel->attribute)}),
          .place = scene.node(channel->node).place};
    }
  }
  return std::nullopt;
}

// Checks the node of the last layer first. Where its keys agree, the import stopped at another node, such as
// the target of a look-at.
std::optional<Loss> KeyCounts(const scene::Scene& scene, std::string_view layer) {
  const motion::Measures measures = motion::MeasuresOf(scene);
  const NodeId last = TransformOf(scene, layer);
  if (last != scene::kNoNode) {
    if (auto loss = UnequalKeys(scene, last, measures)) return loss;
  }
  for (NodeId id = 0; id < scene.nodes().size(); ++id) {
    if (auto loss = UnequalKeys(scene, id, measures)) return loss;
  }
  return std::nullopt;
}

}  // namespace

std::optional<Loss> FindStop(const scene::Scene& scene, diag::Collector* diagnostics, Stop stop,
                             std::uint32_t line, std::string_view layer) {
  switch (stop) {
    case Stop::kByte:
      return Reading(scene, diagnostics, line);
    case Stop::kEnd:
      return End(scene, diagnostics);
    case Stop::kNumber:
      return Loss{.sentence = "a number that cannot be read ends the import",
                  .place = LineRange(scene.text(), line)};
    default:
      return KeyCounts(scene, layer);
  }
}

}  // namespace bake
