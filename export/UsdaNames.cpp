// The rules of USD for names and lenses.
#include <algorithm>
#include <cstdint>
#include <limits>

#include "export/SafeNames.h"
#include "export/UsdaInternal.h"
#include "text/Utf8.h"

namespace interchange {
namespace {

bool IsLetter(char c) { return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z') || c == '_'; }
bool IsDigit(char c) { return c >= '0' && c <= '9'; }

std::string PrimName(std::string_view name, std::string_view otherwise) {
  std::string prim(name.substr(0, kLongestSafeName));
  std::replace_if(
      prim.begin(), prim.end(), [](char c) { return !IsLetter(c) && !IsDigit(c); }, '_');
  if (prim.find_first_not_of('_') == std::string::npos) return std::string(otherwise);
  if (IsDigit(prim.front())) prim.insert(0, 1, '_');
  return prim;
}

bool IsFloat(double number) {
  return number >= std::numeric_limits<float>::min() && number <= std::numeric_limits<float>::max();
}

bool IsOffset(const std::optional<double>& inches, double unit) {
  constexpr double kMost = std::numeric_limits<float>::max() / 100.0;
  return !inches || (*inches / unit <= kMost && *inches / unit >= -kMost);
}

}  // namespace

PrimNames::PrimNames(const Composition& composition) {
  UniqueNames names;
  for (const Layer& layer : composition.layers) {
    layers_.push_back(names.Take(PrimName(layer.name, layer.kind == LayerKind::Camera ? "camera" : "null")));
  }
  root_ = names.Take(PrimName(composition.name, "composition"));
  lenses_.resize(layers_.size());
  for (std::size_t index = 0; index < layers_.size(); ++index) {
    if (composition.layers[index].kind == LayerKind::Camera)
      lenses_[index] = names.Take(layers_[index] + "_lens");
  }
}

std::string UsdaText(std::string_view bytes) {
  constexpr char kDigits[] = "0123456789abcdef";
  constexpr char kDelete = 0x7f;
  std::string text = "\"";
  for (const char c : text::ValidUtf8(bytes)) {
    if (c == '\0') {
      text += "\xef\xbf\xbd";  // readers end a string there
    } else if (c == '\n') {
      text += "\\n";
    } else if (c == '"' || c == '\\') {
      text += '\\';
      text += c;
    } else if ((c > 0 && c < ' ') || c == kDelete) {
      const auto byte = static_cast<std::uint8_t>(c);
      text += "\\x";
      text += kDigits[byte >> 4];
      text += kDigits[byte & 0xf];
    } else {
      text += c;
    }
  }
  return text += '"';
}

bool IsLensOfFloats(const Composition& composition, const Lens& lens) {
  if (!IsFloat(HorizontalAperture(composition, lens)) || !IsFloat(VerticalAperture(composition, lens)))
    return false;
  if (!IsOffset(lens.filmOffsetX, composition.metersPerUnit)) return false;
  if (!IsOffset(lens.filmOffsetY, composition.metersPerUnit)) return false;
  for (std::size_t frame = 0; frame < (lens.zoom.moves() ? composition.frames : 1); ++frame) {
    if (!IsFloat(FocalLength(composition, lens, frame))) return false;
  }
  return true;
}

}  // namespace interchange
