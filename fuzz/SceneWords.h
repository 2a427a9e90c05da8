// The words of scenes, for the mutator.
#pragma once

#include <string_view>

namespace fuzz {

inline constexpr std::string_view kNodeKinds[] = {
    "transform",
    "transform",
    "stereoRigTransform",
    "lookAt",
    "aimConstraint",
    "locator",
    "locator",
    "camera",
    "camera",
    "stereoRigCamera",
    "animCurveTL",
    "animCurveTL",
    "mesh",
    "TRANSFORM",
    "animCurveTA",
    "animCurveTU",
    "script",
};

// Few, and some that differ only in case, so that names repeat and commands refer to the same nodes.
inline constexpr std::string_view kNames[] = {"a",   "b",    "c",       "cam",  "camShape", "A",  "rig",
                                              "loc", "aim",  "k1",      "k2",   "k3",       "k4", "",
                                              "a.b", "null", "NULLish", "|a|b", "x\\\"y"};

// The outputs of a constraint to the node that it turns, and its inputs from there.
inline constexpr std::string_view kTurningAttributes[] = {".cr",
                                                          ".crx",
                                                          ".cry",
                                                          ".crz",
                                                          ".cv",
                                                          ".constraintRotate",
                                                          ".constraintRotateX",
                                                          ".constraintRotateY",
                                                          ".constraintRotateZ",
                                                          ".constraintVector",
                                                          ".constraintVectorX",
                                                          ".constraintVectorY",
                                                          ".constraintVectorZ"};
inline constexpr std::string_view kFollowingAttributes[] = {".ct",
                                                            ".ctx",
                                                            ".cty",
                                                            ".ctz",
                                                            ".constraintTranslate",
                                                            ".constraintTranslateX",
                                                            ".constraintTranslateY",
                                                            ".constraintTranslateZ"};

// Attributes between which a connection has an effect come more often.
inline constexpr std::string_view kSourceAttributes[] = {
    ".o", ".output", ".o", ".t", ".r", ".cr", ".crx", ".constraintRotateY", ".cv", ".pim", "", ".w0"};
inline constexpr std::string_view kDestinationAttributes[] = {".tx",
                                                              ".ty",
                                                              ".tz",
                                                              ".rx",
                                                              ".ry",
                                                              ".rz",
                                                              ".sx",
                                                              ".sy",
                                                              ".sz",
                                                              ".fl",
                                                              ".focalLength",
                                                              ".translateX",
                                                              ".translateY",
                                                              ".translateZ",
                                                              ".rotateX",
                                                              ".rotateY",
                                                              ".rotateZ",
                                                              ".scaleX",
                                                              ".scaleY",
                                                              ".scaleZ",
                                                              ".ct",
                                                              ".ctx",
                                                              ".tg[0].tt",
                                                              ".target[0].targetTranslate",
                                                              ".target[0].targetWeight",
                                                              ".r",
                                                              ".t",
                                                              ""};

inline constexpr std::string_view kTripleAttributes[] = {".t",  ".translate",  ".r",  ".rotate",
                                                         ".s",  ".scale",      ".rp", ".rotatePivot",
                                                         ".sp", ".scalePivot", ".v",  ".T"};
inline constexpr std::string_view kCameraAttributes[] = {
    ".o",  ".orthographic", ".wci", ".worldCenterOfInterest", ".ff", ".filmFit",
    ".fl", ".focalLength",  ".cap", ".cameraAperture",        ".coi"};
inline constexpr std::string_view kKeyAttributes[] = {".ktv[0:3]",    ".ktv[0]", ".keyTimeValue", ".KTV[0]",
                                                      "curve.ktv[3]", ".tan",    ".ktv"};
inline constexpr std::string_view kRenderAttributes[] = {
    ".w", ".width", ".h", ".height", ".dar", ".deviceAspectRatio", ".pa", ".pixelAspect"};

inline constexpr std::string_view kUnits[] = {
    "-l mm",        "-l millimeter", "-l cm",   "-l centimeter", "-l m",    "-l meter",   "-l km",
    "-l kilometer", "-l in",         "-l inch", "-l ft",         "-l foot", "-l yd",      "-l yard",
    "-linear yd",   "-l mi",         "-l mile", "-a deg",        "-a rad",  "-a radian",  "-angle degree",
    "-t hour",      "-t min",        "-t sec",  "-t millisec",   "-t game", "-t film",    "-t pal",
    "-t ntsc",      "-t show",       "-t palf", "-time ntscf",   "-t 12",   "-t 29.97df", "-t 23.976fps",
    "-t 0",         "-t -5",         "-t 1e9",  "-x film",       "-l",
};

inline constexpr std::string_view kOptions[] = {"-n",     "-name", "-p", "-parent", "-s", "-type", "-k",
                                                "-k off", "-ne",   "-l", "-a",      "-t", "-size", "-N"};

inline constexpr std::string_view kNumbers[] = {
    "0",     "-0",         "1",          "2",           "-1",         "0.5",
    "10",    "24",         "90",         "180",         "360",        "-720",
    "1e-9",  "1e9",        "1e300",      "-1e300",      "1e308",      "1e-320",
    "1e400", "5.",         ".5",         "-.25",        "1e",         "1e-5000",
    "32767", "2147483647", "2147483648", "-2147483649", "4294967296", "9007199254740993",
    "1e22",  "35fps",      "0x10",       "--1",         "1.#QNAN",    "-",
    "1.2.3", "23.976",     "1.4173",     "720",         "486",        "1e15",
};

inline constexpr std::string_view kStrayTokens[] = {
    ";",           ";;",     ":",          "(",        ")",           "+",
    "-",           "\"",     "\"a\"",      "// c\n",   "/* c */",     "/***/",
    "/*",          "/",      "//",         "*",        "\\",          "\n",
    " ",           "\t",     "yes",        "double3",  "null",        "{",
    "\xff",        "-n",     "createNode", "setAttr",  "connectAttr", "select",
    "currentUnit", "parent", "file",       "requires", "addAttr",     "disconnectAttr",
};

}  // namespace fuzz
