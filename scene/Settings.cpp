#include "scene/Settings.h"

#include <cmath>
#include <cstddef>
#include <string_view>

#include "scene/ByteClasses.h"

namespace scene {
namespace {

// The first version whose new scenes have the resolution 960 x 540. That of the version before is not known.
constexpr int kWideSince = 2013;
constexpr double kNarrowWidth = 640.0;
constexpr double kNarrowHeight = 480.0;
constexpr double kNarrowAspect = 1.3333333;

// Pixels that are nearly square are square.
constexpr double kNearlySquare = 0.01;

// The number of an attribute, when the file sets it. What cannot be read is reported.
std::optional<Said<double>> WrittenNumber(const Scene& scene, std::string_view node,
                                          std::string_view attribute, diag::Collector& diagnostics) {
  const NodeId id = scene.Find(node);
  if (id == kNoNode) return std::nullopt;
  const std::optional<Value> written = scene.Written(id, attribute);
  if (!written) return std::nullopt;
  if (const std::optional<double> number = written->Number()) return Said<double>{*number, written->range()};
  diagnostics.Report(diag::Code::UnreadableValue, written->range(), {written->text(), attribute});
  return std::nullopt;
}

void ReadUnits(const Scene& scene, Settings& settings) {
  if (const auto unit = LinearUnitOf(scene.linearUnit().word)) {
    settings.centimetersPerUnit = {*unit, scene.linearUnit().place};
  }
  if (const auto unit = AngularUnitOf(scene.angularUnit().word)) {
    settings.angularUnit = {*unit, scene.angularUnit().place};
  }
  if (const auto unit = TimeUnitOf(scene.timeUnit().word)) settings.rate = {*unit, scene.timeUnit().place};
}

// Removes the first word of a text with the white space around it, and returns it.
std::string_view TakeWord(std::string_view* text) {
  std::size_t start = 0;
  while (start < text->size() && IsByte((*text)[start], kSpaceByte)) ++start;
  std::size_t end = start;
  while (end < text->size() && !IsByte((*text)[end], kSpaceByte) && (*text)[end] != ';') ++end;
  const std::string_view word = text->substr(start, end - start);
  text->remove_prefix(end < text->size() ? end + 1 : end);
  return word;
}

// The text that a script runs when its scene is opened; none where it does not set the playback.
std::optional<Value> PlaybackOf(const Scene& scene, NodeId script) {
  if (script == kNoNode || scene.node(script).type != "script") return std::nullopt;
  const std::optional<Value> body = scene.Written(script, "before");
  const bool plays = body && body->text().find("playbackOptions") != std::string_view::npos;
  return plays ? body : std::nullopt;
}

// The text of the script in which Maya stores the settings; without one, of the first script that sets the
// playback.
std::optional<Value> FindPlayback(const Scene& scene) {
  std::optional<Value> body = PlaybackOf(scene, scene.Find("sceneConfigurationScriptNode"));
  for (NodeId id = 0; id < scene.nodes().size() && !body; ++id) body = PlaybackOf(scene, id);
  return body;
}

// "playbackOptions -min 1 -max 24 -ast 1 -aet 48"
void ReadPlayback(const Scene& scene, Settings& settings, diag::Collector& diagnostics) {
  const std::optional<Value> body = FindPlayback(scene);
  if (!body) return;
  const std::string text = body->String().value_or(std::string());
  std::optional<double> first, last, wholeFirst, wholeLast;
  for (std::string_view rest = text; !rest.empty();) {
    const std::string_view option = TakeWord(&rest);
    std::optional<double>* target = nullptr;
    if (option == "-min" || option == "-minTime") target = &first;
    if (option == "-max" || option == "-maxTime") target = &last;
    if (option == "-ast" || option == "-animationStartTime") target = &wholeFirst;
    if (option == "-aet" || option == "-animationEndTime") target = &wholeLast;
    if (target == nullptr) continue;
    const std::string_view number = TakeWord(&rest);
    *target = NumberOf(number);
    if (!*target) diagnostics.Report(diag::Code::UnreadableValue, body->range(), {number, option.substr(1)});
  }
  if (first && last) settings.playback = {{*first, *last}, body->range()};
  if (wholeFirst && wholeLast) settings.animation = {{*wholeFirst, *wholeLast}, body->range()};
}

void ReadRender(const Scene& scene, Settings& settings, diag::Collector& diagnostics) {
  const auto first = WrittenNumber(scene, "defaultRenderGlobals", "startFrame", diagnostics);
  const auto last = WrittenNumber(scene, "defaultRenderGlobals", "endFrame", diagnostics);
  if (first && last) settings.render = {{first->value, last->value}, last->place};
}

// The year at the front of "2025ff03" or after "Maya "; "7.0" is 7.
int YearOf(std::string_view text) {
  if (text.substr(0, 5) == "Maya ") text.remove_prefix(5);
  int year = 0;
  for (std::size_t at = 0; at < text.size() && at < 4 && IsByte(text[at], kDigitByte); ++at) {
    year = year * 10 + (text[at] - '0');
  }
  return year;
}

void ReadVersion(const Scene& scene, Settings& settings) {
  for (const FileInfo& info : scene.fileInfo()) {
    if (info.key != "product") continue;
    settings.product = info.value;
    if (const int year = YearOf(info.value); year != 0) settings.version = {year, info.place};
  }
  for (const Requirement& requirement : scene.requirements()) {
    if (requirement.name != "maya") continue;
    if (const int year = YearOf(requirement.version); year != 0) settings.version = {year, requirement.place};
  }
}

void ReadResolution(const Scene& scene, Settings& settings, diag::Collector& diagnostics) {
  if (settings.version.value != 0 && settings.version.value < kWideSince) {
    settings.width = {kNarrowWidth};
    settings.height = {kNarrowHeight};
    settings.deviceAspect = {kNarrowAspect};
  }
  const auto read = [&](std::string_view attribute, Said<double>& target) {
    const auto number = WrittenNumber(scene, "defaultResolution", attribute, diagnostics);
    if (!number) return;
    if (number->value > 0.0) {
      target = *number;
    } else {
      const std::string_view text = scene.text().substr(number->place->offset, number->place->length);
      diagnostics.Report(diag::Code::UnreadableValue, *number->place, {text, attribute});
    }
  };
  read("width", settings.width);
  read("height", settings.height);
  read("deviceAspectRatio", settings.deviceAspect);
}

}  // namespace

double Settings::pixelAspect() const {
  const double aspect = deviceAspect.value * height.value / width.value;
  if (!(width.value > 0.0) || !(height.value > 0.0) || !(deviceAspect.value > 0.0)) return 1.0;
  return std::abs(aspect - 1.0) <= kNearlySquare ? 1.0 : aspect;
}

double Settings::pictureAspect() const {
  const bool positive = width.value > 0.0 && height.value > 0.0;
  return (positive ? width.value / height.value : 1.0) * pixelAspect();
}

Settings ReadSettings(const Scene& scene, diag::Collector& diagnostics) {
  Settings settings;
  ReadUnits(scene, settings);
  ReadPlayback(scene, settings, diagnostics);
  ReadRender(scene, settings, diagnostics);
  if (const auto frame = WrittenNumber(scene, "time1", "outTime", diagnostics))
    settings.currentFrame = *frame;
  ReadVersion(scene, settings);
  ReadResolution(scene, settings, diagnostics);
  return settings;
}

}  // namespace scene
