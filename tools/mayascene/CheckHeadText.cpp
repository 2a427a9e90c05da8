#include "tools/mayascene/CheckHeadText.h"

#include <fmt/format.h>

#include <algorithm>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "diag/ShownText.h"
#include "tools/mayascene/Quantities.h"

namespace mayascene {
namespace {

constexpr std::size_t kNameColumn = 16;

// The most rows of a list that are shown. The JSON document has more of them.
constexpr std::size_t kShownOfAKind = 8;
constexpr std::size_t kShownLinks = 8;     // above one camera
constexpr std::size_t kShownChannels = 9;  // of one camera and the transforms above it

constexpr std::size_t kUnderScene = 2;  // spaces before a row
constexpr std::size_t kUnderShape = 4;
constexpr std::size_t kUnderLink = 6;

std::string lineOf(const check::Where& where) { return fmt::format(" (line {})", where.place.line); }

std::string said(const std::optional<check::Where>& where) {
  return where ? lineOf(*where) : " (default: the file does not say)";
}

std::string driverText(const check::Drive& drive) {
  const std::string keys = drive.keys ? ", " + countText(*drive.keys, "key") : "";
  return fmt::format("{} {}{}{}", diag::ShownText(drive.type), diag::ShownText(drive.node), keys,
                     lineOf(drive.where));
}

std::string moreText(std::size_t count) { return fmt::format("{} more (--all shows them)", count); }

// "35 to 50 mm, frames 1 to 24"
std::string spanText(const check::Span& span, std::string_view unit, const check::LensOverFrames& over) {
  const std::string largest = span.largest > span.least ? " to " + numberText(span.largest) : "";
  const std::string frames =
      over.first == over.last ? fmt::format("frame {}", numberText(over.first))
                              : fmt::format("frames {} to {}", numberText(over.first), numberText(over.last));
  return fmt::format("{}{}{}, {}", numberText(span.least), largest, unit, frames);
}

class HeadPrinter {
 public:
  HeadPrinter(std::ostream& out, bool all, const Style& style) : out_(out), all_(all), style_(style) {}

  void row(std::string_view name, std::string_view value, std::size_t indent = kUnderScene) {
    std::string start = std::string(indent, ' ') + std::string(name);
    if (start.size() < kNameColumn) start.resize(kNameColumn, ' ');
    out_ << style_.faint(start) << ' ' << value << '\n';
  }

  void scene(const check::Head& head);
  void camera(const check::CameraHead& camera, const std::string& unit);
  void locator(const check::ShapeHead& locator);
  void lookAt(const check::LookAtHead& lookAt);

  // The first rows, then how many more there are, with those that are not in the list.
  template <typename T, typename Show>
  void list(const std::vector<T>& things, std::size_t notInList, std::string_view name, Show show) {
    const std::size_t shown = all_ ? things.size() : std::min(things.size(), kShownOfAKind);
    for (std::size_t i = 0; i < shown; ++i) show(things[i]);
    const std::size_t more = things.size() - shown + notInList;
    if (more != 0) row(name, moreText(more));
  }

 private:
  void stored(std::string_view name, const check::Given<double>& given, std::string_view unit);
  void number(const check::CameraHead& camera, std::string_view channel, std::string_view name,
              const check::Given<double>& given, std::string_view unit,
              std::optional<check::Span> check::LensOverFrames::*span);
  void lens(const check::CameraHead& camera);
  void angle(const check::CameraHead& camera);
  void drivenBy(const check::Drive& drive) { row("driven by", driverText(drive), kUnderLink); }
  void chain(const check::CameraHead& camera);

  std::ostream& out_;
  bool all_;
  const Style& style_;
};

void HeadPrinter::scene(const check::Head& head) {
  if (!head.product.empty()) row("written by", diag::ShownText(head.product));
  row("lengths", diag::ShownText(head.linearUnit.value) + said(head.linearUnit.where));
  row("angles", diag::ShownText(head.angularUnit.value) + said(head.angularUnit.where));
  row("frame rate", fmt::format("{}, {}{}", numberText(head.framesPerSecond),
                                diag::ShownText(head.timeUnit.value), said(head.timeUnit.where)));
  for (const check::NamedFrames& range : head.ranges) {
    row(range.what,
        fmt::format("{} to {}{}", numberText(range.first), numberText(range.last), lineOf(range.where)));
  }
  if (head.ranges.empty()) row("range", "the file does not say");
  row("width", numberText(head.width.value) + said(head.width.where));
  row("height", numberText(head.height.value) + said(head.height.where));
  row("pixel aspect", numberText(head.pixelAspect.value) + said(head.pixelAspect.where));
  std::string came =
      fmt::format("{}, {}", countText(head.camerasThatCame, "camera"), countText(head.nullsThatCame, "null"));
  if (head.composition) {
    const check::CameOverComposition& made = *head.composition;
    came += fmt::format("; {} s ({} frames) of {} x {} pixels", numberText(made.seconds),
                        numberText(made.seconds * made.framesPerSecond), numberText(made.width),
                        numberText(made.height));
  }
  row("came over", came);
}

const check::Drive* driveOf(const check::CameraHead& camera, std::string_view channel) {
  const auto found = std::find_if(camera.drives.begin(), camera.drives.end(),
                                  [channel](const check::Drive& drive) { return drive.channel == channel; });
  return found == camera.drives.end() ? nullptr : &*found;
}

void HeadPrinter::stored(std::string_view name, const check::Given<double>& given, std::string_view unit) {
  row(name, fmt::format("{}{}{}", numberText(given.value), unit, said(given.where)), kUnderShape);
}

// The stored value; for a driven one, its values over the frames.
void HeadPrinter::number(const check::CameraHead& camera, std::string_view channel, std::string_view name,
                         const check::Given<double>& given, std::string_view unit,
                         std::optional<check::Span> check::LensOverFrames::*span) {
  const check::Drive* const drive = driveOf(camera, channel);
  if (drive == nullptr) return stored(name, given, unit);
  if (camera.overFrames && (*camera.overFrames).*span) {
    row(name, spanText(*((*camera.overFrames).*span), unit, *camera.overFrames), kUnderShape);
  } else {
    row(name, fmt::format("driven, values not known; stored: {}{}", numberText(given.value), unit),
        kUnderShape);
  }
  drivenBy(*drive);
}

void HeadPrinter::lens(const check::CameraHead& camera) {
  using Over = check::LensOverFrames;
  number(camera, "focalLength", "focal length", camera.focalLength, " mm", &Over::focalLength);
  if (driveOf(camera, "horizontalFilmAperture") == nullptr &&
      driveOf(camera, "verticalFilmAperture") == nullptr) {
    row("aperture",
        fmt::format("{} x {} in{}", numberText(camera.horizontalAperture.value),
                    numberText(camera.verticalAperture.value), said(camera.horizontalAperture.where)),
        kUnderShape);
  } else {
    number(camera, "horizontalFilmAperture", "film width", camera.horizontalAperture, " in",
           &Over::horizontalAperture);
    number(camera, "verticalFilmAperture", "film height", camera.verticalAperture, " in",
           &Over::verticalAperture);
  }
  if (!camera.orthographicWidth) angle(camera);
  row("film fit", camera.fit.value + said(camera.fit.where), kUnderShape);
  if (const check::Drive* const drive = driveOf(camera, "filmFit")) drivenBy(*drive);
}

void HeadPrinter::angle(const check::CameraHead& camera) {
  constexpr std::string_view kUnit = " degrees across the picture";
  if (camera.drives.empty()) {
    row("angle", fmt::format("{}{}", numberText(camera.angleOfView), kUnit), kUnderShape);
  } else if (camera.overFrames && camera.overFrames->angleOfView) {
    row("angle", spanText(*camera.overFrames->angleOfView, kUnit, *camera.overFrames), kUnderShape);
  } else {
    row("angle", "not known", kUnderShape);
  }
}

// The transforms above the camera and their driven channels. Of many, the lowest ones and a count.
void HeadPrinter::chain(const check::CameraHead& camera) {
  std::size_t links = 0;
  std::size_t channels = 0;
  std::size_t channelsLeft = 0;
  for (const check::ChainLink& link : camera.chain) {
    const bool shown = all_ || links < kShownLinks;
    if (shown) {
      row("under", diag::ShownText(link.name), kUnderShape);
      ++links;
    }
    for (const check::Drive& drive : link.drives) {
      if (!all_ && (!shown || channels == kShownChannels)) {
        ++channelsLeft;
        continue;
      }
      row(drive.channel, driverText(drive), kUnderLink);
      ++channels;
    }
  }
  const std::size_t linksLeft = camera.chain.size() - links;
  if (linksLeft != 0) row("under", moreText(linksLeft), kUnderShape);
  if (camera.chainGoesOn) row("under", "further ones, which are not looked at", kUnderShape);
  if (channelsLeft != 0) row("channels", moreText(channelsLeft), kUnderShape);
}

void HeadPrinter::camera(const check::CameraHead& camera, const std::string& unit) {
  row("camera", style_.strong(diag::ShownText(camera.path)) + lineOf(camera.where));
  if (camera.orthographicWidth) {
    number(camera, "orthographicWidth", "orthographic", *camera.orthographicWidth,
           fmt::format(" {} across the picture", unit), &check::LensOverFrames::orthographicWidth);
  }
  // The import takes some orthographic cameras for perspective ones; their lens then counts.
  if (!camera.orthographicWidth || camera.cameOver) lens(camera);
  chain(camera);
  std::string came = "no layer";
  if (camera.cameOver) {
    came = fmt::format("a camera layer with {} for its place and {} for its zoom, under {}",
                       countText(camera.keys, "key"), countText(camera.zoomKeys, "key"),
                       countText(camera.parents, "null"));
  }
  row("came over", came, kUnderShape);
}

void HeadPrinter::locator(const check::ShapeHead& locator) {
  row("locator", style_.strong(diag::ShownText(locator.path)) + lineOf(locator.where));
  std::string came = "no layer";
  if (locator.cameOver) {
    came = fmt::format("a null layer with {} for its place, under {}", countText(locator.keys, "key"),
                       countText(locator.parents, "null"));
  }
  row("came over", came, kUnderShape);
}

void HeadPrinter::lookAt(const check::LookAtHead& lookAt) {
  row("look-at", style_.strong(diag::ShownText(lookAt.name)) + lineOf(lookAt.where));
  row("turns", lookAt.turns.empty() ? "nothing" : diag::ShownText(lookAt.turns), kUnderShape);
  std::string came = "nothing: it aims no camera";
  if (!lookAt.camera.empty())
    came = fmt::format("{} is aimed at {}", diag::ShownText(lookAt.camera), diag::ShownText(lookAt.target));
  row("came over", came, kUnderShape);
}

}  // namespace

void printHead(std::ostream& out, const CheckedScene& scene, bool all, const Style& style) {
  const check::Head& head = scene.report.head;
  out << style.strong(diag::ShownText(scene.path)) << '\n';
  HeadPrinter printer(out, all, style);
  if (!head.isScene) {
    printer.row("came over", "nothing");
    out << '\n';
    return;
  }
  printer.scene(head);
  const std::string unit = diag::ShownText(head.linearUnit.value);
  printer.list(head.cameras, head.camerasNotShown, "cameras",
               [&](const check::CameraHead& camera) { printer.camera(camera, unit); });
  printer.list(head.locators, head.locatorsNotShown, "locators",
               [&](const check::ShapeHead& locator) { printer.locator(locator); });
  printer.list(head.lookAts, head.lookAtsNotShown, "look-ats",
               [&](const check::LookAtHead& lookAt) { printer.lookAt(lookAt); });
  out << '\n';
}

}  // namespace mayascene
