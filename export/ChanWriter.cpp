// One text file for each camera, a line for each frame: the frame's number, position, rotation in degrees,
// and the angle between the upper and the lower edge of the picture in degrees. Against the world, y up, the
// camera looking along -z. The angles turn about x first, then y, then z. Readers take whole frame numbers
// only.
#include <algorithm>
#include <cmath>
#include <cstddef>
#include <optional>
#include <ostream>
#include <string>
#include <vector>

#include "export/Places.h"
#include "export/ReportedLosses.h"
#include "export/SafeNames.h"
#include "export/TextWriter.h"
#include "export/Writers.h"

namespace interchange {
namespace {

using diag::Code;

struct CameraFile {
  std::size_t layer;
  std::ostream* stream;
  Vector angles;  // of the previous frame
};

void WriteLine(CameraFile& camera, Matrix view, const Composition& composition, std::size_t frame) {
  if (composition.axes == Axes::Host) {
    const Matrix turned = Scaling({1.0, -1.0, -1.0});
    view = turned * view * turned;
  }
  const auto first = static_cast<long long>(std::floor(composition.firstFrame));
  const Vector place = view.Column(3);
  camera.angles = AnglesOf(view, RotationOrder::XYZ, camera.angles);
  const Vector& angles = camera.angles;
  std::string line = std::to_string(first + static_cast<long long>(frame));
  for (const double value : {place.x, place.y, place.z, angles.x, angles.y, angles.z,
                             VerticalAngleAt(composition, *composition.layers[camera.layer].lens, frame)}) {
    line += '\t';
    AppendNumber(&line, value);
  }
  line += '\n';
  camera.stream->write(line.data(), static_cast<std::streamsize>(line.size()));
}

// None, or the camera whose place is not finite.
std::optional<std::size_t> WriteFrames(std::vector<CameraFile>& cameras, const Composition& composition) {
  Worlds worlds(composition, true);
  for (std::size_t frame = 0; frame < composition.frames; ++frame) {
    worlds.GoTo(frame);
    for (CameraFile& camera : cameras) {
      const Matrix view = worlds.ViewOf(camera.layer);
      if (!IsFinite(view)) return camera.layer;
      WriteLine(camera, view, composition, frame);
    }
  }
  return std::nullopt;
}

void SayWhatIsLost(const Composition& composition, diag::Collector* diagnostics) {
  diagnostics->Report(Code::ExportRotationOrder, {});
  const auto nulls = std::count_if(composition.layers.begin(), composition.layers.end(),
                                   [](const Layer& layer) { return layer.kind == LayerKind::Null; });
  if (nulls != 0) diagnostics->Report(Code::ExportNullsLeftOut, {}, {std::to_string(nulls)});
  ReportLostScales(composition, diagnostics);
  ReportLostExtras(composition, diagnostics);
  if (composition.firstFrame != std::floor(composition.firstFrame)) {
    diagnostics->Report(Code::ExportFramesRounded, {});
  }
}

}  // namespace

bool WriteChan(const Composition& composition, const WriteOptions& /*options*/, Files& files,
               diag::Collector* diagnostics) {
  const auto count = std::count_if(composition.layers.begin(), composition.layers.end(),
                                   [](const Layer& layer) { return layer.kind == LayerKind::Camera; });
  if (count == 0) {
    diagnostics->Report(Code::ExportWithoutCamera, {});
    return false;
  }
  std::vector<CameraFile> cameras;
  for (std::size_t i = 0; i < composition.layers.size(); ++i) {
    const Layer& layer = composition.layers[i];
    if (layer.kind != LayerKind::Camera) continue;
    std::string name;
    // A single camera goes to the output that the user named; with several, each file has its camera's name.
    std::ostream* const stream =
        count == 1 ? files.Main() : files.Beside('.' + SafeName(layer.name, "camera"), ".chan", &name);
    if (stream == nullptr) return false;
    cameras.push_back({i, stream, {}});
  }
  if (const auto tooFar = WriteFrames(cameras, composition)) {
    diagnostics->Report(Code::ExportNumberTooLarge, {},
                        {composition.layers[*tooFar].name, "a place in the world"});
    return false;
  }
  SayWhatIsLost(composition, diagnostics);
  return true;
}

}  // namespace interchange
