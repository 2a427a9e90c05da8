// The commands that set and add attributes.
#include <algorithm>
#include <iterator>
#include <optional>

#include "scene/Reader.h"
#include "scene/Value.h"

namespace scene {
namespace {

// Options of setAttr and addAttr that stand alone.
constexpr std::string_view kLoneOptions[] = {
    "av", "alteredValue", "c", "clamp", "uac", "usedAsColor", "uaf", "usedAsFilename", "usedAsProxy", "uap"};

bool StandsAlone(std::string_view option) {
  return std::find(std::begin(kLoneOptions), std::end(kLoneOptions), option.substr(1)) !=
         std::end(kLoneOptions);
}

}  // namespace

// The node that an attribute without a node belongs to. Reports where there is none, unless the command that
// would have made one could not be read: that was reported already.
NodeId Reader::Current(Named attribute) {
  if (current_ == kNoNode && !currentIsLost_) {
    diagnostics_->Report(diag::Code::NoCurrentNode, attribute.place, {attribute.text});
  }
  return current_;
}

// Skips options and their arguments, from the token on; *token becomes the first token that is neither. False
// where the command cannot be read.
bool Reader::SkipOptions(Token* token) {
  for (; token->kind == TokenKind::Option; *token = NextToken()) {
    if (StandsAlone(token->text)) continue;
    *token = NextToken();
    if (token->kind == TokenKind::End) return true;
    if (token->kind == TokenKind::Broken) return false;
  }
  return token->kind != TokenKind::Broken;
}

// setAttr [OPTION ...] PLUG [OPTION ...] VALUE ...: options may also come first. Values stay in the text.
void Reader::ReadSetAttr() {
  Token token = NextToken();
  if (!SkipOptions(&token)) return;
  if (token.kind == TokenKind::End) return Lacks("an attribute");
  const Named plug = NameOf(token);
  const PlugText parts = SplitPlug(plug.text);
  const AttributePath path = ParseAttributePath(parts.attribute);
  std::uint32_t end = 0;
  if (path.name.empty()) {
    if (FindEnd(false, &end)) Lacks("an attribute");
    return;
  }
  const NodeId node = parts.node.empty() ? Current(plug) : builder_.Resolve({parts.node, plug.place});
  if (node == kNoNode || !builder_.Keeps(node, path.name)) {
    (void)FindEnd(false, &end);
    return;
  }
  token = NextToken();
  if (!SkipOptions(&token) || token.kind == TokenKind::End) return;
  const std::uint32_t value = token.kind == TokenKind::String ? token.offset - 1 : token.offset;
  cursor_.MoveTo(token.kind == TokenKind::String ? token.end + 1 : token.end);
  // The edits of a reference are not read, so strange bytes in them do not matter.
  if (!FindEnd(path.name != "ed" && path.name != "edits", &end)) return;
  builder_.Set(node, path, value, end - value);
}

// addAttr -ln LONG -sn SHORT -at TYPE -p COMPOUND -dv DEFAULT ...: of the current node, or of those that are
// named.
void Reader::ReadAddAttr() {
  if (!ReadArguments()) return;
  AddedAttribute added;
  std::vector<Named> nodes;
  for (std::size_t i = 0; i < arguments_.size(); ++i) {
    const Token& token = arguments_[i];
    if (IsValue(token)) {
      nodes.push_back(NameOf(token));
      continue;
    }
    if (token.kind != TokenKind::Option || StandsAlone(token.text)) continue;
    if (i + 1 == arguments_.size() || !IsValue(arguments_[i + 1])) continue;
    const Token& value = arguments_[++i];
    if (Is(token, "ln", "longName")) {
      added.longName = value.text;
      added.place = NameOf(value).place;
    } else if (Is(token, "sn", "shortName")) {
      added.shortName = value.text;
      if (added.longName.empty()) added.place = NameOf(value).place;
    } else if (Is(token, "dv", "defaultValue")) {
      added.fallback = NumberOf(value.text);
    } else if (Is(token, "at", "attributeType")) {
      added.type = value.text;
    } else if (Is(token, "p", "parent")) {
      added.compound = value.text;
    }
  }
  if (added.longName.empty()) added.longName = added.shortName;
  if (added.shortName.empty()) added.shortName = added.longName;
  if (added.longName.empty()) return Lacks("a name");
  if (nodes.empty()) {
    const NodeId node = Current({added.longName, added.place});
    if (node != kNoNode) builder_.AddAttribute(added, node);
  }
  for (const Named& node : nodes) builder_.AddAttribute(added, builder_.Resolve(node));
}

}  // namespace scene
