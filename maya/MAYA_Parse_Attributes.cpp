// "setAttr" on transforms and cameras: reads one attribute into `current` and writes `current` back over the
// first record of its name. Calls no suite.
#include <algorithm>
#include <cmath>
#include <iterator>

#include "maya/ListAccess.h"
#include "maya/MAYA_Parse.h"
#include "maya/TokenText.h"
#include "maya/Words.h"

namespace mayaimport {

namespace {

// The triples of a transform.
struct TripleAttribute {
  std::string_view shortName;
  std::string_view longName;
  double (MAYA_Transform::*field)[kAxisCount];
  double start;  // of a component that the command does not give
};

constexpr TripleAttribute kTriples[] = {
    {".t", ".translate", &MAYA_Transform::translate, 0.0},
    {".r", ".rotate", &MAYA_Transform::rotate, 0.0},
    {".s", ".scale", &MAYA_Transform::scale, 1.0},
    {".rp", ".rotatePivot", &MAYA_Transform::rotatePivot, 0.0},
    {".sp", ".scalePivot", &MAYA_Transform::scalePivot, 0.0},
};

enum class CameraAttribute { Orthographic, CenterOfInterest, FilmFit, FocalLength, Aperture, None };

struct CameraAttributeName {
  std::string_view shortName;
  std::string_view longName;
  CameraAttribute attribute;
};

constexpr CameraAttributeName kCameraAttributes[] = {
    {".o", ".orthographic", CameraAttribute::Orthographic},
    {".wci", ".worldCenterOfInterest", CameraAttribute::CenterOfInterest},
    {".ff", ".filmFit", CameraAttribute::FilmFit},
    {".fl", ".focalLength", CameraAttribute::FocalLength},
    {".cap", ".cameraAperture", CameraAttribute::Aperture},
};

CameraAttribute FindCameraAttribute(std::string_view name) {
  for (const CameraAttributeName& known : kCameraAttributes) {
    if (SameWord(name, known.shortName) || SameWord(name, known.longName)) return known.attribute;
  }
  return CameraAttribute::None;
}

// The values of the film fit that the importer distinguishes.
constexpr double kHorizontalFit = 1.0;
constexpr double kVerticalFit = 2.0;

// Equal but for the last digits.
bool NearlyEqual(double a, double b) {
  constexpr double kRelative = 1e-12;
  constexpr double kAbsolute = 1.000088900582341e-12;
  const double larger = std::max(std::fabs(a), std::fabs(b));
  return std::fabs(a - b) < std::max(kRelative * larger, kAbsolute);
}

// Deliberate: only the vertical fit counts. Fill and overscan count as horizontal here.
std::int32_t FilmFitOf(double value) {
  if (NearlyEqual(value, kHorizontalFit)) return 0;
  return NearlyEqual(value, kVerticalFit) ? 1 : 0;
}

}  // namespace

// Copies the current node over the first record of its name.
//
// Deliberate: it is the first of the name that changes, also where the current node is a later one, and it is
// replaced whole, with the connections that it got since.
template <typename Record>
void MAYA_Parse::WriteBack(RecordList* list, const Record& record) {
  if (currentRecord_ == kNoIndex) return;
  ChangeRecord<Record>(list, currentRecord_, [&](Record& target) { target = record; });
}

void MAYA_Parse::ParseTransformSetAttr() {
  const char* first = nullptr;
  const char* last = nullptr;
  if (GetNextToken(&first, &last) != String) return;
  const std::string_view name = QuotedText(first, last);
  for (const TripleAttribute& triple : kTriples) {
    if (!SameWord(name, triple.shortName) && !SameWord(name, triple.longName)) continue;
    // Deliberate: a component that is missing takes its start value, not what the node had before.
    double values[kAxisCount] = {triple.start, triple.start, triple.start};
    ReadNumbers(values, kAxisCount);
    std::copy(std::begin(values), std::end(values), current.transform.*triple.field);
    WriteBack(transforms, current.transform);
    return;
  }
}

void MAYA_Parse::ParseCameraSetAttr() {
  const char* first = nullptr;
  const char* last = nullptr;
  MayaToken kind = GetNextToken(&first, &last);
  if (kind == Option) {
    // Deliberate: one option and the token after it are skipped, whatever that token is.
    GetNextToken(&first, &last);
    kind = GetNextToken(&first, &last);
  }
  if (kind != String) return;
  MAYA_Camera& camera = current.camera;
  double value = 0.0;
  bool given = false;
  switch (FindCameraAttribute(QuotedText(first, last))) {
    case CameraAttribute::Orthographic:
      given = ReadOrthographic();
      if (given) camera.orthographic = 1;
      break;
    case CameraAttribute::CenterOfInterest:
      given = ReadComponents(camera.worldCenterOfInterest);
      break;
    case CameraAttribute::FilmFit:
      given = ReadLastNumber(&value);
      if (given) camera.filmFit = FilmFitOf(value);
      break;
    case CameraAttribute::FocalLength:
      given = ReadLastNumber(&value);
      if (given) camera.focalLength = value;
      break;
    case CameraAttribute::Aperture:
      given = ReadComponents(camera.cameraAperture);
      break;
    case CameraAttribute::None:
      return;
  }
  // A command without a value writes nothing: the record may have got a connection or a parent since.
  if (given) WriteBack(cameras, camera);
}

// Reads on to the ";". Whether a word is "yes". Deliberate: only "yes" is looked at, so that a camera once
// set orthographic stays so.
bool MAYA_Parse::ReadOrthographic() {
  const char* first = nullptr;
  const char* last = nullptr;
  bool found = false;
  for (MayaToken kind = Unknown; kind != Semicolon;) {
    kind = NextInCommand(&first, &last);
    if (kind == Identifier && SameWord(WordText(first, last), "yes")) found = true;
  }
  return found;
}

// Reads on to the ";". The first numbers go to `values`; later ones are not converted, so they cannot fail.
// Returns how many were taken.
std::int64_t MAYA_Parse::ReadNumbers(double* values, std::int64_t capacity) {
  const char* first = nullptr;
  const char* last = nullptr;
  std::int64_t count = 0;
  for (MayaToken kind = String; kind != Semicolon;) {
    // Numbers begin after the attribute's name or its type.
    if (kind == String) count += ReadPlainNumbers(values + count, capacity - count);
    kind = NextInCommand(&first, &last);
    if (kind == Number && count < capacity) values[count++] = ScanNumber(first, last);
  }
  return count;
}

// The same for fields that are replaced as a whole, once there is a number: what is missing is 0. False when
// there was none.
template <std::size_t Count>
bool MAYA_Parse::ReadComponents(double (&field)[Count]) {
  double values[Count] = {};
  if (ReadNumbers(values, Count) == 0) return false;
  std::copy(std::begin(values), std::end(values), field);
  return true;
}

// Reads on to the ";". Every number is read and the last one stays. False when there was none.
bool MAYA_Parse::ReadLastNumber(double* value) {
  const char* first = nullptr;
  const char* last = nullptr;
  bool found = false;
  for (MayaToken kind = Unknown; kind != Semicolon;) {
    kind = NextInCommand(&first, &last);
    if (kind != Number) continue;
    *value = ScanNumber(first, last);
    found = true;
  }
  return found;
}

}  // namespace mayaimport
