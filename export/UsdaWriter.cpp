// USD as text: a prim for each layer, nested as the layers are, with a time sample for each frame.
//
// Numbers are the doubles of the description. Times are the scene's own frame numbers. A camera is a prim of
// its own below that of its layer, because some readers animate only transforms. It looks along -z; in the
// host's axes it is turned about x to do so.
#include <algorithm>
#include <string>
#include <string_view>
#include <vector>

#include "export/LayerTree.h"
#include "export/Places.h"
#include "export/ReportedLosses.h"
#include "export/TextWriter.h"
#include "export/UsdaInternal.h"
#include "export/Variation.h"
#include "export/Writers.h"

namespace interchange {
namespace {

using diag::Code;

// The film is in millimetres, apertures in tenths of a unit.
double TenthsOfUnit(const Composition& composition, double millimetres) {
  return millimetres * 0.01 / composition.metersPerUnit;
}

constexpr double kMillimetresPerInch = 25.4;

class Usda {
 public:
  Usda(const Composition& composition, std::ostream* stream)
      : composition_(composition), tree_(composition), names_(composition), out_(stream) {}

  void Write() {
    WriteHead();
    BeginPrim("Xform", names_.root(), composition_.name);
    WriteLayers();
    EndPrim();
  }

 private:
  // Parents before their children, without recursion.
  void WriteLayers() {
    std::vector<std::size_t> open;
    std::size_t layer = tree_.FirstRoot();
    while (layer != LayerTree::kNone || !open.empty()) {
      if (layer == LayerTree::kNone) {
        EndPrim();
        layer = tree_.NextSibling(open.back());
        open.pop_back();
      } else {
        BeginLayer(layer);
        open.push_back(layer);
        layer = tree_.FirstChild(layer);
      }
    }
  }

  void WriteHead() {
    out_ << "#usda 1.0\n(\n    customLayerData = {\n        double height = " << composition_.height
         << "\n        double pixelAspect = " << composition_.pixelAspect
         << "\n        double width = " << composition_.width << "\n    }\n    defaultPrim = \""
         << names_.root() << "\"\n    endTimeCode = " << composition_.FrameNumber(composition_.frames - 1)
         << "\n    framesPerSecond = " << composition_.framesPerSecond
         << "\n    metersPerUnit = " << composition_.metersPerUnit
         << "\n    startTimeCode = " << composition_.FrameNumber(0)
         << "\n    timeCodesPerSecond = " << composition_.framesPerSecond << "\n    upAxis = \"Y\"\n)\n";
  }

  // Deep prims are not indented further: the text would grow with the square of the depth.
  TextWriter& Line() {
    constexpr std::size_t kDeepest = 16;
    for (std::size_t level = std::min(depth_, kDeepest); level > 0; --level) out_ << "    ";
    return out_;
  }

  void BeginPrim(std::string_view type, std::string_view prim, std::string_view name) {
    out_ << '\n';
    Line() << "def " << type << " \"" << prim << '"';
    if (prim != name) {
      out_ << " (\n";
      ++depth_;
      Line() << "customData = {\n";
      ++depth_;
      Line() << "string name = " << UsdaText(name) << '\n';
      --depth_;
      Line() << "}\n";
      --depth_;
      Line() << ")";
    }
    out_ << '\n';
    Line() << "{\n";
    ++depth_;
  }

  void EndPrim() {
    --depth_;
    Line() << "}\n";
  }

  void BeginLayer(std::size_t index) {
    const Layer& layer = composition_.layers[index];
    BeginPrim("Xform", names_.layer(index), layer.name);
    WriteTransform(layer);
    if (layer.kind != LayerKind::Camera) return;
    const std::string& lens = names_.lens(index);
    BeginPrim("Camera", lens, lens);
    WriteLens(*layer.lens);
    if (composition_.axes == Axes::Host) {
      Line() << "double xformOp:rotateX = 180\n";
      Line() << "uniform token[] xformOpOrder = [\"xformOp:rotateX\"]\n";
    }
    EndPrim();
  }

  // The value of the first frame, and samples where it changes. `value` writes the value of a frame.
  template <typename Value>
  void WriteAttribute(std::string_view declaration, bool varies, const Value& value) {
    Line() << declaration << " = ";
    value(0);
    out_ << '\n';
    if (!varies) return;
    Line() << declaration << ".timeSamples = {\n";
    ++depth_;
    for (std::size_t frame = 0; frame < composition_.frames; ++frame) {
      Line() << composition_.FrameNumber(frame) << ": ";
      value(frame);
      out_ << ",\n";
    }
    --depth_;
    Line() << "}\n";
  }

  void WriteNumber(std::string_view declaration, double number) {
    Line() << declaration << " = " << number << '\n';
  }

  void WriteVector(const Vector& vector) {
    out_ << '(' << vector.x << ", " << vector.y << ", " << vector.z << ')';
  }

  void WriteThree(std::string_view declaration, const Channel (&channels)[3]) {
    WriteAttribute(declaration, Varies(channels, composition_.frames),
                   [&](std::size_t frame) { WriteVector(VectorAt(channels, frame)); });
  }

  void WriteTransform(const Layer& layer) {
    WriteThree("double3 xformOp:translate", layer.position);
    if (layer.aimed) {
      // Each rotation has the angles nearest to the previous ones, so that nothing spins between two frames.
      Vector angles;
      WriteAttribute(
          "double3 xformOp:rotateXYZ", RotationVaries(layer, composition_.frames), [&](std::size_t frame) {
            angles = AnglesOf(LocalRotationAt(composition_, layer, frame), RotationOrder::XYZ, angles);
            WriteVector(angles);
          });
    } else {
      WriteThree("double3 xformOp:rotateXYZ", layer.rotation);
    }
    WriteThree("double3 xformOp:scale", layer.scale);
    Line() << "uniform token[] xformOpOrder = [\"xformOp:translate\", \"xformOp:rotateXYZ\", "
              "\"xformOp:scale\"]\n";
  }

  void WriteLens(const Lens& lens) {
    Line() << "float2 clippingRange = (0.1, 1000000)\n";
    if (lens.squeeze) WriteNumber("custom double squeeze", *lens.squeeze);
    WriteAttribute("float focalLength", Varies(lens.zoom, composition_.frames),
                   [&](std::size_t frame) { out_ << FocalLength(composition_, lens, frame); });
    WriteNumber("float horizontalAperture", HorizontalAperture(composition_, lens));
    if (lens.filmOffsetX) WriteNumber("float horizontalApertureOffset", Offset(*lens.filmOffsetX));
    Line() << "token projection = \"perspective\"\n";
    WriteNumber("float verticalAperture", VerticalAperture(composition_, lens));
    if (lens.filmOffsetY) WriteNumber("float verticalApertureOffset", Offset(*lens.filmOffsetY));
  }

  double Offset(double inches) const { return TenthsOfUnit(composition_, inches * kMillimetresPerInch); }

  const Composition& composition_;
  const LayerTree tree_;
  const PrimNames names_;
  TextWriter out_;
  std::size_t depth_ = 0;
};

bool IsTaken(const Composition& composition, diag::Collector* diagnostics) {
  bool taken = true;
  for (const Layer& layer : composition.layers) {
    if (layer.kind != LayerKind::Camera || IsLensOfFloats(composition, *layer.lens)) continue;
    diagnostics->Report(Code::ExportNumberTooLarge, {}, {layer.name, "USD"});
    taken = false;
  }
  return taken;
}

}  // namespace

double HorizontalAperture(const Composition& composition, const Lens& lens) {
  return TenthsOfUnit(composition, lens.filmWidth);
}

double VerticalAperture(const Composition& composition, const Lens& lens) {
  return HorizontalAperture(composition, lens) * (composition.height / composition.width);
}

double FocalLength(const Composition& composition, const Lens& lens, std::size_t frame) {
  return HorizontalAperture(composition, lens) * (lens.zoom.at(frame) / composition.width);
}

bool WriteUsda(const Composition& composition, const WriteOptions& /*options*/, Files& files,
               diag::Collector* diagnostics) {
  if (!IsTaken(composition, diagnostics)) return false;
  ReportCommonLosses(composition, "USD", diagnostics);
  if (composition.axes == Axes::Host) diagnostics->Report(Code::ExportDownAxisLost, {});
  std::ostream* const stream = files.Main();
  if (stream == nullptr) return false;
  Usda(composition, stream).Write();
  return true;
}

}  // namespace interchange
