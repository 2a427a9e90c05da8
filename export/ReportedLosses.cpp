#include "export/ReportedLosses.h"

#include <vector>

#include "export/Variation.h"
#include "text/Utf8.h"

namespace interchange {
namespace {

// Whether the layer or one above it is scaled unevenly. Each layer is examined once.
class UnevenScale {
 public:
  explicit UnevenScale(const Composition& composition)
      : composition_(composition), known_(composition.layers.size(), Known::No) {}

  bool IsOver(std::size_t layer) {
    std::vector<std::size_t> way;
    std::optional<std::size_t> at = layer;
    bool uneven = false;
    for (; at && known_[*at] == Known::No; at = composition_.layers[*at].parent) way.push_back(*at);
    if (at) uneven = known_[*at] == Known::Uneven;
    for (; !way.empty(); way.pop_back()) {
      uneven = uneven || IsScaledUnevenly(composition_.layers[way.back()], composition_.frames);
      known_[way.back()] = uneven ? Known::Uneven : Known::Even;
    }
    return uneven;
  }

 private:
  enum class Known : unsigned char { No, Even, Uneven };

  const Composition& composition_;
  std::vector<Known> known_;
};

}  // namespace

void ReportCommonLosses(const Composition& composition, std::string_view format,
                        diag::Collector* diagnostics) {
  UnevenScale scale(composition);
  for (std::size_t index = 0; index < composition.layers.size(); ++index) {
    const Layer& layer = composition.layers[index];
    if (!text::IsUtf8(layer.name)) diagnostics->Report(diag::Code::ExportNameReplaced, {}, {layer.name});
    if (layer.kind == LayerKind::Camera && scale.IsOver(index)) {
      diagnostics->Report(diag::Code::ExportCameraScaled, {}, {layer.name, format});
    }
  }
}

void ReportLostScales(const Composition& composition, diag::Collector* diagnostics) {
  UnevenScale scale(composition);
  for (std::size_t index = 0; index < composition.layers.size(); ++index) {
    const Layer& layer = composition.layers[index];
    if (layer.kind == LayerKind::Camera && scale.IsOver(index)) {
      diagnostics->Report(diag::Code::ExportPartLost, {}, {layer.name, "its uneven scale"});
    }
  }
}

void ReportLostExtras(const Composition& composition, diag::Collector* diagnostics) {
  if (composition.pixelAspect != 1.0) {
    diagnostics->Report(diag::Code::ExportPartLost, {}, {composition.name, "the pixel aspect"});
  }
  for (const Layer& layer : composition.layers) {
    if (!layer.lens) continue;
    if (layer.lens->filmOffsetX || layer.lens->filmOffsetY) {
      diagnostics->Report(diag::Code::ExportPartLost, {}, {layer.name, "the film offset"});
    }
    if (layer.lens->squeeze) {
      diagnostics->Report(diag::Code::ExportPartLost, {}, {layer.name, "the lens squeeze"});
    }
  }
}

}  // namespace interchange
