// Runs the reader on arbitrary bytes: its records are whole, its errors documented, and it gives everything
// back.
#include <cmath>
#include <cstdint>
#include <cstring>
#include <string_view>

#include "fuzz/Bytes.h"
#include "fuzz/ReaderHost.h"
#include "fuzz/Require.h"
#include "fuzz/Target.h"
#include "hostapi/ErrorCodes.h"
#include "maya/MAYA_Parse.h"
#include "tests/support/GuardedMemory.h"

using namespace mayaimport;

namespace {

using fuzz::Require;

template <typename Record>
const Record* RecordAt(const RecordList* list, std::int64_t index) {
  return list != nullptr ? static_cast<const Record*>(RecordListPeek(list, index)) : nullptr;
}

std::int64_t CountOf(const RecordList* list) {
  std::int64_t count = 0;
  if (list != nullptr) Require(RecordListCount(list, &count) == HOST_ERR_NONE, "a list can be counted");
  return count;
}

template <typename Record, typename Visit>
void ForEach(const RecordList* list, Visit visit) {
  const std::int64_t count = CountOf(list);
  for (std::int64_t i = 0; i < count; ++i) visit(*RecordAt<Record>(list, i), i);
}

int Read(MAYA_Parse& parser) {
  try {
    parser.Parse();
    return HOST_ERR_NONE;
  } catch (int code) {
    return code;
  }
}

void CheckOutcome(int code, int messages) {
  switch (code) {
    case HOST_ERR_MAYA_SYNTAX:
    case HOST_ERR_MAYA_UNEXPECTED_END:
      return Require(messages == 1, "an error of the text has one message");
    case HOST_ERR_NONE:
    case HOST_ERR_NUMBER_SYNTAX:
    case HOST_ERR_NUMBER_RANGE:
      return Require(messages == 0, "no message comes without an error of the text");
    default:
      Require(false, "an error is a documented one");
  }
}

void CheckName(const char (&name)[kNameCapacity]) {
  Require(std::memchr(name, '\0', kNameCapacity) != nullptr, "a name ends within its field");
}

template <std::size_t Count>
void CheckFinite(const double (&values)[Count]) {
  for (const double value : values) Require(std::isfinite(value), "every number of a scene is finite");
}

void CheckLink(std::int32_t index, const RecordList* list) {
  Require(index >= kNoIndex && index < CountOf(list), "a link leads to a record");
}

void CheckTransforms(const MAYA_Parse& scene) {
  ForEach<MAYA_Transform>(scene.transforms, [&](const MAYA_Transform& node, std::int64_t) {
    CheckName(node.name);
    CheckName(node.parent);
    CheckFinite(node.translate);
    CheckFinite(node.rotate);
    CheckFinite(node.scale);
    CheckFinite(node.rotatePivot);
    CheckFinite(node.scalePivot);
    for (int slot = 0; slot < kCurveSlotCount; ++slot)
      CheckLink(node.curve[slot], slot < kChannelCount ? scene.curves : scene.transforms);
  });
}

void CheckScene(const MAYA_Parse& scene) {
  CheckTransforms(scene);
  ForEach<MAYA_Camera>(scene.cameras, [&](const MAYA_Camera& camera, std::int64_t) {
    CheckName(camera.name);
    CheckName(camera.parent);
    CheckFinite(camera.cameraAperture);
    CheckFinite(camera.worldCenterOfInterest);
    Require(std::isfinite(camera.focalLength), "a focal length is finite");
    CheckLink(camera.focalLengthCurve, scene.curves);
  });
  ForEach<MAYA_Locator>(scene.locators, [](const MAYA_Locator& locator, std::int64_t) {
    CheckName(locator.name);
    CheckName(locator.parent);
  });
  ForEach<MAYA_AnimCurve>(scene.curves, [](const MAYA_AnimCurve& curve, std::int64_t) {
    CheckName(curve.name);
    ForEach<MAYA_Key>(curve.keys, [](const MAYA_Key& key, std::int64_t) {
      Require(std::isfinite(key.time) && std::isfinite(key.value), "every key is finite");
    });
  });
}

}  // namespace

int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  static testsupport::GuardedMemory memory;
  const char* const text = memory.Hold(fuzz::TextOf(data, size), 1);
  const fuzz::ReaderHost host;
  MAYA_Parse scene(host.basicSuite(), text, text + size);
  const int code = Read(scene);
  CheckOutcome(code, host.messages());
  Require(scene.line >= 0 && scene.line <= static_cast<std::int64_t>(size), "the line is one of the text");
  CheckScene(scene);
  return 0;
}
