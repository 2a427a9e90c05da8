// Comma-separated values: a row for each frame of each layer, or for each key of each stream. Quoted as RFC
// 4180 says, with CR LF at the ends of lines; names are UTF-8.
#include <algorithm>
#include <array>
#include <cstddef>
#include <optional>
#include <string>
#include <vector>

#include "diag/ShownText.h"
#include "export/Places.h"
#include "export/ReportedLosses.h"
#include "export/TextWriter.h"
#include "export/Writers.h"
#include "text/Utf8.h"

namespace interchange {
namespace {

constexpr std::string_view kFrameHead =
    "layer,frame,seconds,tx,ty,tz,rx,ry,rz,sx,sy,sz,wx,wy,wz,zoom,focal,fov,number,parent\r\n";
constexpr std::string_view kKeyHead = "layer,stream,frame,seconds,x,y,z,number\r\n";

// Without the spaces in front. Spaces without a width, and controls, are escaped in a name already.
std::string_view WithoutSpaces(std::string_view cell) {
  while (!cell.empty()) {
    const text::Character character = text::CharacterAt(cell, 0);
    const char32_t point = character.point;
    const bool space = point == ' ' || point == 0xa0 || point == 0x1680 ||
                       (point >= 0x2000 && point <= 0x200a) || point == 0x202f || point == 0x205f ||
                       point == 0x3000;
    if (!space) break;
    cell.remove_prefix(character.length);
  }
  return cell;
}

// Whether a spreadsheet takes the text for a formula, by its first sign. Full-width signs count too.
bool IsFormula(std::string_view text) {
  constexpr std::array<std::string_view, 8> kSigns = {
      "=", "+", "-", "@", "\xef\xbc\x9d", "\xef\xbc\x8b", "\xef\xbc\x8d", "\xef\xbc\xa0"};
  text = WithoutSpaces(text);
  return std::any_of(kSigns.begin(), kSigns.end(),
                     [&](std::string_view sign) { return text.starts_with(sign); });
}

// A name as a cell. An apostrophe in front of a formula keeps it text. Names with a semicolon are quoted for
// programs that separate cells by semicolons.
std::string Cell(std::string_view name) {
  std::string text = diag::ShownText(name);
  if (IsFormula(text)) text.insert(0, 1, '\'');
  if (text.find_first_of("\",; ") == std::string::npos) return text;
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

// The rows of the frames.
class Frames {
 public:
  Frames(const Composition& composition, TextWriter* out)
      : composition_(composition), worlds_(composition), angles_(composition.layers.size()), out_(*out) {
    for (const Layer& layer : composition.layers) names_.push_back(Cell(layer.name));
  }

  // None, or the layer whose place is not finite.
  std::optional<std::size_t> Write() {
    for (std::size_t frame = 0; frame < composition_.frames; ++frame) {
      worlds_.GoTo(frame);
      for (std::size_t index = 0; index < names_.size(); ++index) {
        if (!IsFinite(worlds_.Of(index).Column(3))) return index;
        WriteRow(index, frame);
      }
    }
    return std::nullopt;
  }

 private:
  void WriteRow(std::size_t index, std::size_t frame) {
    const Layer& layer = composition_.layers[index];
    const double number = composition_.FrameNumber(frame);
    out_ << names_[index] << ',' << number << ',' << number / composition_.framesPerSecond;
    WriteVector(out_, VectorAt(layer.position, frame));
    WriteVector(out_, AnglesAt(index, frame));
    WriteVector(out_, VectorAt(layer.scale, frame));
    WriteVector(out_, worlds_.Of(index).Column(3));
    WriteLens(out_, composition_, layer, frame);
    out_ << ',' << index + 1 << ',';
    if (layer.parent) out_ << *layer.parent + 1;
    out_ << "\r\n";
  }

  // The angles of an aimed camera are those nearest to the angles of the previous frame.
  Vector AnglesAt(std::size_t index, std::size_t frame) {
    const Layer& layer = composition_.layers[index];
    if (!layer.aimed) return VectorAt(layer.rotation, frame);
    const Matrix rotation = LocalRotationAt(composition_, layer, frame);
    return angles_[index] = AnglesOf(rotation, RotationOrder::XYZ, angles_[index]);
  }

  const Composition& composition_;
  Worlds worlds_;
  std::vector<Vector> angles_;
  std::vector<std::string> names_;
  TextWriter& out_;
};

void WriteKeys(TextWriter& out, const Composition& composition, std::size_t index) {
  const Layer& layer = composition.layers[index];
  const std::string name = Cell(layer.name);
  for (const StreamKeys& stream : layer.keys) {
    for (std::size_t key = 0; key < stream.frames->size(); ++key) {
      const double frame = (*stream.frames)[key];
      out << name << ',' << stream.stream << ',' << frame << ',' << frame / composition.framesPerSecond;
      for (std::size_t i = 0; i < 3; ++i) {
        out << ',';
        if (i < stream.components) out << stream.values[i].at(key);
      }
      out << ',' << index + 1 << "\r\n";
    }
  }
}

}  // namespace

bool WriteCsv(const Composition& composition, const WriteOptions& options, Files& files,
              diag::Collector* diagnostics) {
  std::ostream* const stream = files.Main();
  if (stream == nullptr) return false;
  TextWriter out(stream);
  out << (options.keys ? kKeyHead : kFrameHead);
  if (options.keys) {
    for (std::size_t layer = 0; layer < composition.layers.size(); ++layer)
      WriteKeys(out, composition, layer);
  } else if (const auto tooFar = Frames(composition, &out).Write()) {
    diagnostics->Report(diag::Code::ExportNumberTooLarge, {}, {composition.layers[*tooFar].name, "CSV"});
    return false;
  }
  ReportLostExtras(composition, diagnostics);
  return true;
}

}  // namespace interchange
