// What the reader keeps of a scene: plain records, copied by value into and out of the host's lists.
//
// Names are NUL-terminated bytes, at most 255 of them, and are compared without regard to case. A reference
// to another record is its list index, -1 for none.
#pragma once

#include <cstddef>
#include <cstdint>
#include <type_traits>

#include "hostutil/RecordList.h"

namespace mayaimport {

inline constexpr std::size_t kNameCapacity = 256;
inline constexpr std::int32_t kNoIndex = -1;

// The slots of MAYA_Transform::curve: nine channels as three groups of three axes, then three links.
inline constexpr int kAxisCount = 3;
inline constexpr int kGroupCount = 3;
inline constexpr int kChannelCount = kGroupCount * kAxisCount;
enum ChannelGroup : std::int32_t { kTranslateGroup = 0, kRotateGroup = 1, kScaleGroup = 2 };
inline constexpr int kFollowedSlot = 9;      // the transform whose translate feeds the constraint
inline constexpr int kTargetSlot = 10;       // the transform that the constraint looks at
inline constexpr int kConstrainedSlot = 11;  // the transform that the constraint turns
inline constexpr int kCurveSlotCount = 12;

// A transform, or a constraint, which differs by its links alone.
struct MAYA_Transform {
  char name[kNameCapacity];
  char parent[kNameCapacity];
  double translate[kAxisCount];         // in the scene's linear unit
  double rotate[kAxisCount];            // in the scene's angle unit
  double scale[kAxisCount];             // default 1, 1, 1
  double rotatePivot[kAxisCount];       // in the scene's linear unit
  double scalePivot[kAxisCount];        // in the scene's linear unit
  std::int32_t curve[kCurveSlotCount];  // default -1; slots 0 to 8 index the curves, 9 to 11 the transforms
};

struct MAYA_Camera {
  char name[kNameCapacity];
  char parent[kNameCapacity];  // the camera's transform
  double cameraAperture[2];    // horizontal, vertical, in inches; default 1.4173, 0.9449
  double worldCenterOfInterest[3];
  double focalLength;             // in millimetres; default 35.0
  std::int32_t filmFit;           // 1 for a vertical fit, else 0
  std::uint8_t orthographic;      // 1 when set to "yes"
  std::int32_t focalLengthCurve;  // default -1
};

struct MAYA_Locator {
  char name[kNameCapacity];
  char parent[kNameCapacity];
};

struct MAYA_Key {
  double time;   // in the scene's time unit
  double value;  // in the unit of the channel that the curve drives
};

struct MAYA_AnimCurve {
  char name[kNameCapacity];
  char parent[kNameCapacity];
  RecordList* keys;  // of MAYA_Key, in file order; null until the first key is read. Owned by the one record
                     // that holds it.
};

// Every record begins with its name, so that a list can be searched without knowing its kind.
static_assert(offsetof(MAYA_Transform, name) == 0 && offsetof(MAYA_Camera, name) == 0 &&
              offsetof(MAYA_Locator, name) == 0 && offsetof(MAYA_AnimCurve, name) == 0);
static_assert(std::is_trivially_copyable_v<MAYA_Transform> && std::is_trivially_copyable_v<MAYA_Camera> &&
              std::is_trivially_copyable_v<MAYA_Locator> && std::is_trivially_copyable_v<MAYA_AnimCurve>);

// Records with the defaults of their kind.
MAYA_Transform DefaultTransform();
MAYA_Camera DefaultCamera();

// Which node "setAttr" applies to.
enum NodeKind : std::int32_t {
  kNoNode = 0,
  kTransformNode = 1,
  kCameraNode = 2,
  kCurveNode = 3,
  kRenderSettings = 4,
  kLocatorNode = 5,
};

}  // namespace mayaimport
