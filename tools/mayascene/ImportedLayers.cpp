#include "tools/mayascene/ImportedLayers.h"

#include <algorithm>
#include <iterator>
#include <map>
#include <string>

#include "hostapi/ErrorCodes.h"
#include "hostapi/LayerStreams.h"

namespace mayascene {
namespace {

// The kind of stop for a code. Several codes are one kind.
check::Stop stopOf(const SceneLook& look, const refhost::CallbackResult& result) {
  const bool made = result.folder != nullptr && !result.folder->compositions.empty();
  // A file that is shorter than the header fails to be read.
  if (!made && !look.mayaHeader) return check::Stop::NotAScene;
  switch (result.code) {
    case 0:
      return made || result.messages.empty() ? check::Stop::None : check::Stop::NotAScene;
    case HOST_ERR_MAYA_SYNTAX:
      return check::Stop::RefusedByte;
    case HOST_ERR_MAYA_UNEXPECTED_END:
      return check::Stop::UnexpectedEnd;
    case HOST_ERR_MAYA_KEY_COUNTS:
      return check::Stop::UnequalKeys;
    case HOST_ERR_NUMBER_SYNTAX:
      return check::Stop::BadNumber;
    case HOST_ERR_NUMBER_RANGE:
      return check::Stop::LargeNumber;
    default:
      return check::Stop::Other;
  }
}

std::string sentenceOf(const refhost::CallbackResult& result) {
  std::string sentence(refhost::errorSentence(result.code));
  if (sentence.empty()) sentence = "an unknown code";
  for (const std::string& refusal : result.refusals) sentence += "; the host refused: " + refusal;
  return sentence;
}

double quotient(const HostRatio& ratio) {
  return static_cast<double>(ratio.numerator) / static_cast<double>(ratio.denominator);
}

double secondsOf(const T_Time& time) {
  return static_cast<double>(time.value) / static_cast<double>(time.scale);
}

check::CameOverStream streamOf(const refhost::Layer& layer, std::int32_t id) {
  check::CameOverStream out;
  const refhost::Stream* const stream = layer.findStream(id);
  if (stream == nullptr) return out;
  std::copy(std::begin(stream->value), std::end(stream->value), out.value.begin());
  if (stream->keyCount() == 0) return out;
  out.times.reserve(stream->keyCount());
  for (const T_Time& time : stream->keys->times) out.times.push_back(secondsOf(time));
  out.values = stream->keys->values;
  return out;
}

check::CameOverLayer layerOf(const refhost::Layer& layer) {
  check::CameOverLayer out;
  out.kind = layer.kind == refhost::LayerKind::Camera ? check::LayerKind::Camera : check::LayerKind::Null;
  out.name = layer.name;
  out.aimed = layer.aimed;
  out.position = streamOf(layer, HOST_STREAM_POSITION);
  out.scale = streamOf(layer, HOST_STREAM_SCALE);
  out.rotateX = streamOf(layer, HOST_STREAM_ROTATION_X);
  out.rotateY = streamOf(layer, HOST_STREAM_ROTATION_Y);
  out.rotateZ = streamOf(layer, HOST_STREAM_ROTATION_Z);
  out.interest = streamOf(layer, HOST_STREAM_ANCHOR_POINT);
  out.zoom = streamOf(layer, HOST_STREAM_ZOOM);
  return out;
}

void addLayers(const refhost::Composition& composition, check::CameOver* cameOver) {
  std::map<const refhost::Layer*, std::size_t> places;
  for (const refhost::Layer* layer : composition.layers) {
    if (layer->kind == refhost::LayerKind::Composition) continue;
    places.emplace(layer, cameOver->layers.size());
    cameOver->layers.push_back(layerOf(*layer));
  }
  for (const auto& [layer, place] : places) {
    const auto parent = places.find(layer->parent);
    if (parent != places.end()) cameOver->layers[place].parent = parent->second;
  }
}

check::CameOverComposition compositionOf(const refhost::Composition& shown,
                                         const refhost::Composition& inner) {
  return {.width = static_cast<double>(shown.width),
          .height = static_cast<double>(shown.height),
          .pixelAspect = quotient(shown.pixelAspect),
          .framesPerSecond = quotient(shown.frameRate),
          .seconds = secondsOf(shown.duration),
          .layerWidth = static_cast<double>(inner.width)};
}

}  // namespace

check::CameOver whatCameOver(const SceneLook& look, const refhost::CallbackResult& result, bool converted) {
  check::CameOver cameOver;
  cameOver.stop = stopOf(look, result);
  cameOver.code = result.code;
  if (result.code != 0) cameOver.sentence = sentenceOf(result);
  cameOver.line = result.line > 0 ? static_cast<std::uint64_t>(result.line) : 0;
  cameOver.distancesConverted = converted;
  if (result.folder == nullptr || result.folder->compositions.empty()) return cameOver;
  // Where there are two, the first holds the layers and the second one shows it.
  const refhost::Composition& inner = *result.folder->compositions.front();
  cameOver.composition = compositionOf(*result.folder->compositions.back(), inner);
  addLayers(inner, &cameOver);
  return cameOver;
}

}  // namespace mayascene
