// The attributes of nodes that drive channels (curves, and the nodes between a curve and a channel) and of a
// scene's settings (time, resolution, render settings, scripts, references).
#include "scene/AttributeRowsInternal.h"

namespace scene {
namespace {

constexpr AttributeRow kCurve[] = {
    Single("tan", "tangentType", 4),
    Single("wgt", "weightedTangents", 1),
    Compound("ktv", "keyTimeValue", 2),
    Single("kt", "keyTime"),
    Single("kv", "keyValue"),
    Single("kit", "keyTanInType"),
    Single("kot", "keyTanOutType"),
    Single("kix", "keyTanInX"),
    Single("kiy", "keyTanInY"),
    Single("kox", "keyTanOutX"),
    Single("koy", "keyTanOutY"),
    Single("ktl", "keyTanLocked", 1),
    Single("kwl", "keyWeightLocked", 1),
    Single("kbd", "keyBreakdown", 0),
    Single("pre", "preInfinity", 0),
    Single("pst", "postInfinity", 0),
    Single("roti", "rotationInterpolation", 1),
    Single("i", "input"),
    Single("o", "output"),
};

constexpr AttributeRow kUnitConversion[] = {
    Single("i", "input"),
    Single("o", "output"),
    Single("cf", "conversionFactor", 1),
};

constexpr AttributeRow kPairBlend[] = {
    Compound("it1", "inTranslate1", 3), Single("itx1", "inTranslateX1", 0),
    Single("ity1", "inTranslateY1", 0), Single("itz1", "inTranslateZ1", 0),
    Compound("it2", "inTranslate2", 3), Single("itx2", "inTranslateX2", 0),
    Single("ity2", "inTranslateY2", 0), Single("itz2", "inTranslateZ2", 0),
    Compound("ir1", "inRotate1", 3),    Single("irx1", "inRotateX1", 0),
    Single("iry1", "inRotateY1", 0),    Single("irz1", "inRotateZ1", 0),
    Compound("ir2", "inRotate2", 3),    Single("irx2", "inRotateX2", 0),
    Single("iry2", "inRotateY2", 0),    Single("irz2", "inRotateZ2", 0),
    Single("w", "weight", 1),           Single("txm", "translateXMode", 0),
    Single("tym", "translateYMode", 0), Single("tzm", "translateZMode", 0),
    Single("rm", "rotateMode", 0),      Single("ri", "rotInterpolation", 0),
    Triple("ot", "outTranslate", 0),    Triple("or", "outRotate", 0),
    Single("c", "currentDriver"),
};

constexpr AttributeRow kBlendWeighted[] = {
    Single("i", "input", 0),
    Single("w", "weight", 1),
    Single("o", "output"),
    Single("c", "current"),
};

constexpr AttributeRow kAnimBlend[] = {
    Single("ia", "inputA", 0),  Single("ib", "inputB", 0), Single("wa", "weightA", 1),
    Single("wb", "weightB", 1), Single("o", "output"),
};

constexpr AttributeRow kReference[] = {
    Single("fn", "fileNames"),       Single("ed", "edits"),           Single("phl", "placeHolderList"),
    Single("fp", "fosterParent"),    Single("sr", "sharedReference"), Single("lk", "locked", 0),
    Single("asn", "associatedNode"),
};

constexpr AttributeRow kScript[] = {
    Single("b", "before"),
    Single("a", "after"),
    Single("st", "scriptType", 0),
};

constexpr AttributeRow kTime[] = {
    Single("o", "outTime", 1),
    Single("unw", "unwarpedTime", 1),
};

// Width and height have no default here: it depends on the version of the program that made the scene.
constexpr AttributeRow kResolution[] = {
    Single("w", "width"),
    Single("h", "height"),
    Single("dar", "deviceAspectRatio"),
    Single("pa", "pixelAspect"),
    Single("ldar", "lockDeviceAspectRatio"),
};

constexpr AttributeRow kRenderGlobals[] = {
    Single("an", "animation", 0),
    Single("fs", "startFrame"),
    Single("ef", "endFrame"),
    Single("be", "byFrame", 1),
};

}  // namespace

std::span<const AttributeRow> CurveRows() { return kCurve; }
std::span<const AttributeRow> UnitConversionRows() { return kUnitConversion; }
std::span<const AttributeRow> PairBlendRows() { return kPairBlend; }
std::span<const AttributeRow> BlendWeightedRows() { return kBlendWeighted; }
std::span<const AttributeRow> AnimBlendRows() { return kAnimBlend; }
std::span<const AttributeRow> ReferenceRows() { return kReference; }
std::span<const AttributeRow> ScriptRows() { return kScript; }
std::span<const AttributeRow> TimeRows() { return kTime; }
std::span<const AttributeRow> ResolutionRows() { return kResolution; }
std::span<const AttributeRow> RenderGlobalsRows() { return kRenderGlobals; }

}  // namespace scene
