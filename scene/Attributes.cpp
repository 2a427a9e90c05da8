#include "scene/Attributes.h"

#include <cmath>
#include <cstddef>
#include <deque>
#include <initializer_list>
#include <map>
#include <span>

#include "scene/AttributeRowsInternal.h"
#include "scene/FlatMap.h"

namespace scene {
namespace {

// The attributes made from one table of rows, with the links between compounds and components.
class AttributeTable {
 public:
  explicit AttributeTable(std::span<const AttributeRow> rows) {
    for (std::size_t at = 0; at < rows.size(); ++at) {
      AttributeInfo& attribute = Add(rows[at]);
      if (rows[at].shape == RowShape::Triple) AddTriple(attribute);
      if (rows[at].shape != RowShape::Compound) continue;
      for (int i = 0; i < rows[at].components; ++i)
        Join(attribute, Add(rows[at + 1 + static_cast<std::size_t>(i)]));
      at += static_cast<std::size_t>(rows[at].components);
    }
  }
  AttributeTable(const AttributeTable&) = delete;
  AttributeTable& operator=(const AttributeTable&) = delete;

  const std::deque<AttributeInfo>& attributes() const { return attributes_; }

 private:
  AttributeInfo& Add(const AttributeRow& row) {
    AttributeInfo& attribute = attributes_.emplace_back();
    attribute.longName = row.longName;
    attribute.shortName = row.shortName;
    if (!std::isnan(row.fallback)) attribute.fallback = row.fallback;
    return attribute;
  }

  static void Join(AttributeInfo& compound, AttributeInfo& component) {
    component.compound = &compound;
    component.component = static_cast<int>(compound.components.size());
    compound.components.push_back(&component);
  }

  void AddTriple(AttributeInfo& compound) {
    constexpr char kShort[] = {'x', 'y', 'z'};
    constexpr char kLong[] = {'X', 'Y', 'Z'};
    for (int i = 0; i < 3; ++i) {
      const std::string shortName = compound.shortName + kShort[i];
      const std::string longName = compound.longName + kLong[i];
      Join(compound, Add(Single(shortName, longName, compound.fallback.value_or(kNoFallback))));
    }
  }

  std::deque<AttributeInfo> attributes_;  // their addresses stay
};

// The tables that a node type has; where two have a name, the first counts. A type is one line of AllTypes.
using TablesOfType = std::vector<const AttributeTable*>;
using Types = std::map<std::string_view, TablesOfType>;

Types AllTypes() {
  static const AttributeTable kTransform(TransformRows());
  const AttributeTable* const transform = &kTransform;
  static const AttributeTable kJoint(JointRows()), kCamera(CameraRows()), kStereoCamera(StereoCameraRows());
  static const AttributeTable kStereoTransform(StereoTransformRows()), kLocator(LocatorRows());
  static const AttributeTable kConstraint(ConstraintRows()), kCurve(CurveRows());
  static const AttributeTable kUnitConversion(UnitConversionRows()), kPairBlend(PairBlendRows());
  static const AttributeTable kBlendWeighted(BlendWeightedRows()), kAnimBlend(AnimBlendRows());
  static const AttributeTable kReference(ReferenceRows()), kScript(ScriptRows()), kTime(TimeRows());
  static const AttributeTable kResolution(ResolutionRows()), kRenderGlobals(RenderGlobalsRows());
  Types types = {
      {"transform", {transform}},
      {"joint", {&kJoint, transform}},
      {"fosterParent", {transform}},
      {"camera", {&kCamera, transform}},
      {"stereoRigCamera", {&kStereoCamera, &kCamera, transform}},
      {"stereoRigTransform", {&kStereoTransform, transform}},
      {"locator", {&kLocator, transform}},
      {"unitConversion", {&kUnitConversion}},
      {"timeToUnitConversion", {&kUnitConversion}},
      {"unitToTimeConversion", {&kUnitConversion}},
      {"pairBlend", {&kPairBlend}},
      {"blendWeighted", {&kBlendWeighted}},
      {"reference", {&kReference}},
      {"script", {&kScript}},
      {"time", {&kTime}},
      {"resolution", {&kResolution}},
      {"renderGlobals", {&kRenderGlobals}},
  };
  for (const char* type : {"lookAt", "aimConstraint", "pointConstraint", "orientConstraint",
                           "parentConstraint", "scaleConstraint"}) {
    types[type] = {&kConstraint, transform};
  }
  for (const char* type : {"animCurveTL", "animCurveTA", "animCurveTU", "animCurveTT", "animCurveUL",
                           "animCurveUA", "animCurveUU", "animCurveUT"}) {
    types[type] = {&kCurve};
  }
  for (const char* type : {"animBlendNodeAdditive", "animBlendNodeAdditiveDA", "animBlendNodeAdditiveDL",
                           "animBlendNodeAdditiveF", "animBlendNodeAdditiveFA", "animBlendNodeAdditiveFL",
                           "animBlendNodeAdditiveI16", "animBlendNodeAdditiveI32",
                           "animBlendNodeAdditiveRotation", "animBlendNodeAdditiveScale"}) {
    types[type] = {&kAnimBlend};
  }
  return types;
}

// All types and their attributes. Look-ups are frequent: each line of a scene needs one.
class AttributeIndex {
 public:
  AttributeIndex() {
    for (const auto& [type, tables] : AllTypes()) Add(type, tables);
    unknown_ = NumberOf("transform");
  }

  TypeNumber NumberOf(std::string_view nodeType) const {
    const TypeNumber* const found = numbers_.Find(0, nodeType);
    return found == nullptr ? TypeNumber::Unknown : *found;
  }

  const AttributeInfo* Find(TypeNumber type, std::string_view name) const {
    const TypeNumber known = type == TypeNumber::Unknown ? unknown_ : type;
    const AttributeInfo* const* const found = byName_.Find(static_cast<std::uint64_t>(known), name);
    return found == nullptr ? nullptr : *found;
  }

 private:
  void Add(std::string_view type, const TablesOfType& tables) {
    const std::uint32_t number = ++count_;
    numbers_.At(0, type) = TypeNumber{number};
    // A later entry replaces an earlier one: the first table wins, and in it long names win over short ones.
    for (auto table = tables.rbegin(); table != tables.rend(); ++table) {
      const std::deque<AttributeInfo>& attributes = (*table)->attributes();
      for (auto at = attributes.rbegin(); at != attributes.rend(); ++at) {
        byName_.At(number, at->shortName) = &*at;
      }
      for (const AttributeInfo& attribute : attributes) byName_.At(number, attribute.longName) = &attribute;
    }
  }

  std::uint32_t count_ = 0;
  TypeNumber unknown_ = TypeNumber::Unknown;  // the type that is used for one that is not known
  FlatMap<TypeNumber> numbers_;
  FlatMap<const AttributeInfo*> byName_;  // long and short, by the numbers of the types
};

const AttributeIndex& Index() {
  static const AttributeIndex kIndex;
  return kIndex;
}

}  // namespace

TypeNumber TypeNumberOf(std::string_view nodeType) { return Index().NumberOf(nodeType); }

const AttributeInfo* FindAttribute(TypeNumber nodeType, std::string_view name) {
  return Index().Find(nodeType, name);
}

const AttributeInfo* FindAttribute(std::string_view nodeType, std::string_view name) {
  return FindAttribute(TypeNumberOf(nodeType), name);
}

bool KeepsAttributes(std::string_view nodeType) { return TypeNumberOf(nodeType) != TypeNumber::Unknown; }

std::string_view TypeOfProgramNode(std::string_view name) {
  if (name == "time1") return "time";
  if (name == "defaultResolution") return "resolution";
  if (name == "defaultRenderGlobals") return "renderGlobals";
  return {};
}

}  // namespace scene
