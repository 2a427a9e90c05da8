#include "tools/mayascene/CheckHeadText.h"

#include <string>
#include <string_view>

#include "diag/ShownText.h"
#include "tools/mayascene/Quantities.h"

namespace mayascene {
namespace {

constexpr std::size_t kNameColumn = 16;

// Of many cameras these are shown; the document has more of them.
constexpr std::size_t kShownCameras = 20;

std::string lineOf(const check::Where& where) { return " (line " + std::to_string(where.place.line) + ')'; }

std::string said(const std::optional<check::Where>& where) {
  return where ? lineOf(*where) : " (default: the file does not say)";
}

class HeadPrinter {
 public:
  HeadPrinter(std::ostream& out, const Style& style) : out_(out), style_(style) {}

  void row(std::string_view name, std::string_view value, std::size_t indent = 2) {
    std::string start = std::string(indent, ' ') + std::string(name);
    if (start.size() < kNameColumn) start.resize(kNameColumn, ' ');
    out_ << style_.faint(start) << ' ' << value << '\n';
  }

  void scene(const check::Head& head);
  void camera(const check::CameraHead& camera);

 private:
  void drives(const std::vector<check::Drive>& drives);

  std::ostream& out_;
  const Style& style_;
};

void HeadPrinter::scene(const check::Head& head) {
  if (!head.product.empty()) row("written by", diag::ShownText(head.product));
  row("lengths", diag::ShownText(head.linearUnit.value) + said(head.linearUnit.where));
  row("angles", diag::ShownText(head.angularUnit.value) + said(head.angularUnit.where));
  row("frame rate", numberText(head.framesPerSecond) + ", " + diag::ShownText(head.timeUnit.value) +
                        said(head.timeUnit.where));
  for (const check::Range& range : head.ranges) {
    row(range.what, numberText(range.first) + " to " + numberText(range.last) + lineOf(range.where));
  }
  if (head.ranges.empty()) row("range", "the file does not say");
  row("width", numberText(head.width.value) + said(head.width.where));
  row("height", numberText(head.height.value) + said(head.height.where));
  row("pixel aspect", numberText(head.pixelAspect.value) + said(head.pixelAspect.where));
  row("came over", countText(head.camerasThatCame, "camera") + ", " + countText(head.nullsThatCame, "null"));
}

void HeadPrinter::drives(const std::vector<check::Drive>& drives) {
  for (const check::Drive& drive : drives) {
    std::string text = diag::ShownText(drive.type) + ' ' + diag::ShownText(drive.node);
    if (drive.keys) text += ", " + countText(*drive.keys, "key");
    row(drive.channel, text + lineOf(drive.where), 6);
  }
}

void HeadPrinter::camera(const check::CameraHead& camera) {
  row("camera", style_.strong(diag::ShownText(camera.path)) + lineOf(camera.where));
  row("focal length", numberText(camera.focalLength.value) + " mm" + said(camera.focalLength.where), 4);
  row("aperture",
      numberText(camera.horizontalAperture.value) + " x " + numberText(camera.verticalAperture.value) +
          " in" + said(camera.horizontalAperture.where),
      4);
  row("angle", numberText(camera.angleOfView) + " degrees across the picture", 4);
  row("film fit", camera.fit.value + said(camera.fit.where), 4);
  drives(camera.drives);
  for (const check::ChainLink& link : camera.chain) {
    row("under", diag::ShownText(link.name), 4);
    drives(link.drives);
  }
  if (camera.chainGoesOn) row("under", "and more", 4);
  std::string came = "no layer";
  if (camera.cameOver) {
    came = "a camera layer with " + countText(camera.keys, "key") + " for its place and " +
           countText(camera.zoomKeys, "key") + " for its zoom, under " + countText(camera.parents, "null");
  }
  row("came over", came, 4);
}

}  // namespace

void printHead(std::ostream& out, const CheckedScene& scene, const Style& style) {
  const check::Head& head = scene.report.head;
  out << style.strong(diag::ShownText(scene.path)) << '\n';
  HeadPrinter printer(out, style);
  if (!head.isScene) {
    printer.row("came over", "nothing");
    out << '\n';
    return;
  }
  printer.scene(head);
  std::size_t shown = 0;
  for (const check::CameraHead& camera : head.cameras) {
    if (++shown > kShownCameras) break;
    printer.camera(camera);
  }
  const std::size_t all = head.cameras.size() + head.camerasNotShown;
  if (all > kShownCameras) printer.row("cameras", std::to_string(all - kShownCameras) + " more");
  out << '\n';
}

}  // namespace mayascene
