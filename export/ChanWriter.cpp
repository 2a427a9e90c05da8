// One text file for each camera, a line for each frame: the frame's number, position, rotation in degrees,
// and the angle between the upper and the lower edge of the picture in degrees. Against the world, y up, the
// camera looking along -z. The angles turn about x first, then y, then z. Readers take whole frame numbers
// only.
#include <algorithm>
#include <cmath>
#include <cstddef>
#include <ostream>
#include <string>

#include "export/Places.h"
#include "export/ReportedLosses.h"
#include "export/SafeNames.h"
#include "export/TextWriter.h"
#include "export/Writers.h"

namespace interchange {
namespace {

using diag::Code;

Matrix ViewInScene(const Composition& composition, std::size_t layer, std::size_t frame) {
  const Matrix view = ViewAt(composition, layer, frame);
  if (composition.axes == Axes::Scene) return view;
  const Matrix turned = Scaling({1.0, -1.0, -1.0});
  return turned * view * turned;
}

bool WriteCamera(std::ostream* stream, const Composition& composition, std::size_t index) {
  TextWriter out(stream);
  const Layer& layer = composition.layers[index];
  const double first = std::floor(composition.firstFrame);
  Vector angles;
  for (std::size_t frame = 0; frame < composition.frames; ++frame) {
    const Matrix view = ViewInScene(composition, index, frame);
    if (!IsFinite(view)) return false;
    const Vector place = view.Column(3);
    angles = AnglesOf(view, RotationOrder::XYZ, angles);
    out << std::to_string(static_cast<long long>(first) + static_cast<long long>(frame));
    for (const double value : {place.x, place.y, place.z, angles.x, angles.y, angles.z,
                               VerticalAngleAt(composition, *layer.lens, frame)}) {
      out << '\t' << value;
    }
    out << '\n';
  }
  return true;
}

void SayWhatIsLost(const Composition& composition, diag::Collector* diagnostics) {
  diagnostics->Report(Code::ExportRotationOrder, {});
  const auto nulls = std::count_if(composition.layers.begin(), composition.layers.end(),
                                   [](const Layer& layer) { return layer.kind == LayerKind::Null; });
  if (nulls != 0) diagnostics->Report(Code::ExportNullsLeftOut, {}, {std::to_string(nulls)});
  ReportLostExtras(composition, diagnostics);
  if (composition.firstFrame != std::floor(composition.firstFrame)) {
    diagnostics->Report(Code::ExportFramesRounded, {});
  }
}

}  // namespace

bool WriteChan(const Composition& composition, const WriteOptions& /*options*/, Files& files,
               diag::Collector* diagnostics) {
  const auto cameras = std::count_if(composition.layers.begin(), composition.layers.end(),
                                     [](const Layer& layer) { return layer.kind == LayerKind::Camera; });
  if (cameras == 0) {
    diagnostics->Report(Code::ExportWithoutCamera, {});
    return false;
  }
  for (std::size_t i = 0; i < composition.layers.size(); ++i) {
    const Layer& layer = composition.layers[i];
    if (layer.kind != LayerKind::Camera) continue;
    std::string name;
    // One camera has the output that was named; of several each has its name after it.
    std::ostream* const stream =
        cameras == 1 ? files.Main() : files.Beside('.' + SafeName(layer.name, "camera"), ".chan", &name);
    if (stream == nullptr) return false;
    if (!WriteCamera(stream, composition, i)) {
      diagnostics->Report(Code::ExportNumberTooLarge, {}, {layer.name, "a place in the world"});
      return false;
    }
  }
  SayWhatIsLost(composition, diagnostics);
  return true;
}

}  // namespace interchange
