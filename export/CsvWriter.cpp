// Comma-separated values: a row for each frame of each layer, or for each key of each stream. Quoted as RFC
// 4180 says, with CR LF at the ends of lines; names are UTF-8.
#include <cstddef>
#include <string>

#include "diag/ShownText.h"
#include "export/Places.h"
#include "export/TextWriter.h"
#include "export/Writers.h"

namespace interchange {
namespace {

constexpr std::string_view kFrameHead =
    "layer,frame,seconds,tx,ty,tz,rx,ry,rz,sx,sy,sz,wx,wy,wz,zoom,focal,fov,number,parent\r\n";
constexpr std::string_view kKeyHead = "layer,stream,frame,seconds,x,y,z,number\r\n";

// A name as a cell. A spreadsheet takes text that begins so for a formula; an apostrophe in front keeps it
// text.
std::string Cell(std::string_view name) {
  std::string text = diag::ShownText(name);
  constexpr std::string_view kFormula = "=+-@";
  const std::size_t first = text.find_first_not_of(' ');
  if (first != std::string::npos && kFormula.find(text[first]) != std::string_view::npos)
    text.insert(0, 1, '\'');
  if (text.find_first_of("\", ") == std::string::npos) return text;
  std::string quoted = "\"";
  for (const char c : text) quoted.append(c == '"' ? 2 : 1, c);
  return quoted + '"';
}

void WriteVector(TextWriter& out, const Vector& vector) {
  out << ',' << vector.x << ',' << vector.y << ',' << vector.z;
}

// Zoom in pixels, focal length in millimetres, vertical field of view in degrees; empty where there is no
// lens.
void WriteLens(TextWriter& out, const Composition& composition, const Layer& layer, std::size_t frame) {
  if (!layer.lens) {
    out << ",,,";
    return;
  }
  const double zoom = layer.lens->zoom.at(frame);
  out << ',' << zoom << ',' << zoom * (layer.lens->filmWidth / composition.width) << ','
      << VerticalAngleAt(composition, *layer.lens, frame);
}

bool WriteFrames(TextWriter& out, const Composition& composition, std::size_t index) {
  const Layer& layer = composition.layers[index];
  const std::string name = Cell(layer.name);
  const std::string parent = layer.parent ? std::to_string(*layer.parent + 1) : "";
  Vector angles;
  for (std::size_t frame = 0; frame < composition.frames; ++frame) {
    const Vector place = {layer.position[0].at(frame), layer.position[1].at(frame),
                          layer.position[2].at(frame)};
    const Vector turned = {layer.rotation[0].at(frame), layer.rotation[1].at(frame),
                           layer.rotation[2].at(frame)};
    angles = layer.aimed ? AnglesOf(LocalRotationAt(composition, layer, frame), RotationOrder::XYZ, angles)
                         : turned;
    const Vector world = WorldAt(composition, index, frame).Column(3);
    if (!IsFinite(world)) return false;
    out << name << ',' << composition.FrameNumber(frame) << ','
        << static_cast<double>(frame) / composition.framesPerSecond;
    WriteVector(out, place);
    WriteVector(out, angles);
    WriteVector(out, {layer.scale[0].at(frame), layer.scale[1].at(frame), layer.scale[2].at(frame)});
    WriteVector(out, world);
    WriteLens(out, composition, layer, frame);
    out << ',' << index + 1 << ',' << parent << "\r\n";
  }
  return true;
}

void WriteKeys(TextWriter& out, const Composition& composition, std::size_t index) {
  const Layer& layer = composition.layers[index];
  const std::string name = Cell(layer.name);
  for (const StreamKeys& stream : layer.keys) {
    for (std::size_t key = 0; key < stream.frames.size(); ++key) {
      const double frame = stream.frames[key];
      out << name << ',' << stream.stream << ',' << frame << ','
          << (frame - composition.firstFrame) / composition.framesPerSecond;
      for (std::size_t i = 0; i < 3; ++i) {
        out << ',';
        if (i < stream.components) out << stream.values[key * stream.components + i];
      }
      out << ',' << index + 1 << "\r\n";
    }
  }
}

}  // namespace

bool WriteCsv(const Composition& composition, const WriteOptions& options, std::string_view /*stem*/,
              Files& files, diag::Collector* diagnostics) {
  std::ostream* const stream = files.Main();
  if (stream == nullptr) return false;
  TextWriter out(stream);
  out << (options.keys ? kKeyHead : kFrameHead);
  for (std::size_t layer = 0; layer < composition.layers.size(); ++layer) {
    if (options.keys) {
      WriteKeys(out, composition, layer);
    } else if (!WriteFrames(out, composition, layer)) {
      diagnostics->Report(diag::Code::ExportNumberTooLarge, {}, {composition.layers[layer].name, "CSV"});
      return false;
    }
  }
  return true;
}

}  // namespace interchange
