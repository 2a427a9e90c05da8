// The main loop, and the commands that create and choose nodes and units.
#include <initializer_list>

#include "tests/secondreader/SceneReader.h"

namespace secondreader {
namespace {

// The codes of unit words, from 1 in the order of the lists.
struct UnitWord {
  int code;
  std::initializer_list<std::string_view> words;
};

int codeOf(std::string_view word, std::initializer_list<UnitWord> units, int standard) {
  for (const UnitWord& unit : units) {
    if (isOneOf(word, unit.words)) return unit.code;
  }
  return standard;
}

int linearCode(std::string_view word, int standard) {
  return codeOf(word,
                {{1, {"mm", "millimeter"}},
                 {2, {"cm", "centimeter"}},
                 {3, {"m", "meter"}},
                 {4, {"km", "kilometer"}},
                 {5, {"in", "inch"}},
                 {6, {"ft", "foot"}},
                 {7, {"yd", "yard"}},
                 {8, {"mi", "mile"}}},
                standard);
}

int angleCode(std::string_view word, int standard) {
  return codeOf(word, {{1, {"deg", "degree"}}, {2, {"rad", "radian"}}}, standard);
}

int timeCode(std::string_view word, int standard) {
  return codeOf(word,
                {{1, {"hour"}},
                 {2, {"min"}},
                 {3, {"sec"}},
                 {4, {"millisec"}},
                 {5, {"game"}},
                 {6, {"film"}},
                 {7, {"pal"}},
                 {8, {"ntsc"}},
                 {9, {"show"}},
                 {10, {"palf"}},
                 {11, {"ntscf"}}},
                standard);
}
constexpr int kRateAsNumber = 12;

}  // namespace

Token SceneReader::inCommand() {
  const Token token = lexer_.next();
  if (token.kind == Kind::EndOfFile) lexer_.failAtEnd();
  return token;
}

void SceneReader::read() {
  for (;;) {
    switch (lexer_.next().kind) {
      case Kind::EndOfFile:
        return;
      case Kind::CreateNode:
        createNode();
        break;
      case Kind::SetAttr:
        setAttr();
        break;
      case Kind::ConnectAttr:
        connectAttr();
        break;
      case Kind::Select:
        select();
        break;
      case Kind::CurrentUnit:
        currentUnit();
        break;
      default:
        break;
    }
  }
}

void SceneReader::clearCurrent() { kind_ = Current::None; }

void SceneReader::createNode() {
  const Token token = lexer_.next();
  if (token.kind != Kind::Identifier) return;
  const std::string type = copied(token.text);
  if (isOneOf(type, {"transform", "stereoRigTransform", "lookAt", "aimConstraint"})) {
    createRecord(scene_.transforms, transform_, Current::Transform);
  } else if (isOneOf(type, {"locator"})) {
    createRecord(scene_.locators, locator_, Current::Locator);
  } else if (isOneOf(type, {"camera", "stereoRigCamera"})) {
    createRecord(scene_.cameras, camera_, Current::Camera);
  } else if (isOneOf(type, {"animCurveTL", "animCurveTA", "animCurveTU"})) {
    createRecord(scene_.curves, curve_, Current::Curve);
  } else {
    clearCurrent();
  }
}

template <typename Record>
void SceneReader::createRecord(std::vector<Record>& list, Record& current, Current kind) {
  Record record;
  for (;;) {
    const Token token = inCommand();
    if (token.kind == Kind::Semicolon) break;
    if (token.kind == Kind::Option && takeOption(token, &record.name, &record.parent)) break;
  }
  list.push_back(record);
  kind_ = kind;
  current = record;
}

// True when the command ended with the option.
bool SceneReader::takeOption(const Token& option, std::string* name, std::string* parent) {
  const std::string word = copied(option.text);
  const bool isName = isOneOf(word, {"-n", "-name"});
  if (!isName && !isOneOf(word, {"-p", "-parent"})) return false;
  const Token value = inCommand();
  if (value.kind == Kind::String) *(isName ? name : parent) = unquoted(value.text);
  return value.kind == Kind::Semicolon;
}

void SceneReader::select() {
  constexpr std::string_view kResolution = "defaultResolution";
  bool matched = false;
  for (;;) {
    Token token = inCommand();
    if (token.kind == Kind::Option) continue;
    if (token.kind == Kind::Colon) {
      token = inCommand();
      if (token.kind == Kind::Semicolon) return;
      if (token.kind != Kind::Identifier || !same(copied(token.text), kResolution)) continue;
    }
    if (token.kind == Kind::Identifier && same(copied(token.text), kResolution)) {
      kind_ = Current::Render;
      matched = true;
      continue;
    }
    if (!matched) clearCurrent();
    if (token.kind == Kind::Semicolon) return;
  }
}

void SceneReader::currentUnit() {
  for (;;) {
    Token token = inCommand();
    if (token.kind == Kind::Semicolon) return;
    if (token.kind != Kind::Option) continue;
    const std::string option = copied(token.text);
    const bool linear = isOneOf(option, {"-l", "-linear"});
    const bool angle = isOneOf(option, {"-a", "-angle"});
    const bool time = isOneOf(option, {"-t", "-time"});
    if (!linear && !angle && !time) continue;
    token = inCommand();
    if (token.kind == Kind::Semicolon) return;
    if (token.kind == Kind::Identifier) {
      const std::string word = copied(token.text);
      if (linear) scene_.linearUnit = linearCode(word, scene_.linearUnit);
      if (angle) scene_.angleUnit = angleCode(word, scene_.angleUnit);
      if (time) scene_.timeUnit = timeCode(word, scene_.timeUnit);
    } else if (time && token.kind == Kind::Number) {
      scene_.timeUnit = kRateAsNumber;
      scene_.frameRate = number(token);
    }
  }
}

}  // namespace secondreader
