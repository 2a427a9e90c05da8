// MA0301 to MA0399: animation curves.
#include "diag/TableInternal.h"

namespace diag {
namespace {

constexpr Entry kCurveCodes[] = {
    {.code = Code::UnknownTangentType,
     .severity = Severity::Warning,
     .symbol = "UnknownTangentType",
     .sentence = "\"{0}\" has tangents of a type that is not known",
     .meaning = "A key has a slow or a fast tangent, or no legal type, and the file does not write the "
                "tangent itself. The slope of such a tangent is not known. It is taken as a spline. Only "
                "the way between keys can differ.",
     .example = "createNode animCurveTL -n \"shotCam_translateX\";\n  setAttr \".tan\" 6;\n  setAttr -s 2 "
                "\".ktv[0:1]\"  1 0 24 10;",
     .help = "Set the tangents of \"{0}\" to spline or auto, and export the scene again."},
    {.code = Code::StepIntoKey,
     .severity = Severity::Note,
     .symbol = "StepIntoKey",
     .sentence = "\"{0}\" has a step on the way into a key",
     .meaning = "The type of a span is that of the key before it. A step on the way into a key has no effect "
                "that is known; the curve is taken as level there.",
     .example = "createNode animCurveTL -n \"shotCam_translateX\";\n  setAttr \".tan\" 9;\n  setAttr -s 2 "
                "\".ktv[0:1]\"  1 0 24 10;\n  setAttr -s 2 \".kit[1]\"  5;",
     .help = "Look at the way between the keys of \"{0}\" in the result."},
    {.code = Code::AutoMixTangent,
     .severity = Severity::Note,
     .symbol = "AutoMixTangent",
     .sentence = "\"{0}\" has tangents of type 27, which is taken as auto mix",
     .meaning = "The rule of auto mix is known. That its code is 27 is only likely.",
     .example = "createNode animCurveTL -n \"shotCam_translateX\";\n  setAttr \".tan\" 27;\n  setAttr -s 3 "
                "\".ktv[0:2]\"  1 0 12 3 24 10;",
     .help = "Look at the way between the keys of \"{0}\" in the result."},
    {.code = Code::FixedWithoutTangent,
     .severity = Severity::Warning,
     .symbol = "FixedWithoutTangent",
     .sentence = "\"{0}\" has a fixed tangent that is not in the file",
     .meaning = "The slope of a fixed tangent stands in the file, and here it does not. The tangent is taken "
                "as a spline. Only the way between keys can differ.",
     .example = "createNode animCurveTL -n \"shotCam_translateX\";\n  setAttr \".tan\" 1;\n  setAttr -s 2 "
                "\".ktv[0:1]\"  1 0 24 10;",
     .help = "Set the tangents of \"{0}\" again, and export the scene."},
    {.code = Code::EmptyFixedTangent,
     .severity = Severity::Note,
     .symbol = "EmptyFixedTangent",
     .sentence = "\"{0}\" leaves a key by a fixed tangent without a direction",
     .meaning = "The file writes (0, 0) for a tangent. It is taken as level.",
     .example = "createNode animCurveTL -n \"shotCam_translateX\";\n  setAttr \".tan\" 1;\n  setAttr -s 2 "
                "\".ktv[0:1]\"  1 0 24 10;\n  setAttr -s 2 \".kox[0:1]\"  0 1;\n  setAttr -s 2 \".koy[0:1]\" "
                " 0 0;\n  setAttr -s 2 \".kix[0:1]\"  1 1;\n  setAttr -s 2 \".kiy[0:1]\"  0 0;",
     .help = "Look at the way between the keys of \"{0}\" in the result."},
    {.code = Code::UnknownInfinity,
     .severity = Severity::Warning,
     .symbol = "UnknownInfinity",
     .sentence = "what \"{0}\" does outside its keys is not known",
     .meaning = "A code says what a curve does before its first key or after its last one. This code is not "
                "known. The curve is taken as constant there.",
     .example = "createNode animCurveTL -n \"shotCam_translateX\";\n  setAttr \".tan\" 9;\n  setAttr -s 2 "
                "\".ktv[0:1]\"  1 0 24 10;\n  setAttr \".pst\" 2;",
     .help = "Set the infinity of \"{0}\" again, and export the scene."},
    {.code = Code::InfinityOfOneKey,
     .severity = Severity::Note,
     .symbol = "InfinityOfOneKey",
     .sentence = "\"{0}\" has one key and is to go on outside it",
     .meaning =
         "A curve of one key cannot cycle or go on in a direction. The key's value is used at all times.",
     .example = "createNode animCurveTL -n \"shotCam_translateX\";\n  setAttr \".tan\" 9;\n  setAttr "
                "\".ktv[0]\"  1 10;\n  setAttr \".pst\" 3;",
     .help = "Nothing has to be done."},
    {.code = Code::LinearInfinityAtLinearKey,
     .severity = Severity::Warning,
     .symbol = "LinearInfinityAtLinearKey",
     .sentence = "\"{0}\" goes on linearly outside a linear key, where it is taken as level",
     .meaning = "Outside its keys the curve goes on with the slope of its outer tangent. At a linear key "
                "that tangent is level in the file. A program may show the slope of the last span instead.",
     .example = "createNode animCurveTL -n \"shotCam_translateX\";\n  setAttr \".tan\" 2;\n  setAttr -s 2 "
                "\".ktv[0:1]\"  1 0 24 10;\n  setAttr \".pst\" 1;",
     .help = "Set a key of \"{0}\" at the end of the range."},
    {.code = Code::PlateauBesideOvershoot,
     .severity = Severity::Note,
     .symbol = "PlateauBesideOvershoot",
     .sentence = "\"{0}\" has a plateau key beside a fixed tangent that overshoots",
     .meaning = "Beside such a tangent a plateau may be level where the rule gives it a slope. The rule is "
                "followed.",
     .example = "createNode animCurveTL -n \"shotCam_translateX\";\n  setAttr \".tan\" 16;\n  setAttr "
                "\".wgt\" no;\n  setAttr -s 3 \".ktv[0:2]\"  0 0 24 4 48 9;\n  setAttr -s 3 \".kot[0:2]\"  1 "
                "16 16;\n  setAttr -s 3 \".kox[0:2]\"  1 1 1;\n  setAttr -s 3 \".koy[0:2]\"  -9 0 0;",
     .help = "Look at the way between the keys of \"{0}\" in the result."},
    {.code = Code::QuaternionCurve,
     .severity = Severity::Warning,
     .symbol = "QuaternionCurve",
     .sentence = "\"{0}\" is one of three curves that turn together, and is taken by itself",
     .meaning = "The three curves of a rotation should be interpolated as one rotation. Each is interpolated "
                "by itself. On the keys nothing differs; between them the rotation can take another path.",
     .example = "createNode animCurveTA -n \"shotCam_rotateX\";\n  setAttr \".tan\" 9;\n  setAttr -s 2 "
                "\".ktv[0:1]\"  1 0 24 90;\n  setAttr \".roti\" 3;",
     .help =
         "Bake the rotation where the scene was made, or set its interpolation to independent Euler angles."},
    {.code = Code::KeysByComponent,
     .severity = Severity::Warning,
     .symbol = "KeysByComponent",
     .sentence = "\"{0}\" has keys whose time and value are set apart, which are not read",
     .meaning = "A key is read where its time and its value are set as a pair. A time or a value that is set "
                "alone changes no key.",
     .example = "createNode animCurveTL -n \"shotCam_translateX\";\n  setAttr \".ktv[0].kt\" 1;\n  setAttr "
                "\".ktv[0].kv\" 10;",
     .help = "Export the scene again, or write each key of \"{0}\" as a pair of time and value."},
};

}  // namespace

std::span<const Entry> CurveCodes() { return kCurveCodes; }

}  // namespace diag
