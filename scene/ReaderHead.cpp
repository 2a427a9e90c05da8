// The commands at the head of a file: its requirements, file information, references and units.
#include "scene/Reader.h"
#include "scene/Units.h"

namespace scene {
namespace {

constexpr std::string_view kLinear = "length";
constexpr std::string_view kAngular = "angle";
constexpr std::string_view kTime = "time";

}  // namespace

// requires [-nodeType TYPE ...] NAME VERSION
void Reader::ReadRequires() {
  if (!ReadArguments()) return;
  std::vector<Named> words;
  for (std::size_t i = 0; i < arguments_.size(); ++i) {
    if (arguments_[i].kind == TokenKind::Option) {
      ++i;
    } else if (IsValue(arguments_[i])) {
      words.push_back(NameOf(arguments_[i]));
    }
  }
  if (words.empty()) return Lacks("a name");
  const Named version = words.size() > 1 ? words[1] : Named{};
  builder_.AddRequirement({words[0].text, version.text, words[0].place});
}

// fileInfo KEY VALUE
void Reader::ReadFileInfo() {
  if (!ReadArguments()) return;
  if (arguments_.size() < 2) return Lacks("a key and a value");
  builder_.AddFileInfo({arguments_[0].text, arguments_[1].text, NameOf(arguments_[1]).place});
}

// file -r -rfn NODE -ns SPACE ... FILE; with -rdi instead of -r it is only announced.
void Reader::ReadFile() {
  if (!ReadArguments()) return;
  Reference reference;
  bool read = false;
  bool announced = false;
  for (std::size_t i = 0; i < arguments_.size(); ++i) {
    const Token& token = arguments_[i];
    if (token.kind == TokenKind::Option) {
      const bool reads = Is(token, "r", "reference");
      read = read || reads;
      announced = announced || Is(token, "rdi", "referenceDepthInfo");
      if (reads || i + 1 == arguments_.size() || !IsValue(arguments_[i + 1])) continue;
      const Token& value = arguments_[++i];
      if (Is(token, "rfn", "referenceNode")) reference.node = value.text;
      if (Is(token, "ns", "namespace")) reference.nameSpace = value.text;
    } else if (IsValue(token)) {
      reference.file = token.text;
      reference.place = NameOf(token).place;
    }
  }
  if (!read && !announced) return;
  if (reference.file.empty()) return Lacks("a file");
  if (reference.node.empty()) reference.node = reference.file;
  builder_.AddReference(reference, read);
}

// currentUnit -l LENGTH -a ANGLE -t TIME
void Reader::ReadCurrentUnit() {
  if (!ReadArguments()) return;
  const auto set = [this](UnitWord& unit, std::string_view kind, const Token& token, bool known) {
    const Named word = NameOf(token);
    if (!known) return diagnostics_->Report(diag::Code::UnknownUnit, word.place, {word.text, kind});
    if (!unit.word.empty() && unit.word != word.text) {
      diagnostics_->Report(diag::Code::SecondUnit, word.place, {kind, unit.word, word.text});
    }
    unit = {word.text, word.place};
  };
  for (std::size_t i = 0; i + 1 < arguments_.size(); ++i) {
    const Token& value = arguments_[i + 1];
    if (Is(arguments_[i], "l", "linear")) {
      set(builder_.linearUnit(), kLinear, value, LinearUnitOf(value.text).has_value());
    } else if (Is(arguments_[i], "a", "angle")) {
      set(builder_.angularUnit(), kAngular, value, AngularUnitOf(value.text).has_value());
    } else if (Is(arguments_[i], "t", "time")) {
      set(builder_.timeUnit(), kTime, value, TimeUnitOf(value.text).has_value());
    }
  }
}

}  // namespace scene
