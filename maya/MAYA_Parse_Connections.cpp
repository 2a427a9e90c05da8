// "connectAttr": which curve drives which channel, and how a constraint is wired. Writes the index slots of
// the records in their lists; calls no suite.
#include "maya/ListAccess.h"
#include "maya/MAYA_Parse.h"
#include "maya/TokenText.h"
#include "maya/Words.h"

namespace mayaimport {

namespace {

constexpr std::string_view kOutputs[] = {"output", "o"};

// By channel slot.
struct ChannelName {
  std::string_view shortName;
  std::string_view longName;
};
constexpr ChannelName kChannels[kChannelCount] = {
    {"tx", "translateX"}, {"ty", "translateY"}, {"tz", "translateZ"}, {"rx", "rotateX"}, {"ry", "rotateY"},
    {"rz", "rotateZ"},    {"sx", "scaleX"},     {"sy", "scaleY"},     {"sz", "scaleZ"},
};

// The outputs by which a constraint turns its object. Deliberate: the axes of the constraint vector have no
// short names of their own; "crx", "cry" and "crz" serve them too, and "cvx" means nothing.
constexpr std::string_view kTurningOutputs[] = {
    "constraintRotate",  "cr",  "constraintRotateX", "crx", "constraintRotateY", "cry",
    "constraintRotateZ", "crz", "constraintVector",  "cv",  "constraintVectorX", "constraintVectorY",
    "constraintVectorZ",
};

constexpr std::string_view kFollowingInputs[] = {
    "constraintTranslate",  "ct",  "constraintTranslateX", "ctx",
    "constraintTranslateY", "cty", "constraintTranslateZ", "ctz",
};

constexpr std::string_view kFocalLengthInputs[] = {"fl", "focalLength"};

}  // namespace

void MAYA_Parse::ParseConnectAttr() {
  const char* first = nullptr;
  const char* last = nullptr;
  std::string_view source;
  std::string_view destination;
  scout_.LookAhead(position, end(), curveNames_, transformNames_);
  for (MayaToken kind = Unknown; kind != Semicolon;) {
    kind = NextInCommand(&first, &last);
    if (kind != String) continue;
    source = QuotedText(first, last);
    kind = NextInCommand(&first, &last);
    if (kind == String) destination = QuotedText(first, last);
  }
  const std::size_t sourceDot = source.find('.');
  const std::size_t destinationDot = destination.find('.');
  if (sourceDot == std::string_view::npos || destinationDot == std::string_view::npos) return;
  MakeConnection(source, sourceDot, destination, destinationDot);
}

void MAYA_Parse::MakeConnection(std::string_view source, std::size_t sourceDot, std::string_view destination,
                                std::size_t destinationDot) {
  const std::string_view sourceAttribute = source.substr(sourceDot + 1);
  const std::string_view attribute = destination.substr(destinationDot + 1);
  const std::int32_t curve = curveNames_.Find(source.substr(0, sourceDot));
  const bool fromCurve = curve != kNoIndex;
  if (fromCurve && !IsOneOf(sourceAttribute, kOutputs)) return;

  const std::string_view destinationNode = destination.substr(0, destinationDot);
  const std::int32_t transform = transformNames_.Find(destinationNode);
  if (transform != kNoIndex) {
    if (fromCurve) return ConnectCurve(curve, transform, attribute);
    const std::int32_t sourceTransform = transformNames_.Find(source.substr(0, sourceDot));
    if (sourceTransform == kNoIndex) return;
    return ConnectTransforms(sourceTransform, sourceAttribute, transform, attribute);
  }
  if (!fromCurve || !IsOneOf(attribute, kFocalLengthInputs)) return;
  const std::int32_t camera = cameraNames_.Find(destinationNode);
  if (camera == kNoIndex) return;
  ChangeRecord<MAYA_Camera>(cameras, camera, [&](MAYA_Camera& record) { record.focalLengthCurve = curve; });
}

void MAYA_Parse::ConnectCurve(std::int32_t curve, std::int32_t transform, std::string_view attribute) {
  for (int slot = 0; slot < kChannelCount; ++slot) {
    if (SameWord(attribute, kChannels[slot].shortName) || SameWord(attribute, kChannels[slot].longName)) {
      return SetLink(transform, slot, curve);
    }
  }
}

void MAYA_Parse::ConnectTransforms(std::int32_t source, std::string_view sourceAttribute,
                                   std::int32_t destination, std::string_view attribute) {
  if (IsOneOf(sourceAttribute, kTurningOutputs)) {
    SetLink(source, kConstrainedSlot, destination);
  } else if (IsOneOf(attribute, kFollowingInputs)) {
    SetLink(destination, kFollowedSlot, source);
  } else if (attribute.find("target") != std::string_view::npos) {
    // Deliberate: "target" anywhere, with its case. The short form "tg[0].tt" is no target, and a weight that
    // the constraint wires to its own "target[0].targetWeight" makes the constraint its own target.
    SetLink(destination, kTargetSlot, source);
  }
}

// Deliberate: only the record in the list changes. A later "setAttr" on the node that is current writes its
// older copy back and clears the connection again.
void MAYA_Parse::SetLink(std::int32_t transform, int slot, std::int32_t index) {
  ChangeRecord<MAYA_Transform>(transforms, transform,
                               [&](MAYA_Transform& record) { record.curve[slot] = index; });
}

}  // namespace mayaimport
