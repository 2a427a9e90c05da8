// "createNode": reads the node's type and names, appends a record with the defaults of its kind and makes it
// current. Writes the four lists, `currentKind` and `current`; calls no suite.
#include <cstring>

#include "maya/ListAccess.h"
#include "maya/MAYA_Parse.h"
#include "maya/TokenText.h"
#include "maya/Words.h"

namespace mayaimport {

namespace {

struct NodeType {
  std::string_view name;
  void (MAYA_Parse::*parse)();
};

constexpr NodeType kNodeTypes[] = {
    {"transform", &MAYA_Parse::ParseCreateTransformNode},
    {"stereoRigTransform", &MAYA_Parse::ParseCreateTransformNode},
    {"lookAt", &MAYA_Parse::ParseCreateLookAtNode},
    {"aimConstraint", &MAYA_Parse::ParseCreateLookAtNode},
    {"locator", &MAYA_Parse::ParseCreateLocatorNode},
    {"camera", &MAYA_Parse::ParseCreateCameraNode},
    {"stereoRigCamera", &MAYA_Parse::ParseCreateCameraNode},
    {"animCurveTL", &MAYA_Parse::ParseCreateAnimNode},
    {"animCurveTA", &MAYA_Parse::ParseCreateAnimNode},
    {"animCurveTU", &MAYA_Parse::ParseCreateAnimNode},
};

constexpr std::string_view kNameOptions[] = {"-n", "-name"};
constexpr std::string_view kParentOptions[] = {"-p", "-parent"};

}  // namespace

void MAYA_Parse::ParseCreateNode() {
  const char* first = nullptr;
  const char* last = nullptr;
  // Deliberate: a type that is no plain word leaves the current node as it is, so that the attributes which
  // follow still go to the node before.
  if (GetNextToken(&first, &last) != Identifier) return;
  const std::string_view type = WordText(first, last);
  for (const NodeType& known : kNodeTypes) {
    if (SameWord(type, known.name)) return (this->*known.parse)();
  }
  ClearCurrent();
}

void MAYA_Parse::ParseCreateTransformNode() {
  CreateNodeRecord(DefaultTransform(), kTransformNode, &transforms, &transformNames_);
}

// A constraint is a transform that differs by its connections alone.
void MAYA_Parse::ParseCreateLookAtNode() { ParseCreateTransformNode(); }

void MAYA_Parse::ParseCreateCameraNode() {
  CreateNodeRecord(DefaultCamera(), kCameraNode, &cameras, &cameraNames_);
}

void MAYA_Parse::ParseCreateAnimNode() {
  CreateNodeRecord(MAYA_AnimCurve{}, kCurveNode, &curves, &curveNames_);
}

void MAYA_Parse::ParseCreateLocatorNode() {
  CreateNodeRecord(MAYA_Locator{}, kLocatorNode, &locators, nullptr);
}

// Reads the rest of the command. `names` is null for a kind that is never looked up.
template <typename Record>
void MAYA_Parse::CreateNodeRecord(Record record, NodeKind kind, RecordList** list, NameIndex* names) {
  for (bool ended = false; !ended;) {
    const char* first = nullptr;
    const char* last = nullptr;
    switch (NextInCommand(&first, &last)) {
      case Option: {
        const std::string_view option = WordText(first, last);
        if (IsOneOf(option, kNameOptions)) {
          ended = TakeName(record.name);
        } else if (IsOneOf(option, kParentOptions)) {
          ended = TakeName(record.parent);
        }
        break;
      }
      case Semicolon:
        ended = true;
        break;
      default:
        break;
    }
  }
  AppendRecord(list, record);
  const auto index = static_cast<std::int32_t>(RecordCount(*list) - 1);
  DisposeLooseKeys();
  currentKind = kind;
  currentRecord_ = kNoIndex;
  std::memcpy(static_cast<void*>(&current), &record, sizeof record);
  if (names != nullptr) currentRecord_ = names->Append(index, record.name);
}

// Takes the next token as a name if it is a string, else drops it. True when it was the command's ";".
bool MAYA_Parse::TakeName(char (&name)[kNameCapacity]) {
  const char* first = nullptr;
  const char* last = nullptr;
  const MayaToken kind = NextInCommand(&first, &last);
  if (kind == String) {
    if (name[0] != '\0') std::memset(name, 0, sizeof name);  // a field holds zeros after its text
    std::int32_t length = 0;
    BuildQuote(first, last, &length, name);
  }
  return kind == Semicolon;
}

}  // namespace mayaimport
