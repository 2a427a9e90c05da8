// The attributes of what has a place: transforms, joints, constraints, cameras, locators.
#include "scene/AttributeRowsInternal.h"

namespace scene {
namespace {

constexpr AttributeRow kTransform[] = {
    Single("v", "visibility", 1),
    Single("io", "intermediateObject", 0),
    Triple("t", "translate", 0),
    Triple("r", "rotate", 0),
    Triple("s", "scale", 1),
    Compound("sh", "shear", 3),
    Single("shxy", "shearXY", 0),
    Single("shxz", "shearXZ", 0),
    Single("shyz", "shearYZ", 0),
    Single("ro", "rotateOrder", 0),
    Triple("ra", "rotateAxis", 0),
    Triple("rp", "rotatePivot", 0),
    Triple("rpt", "rotatePivotTranslate", 0),
    Triple("sp", "scalePivot", 0),
    Triple("spt", "scalePivotTranslate", 0),
    Single("it", "inheritsTransform", 1),
    Single("opm", "offsetParentMatrix"),
    Single("m", "matrix"),
    Single("im", "inverseMatrix"),
    Single("wm", "worldMatrix"),
    Single("wim", "worldInverseMatrix"),
    Single("pm", "parentMatrix"),
    Single("pim", "parentInverseMatrix"),
    Compound("mntl", "minTransLimit", 3),
    Single("mntx", "minTransXLimit", -1),
    Single("mnty", "minTransYLimit", -1),
    Single("mntz", "minTransZLimit", -1),
    Compound("mxtl", "maxTransLimit", 3),
    Single("mxtx", "maxTransXLimit", 1),
    Single("mxty", "maxTransYLimit", 1),
    Single("mxtz", "maxTransZLimit", 1),
    Compound("mtle", "minTransLimitEnable", 3),
    Single("mtxe", "minTransXLimitEnable", 0),
    Single("mtye", "minTransYLimitEnable", 0),
    Single("mtze", "minTransZLimitEnable", 0),
    Compound("xtle", "maxTransLimitEnable", 3),
    Single("xtxe", "maxTransXLimitEnable", 0),
    Single("xtye", "maxTransYLimitEnable", 0),
    Single("xtze", "maxTransZLimitEnable", 0),
    Compound("mnrl", "minRotLimit", 3),
    Single("mnrx", "minRotXLimit", -45),
    Single("mnry", "minRotYLimit", -45),
    Single("mnrz", "minRotZLimit", -45),
    Compound("mxrl", "maxRotLimit", 3),
    Single("mxrx", "maxRotXLimit", 45),
    Single("mxry", "maxRotYLimit", 45),
    Single("mxrz", "maxRotZLimit", 45),
    Compound("mrle", "minRotLimitEnable", 3),
    Single("mrxe", "minRotXLimitEnable", 0),
    Single("mrye", "minRotYLimitEnable", 0),
    Single("mrze", "minRotZLimitEnable", 0),
    Compound("xrle", "maxRotLimitEnable", 3),
    Single("xrxe", "maxRotXLimitEnable", 0),
    Single("xrye", "maxRotYLimitEnable", 0),
    Single("xrze", "maxRotZLimitEnable", 0),
    Compound("mnsl", "minScaleLimit", 3),
    Single("mnsx", "minScaleXLimit", -1),
    Single("mnsy", "minScaleYLimit", -1),
    Single("mnsz", "minScaleZLimit", -1),
    Compound("mxsl", "maxScaleLimit", 3),
    Single("mxsx", "maxScaleXLimit", 1),
    Single("mxsy", "maxScaleYLimit", 1),
    Single("mxsz", "maxScaleZLimit", 1),
    Compound("msle", "minScaleLimitEnable", 3),
    Single("msxe", "minScaleXLimitEnable", 0),
    Single("msye", "minScaleYLimitEnable", 0),
    Single("msze", "minScaleZLimitEnable", 0),
    Compound("xsle", "maxScaleLimitEnable", 3),
    Single("xsxe", "maxScaleXLimitEnable", 0),
    Single("xsye", "maxScaleYLimitEnable", 0),
    Single("xsze", "maxScaleZLimitEnable", 0),
};

constexpr AttributeRow kJoint[] = {
    Triple("jo", "jointOrient", 0),
    Triple("is", "inverseScale", 1),
    Single("ssc", "segmentScaleCompensate", 1),
};

constexpr AttributeRow kCamera[] = {
    Single("rnd", "renderable", 1),
    Compound("cap", "cameraAperture", 2),
    Single("hfa", "horizontalFilmAperture", 1.41732),
    Single("vfa", "verticalFilmAperture", 0.94488),
    Single("fl", "focalLength", 35),
    Single("lsr", "lensSqueezeRatio", 1),
    Single("ff", "filmFit", 1),
    Single("ffo", "filmFitOffset", 0),
    Compound("fio", "filmOffset", 2),
    Single("hfo", "horizontalFilmOffset", 0),
    Single("vfo", "verticalFilmOffset", 0),
    Single("se", "shakeEnabled", 0),
    Compound("shk", "shake", 2),
    Single("hs", "horizontalShake", 0),
    Single("vs", "verticalShake", 0),
    Single("soe", "shakeOverscanEnabled", 0),
    Single("sos", "shakeOverscan", 1),
    Single("ppj", "postProjection"),
    Single("psc", "preScale", 1),
    Compound("ct", "filmTranslate", 2),
    Single("fth", "filmTranslateH", 0),
    Single("ftv", "filmTranslateV", 0),
    Single("frv", "filmRollValue", 0),
    Single("ptsc", "postScale", 1),
    Single("ovr", "overscan", 1),
    Single("cs", "cameraScale", 1),
    Single("pze", "panZoomEnabled", 0),
    Single("rpz", "renderPanZoom", 0),
    Compound("pn", "pan", 2),
    Single("hpn", "horizontalPan", 0),
    Single("vpn", "verticalPan", 0),
    Single("zom", "zoom", 1),
    Single("o", "orthographic", 0),
    Single("ow", "orthographicWidth", 10),
    Single("ncp", "nearClipPlane", 0.1),
    Single("fcp", "farClipPlane", 10000),
    Single("coi", "centerOfInterest", 5),
    Single("fd", "focusDistance", 5),
    Single("fs", "fStop", 5.6),
    Single("sa", "shutterAngle", 144),
    Single("imn", "imageName"),
    Single("den", "depthName"),
    Single("man", "maskName"),
    Single("hc", "homeCommand"),
    Triple("tp", "tumblePivot", 0),
};

constexpr AttributeRow kStereoCamera[] = {
    Single("sm", "stereo", 2),
    Single("isep", "interaxialSeparation", 6.35),
    Single("zp", "zeroParallax", 254),
};

constexpr AttributeRow kStereoTransform[] = {
    Single("slo", "stereoLeftOffset", 0),    Single("sla", "stereoLeftAngle", 0),
    Single("fbol", "filmBackOutputLeft", 0), Single("sro", "stereoRightOffset", 0),
    Single("sra", "stereoRightAngle", 0),    Single("fbor", "filmBackOutputRight", 0),
};

constexpr AttributeRow kLocator[] = {
    Triple("lp", "localPosition", 0), Compound("los", "localScale", 3), Single("lsx", "localScaleX", 1),
    Single("lsy", "localScaleY", 1),  Single("lsz", "localScaleZ", 1),
};

// Those of one target stand under "target[i]".
constexpr AttributeRow kConstraint[] = {
    Triple("tt", "targetTranslate", 0),
    Triple("tr", "targetRotate", 0),
    Triple("ts", "targetScale", 1),
    Triple("trp", "targetRotatePivot", 0),
    Triple("trt", "targetRotateTranslate", 0),
    Single("tro", "targetRotateOrder", 0),
    Triple("tjo", "targetJointOrient", 0),
    Single("tpm", "targetParentMatrix"),
    Triple("tot", "targetOffsetTranslate", 0),
    Triple("tor", "targetOffsetRotate", 0),
    Single("tw", "targetWeight", 1),
    Triple("ct", "constraintTranslate", 0),
    Triple("cr", "constraintRotate", 0),
    Triple("cs", "constraintScale", 1),
    Triple("crp", "constraintRotatePivot", 0),
    Triple("crt", "constraintRotateTranslate", 0),
    Single("cro", "constraintRotateOrder", 0),
    Triple("cjo", "constraintJointOrient", 0),
    Single("cpim", "constraintParentInverseMatrix"),
    Triple("a", "aimVector"),
    Triple("u", "upVector"),
    Triple("wu", "worldUpVector"),
    Single("wum", "worldUpMatrix"),
    Single("wut", "worldUpType", 3),
    Triple("o", "offset"),
    Single("tws", "twist", 0),
    Single("db", "distanceBetween"),
    Single("int", "interpType"),
    Triple("rst", "restTranslate", 0),
    Triple("rsrr", "restRotate", 0),
    Triple("lr", "lastTargetRotation", 0),
};

}  // namespace

std::span<const AttributeRow> TransformRows() { return kTransform; }
std::span<const AttributeRow> JointRows() { return kJoint; }
std::span<const AttributeRow> CameraRows() { return kCamera; }
std::span<const AttributeRow> StereoCameraRows() { return kStereoCamera; }
std::span<const AttributeRow> StereoTransformRows() { return kStereoTransform; }
std::span<const AttributeRow> LocatorRows() { return kLocator; }
std::span<const AttributeRow> ConstraintRows() { return kConstraint; }

}  // namespace scene
