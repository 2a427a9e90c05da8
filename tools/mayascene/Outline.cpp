#include "tools/mayascene/Outline.h"

#include <fmt/format.h>

#include <algorithm>
#include <cstddef>
#include <string>
#include <string_view>
#include <unordered_map>
#include <vector>

#include "hostapi/CameraSuite.h"
#include "hostapi/LayerStreams.h"
#include "tools/mayascene/LayerSummary.h"
#include "tools/mayascene/Quantities.h"
#include "tools/mayascene/StreamWords.h"

namespace mayascene {
namespace {

using refhost::Composition;
using refhost::Layer;
using refhost::LayerKind;
using refhost::Stream;

constexpr std::size_t kStep = 2;          // the indentation of a child layer under its parent
constexpr std::size_t kPropertyStep = 4;  // that of a property under its layer
constexpr std::size_t kDeepest =
    24;  // deeper layers show their depth as a number, and are not indented further
constexpr std::size_t kLabelWidth = 19;
constexpr double kPointsPerInch = 72.0;
constexpr double kMillimetresPerInch = 25.4;

struct Row {
  std::string_view label;
  std::string value;  // the static value; in parentheses where keys replace it
  std::string keys;
};

std::string padded(std::string_view text, std::size_t width) {
  std::string result(text);
  if (result.size() < width) result.append(width - result.size(), ' ');
  return result;
}

std::string filmText(const Layer& camera) {
  const double millimetres = camera.filmSize / kPointsPerInch * kMillimetresPerInch;
  return fmt::format("{} pt ({} mm) {}", numberText(camera.filmSize), numberText(millimetres),
                     camera.filmDirection == HOST_FILM_VERTICAL ? "vertically" : "horizontally");
}

std::vector<Row> rowsOf(const Layer& layer) {
  std::vector<Row> rows;
  for (const StreamWords& words : kStreamWords) {
    const Stream* stream = layer.findStream(words.id);
    if (stream == nullptr) continue;
    Row row;
    row.label = layer.kind == LayerKind::Camera ? words.cameraLabel : words.label;
    row.value = valueText(*stream) + std::string(words.unitSign);
    if (stream->keyCount() > 0) {
      row.value = '(' + row.value + ')';
      row.keys = keysText(*stream, layer.composition->frameRate);
    }
    rows.push_back(std::move(row));
    if (words.id == HOST_STREAM_ZOOM && layer.filmDirection != refhost::kFilmNeverSet)
      rows.push_back({"film size", filmText(layer), ""});
  }
  return rows;
}

std::string layerTitle(const Layer& layer, const Style& style) {
  const std::string name = style.strong(quotedTerminalText(layer.name));
  switch (layer.kind) {
    case LayerKind::Camera:
      return fmt::format("camera {}{}", name, layer.aimed ? ", aimed at its point of interest" : "");
    case LayerKind::Composition:
      return "composition " + name;
    case LayerKind::Null:
      break;
  }
  return "null " + name;
}

void printProperties(std::ostream& out, const Layer& layer, const std::string& indent, const Style& style) {
  const std::vector<Row> rows = rowsOf(layer);
  std::size_t widest = 0;
  for (const Row& row : rows) {
    if (!row.keys.empty()) widest = std::max(widest, row.value.size());
  }
  for (const Row& row : rows) {
    out << indent << std::string(kPropertyStep, ' ') << style.faint(padded(row.label, kLabelWidth));
    if (row.keys.empty()) {
      out << row.value << '\n';
    } else {
      out << padded(row.value, widest) << "   " << row.keys << '\n';
    }
  }
}

void printLayer(std::ostream& out, const Layer& layer, std::size_t depth, Detail detail, const Style& style) {
  const std::string indent(kStep * (1 + std::min(depth, kDeepest)), ' ');
  out << indent;
  if (depth > kDeepest) out << style.faint(fmt::format("[depth {}] ", depth));
  out << layerTitle(layer, style);
  if (detail == Detail::Layers && layer.kind != LayerKind::Composition) out << "   " << layerSummary(layer);
  out << '\n';
  if (detail == Detail::Properties) printProperties(out, layer, indent, style);
}

// Parents before their children, and siblings in the order in which they were made. Without recursion: a
// chain of parents can be longer than the stack is deep.
void printLayers(std::ostream& out, const Composition& composition, Detail detail, const Style& style) {
  std::unordered_map<const Layer*, std::vector<const Layer*>> children;
  for (const Layer* layer : composition.layers) children[layer->parent].push_back(layer);
  struct Pending {
    const Layer* layer;
    std::size_t depth;
  };
  std::vector<Pending> pending;
  const auto push = [&](const Layer* parent, std::size_t depth) {
    const auto found = children.find(parent);
    if (found == children.end()) return;
    for (auto child = found->second.rbegin(); child != found->second.rend(); ++child) {
      pending.push_back({*child, depth});
    }
  };
  push(nullptr, 0);
  while (!pending.empty()) {
    const Pending next = pending.back();
    pending.pop_back();
    printLayer(out, *next.layer, next.depth, detail, style);
    push(next.layer, next.depth + 1);
  }
}

void printComposition(std::ostream& out, const Composition& composition, Detail detail, const Style& style) {
  out << '\n'
      << style.strong(quotedTerminalText(composition.name)) << "   " << composition.width << " x "
      << composition.height << " px, pixel aspect " << ratioText(composition.pixelAspect) << ", "
      << ratioText(composition.frameRate) << " fps, "
      << durationText(composition.duration, composition.frameRate) << '\n';
  if (composition.layers.empty()) out << "  no layers\n";
  printLayers(out, composition, detail, style);
}

// "1 composition, 1 camera, 2 nulls, 840 keys"
std::string summary(const refhost::Folder& folder) {
  std::size_t cameras = 0, nulls = 0, keys = 0;
  for (const Composition* composition : folder.compositions) {
    for (const Layer* layer : composition->layers) {
      if (layer->kind == LayerKind::Camera) ++cameras;
      if (layer->kind == LayerKind::Null) ++nulls;
      for (const Stream& stream : layer->streams) keys += stream.keyCount();
    }
  }
  return fmt::format("{}, {}, {}, {}", countText(folder.compositions.size(), "composition"),
                     countText(cameras, "camera"), countText(nulls, "null"), countText(keys, "key"));
}

bool madeSomething(const SceneReport& scene) {
  return scene.result.folder != nullptr && !scene.result.folder->compositions.empty();
}

std::string headline(const SceneReport& scene) {
  switch (scene.outcome) {
    case Outcome::Imported:
      return summary(*scene.result.folder);
    case Outcome::Nothing:
      return "nothing to import, the scene has no cameras";
    case Outcome::Failed:
      if (madeSomething(scene)) return summary(*scene.result.folder) + " (incomplete)";
      break;
    case Outcome::Refused:
    case Outcome::Unreadable:
      break;
  }
  return "nothing was imported";
}

}  // namespace

void printOutline(std::ostream& out, const SceneReport& scene, Detail detail, const Style& style) {
  out << terminalText(scene.path) << ": " << headline(scene) << '\n';
  if (madeSomething(scene)) {
    for (const Composition* composition : scene.result.folder->compositions) {
      printComposition(out, *composition, detail, style);
    }
  }
  if (scene.result.messages.empty()) return;
  out << "\nmessages\n";
  for (const std::string& message : scene.result.messages) out << "  " << terminalText(message) << '\n';
}

}  // namespace mayascene
