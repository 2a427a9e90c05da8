#include "scene/Attributes.h"

#include <cmath>
#include <cstddef>
#include <deque>
#include <initializer_list>
#include <span>
#include <unordered_map>

#include "scene/AttributeRowsInternal.h"

namespace scene {
namespace {

// One table of rows made into attributes that know one another.
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

  const AttributeInfo* Find(std::string_view name) const {
    const auto found = byName_.find(name);
    return found == byName_.end() ? nullptr : found->second;
  }

 private:
  AttributeInfo& Add(const AttributeRow& row) {
    AttributeInfo& attribute = attributes_.emplace_back();
    attribute.longName = row.longName;
    attribute.shortName = row.shortName;
    if (!std::isnan(row.fallback)) attribute.fallback = row.fallback;
    byName_[attribute.longName] = &attribute;
    byName_.emplace(attribute.shortName, &attribute);
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
  std::unordered_map<std::string_view, const AttributeInfo*> byName_;
};

// The tables that a node type has, looked through one after the other. A type is one line of AllTypes.
using TablesOfType = std::vector<const AttributeTable*>;
using Types = std::unordered_map<std::string_view, TablesOfType>;

const AttributeTable* TransformTable() {
  static const AttributeTable table(TransformRows());
  return &table;
}

Types AllTypes() {
  const AttributeTable* const transform = TransformTable();
  static const AttributeTable joint(JointRows()), camera(CameraRows()), stereoCamera(StereoCameraRows());
  static const AttributeTable stereoTransform(StereoTransformRows()), locator(LocatorRows());
  static const AttributeTable constraint(ConstraintRows()), curve(CurveRows());
  static const AttributeTable unitConversion(UnitConversionRows()), pairBlend(PairBlendRows());
  static const AttributeTable blendWeighted(BlendWeightedRows()), animBlend(AnimBlendRows());
  static const AttributeTable reference(ReferenceRows()), script(ScriptRows()), time(TimeRows());
  static const AttributeTable resolution(ResolutionRows()), renderGlobals(RenderGlobalsRows());
  Types types = {
      {"transform", {transform}},
      {"joint", {&joint, transform}},
      {"fosterParent", {transform}},
      {"camera", {&camera, transform}},
      {"stereoRigCamera", {&stereoCamera, &camera, transform}},
      {"stereoRigTransform", {&stereoTransform, transform}},
      {"locator", {&locator, transform}},
      {"unitConversion", {&unitConversion}},
      {"timeToUnitConversion", {&unitConversion}},
      {"unitToTimeConversion", {&unitConversion}},
      {"pairBlend", {&pairBlend}},
      {"blendWeighted", {&blendWeighted}},
      {"reference", {&reference}},
      {"script", {&script}},
      {"time", {&time}},
      {"resolution", {&resolution}},
      {"renderGlobals", {&renderGlobals}},
  };
  for (const char* type : {"lookAt", "aimConstraint", "pointConstraint", "orientConstraint",
                           "parentConstraint", "scaleConstraint"}) {
    types[type] = {&constraint, transform};
  }
  for (const char* type : {"animCurveTL", "animCurveTA", "animCurveTU", "animCurveTT", "animCurveUL",
                           "animCurveUA", "animCurveUU", "animCurveUT"}) {
    types[type] = {&curve};
  }
  for (const char* type : {"animBlendNodeAdditive", "animBlendNodeAdditiveDA", "animBlendNodeAdditiveDL",
                           "animBlendNodeAdditiveF", "animBlendNodeAdditiveFA", "animBlendNodeAdditiveFL",
                           "animBlendNodeAdditiveI16", "animBlendNodeAdditiveI32",
                           "animBlendNodeAdditiveRotation", "animBlendNodeAdditiveScale"}) {
    types[type] = {&animBlend};
  }
  return types;
}

// Null where the type is not known.
const TablesOfType* TablesOf(std::string_view nodeType) {
  static const Types types = AllTypes();
  const auto found = types.find(nodeType);
  return found == types.end() ? nullptr : &found->second;
}

}  // namespace

const AttributeInfo* FindAttribute(std::string_view nodeType, std::string_view name) {
  const TablesOfType* const tables = TablesOf(nodeType);
  if (tables == nullptr) return TransformTable()->Find(name);
  for (const AttributeTable* table : *tables) {
    if (const AttributeInfo* const found = table->Find(name)) return found;
  }
  return nullptr;
}

bool KeepsAttributes(std::string_view nodeType) { return TablesOf(nodeType) != nullptr; }

std::string_view TypeOfProgramNode(std::string_view name) {
  if (name == "time1") return "time";
  if (name == "defaultResolution") return "resolution";
  if (name == "defaultRenderGlobals") return "renderGlobals";
  return {};
}

}  // namespace scene
