// The words that the second reader knows, each with what it means where it stands.
#pragma once

#include <algorithm>
#include <span>
#include <string_view>

#include "tests/secondreader/Words.h"

namespace secondreader {

enum class Means {
  Transform,
  Locator,
  Camera,
  Curve,
  Name,
  Parent,
  LinearUnitOption,
  AngleUnitOption,
  TimeUnitOption,
  LinearUnit,
  AngleUnit,
  TimeUnit,
  RenderSettings,
  Yes,
  KeyCount,
  Translate,
  Rotate,
  Scale,
  RotatePivot,
  ScalePivot,
  Orthographic,
  Interest,
  FilmFit,
  FocalLength,
  Aperture,
  Keys,
  Width,
  Height,
  DeviceAspect,
  PixelAspect,
  Output,
  Channel,
  Turns,
  Follows,
  Target,
};

struct KnownWord {
  std::string_view word;
  Means meaning;
  int code = 0;  // of a unit or a channel
};

// Node types, options, units: words by themselves.
inline constexpr KnownWord kBareWords[] = {
    {"transform", Means::Transform},
    {"stereoRigTransform", Means::Transform},
    {"lookAt", Means::Transform},
    {"aimConstraint", Means::Transform},
    {"locator", Means::Locator},
    {"camera", Means::Camera},
    {"stereoRigCamera", Means::Camera},
    {"animCurveTL", Means::Curve},
    {"animCurveTA", Means::Curve},
    {"animCurveTU", Means::Curve},
    {"-n", Means::Name},
    {"-name", Means::Name},
    {"-p", Means::Parent},
    {"-parent", Means::Parent},
    {"-l", Means::LinearUnitOption},
    {"-linear", Means::LinearUnitOption},
    {"-a", Means::AngleUnitOption},
    {"-angle", Means::AngleUnitOption},
    {"-t", Means::TimeUnitOption},
    {"-time", Means::TimeUnitOption},
    {"mm", Means::LinearUnit, 1},
    {"millimeter", Means::LinearUnit, 1},
    {"cm", Means::LinearUnit, 2},
    {"centimeter", Means::LinearUnit, 2},
    {"m", Means::LinearUnit, 3},
    {"meter", Means::LinearUnit, 3},
    {"km", Means::LinearUnit, 4},
    {"kilometer", Means::LinearUnit, 4},
    {"in", Means::LinearUnit, 5},
    {"inch", Means::LinearUnit, 5},
    {"ft", Means::LinearUnit, 6},
    {"foot", Means::LinearUnit, 6},
    {"yd", Means::LinearUnit, 7},
    {"yard", Means::LinearUnit, 7},
    {"mi", Means::LinearUnit, 8},
    {"mile", Means::LinearUnit, 8},
    {"deg", Means::AngleUnit, 1},
    {"degree", Means::AngleUnit, 1},
    {"rad", Means::AngleUnit, 2},
    {"radian", Means::AngleUnit, 2},
    {"hour", Means::TimeUnit, 1},
    {"min", Means::TimeUnit, 2},
    {"sec", Means::TimeUnit, 3},
    {"millisec", Means::TimeUnit, 4},
    {"game", Means::TimeUnit, 5},
    {"film", Means::TimeUnit, 6},
    {"pal", Means::TimeUnit, 7},
    {"ntsc", Means::TimeUnit, 8},
    {"show", Means::TimeUnit, 9},
    {"palf", Means::TimeUnit, 10},
    {"ntscf", Means::TimeUnit, 11},
    {"defaultResolution", Means::RenderSettings},
    {"yes", Means::Yes},
    {"-s", Means::KeyCount},
};

// Attributes that are set: in quotes.
inline constexpr KnownWord kAttributes[] = {
    {".t", Means::Translate},      {".translate", Means::Translate},
    {".r", Means::Rotate},         {".rotate", Means::Rotate},
    {".s", Means::Scale},          {".scale", Means::Scale},
    {".rp", Means::RotatePivot},   {".rotatePivot", Means::RotatePivot},
    {".sp", Means::ScalePivot},    {".scalePivot", Means::ScalePivot},
    {".o", Means::Orthographic},   {".orthographic", Means::Orthographic},
    {".wci", Means::Interest},     {".worldCenterOfInterest", Means::Interest},
    {".ff", Means::FilmFit},       {".filmFit", Means::FilmFit},
    {".fl", Means::FocalLength},   {".focalLength", Means::FocalLength},
    {".cap", Means::Aperture},     {".cameraAperture", Means::Aperture},
    {".ktv", Means::Keys},         {".keyTimeValue", Means::Keys},
    {".w", Means::Width},          {".width", Means::Width},
    {".h", Means::Height},         {".height", Means::Height},
    {".dar", Means::DeviceAspect}, {".deviceAspectRatio", Means::DeviceAspect},
    {".pa", Means::PixelAspect},   {".pixelAspect", Means::PixelAspect},
};

// Attributes that are connected: after the node's name and a dot.
inline constexpr KnownWord kPlugs[] = {
    {"o", Means::Output},
    {"output", Means::Output},
    {"fl", Means::FocalLength},
    {"focalLength", Means::FocalLength},
    {"tx", Means::Channel, 0},
    {"translateX", Means::Channel, 0},
    {"ty", Means::Channel, 1},
    {"translateY", Means::Channel, 1},
    {"tz", Means::Channel, 2},
    {"translateZ", Means::Channel, 2},
    {"rx", Means::Channel, 3},
    {"rotateX", Means::Channel, 3},
    {"ry", Means::Channel, 4},
    {"rotateY", Means::Channel, 4},
    {"rz", Means::Channel, 5},
    {"rotateZ", Means::Channel, 5},
    {"sx", Means::Channel, 6},
    {"scaleX", Means::Channel, 6},
    {"sy", Means::Channel, 7},
    {"scaleY", Means::Channel, 7},
    {"sz", Means::Channel, 8},
    {"scaleZ", Means::Channel, 8},
    {"cr", Means::Turns},
    {"constraintRotate", Means::Turns},
    {"crx", Means::Turns},
    {"constraintRotateX", Means::Turns},
    {"cry", Means::Turns},
    {"constraintRotateY", Means::Turns},
    {"crz", Means::Turns},
    {"constraintRotateZ", Means::Turns},
    {"cv", Means::Turns},
    {"constraintVector", Means::Turns},
    {"constraintVectorX", Means::Turns},
    {"constraintVectorY", Means::Turns},
    {"constraintVectorZ", Means::Turns},
    {"ct", Means::Follows},
    {"constraintTranslate", Means::Follows},
    {"ctx", Means::Follows},
    {"constraintTranslateX", Means::Follows},
    {"cty", Means::Follows},
    {"constraintTranslateY", Means::Follows},
    {"ctz", Means::Follows},
    {"constraintTranslateZ", Means::Follows},
    {"target", Means::Target},
};

inline bool means(std::span<const KnownWord> words, std::string_view word, Means meaning) {
  return std::any_of(words.begin(), words.end(), [&](const KnownWord& known) {
    return known.meaning == meaning && same(known.word, word);
  });
}

// Whether a word of that meaning stands anywhere in the text, in the same case.
inline bool holds(std::span<const KnownWord> words, std::string_view text, Means meaning) {
  return std::any_of(words.begin(), words.end(), [&](const KnownWord& known) {
    return known.meaning == meaning && text.find(known.word) != std::string_view::npos;
  });
}

// The code of the word; the standard one when it has not that meaning.
inline int codeOf(std::span<const KnownWord> words, std::string_view word, Means meaning, int standard) {
  const auto found = std::find_if(words.begin(), words.end(), [&](const KnownWord& known) {
    return known.meaning == meaning && same(known.word, word);
  });
  return found == words.end() ? standard : found->code;
}

}  // namespace secondreader
