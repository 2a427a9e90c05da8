// The four kinds of setAttr.
#include <algorithm>
#include <cmath>

#include "tests/secondreader/KnownWords.h"
#include "tests/secondreader/Numbers.h"
#include "tests/secondreader/SceneReader.h"

namespace secondreader {
namespace {

bool nearlyEqual(double a, double b) {
  constexpr double kRelative = 1e-12;
  constexpr double kLeast = 1.000088900582341e-12;
  const double larger = std::fabs(a) > std::fabs(b) ? std::fabs(a) : std::fabs(b);
  return std::fabs(a - b) < std::max(kRelative * larger, kLeast);
}

}  // namespace

void SceneReader::setAttr() {
  switch (kind_) {
    case Current::Transform:
      return setTransformAttr();
    case Current::Camera:
      return setCameraAttr();
    case Current::Curve:
      return setCurveAttr();
    case Current::Render:
      return setRenderAttr();
    case Current::None:
    case Current::Locator:
      return;
  }
}

double SceneReader::number(const Token& token) { return host_.scanNumber(copied(token.text)); }

template <typename Record>
void SceneReader::writeBack(std::vector<Record>& list, const Record& current) {
  const int index = findNamed(list, current.name);
  if (index >= 0) list[static_cast<std::size_t>(index)] = current;
}

void SceneReader::readTriple(Triple& triple, Triple standard) {
  std::size_t count = 0;
  for (Token token = inCommand(); token.kind != Kind::Semicolon; token = inCommand()) {
    if (token.kind == Kind::Number && count < standard.size()) standard[count++] = number(token);
  }
  triple = standard;
}

void SceneReader::setTransformAttr() {
  constexpr Triple kNone{0.0, 0.0, 0.0};
  constexpr Triple kUnscaled{1.0, 1.0, 1.0};
  const Token token = lexer_.next();
  if (token.kind != Kind::String) return;
  const std::string attribute = unquoted(token.text);
  if (means(kAttributes, attribute, Means::Translate)) {
    readTriple(transform_.translate, kNone);
  } else if (means(kAttributes, attribute, Means::Rotate)) {
    readTriple(transform_.rotate, kNone);
  } else if (means(kAttributes, attribute, Means::Scale)) {
    readTriple(transform_.scale, kUnscaled);
  } else if (means(kAttributes, attribute, Means::RotatePivot)) {
    readTriple(transform_.rotatePivot, kNone);
  } else if (means(kAttributes, attribute, Means::ScalePivot)) {
    readTriple(transform_.scalePivot, kNone);
  } else {
    return;
  }
  writeBack(scene_.transforms, transform_);
}

void SceneReader::setCameraAttr() {
  Token token = lexer_.next();
  if (token.kind == Kind::Option) {
    lexer_.next();
    token = lexer_.next();
  }
  if (token.kind != Kind::String) return;
  const std::string attribute = unquoted(token.text);
  const bool orthographic = means(kAttributes, attribute, Means::Orthographic);
  const bool interest = means(kAttributes, attribute, Means::Interest);
  const bool fit = means(kAttributes, attribute, Means::FilmFit);
  const bool focal = means(kAttributes, attribute, Means::FocalLength);
  const bool aperture = means(kAttributes, attribute, Means::Aperture);
  if (!orthographic && !interest && !fit && !focal && !aperture) return;
  Triple values{};
  std::size_t count = 0;
  bool given = false;  // the command has a value
  for (token = inCommand(); token.kind != Kind::Semicolon; token = inCommand()) {
    if (orthographic && token.kind == Kind::Identifier && means(kBareWords, copied(token.text), Means::Yes)) {
      camera_.orthographic = given = true;
    }
    if (orthographic || token.kind != Kind::Number) continue;
    given = true;
    if (fit) {
      const double value = number(token);
      camera_.verticalFit = !nearlyEqual(value, 1.0) && nearlyEqual(value, 2.0);
    } else if (focal) {
      camera_.focalLength = number(token);
    } else if ((interest && count < 3) || (aperture && count < 2)) {
      values[count++] = number(token);
    }
  }
  if (aperture && count > 0) {
    camera_.horizontalAperture = values[0];
    camera_.verticalAperture = values[1];
  }
  if (given) writeBack(scene_.cameras, camera_);
}

void SceneReader::setCurveAttr() {
  if (findKeys()) readKeys();
  writeBack(scene_.curves, curve_);
}

// True before the keys; false when the command ended without any.
bool SceneReader::findKeys() {
  for (;;) {
    const Token token = inCommand();
    if (token.kind == Kind::Semicolon) return false;
    if (token.kind == Kind::Option && !means(kBareWords, copied(token.text), Means::KeyCount)) lexer_.next();
    if (token.kind != Kind::String) continue;
    if (holds(kAttributes, unquoted(token.text), Means::Keys)) return true;
  }
}

void SceneReader::readKeys() {
  for (Token token = inCommand(); token.kind != Kind::Semicolon; token = inCommand()) {
    if (token.kind != Kind::Number) continue;
    Key key;
    key.time = number(token);
    const Token value = inCommand();
    if (value.kind == Kind::Number) key.value = number(value);
    if (curve_.keys == nullptr) curve_.keys = std::make_shared<std::vector<Key>>();
    curve_.keys->push_back(key);
    if (value.kind == Kind::Semicolon) return;
  }
}

void SceneReader::setRenderAttr() {
  for (Token token = inCommand(); token.kind != Kind::Semicolon; token = inCommand()) {
    if (token.kind != Kind::String) continue;
    const std::string attribute = unquoted(token.text);
    const bool width = means(kAttributes, attribute, Means::Width);
    const bool height = means(kAttributes, attribute, Means::Height);
    const bool device = means(kAttributes, attribute, Means::DeviceAspect);
    const bool pixel = means(kAttributes, attribute, Means::PixelAspect);
    if (!width && !height && !device && !pixel) continue;
    token = inCommand();
    if (token.kind == Kind::Semicolon) return;
    if (token.kind != Kind::Number) continue;
    const double value = number(token);
    if (width) scene_.width = wholePart(value);
    if (height) scene_.height = wholePart(value);
    if (device) scene_.deviceAspectRatio = value;
    if (pixel) scene_.pixelAspect = value;
  }
}

}  // namespace secondreader
