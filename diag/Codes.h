// The codes of all diagnostics, and what the one table says about each.
//
// A code's number is its name: Code::OpenString is 101, shown as MA0101. Numbers are given once and are never
// used again. They go by topic:
//   100  reading the text            400  what drives a channel
//   200  nodes, names, units         500  cameras and locators
//   300  curves                      600  what a bake writes
//   700  what stops an import        800  what does not come over
//   900  where the picture differs   1000 what keeps a check from its end
//   1100 what an export cannot say
#pragma once

#include <cstdint>
#include <span>
#include <string>
#include <string_view>

namespace diag {

enum class Code : std::uint16_t {
  // Reading the text: diag/ReadingCodes.cpp
  OpenString = 101,
  OpenComment = 102,
  CommandCutOff = 103,
  CommandWithoutEnd = 104,
  ConflictMark = 105,
  TemplateField = 106,
  UnexpectedByte = 107,
  IncompleteCommand = 108,
  UnreadableValue = 109,
  TextTooLong = 110,
  // Nodes, names, units: diag/NodeCodes.cpp
  NoCurrentNode = 201,
  NameTaken = 202,
  AmbiguousName = 203,
  ParentMissing = 204,
  ParentInReference = 205,
  ParentCircle = 206,
  UnknownNode = 207,
  AlreadyConnected = 208,
  UnknownUnit = 209,
  SecondUnit = 210,
  ReferenceNotRead = 211,
  SameNames = 212,
  NamesDifferInCase = 213,
  NameTooLong = 214,
  NodeWithoutName = 215,
  TextAfterNul = 216,
  // Curves: diag/CurveCodes.cpp
  UnknownTangentType = 301,
  StepIntoKey = 302,
  AutoMixTangent = 303,
  FixedWithoutTangent = 304,
  EmptyFixedTangent = 305,
  UnknownInfinity = 306,
  InfinityOfOneKey = 307,
  LinearInfinityAtLinearKey = 308,
  PlateauBesideOvershoot = 309,
  QuaternionCurve = 310,
  KeysByComponent = 311,
  // What drives a channel: diag/DriverCodes.cpp
  UnsupportedDriver = 401,
  DriverWithoutAnswer = 402,
  DriverCircle = 403,
  SeveralTargets = 404,
  TwistSign = 405,
  StereoRig = 406,
  // Cameras and locators: diag/CameraCodes.cpp
  CameraNotFound = 501,
  FilmOffsetLost = 502,
  LensSqueezeInAperture = 503,
  PictureEffectLost = 504,
  CameraMirrored = 505,
  CameraSheared = 506,
  CameraWithoutLens = 507,
  CameraNotFinite = 508,
  NullSheared = 509,
  NullNotFinite = 510,
  LocatorsLeftOut = 511,
  CameraUneven = 512,
  // What a bake writes: diag/BakeCodes.cpp
  NoCamera = 601,
  TooManyFrames = 602,
  ClockTimeUnit = 603,
  CameraInWorldSpace = 604,
  // What stops an import: diag/StopCodes.cpp
  ImportStopped = 701,
  NotMayaAscii = 702,
  MayaBinary = 703,
  CompressedFile = 704,
  EmptyFile = 705,
  MarkBeforeHeader = 706,
  UnquotedPath = 711,
  AliasList = 712,
  ConflictMarkStops = 713,
  TemplateFieldStops = 714,
  RefusedByte = 715,
  LastCommentOpen = 716,
  CutOffInString = 717,
  CutOffInComment = 718,
  CutOffInCommand = 719,
  UnequalKeys = 720,
  NumberTooLarge = 721,
  NumberUnreadable = 722,
  // What does not come over: diag/LossCodes.cpp
  OrthographicCamera = 801,
  StartupCameras = 802,
  CameraNotImported = 803,
  ParentIsPath = 804,
  ParentNotImported = 805,
  ChannelsOfOneKey = 806,
  DrivenByNoCurve = 807,
  CurveThroughNode = 808,
  ConnectionToPath = 809,
  FocalLengthElsewhere = 810,
  LookAtShortNames = 811,
  LookAtWeightLast = 812,
  LookAtNotTaken = 813,
  AttributesWithoutPlace = 814,
  OrthographicAsPerspective = 815,
  ParentElsewhere = 816,
  StoredValueSkipped = 817,
  LocatorsWithoutCamera = 821,
  NoCameraToImport = 822,
  TargetLosesItsChain = 823,
  ParentByCommand = 824,
  // Where the picture differs: diag/PictureCodes.cpp
  PictureShifts = 901,
  KeysAreNoBake = 902,
  RotateOrderLost = 903,
  RotateAxisLost = 904,
  ShearLost = 905,
  PivotTranslationLost = 906,
  InheritanceOff = 907,
  FitDiffers = 908,
  LensSqueezeLost = 909,
  CameraScaleLost = 910,
  ChainScaled = 911,
  PictureSizeAssumed = 912,
  KeysStartApart = 913,
  OtherLengthUnit = 914,
  BeyondCompositionTime = 915,
  NegativeFrames = 916,
  FractionalFrames = 917,
  RateDiffers = 918,
  ShiftNotMeasured = 919,
  ApertureMotionLost = 920,
  FitMotionLost = 921,
  InfinityLost = 922,
  OffsetMatrixLost = 923,
  LimitLost = 924,
  RadiansLost = 925,
  KeysAtOneTime = 926,
  AimedPivotLost = 927,
  LookAtTurnLost = 928,
  // What keeps a check from its end: diag/ProcessCodes.cpp
  CheckTimedOut = 1001,
  CheckBrokeOff = 1002,
  CheckOutOfMemory = 1003,
  ReportTooLarge = 1004,
  CheckNotStarted = 1005,
  // What an export cannot say: diag/ExportCodes.cpp
  ExportNotFinite = 1101,
  ExportPictureUnusable = 1102,
  ExportLensUnusable = 1103,
  ExportParentCircle = 1104,
  ExportNumberTooLarge = 1105,
  ExportTooManyFrames = 1106,
  ExportKeysBetweenFrames = 1107,
  ExportNullsLeftOut = 1108,
  ExportWithoutCamera = 1109,
  ExportNameReplaced = 1110,
  ExportCameraScaled = 1111,
  ExportTimesShifted = 1112,
  ExportTimesTooFine = 1113,
  ExportZoomByExtension = 1114,
  ExportFileTooLarge = 1115,
  ExportDownAxisLost = 1116,
  ExportNoKeysInFrames = 1117,
  ExportNothingKeyed = 1118,
  ExportRotationOrder = 1121,
  ExportPartLost = 1122,
  ExportFramesRounded = 1123,
  ExportFramesHeld = 1124,
};

// Ordered: a later one is worse.
enum class Severity : std::uint8_t { Note, Warning, Error };

// One row of the table. Texts are static and in plain English.
struct Entry {
  Code code;
  Severity severity;
  std::string_view symbol;    // the code's name as it is written above
  std::string_view sentence;  // what is so; {0}, {1} … stand for the arguments
  std::string_view meaning;   // what it means, for the page
  std::string_view example;   // lines of a scene, or a command, that cause it; may be empty
  std::string_view help;      // what to do, in a compositor's words; may have the sentence's placeholders
};

// All rows, in the order of their numbers. Lives as long as the program.
std::span<const Entry> Table();

// The row of a code. Every code has one.
const Entry& EntryOf(Code code);

// How many arguments a row's texts have: one more than the largest placeholder.
std::size_t ArgumentCount(const Entry& entry);

// "MA0101"
std::string NameOf(Code code);

// "note", "warning", "error"
std::string_view NameOf(Severity severity);

}  // namespace diag
