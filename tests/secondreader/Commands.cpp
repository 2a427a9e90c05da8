// The main loop, and the commands that create and choose nodes and units.
#include "tests/secondreader/KnownWords.h"
#include "tests/secondreader/SceneReader.h"

namespace secondreader {
namespace {

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
  if (means(kBareWords, type, Means::Transform)) {
    createRecord(scene_.transforms, transform_, Current::Transform);
  } else if (means(kBareWords, type, Means::Locator)) {
    createRecord(scene_.locators, locator_, Current::Locator);
  } else if (means(kBareWords, type, Means::Camera)) {
    createRecord(scene_.cameras, camera_, Current::Camera);
  } else if (means(kBareWords, type, Means::Curve)) {
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
  const bool isName = means(kBareWords, word, Means::Name);
  if (!isName && !means(kBareWords, word, Means::Parent)) return false;
  const Token value = inCommand();
  if (value.kind == Kind::String) *(isName ? name : parent) = unquoted(value.text);
  return value.kind == Kind::Semicolon;
}

void SceneReader::select() {
  const auto isResolution = [](const Token& token) {
    return token.kind == Kind::Identifier && means(kBareWords, copied(token.text), Means::RenderSettings);
  };
  bool matched = false;
  for (;;) {
    Token token = inCommand();
    if (token.kind == Kind::Option) continue;
    if (token.kind == Kind::Colon) {
      token = inCommand();
      if (token.kind == Kind::Semicolon) return;
      if (!isResolution(token)) continue;
    }
    if (isResolution(token)) {
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
    const bool linear = means(kBareWords, option, Means::LinearUnitOption);
    const bool angle = means(kBareWords, option, Means::AngleUnitOption);
    const bool time = means(kBareWords, option, Means::TimeUnitOption);
    if (!linear && !angle && !time) continue;
    token = inCommand();
    if (token.kind == Kind::Semicolon) return;
    if (token.kind == Kind::Identifier) {
      const std::string word = copied(token.text);
      if (linear) scene_.linearUnit = codeOf(kBareWords, word, Means::LinearUnit, scene_.linearUnit);
      if (angle) scene_.angleUnit = codeOf(kBareWords, word, Means::AngleUnit, scene_.angleUnit);
      if (time) scene_.timeUnit = codeOf(kBareWords, word, Means::TimeUnit, scene_.timeUnit);
    } else if (time && token.kind == Kind::Number) {
      scene_.timeUnit = kRateAsNumber;
      scene_.frameRate = number(token);
    }
  }
}

}  // namespace secondreader
