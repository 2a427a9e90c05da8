// The rows of the tables of attributes.
#pragma once

#include <limits>
#include <span>
#include <string_view>

namespace scene {

inline constexpr double kNoFallback = std::numeric_limits<double>::quiet_NaN();

enum class RowShape {
  Single,
  Triple,    // its components have its names with x, y, z or X, Y, Z at the end
  Compound,  // its components are the rows that follow, `components` of them
};

struct AttributeRow {
  std::string_view shortName;
  std::string_view longName;
  RowShape shape;
  double fallback = kNoFallback;
  int components = 0;
};

constexpr AttributeRow Single(std::string_view shortName, std::string_view longName,
                              double fallback = kNoFallback) {
  return {shortName, longName, RowShape::Single, fallback, 0};
}

constexpr AttributeRow Triple(std::string_view shortName, std::string_view longName,
                              double fallback = kNoFallback) {
  return {shortName, longName, RowShape::Triple, fallback, 3};
}

constexpr AttributeRow Compound(std::string_view shortName, std::string_view longName, int components) {
  return {shortName, longName, RowShape::Compound, kNoFallback, components};
}

// The tables, each for a part of the attributes of some node types.
std::span<const AttributeRow> TransformRows();
std::span<const AttributeRow> JointRows();
std::span<const AttributeRow> CameraRows();
std::span<const AttributeRow> StereoCameraRows();
std::span<const AttributeRow> StereoTransformRows();
std::span<const AttributeRow> LocatorRows();
std::span<const AttributeRow> ConstraintRows();
std::span<const AttributeRow> CurveRows();
std::span<const AttributeRow> UnitConversionRows();
std::span<const AttributeRow> PairBlendRows();
std::span<const AttributeRow> BlendWeightedRows();
std::span<const AttributeRow> AnimBlendRows();
std::span<const AttributeRow> ReferenceRows();
std::span<const AttributeRow> ScriptRows();
std::span<const AttributeRow> TimeRows();
std::span<const AttributeRow> ResolutionRows();
std::span<const AttributeRow> RenderGlobalsRows();

}  // namespace scene
