#include "tools/mayascene/ClosingLine.h"

#include <algorithm>
#include <cstdio>
#include <new>

#include "hostapi/ErrorCodes.h"
#include "hostapi/LayerStreams.h"
#include "scene/Scene.h"
#include "tools/mayascene/SceneText.h"
#include "tools/mayascene/TerminalText.h"

namespace mayascene {
namespace {

using refhost::Layer;
using refhost::LayerKind;

std::optional<bake::Stop> stopOf(const refhost::CallbackResult& result) {
  if (result.code == HOST_ERR_MAYA_KEY_COUNTS) return bake::Stop::kKeyCounts;
  if (result.line == 0) return std::nullopt;
  switch (result.code) {
    case HOST_ERR_MAYA_SYNTAX:
      return bake::Stop::kByte;
    case HOST_ERR_MAYA_UNEXPECTED_END:
      return bake::Stop::kEnd;
    case HOST_ERR_NUMBER_SYNTAX:
    case HOST_ERR_NUMBER_RANGE:
      return bake::Stop::kNumber;
    default:
      return std::nullopt;
  }
}

std::size_t keysOf(const Layer& layer, std::int32_t stream) {
  const refhost::Stream* found = layer.findStream(stream);
  return found == nullptr ? 0 : found->keyCount();
}

bake::CameOver::Camera cameraOf(const Layer& layer) {
  bake::CameOver::Camera camera{.name = layer.name,
                                .keys = keysOf(layer, HOST_STREAM_POSITION),
                                .zoomKeys = keysOf(layer, HOST_STREAM_ZOOM),
                                .aimed = layer.aimed,
                                .above = {}};
  for (const Layer* above = layer.parent; above != nullptr; above = above->parent) {
    camera.above.push_back({above->name, keysOf(*above, HOST_STREAM_POSITION)});
  }
  return camera;
}

double quotientOf(const HostRatio& ratio) {
  return ratio.denominator == 0 ? 0.0 : static_cast<double>(ratio.numerator) / ratio.denominator;
}

bake::CameOver cameOver(const refhost::Folder& folder) {
  bake::CameOver import;
  for (const refhost::Composition* composition : folder.compositions) {
    import.width = composition->width;  // where there are two, the second one is the picture
    import.height = composition->height;
    import.pixelAspect = quotientOf(composition->pixelAspect);
    import.framesPerSecond = quotientOf(composition->frameRate);
    for (const Layer* layer : composition->layers) {
      if (layer->kind == LayerKind::Composition) continue;
      ++import.layers;
      if (layer->kind == LayerKind::Camera) import.cameras.push_back(cameraOf(*layer));
    }
  }
  return import;
}

// Empty where there is none.
std::string_view lastLayer(const refhost::Folder* folder) {
  const Layer* last = nullptr;
  if (folder == nullptr) return {};
  for (const refhost::Composition* composition : folder->compositions) {
    for (const Layer* layer : composition->layers) {
      if (layer->kind == LayerKind::Composition) continue;
      if (last == nullptr || layer->number > last->number) last = layer;
    }
  }
  return last == nullptr ? std::string_view() : std::string_view(last->name);
}

std::string commandOf(const std::string& path, const BakingCommand& command) {
  return command.before + ' ' + shellWord(path) + command.after;
}

// Whether there was nothing to say.
bool say(const SceneReport& report, const BakingCommand& command, Diagnostics& diagnostics) {
  std::string failure;
  const auto text = SceneText::open(report.path, &failure);
  if (text == nullptr) return true;
  diag::Collector collector(text->text());
  const scene::Scene scene = scene::Read(text->text(), collector);
  const auto loss = lossOf(report.result, scene, &collector);
  if (!loss) return true;
  std::string line = loss->sentence;
  if (loss->place)
    line.insert(0, "line " + std::to_string(collector.lines().At(loss->place->offset).line) + ": ");
  if (loss->comesWithBake) line += ". To bring it over: " + commandOf(report.path, command);
  diagnostics.close(report.path, line);
  return false;
}

}  // namespace

std::optional<bake::Loss> lossOf(const refhost::CallbackResult& result, const scene::Scene& scene,
                                 diag::Collector* collector) {
  if (const auto stop = stopOf(result)) {
    return bake::FindStop(scene, collector, *stop, static_cast<std::uint32_t>(result.line),
                          lastLayer(result.folder));
  }
  return bake::FindLoss(scene, result.folder == nullptr ? bake::CameOver() : cameOver(*result.folder));
}

bool closeWithLoss(const SceneReport& report, bool quiet, const BakingCommand& command,
                   Diagnostics& diagnostics) {
  const bool stopped = report.outcome == Outcome::Failed && stopOf(report.result).has_value();
  const bool ended = report.outcome == Outcome::Imported || report.outcome == Outcome::Nothing;
  if (!stopped && (quiet || !ended)) return true;
  try {
    return say(report, command, diagnostics);
  } catch (const std::bad_alloc&) {
    // The import is over and keeps its status. Only this line is missing.
    return false;
  }
}

std::string shellWord(std::string_view bytes) {
  constexpr std::string_view kPlain =
      "abcdefghijklmnopqrstuvwxyzABCDEFGHIJKLMNOPQRSTUVWXYZ0123456789_-./,:@%+=";
  const std::string word = (bytes.starts_with('-') ? "./" : "") + std::string(bytes);
  if (word.find_first_not_of(kPlain) == std::string::npos) return word;
  if (terminalText(word) == word && word.find('\'') == std::string::npos) return '\'' + word + '\'';
  std::string escaped = "$'";
  for (const char c : word) {
    const bool printable = c >= ' ' && c <= '~' && c != '\'' && c != '\\';
    if (printable) {
      escaped += c;
      continue;
    }
    char text[8];
    (void)std::snprintf(text, sizeof text, "\\x%02x", static_cast<unsigned>(static_cast<unsigned char>(c)));
    escaped += text;
  }
  return escaped + '\'';
}

}  // namespace mayascene
