// From a scene to compositions: measures the scene, makes one composition or two, and then its layers. Reads
// the settings and the lists; calls the comp and layer suites.
#include "hostapi/CompSuite.h"
#include "hostapi/LayerSuite.h"
#include "hostutil/HostNumbers.h"
#include "maya/ListAccess.h"
#include "maya/MAYA_Parse.h"
#include "maya/Words.h"
#include "plugin/ErrorCodes.h"

namespace mayaimport {

namespace {

constexpr HostRatio kSquarePixels{1, 1};

// Deliberate: this name alone marks the default perspective camera, whatever its node is.
constexpr std::string_view kPerspectiveCamera = "perspShape";

UTF16Handle SquareName(const UTF16String* name) {
  UTF16String* word = nullptr;
  ThrowOnError(UTF16StringMakeFromBytes(LocalizedText(kSquareWord), &word));
  const UTF16Handle ownedWord(word);
  UTF16String* squareName = nullptr;
  ThrowOnError(UTF16StringFormat(LocalizedText(kSquareNamePattern), word, name, &squareName));
  return UTF16Handle(squareName);
}

// How wide an image is in square pixels.
std::int32_t SquareWidth(std::int32_t width, const HostRatio& pixelAspect) {
  const double scaled = static_cast<double>(width) * pixelAspect.numerator / pixelAspect.denominator;
  return TruncateToInt32(scaled + 0.5);
}

}  // namespace

void MAYA_Parse::MakeComp(VOR_Item* folder, const UTF16String* name) {
  if (cameras == nullptr) return;
  ResetOffset();
  VOR_CompItem* const comp = CreateCompositions(folder, name);

  const std::int64_t cameraCount = RecordCount(cameras);
  for (std::int64_t i = 0; i < cameraCount; ++i) {
    const auto camera = FetchRecord<MAYA_Camera>(cameras, i);
    if (camera.orthographic != 0 || SameWord(camera.name, kPerspectiveCamera)) continue;
    CreateCameraLayerAndKeyframes(comp, &camera);
  }
  const std::int64_t locatorCount = RecordCount(locators);
  for (std::int64_t i = 0; i < locatorCount; ++i) {
    const auto locator = FetchRecord<MAYA_Locator>(locators, i);
    CreateLocatorLayerAndKeyframes(comp, &locator);
  }
}

// Makes the composition that receives the layers: with square pixels the only one, else a square one that is
// nested in a second with the scene's own pixels.
VOR_CompItem* MAYA_Parse::CreateCompositions(VOR_Item* folder, const UTF16String* name) {
  const T_Time duration = FindLongestAnimation();
  const HostRatio pixelRatio = FindPixelAspectRatio();
  const HostRatio rate = FindFrameRate();
  const auto create = [&](const UTF16String* compName, std::int32_t width, const HostRatio& aspect) {
    VOR_CompItem* comp = nullptr;
    ThrowOnError(CompSuite21().CreateComp(folder, UTF16StringUnits(compName), width, resolutionHeight,
                                          &aspect, &duration, &rate, &comp));
    return comp;
  };

  std::int32_t order = 0;
  ThrowOnError(HostRatioCompare(&kSquarePixels, &pixelRatio, &order));
  if (order == 0) return create(name, resolutionWidth, pixelRatio);

  const UTF16Handle squareName = SquareName(name);
  VOR_CompItem* const square =
      create(squareName.get(), SquareWidth(resolutionWidth, pixelRatio), kSquarePixels);
  VOR_CompItem* const display = create(name, resolutionWidth, pixelRatio);
  VOR_Item* item = nullptr;
  ThrowOnError(CompSuite9().GetItemFromComp(square, &item));
  VOR_Layer* nested = nullptr;
  ThrowOnError(LayerSuite10().AddLayerFromItem(item, display, &nested));
  return square;
}

}  // namespace mayaimport
