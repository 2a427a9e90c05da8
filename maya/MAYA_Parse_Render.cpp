// "select", which makes the render settings current or leaves no current node, and "setAttr" on the render
// settings. Writes `currentKind`, `current`, the resolution and the aspects; calls no suite.
#include "hostutil/HostNumbers.h"
#include "maya/MAYA_Parse.h"
#include "maya/TokenText.h"
#include "maya/Words.h"

namespace mayaimport {

namespace {

constexpr std::string_view kRenderNode = "defaultResolution";

enum class RenderAttribute { Width, Height, DeviceAspect, PixelAspect, None };

struct RenderAttributeName {
  std::string_view shortName;
  std::string_view longName;
  RenderAttribute attribute;
};

constexpr RenderAttributeName kRenderAttributes[] = {
    {".w", ".width", RenderAttribute::Width},
    {".h", ".height", RenderAttribute::Height},
    {".dar", ".deviceAspectRatio", RenderAttribute::DeviceAspect},
    {".pa", ".pixelAspect", RenderAttribute::PixelAspect},
};

RenderAttribute FindRenderAttribute(std::string_view name) {
  for (const RenderAttributeName& known : kRenderAttributes) {
    if (SameWord(name, known.shortName) || SameWord(name, known.longName)) return known.attribute;
  }
  return RenderAttribute::None;
}

}  // namespace

void MAYA_Parse::ParseSelect() {
  const char* first = nullptr;
  const char* last = nullptr;
  bool matched = false;
  for (;;) {
    MayaToken kind = NextInCommand(&first, &last);
    if (kind == Option) continue;
    // Deliberate: after a colon only the render node has an effect. Any other token there, also ";", leaves
    // the current node as it is.
    const bool afterColon = kind == Colon;
    if (afterColon) kind = NextInCommand(&first, &last);
    if (kind == Identifier && SameWord(WordText(first, last), kRenderNode)) {
      ClearCurrent();
      currentKind = kRenderSettings;
      matched = true;
    } else if (!matched && !afterColon) {
      ClearCurrent();
    }
    if (kind == Semicolon) return;
  }
}

void MAYA_Parse::ParseRenderSetAttr() {
  const char* first = nullptr;
  const char* last = nullptr;
  for (MayaToken kind = Unknown; kind != Semicolon;) {
    kind = NextInCommand(&first, &last);
    if (kind != String) continue;
    const RenderAttribute attribute = FindRenderAttribute(QuotedText(first, last));
    if (attribute == RenderAttribute::None) continue;
    kind = NextInCommand(&first, &last);
    if (kind != Number) continue;
    const double value = ScanNumber(first, last);
    if (attribute == RenderAttribute::Width) resolutionWidth = TruncateToInt32(value);
    if (attribute == RenderAttribute::Height) resolutionHeight = TruncateToInt32(value);
    if (attribute == RenderAttribute::DeviceAspect) deviceAspectRatio = value;
    if (attribute == RenderAttribute::PixelAspect) pixelAspect = value;
  }
}

}  // namespace mayaimport
