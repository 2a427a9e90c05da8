// Compositions as no host in good order holds them.
#include <iterator>
#include <limits>
#include <memory>

#include "tests/export/Shots.h"
#include "tests/support/SplitMix.h"

namespace exporttest {
namespace {

using interchange::Axes;
using interchange::Channel;
using interchange::Composition;
using interchange::Layer;
using interchange::LayerKind;

class Hostile {
 public:
  explicit Hostile(std::uint64_t seed) : state_(seed) {}

  Composition Whole() {
    Composition whole;
    // Most are wrong in a few places only, so that writers get to see the rest.
    wrong_ = Below(3) == 0 ? 40 : 0;
    whole.name = Name();
    whole.width = Wrong() ? Odd() : 1 + static_cast<double>(Below(4000));
    whole.height = Wrong() ? Odd() : 1 + static_cast<double>(Below(4000));
    whole.pixelAspect = Wrong() ? Odd() : 0.5 + Part();
    whole.framesPerSecond = Wrong() ? Odd() : 1 + 100 * Part();
    whole.firstFrame = Wrong() ? Odd() : static_cast<double>(Below(3000)) - 500 + (Below(4) == 0 ? 0.5 : 0.0);
    whole.frames = Wrong() ? Below(2) : 1 + (Below(2) == 0 ? Below(30) : 0);
    whole.metersPerUnit = Wrong() ? Odd() : 0.001 + Part();
    whole.axes = Below(2) == 0 ? Axes::Scene : Axes::Host;
    frames_ = whole.frames;
    whole.layers.resize(Below(8) == 0 ? 0 : Below(9));
    for (Layer& layer : whole.layers) Fill(layer, whole.layers.size());
    return whole;
  }

 private:
  std::uint64_t Below(std::uint64_t bound) { return testsupport::SplitMix(&state_) % bound; }
  double Part() { return static_cast<double>(Below(1u << 30)) / (1u << 30); }
  bool Wrong() { return wrong_ != 0 && Below(wrong_) == 0; }

  double Odd() {
    using Limits = std::numeric_limits<double>;
    const double odd[] = {0,
                          -0.0,
                          -1,
                          1e-300,
                          5e-324,
                          1e40,
                          -1e40,
                          1e300,
                          Limits::max(),
                          -Limits::max(),
                          Limits::infinity(),
                          -Limits::infinity(),
                          Limits::quiet_NaN(),
                          1e9,
                          1e17,
                          3.5e38};
    return odd[Below(std::size(odd))];
  }

  std::string Name() {
    static const std::string kNames[] = {"",
                                         "cam",
                                         "cam",
                                         "CAM",
                                         "null1",
                                         "a b",
                                         "../../up",
                                         "C:\\con",
                                         "con",
                                         "..",
                                         ".",
                                         "/",
                                         "=1+1",
                                         "@x",
                                         "-r",
                                         "\"",
                                         "'",
                                         "\\",
                                         "a\"b\\c",
                                         "line\nfeed",
                                         "tab\tcr\r",
                                         std::string("nul\0l", 5),
                                         "\x1b[2J",
                                         "\x7f",
                                         "\xff\xfe",
                                         "\xc3",
                                         "\xed\xa0\x80",
                                         "caf\xc3\xa9",
                                         "\xf0\x9f\x8e\xa5",
                                         "\xe2\x80\xae"
                                         "rtl",
                                         "7up",
                                         "def Xform \"x\" {",
                                         "}",
                                         "\"\"\"",
                                         "#usda",
                                         "</x>",
                                         "%2e%2e",
                                         "a,b;c",
                                         "x:y|z",
                                         "|grp|cam",
                                         "ns:cam",
                                         "_",
                                         "__",
                                         "\xef\xbb\xbf"
                                         "bom",
                                         std::string(300, 'n'),
                                         std::string(5000, '"')};
    if (Below(5) != 0) return kNames[Below(std::size(kNames))];
    std::string bytes;
    for (std::uint64_t left = Below(12); left > 0; --left) bytes += static_cast<char>(Below(256));
    return bytes;
  }

  double Number(double size) { return Wrong() ? Odd() : (Part() - 0.5) * size; }

  Channel Value(double size, double middle) {
    const std::uint64_t kind = Below(4);
    const std::size_t count = kind == 3 ? 1 + Below(4) : Wrong() ? Below(40) : frames_;
    if (kind < 2 || count == 0) return {middle + Number(size)};
    std::vector<double> values;
    for (std::size_t i = 0; i < count; ++i) values.push_back(middle + Number(size));
    if (kind == 2) return Channel(values);
    std::vector<double> places = {Part() * 10 - 5};
    while (places.size() < count) places.push_back(places.back() + 0.1 + Part() * 10);
    return {std::make_shared<const std::vector<double>>(places), values};
  }

  void Fill(Layer& layer, std::size_t layers) {
    layer.name = Name();
    layer.kind = Below(2) == 0 ? LayerKind::Camera : LayerKind::Null;
    if (Below(2) == 0) layer.parent = Below(Wrong() ? layers + 2 : layers);
    // A circle is found often enough without one that is a single layer.
    if (layer.parent && !Wrong() && *layer.parent >= given_) layer.parent.reset();
    ++given_;
    for (std::size_t i = 0; i < 3; ++i) {
      layer.position[i] = Value(Below(5) == 0 ? 1e6 : 100, 0);
      layer.rotation[i] = Value(Below(5) == 0 ? 1e5 : 300, 0);
      layer.scale[i] = Below(3) == 0 ? Value(2, Below(5) == 0 ? 0 : 1.5) : Channel(1.0);
      layer.interest[i] = Value(100, 0);
    }
    layer.aimed = layer.kind == LayerKind::Camera && Below(2) == 0;
    if (layer.kind == LayerKind::Camera && !Wrong()) FillLens(layer.lens.emplace());
  }

  void FillLens(interchange::Lens& lens) {
    lens.zoom = Value(1000, 1500);
    lens.filmWidth = Wrong() ? Odd() : 1 + 70 * Part();
    lens.filmHeight = Wrong() ? Odd() : 1 + 70 * Part();
    if (Below(3) == 0) lens.filmOffsetX = Number(1);
    if (Below(3) == 0) lens.filmOffsetY = Number(1);
    if (Below(3) == 0) lens.squeeze = Number(4);
  }

  std::uint64_t state_;
  std::uint64_t wrong_ = 0;  // one value of so many
  std::size_t frames_ = 1;
  std::size_t given_ = 0;
};

}  // namespace

Composition HostileComposition(std::uint64_t seed) { return Hostile(seed).Whole(); }

}  // namespace exporttest
