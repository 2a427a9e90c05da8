#include "tests/export/HostileCompositions.h"

#include <gtest/gtest.h>

#include <cmath>
#include <limits>
#include <set>
#include <utility>
#include <vector>

#include "export/SafeNames.h"
#include "tests/support/SplitMix.h"

namespace interchange_test {
namespace {

using interchange::Channel;
using interchange::Composition;
using interchange::Layer;
using interchange::LayerKind;
using interchange::Lens;

class Maker {
 public:
  explicit Maker(std::uint64_t seed) : state_(seed * 7919 + 17) {}

  Composition Make() {
    notFinite_ = OneIn(10);
    huge_ = OneIn(5);
    Composition composition;
    composition.name = Name();
    composition.width = OneIn(40) ? Any() : 1.0 + Whole(8192);
    composition.height = OneIn(40) ? Any() : 1.0 + Whole(8192);
    composition.pixelAspect = OneIn(5) ? Pick({0.5, 2.0, 1.4587}) : 1.0;
    composition.framesPerSecond = OneIn(40) ? Any() : Pick({24.0, 23.976, 29.97, 25.0, 0.001, 6000.0});
    composition.firstFrame = OneIn(20) ? Pick({1e300, -1e300, 1e19, -1e19, 0x1p53, -0x1p53 + 6.0})
                                       : Pick({1.0, 0.0, -20.0, 1001.0, 0.25, 1e9});
    composition.frames = OneIn(3) ? 1 : 1 + static_cast<std::size_t>(Whole(12));
    composition.metersPerUnit = Pick({0.01, 1.0, 0.0254, 1e-6, 1609.344});
    composition.axes = OneIn(2) ? interchange::Axes::Scene : interchange::Axes::Host;
    const auto layers = static_cast<std::size_t>(OneIn(12) ? 0 : OneIn(60) ? 60 : Whole(8) + 1);
    const bool cameras = !OneIn(6);
    for (std::size_t i = 0; i < layers; ++i) {
      composition.layers.push_back(MakeLayer(composition, i, layers, cameras && OneIn(2)));
    }
    if (layers > 1 && OneIn(30))
      composition.layers[0].parent = layers - 1;  // a circle, where the way leads back
    return composition;
  }

 private:
  std::uint64_t Next() { return testsupport::SplitMix(&state_); }
  bool OneIn(std::uint64_t n) { return Next() % n == 0; }
  double Whole(std::uint64_t below) { return static_cast<double>(Next() % below); }
  double Unit() { return static_cast<double>(Next() >> 11) * 0x1.0p-53; }

  template <typename T>
  T Pick(std::initializer_list<T> all) {
    return all.begin()[Next() % all.size()];
  }

  // Any number at all.
  double Any() {
    return Pick({0.0, -0.0, -1.0, 1e-320, 1e300, -1e300, 4e38, 1e-45,
                 notFinite_ ? std::numeric_limits<double>::quiet_NaN() : 2.0,
                 notFinite_ ? std::numeric_limits<double>::infinity() : 3.0});
  }

  double Number(double reach) {
    if (huge_ && OneIn(8)) return Any();
    if (notFinite_ && OneIn(20)) return Any();
    return (Unit() * 2.0 - 1.0) * reach;
  }

  Channel Values(const Composition& composition, double reach, double about = 0.0) {
    if (OneIn(2)) return about + Number(reach);
    std::vector<double> values;
    if (OneIn(2)) {
      for (std::size_t i = 0; i < composition.frames; ++i) values.push_back(about + Number(reach));
      return Channel(std::move(values));
    }
    std::vector<double> places;
    double place = Number(3.0);
    for (double i = Whole(6); i >= 0.0; --i) {
      places.push_back(place);
      values.push_back(about + Number(reach));
      place += 0.01 + Unit() * 9.0;
    }
    return Channel(std::make_shared<const std::vector<double>>(std::move(places)), std::move(values));
  }

  std::string Bytes() {
    std::string bytes;
    for (double i = Whole(30); i > 0.0; --i) bytes += static_cast<char>(Next() & 0xff);
    return bytes;
  }

  std::string Name() {
    return Pick<std::string>({"shotcam",
                              "shotcam",
                              "SHOTCAM",
                              "",
                              "arm",
                              "=1+cmd|' /C calc'!A0",
                              "+1",
                              "-1",
                              "@x",
                              "\t=1",
                              "a,b",
                              "say \"x\"",
                              "two\nlines",
                              "cr\r",
                              "../../etc/passwd",
                              "/",
                              "..",
                              ".",
                              "con",
                              "a<b>&c",
                              "\"\\",
                              "{}",
                              "#usda 1.0",
                              "1st",
                              "\xff\xfe",
                              "\xed\xa0\x80",
                              "\xe3\x82\xab\xe3\x83\xa1\xe3\x83\xa9",
                              "\xe2\x80\xae",
                              std::string("nul\0in", 6),
                              std::string(3000, 'x'),
                              Bytes(),
                              Bytes()});
  }

  Lens MakeLens(const Composition& composition) {
    Lens lens;
    lens.zoom = OneIn(30) ? Values(composition, 1000.0) : Values(composition, 900.0, 1000.0);
    lens.filmWidth = OneIn(40) ? Any() : 1.0 + Unit() * 70.0;
    lens.filmHeight = lens.filmWidth * composition.height / composition.width;
    if (OneIn(4)) lens.filmOffsetX = Number(0.5);
    if (OneIn(4)) lens.filmOffsetY = Number(0.5);
    if (OneIn(4)) lens.squeeze = Pick({1.0, 2.0, 1.33});
    return lens;
  }

  Layer MakeLayer(const Composition& composition, std::size_t index, std::size_t layers, bool camera) {
    Layer layer;
    layer.name = Name();
    for (int axis = 0; axis < 3; ++axis) {
      layer.position[axis] = Values(composition, 5000.0);
      layer.rotation[axis] = Values(composition, 720.0);
      if (OneIn(3)) layer.scale[axis] = Values(composition, 3.0);
      if (OneIn(8)) layer.scale[axis] = 0.0;
    }
    // Up to the last layer, or down: never in a circle by itself.
    const bool upwards = (layers & 1) != 0;
    if (OneIn(2) && !upwards && index > 0) layer.parent = index - 1;
    if (OneIn(2) && upwards && index + 1 < layers) layer.parent = index + 1;
    if (!camera) return layer;
    layer.kind = LayerKind::Camera;
    if (!OneIn(60)) layer.lens = MakeLens(composition);
    layer.aimed = OneIn(3);
    for (int axis = 0; axis < 3; ++axis) {
      layer.interest[axis] = OneIn(4) ? layer.position[axis] : Values(composition, 5000.0);
    }
    return layer;
  }

  std::uint64_t state_;
  bool notFinite_ = false;
  bool huge_ = false;
};

}  // namespace

Composition HostileComposition(std::uint64_t seed) { return Maker(seed).Make(); }

std::ostream* FilesInMemory::Main() {
  EXPECT_EQ(main_, nullptr) << "the main output is asked for once";
  main_ = std::make_unique<std::ostringstream>();
  return main_.get();
}

std::ostream* FilesInMemory::Beside(std::string_view part, std::string_view suffix, std::string* name) {
  // A dot and a safe name, where anything is added to the name that the user gave.
  const std::string_view added = part.substr(part.empty() ? 0 : 1);
  EXPECT_TRUE(part.empty() || part.front() == '.');
  EXPECT_EQ(interchange::SafeName(added, ""), added);
  const std::string stem = stem_ + std::string(part);
  *name = stem + std::string(suffix);
  for (int number = 2; beside_.count(*name) != 0; ++number) {
    *name = stem + '_' + std::to_string(number) + std::string(suffix);
  }
  return (beside_[*name] = std::make_unique<std::ostringstream>()).get();
}

std::map<std::string, std::string> FilesInMemory::beside() const {
  std::map<std::string, std::string> all;
  for (const auto& [name, stream] : beside_) all[name] = stream->str();
  return all;
}

}  // namespace interchange_test
