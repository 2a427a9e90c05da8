#include "fuzz/SceneMutator.h"

#include <array>
#include <charconv>
#include <iterator>

#include "fuzz/SceneWords.h"

namespace fuzz {
namespace {

std::string Quoted(std::string_view text) { return '"' + std::string(text) + '"'; }

std::string Name(Dice& dice) {
  if (!dice.OneIn(64)) return std::string(dice.Pick(kNames));
  // Around the longest name that a record holds.
  return std::string(250 + dice.Below(10), static_cast<char>('a' + dice.Below(26)));
}

std::string Number(Dice& dice) {
  if (dice.OneIn(4)) return std::string(dice.Pick(kNumbers));
  std::array<char, 32> digits{};
  const double value = (static_cast<double>(dice.Below(4001)) - 2000.0) / (dice.OneIn(2) ? 1.0 : 16.0);
  const std::to_chars_result end = std::to_chars(digits.data(), digits.data() + digits.size(), value);
  return std::string(digits.data(), end.ptr);
}

std::string Numbers(Dice& dice, std::size_t count) {
  std::string text;
  for (; count > 0; --count) text += ' ' + Number(dice);
  return text;
}

std::string CreateNode(Dice& dice) {
  std::string text = "createNode " + std::string(dice.Pick(kNodeKinds));
  if (dice.OneIn(8)) text += " -s";
  if (!dice.OneIn(16)) text += " -n " + Quoted(Name(dice));
  if (!dice.OneIn(3)) text += " -p " + Quoted(Name(dice));
  return text;
}

std::string SetTriple(Dice& dice) {
  return "setAttr " + Quoted(dice.Pick(kTripleAttributes)) + " -type \"double3\"" +
         Numbers(dice, dice.Below(5));
}

std::string SetCamera(Dice& dice) {
  const std::string_view attribute = dice.Pick(kCameraAttributes);
  return "setAttr " + std::string(dice.OneIn(4) ? "-k off " : "") + Quoted(attribute) +
         (dice.OneIn(4) ? " yes" : Numbers(dice, dice.Below(4)));
}

// Keys at rising times as a rule, for that is what bakes hold.
std::string SetKeys(Dice& dice) {
  const std::size_t count = dice.Below(8);
  std::string text = "setAttr -s " + std::to_string(count) + ' ' + Quoted(dice.Pick(kKeyAttributes));
  const bool rising = !dice.OneIn(4);
  for (std::size_t key = 0; key < count; ++key)
    text += (rising ? ' ' + std::to_string(key) : Numbers(dice, 1)) + Numbers(dice, 1);
  return text;
}

std::string SetRender(Dice& dice) {
  return "setAttr " + Quoted(dice.Pick(kRenderAttributes)) + Numbers(dice, 1);
}

std::string Connect(Dice& dice) {
  return "connectAttr " + Quoted(Name(dice) + std::string(dice.Pick(kSourceAttributes))) + ' ' +
         Quoted(Name(dice) + std::string(dice.Pick(kDestinationAttributes)));
}

std::string SelectNode(Dice& dice) {
  return dice.OneIn(4) ? "select -ne " + Name(dice) : "select -ne :defaultResolution";
}

std::string Units(Dice& dice) {
  std::string text = "currentUnit";
  for (std::size_t count = 1 + dice.Below(3); count > 0; --count)
    text += ' ' + std::string(dice.Pick(kUnits));
  return text;
}

std::string Comment(Dice& dice) { return dice.OneIn(2) ? "// setAttr \"x\"" : "/* createNode camera; */"; }

// Makes a curve, its keys and its connection together: made apart they would hardly ever fit.
std::string AnimatedChannel(Dice& dice) {
  const std::string curve(dice.Pick(kNames));
  return "createNode animCurveTL -n " + Quoted(curve) + ";\n\t" + SetKeys(dice) + ";\nconnectAttr " +
         Quoted(curve + ".o") + ' ' + Quoted(Name(dice) + std::string(dice.Pick(kDestinationAttributes)));
}

std::string NodeWithShape(Dice& dice) {
  const std::string name = Name(dice);
  const std::string shape(dice.OneIn(2) ? "camera" : "locator");
  return "createNode transform -n " + Quoted(name) + (dice.OneIn(2) ? " -p " + Quoted(Name(dice)) : "") +
         ";\n\t" + SetTriple(dice) + ";\ncreateNode " + shape + " -n " + Quoted(Name(dice)) + " -p " +
         Quoted(name);
}

// Two of three links make no constraint, so all three come at once.
std::string AimConstraint(Dice& dice) {
  const std::string node = Name(dice), turned = Name(dice), target = Name(dice);
  const std::string follows(dice.Pick(kFollowingAttributes)), turns(dice.Pick(kTurningAttributes));
  return "createNode aimConstraint -n " + Quoted(node) + ";\nconnectAttr " + Quoted(turned + ".t") + ' ' +
         Quoted(node + follows) + ";\nconnectAttr " + Quoted(target + ".t") + ' ' +
         Quoted(node + ".target[0].targetTranslate") + ";\nconnectAttr " + Quoted(node + turns) + ' ' +
         Quoted(turned + ".r");
}

struct Span {
  std::size_t begin = 0;
  std::size_t size = 0;
};

// The span of a random byte between two separators, with the separator that ends it. So long spans are picked
// more often.
Span PickSpan(std::string_view text, std::string_view separators, Dice& dice) {
  if (text.empty()) return {};
  const std::size_t at = dice.Below(text.size());
  const std::size_t before = at > 0 ? text.find_last_of(separators, at - 1) : std::string_view::npos;
  const std::size_t begin = before == std::string_view::npos ? 0 : before + 1;
  const std::size_t end = text.find_first_of(separators, at);
  return {begin, (end == std::string_view::npos ? text.size() : end + 1) - begin};
}

Span PickCommand(std::string_view text, Dice& dice) { return PickSpan(text, ";", dice); }

// Without the blank that ends it.
Span PickToken(std::string_view text, Dice& dice) {
  Span span = PickSpan(text, " \t\n;", dice);
  if (span.size > 1) --span.size;
  return span;
}

// A token of the same sort as a rule.
std::string OtherToken(std::string_view token, Dice& dice) {
  const char first = token.empty() || dice.OneIn(8) ? '\0' : token.front();
  if ((first >= '0' && first <= '9') || first == '.' || (first == '-' && token.size() > 1 && token[1] <= '9'))
    return Number(dice);
  if (first == '-') return std::string(dice.Pick(kOptions));
  if (first == '"') {
    if (dice.OneIn(2)) return Quoted(Name(dice));
    return Quoted(token.find('.') == std::string_view::npos ? dice.Pick(kTripleAttributes)
                                                            : dice.Pick(kCameraAttributes));
  }
  if (first >= 'a' && first <= 'z') return std::string(dice.Pick(kNodeKinds));
  return std::string(dice.Pick(kStrayTokens));
}

}  // namespace

std::uint32_t Dice::Roll() {
  // Xorshift, whose bits above the 64th are meant to fall away; masked, so that no sanitizer sees a loss.
  if (state_ == 0) state_ = 1;
  state_ ^= (state_ & 0x7ffffffffffu) << 21;
  state_ ^= state_ >> 35;
  state_ ^= (state_ & 0xfffffffffffffffu) << 4;
  return static_cast<std::uint32_t>(state_ >> 32);
}

std::string MakeCommand(Dice& dice) {
  using Maker = std::string (*)(Dice&);
  static constexpr Maker kMakers[] = {CreateNode, SetTriple,       SetCamera,     SetKeys,
                                      SetRender,  Connect,         SelectNode,    Units,
                                      Comment,    AnimatedChannel, NodeWithShape, AimConstraint};
  return kMakers[dice.Below(std::size(kMakers))](dice) + ";\n";
}

std::string MutateScene(std::string_view scene, Dice& dice) {
  std::string text(scene);
  const std::size_t change = dice.Below(12);
  if (change < 6) {
    const Span command = PickCommand(scene, dice);
    switch (change) {
      case 0:
        return text.erase(command.begin, command.size);
      case 1:
        return text.replace(command.begin, command.size, MakeCommand(dice));
      case 2:
        return text.insert(PickCommand(scene, dice).begin, scene.substr(command.begin, command.size));
      default:
        return text.insert(command.begin + command.size, '\n' + MakeCommand(dice));
    }
  }
  const Span token = PickToken(scene, dice);
  switch (change) {
    case 6:
      return text.insert(token.begin, std::string(dice.Pick(kStrayTokens)) + (dice.OneIn(2) ? " " : ""));
    case 7:
      return text.erase(token.begin, token.size);
    case 8:
      return dice.OneIn(4) ? text.substr(0, token.begin + token.size) : text + MakeCommand(dice);
    default:
      return text.replace(token.begin, token.size, OtherToken(scene.substr(token.begin, token.size), dice));
  }
}

}  // namespace fuzz
