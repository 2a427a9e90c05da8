// A plain description of one composition, for writers: layers, places and lenses at every frame. It knows
// neither host nor reader.
#pragma once

#include <cstddef>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace interchange {

// A value that stays, or one that moves: by a value for each frame, or by keys, with straight lines between
// them and level outside. Copies share the values.
class Channel {
 public:
  // The places of keys: rising, counted from the composition's first frame; may be fractions and below 0.
  using Places = std::shared_ptr<const std::vector<double>>;

  Channel(double value = 0.0) : value_(value) {}
  // One value a frame; at least one.
  explicit Channel(std::vector<double> perFrame)
      : values_(std::make_shared<const std::vector<double>>(std::move(perFrame))) {}
  // A value a key; at least one. Channels with keys at the same places share them.
  Channel(Places places, std::vector<double> values)
      : values_(std::make_shared<const std::vector<double>>(std::move(values))), places_(std::move(places)) {}

  bool moves() const { return values_ != nullptr; }

  // `frame` counts from 0, and is below the composition's frames.
  double at(std::size_t frame) const {
    if (!values_) return value_;
    return places_ ? AtKeys(static_cast<double>(frame)) : (*values_)[frame];
  }

  // Whether at() gives a finite value for each of so many frames.
  bool IsSound(std::size_t frames) const;

 private:
  double AtKeys(double frame) const;

  double value_ = 0.0;
  std::shared_ptr<const std::vector<double>> values_;  // null: the value stays
  Places places_;                                      // null: a value for each frame
};

// The axes of positions and rotations, and where a camera without rotation looks.
enum class Axes {
  Scene,  // y up, right-handed, a camera looks along -z
  Host,   // y down, right-handed, a camera looks along +z, its picture's up is -y
};

enum class LayerKind { Camera, Null };

// The lens of a camera. A point at (x, y, z) in the camera's own axes of the scene (z below 0) lands
// at (x, y)·zoom/-z pixels to the right of the middle and above it.
struct Lens {
  Channel zoom = 1.0;                 // pixels of the composition's width and height
  double filmWidth = 36.0;            // millimetres; the focal length is zoom·filmWidth/width
  double filmHeight = 20.25;          // millimetres; filmWidth·height/width
  std::optional<double> filmOffsetX;  // inches, right and up, where known
  std::optional<double> filmOffsetY;
  std::optional<double> squeeze;  // of the scene's lens, where known
};

// The keys of one stream as the composition has them, for lists of keys, in units and axes of the
// description.
struct StreamKeys {
  std::string_view stream;     // "position", …; a literal
  std::size_t components = 1;  // 1 or 3 values a key
  Channel::Places frames;      // not null: the scene's own numbers, rising; streams may share them
  Channel values[3];           // a component each, with a value for each key
};

struct Layer {
  std::string name;  // any bytes; may be empty, may stand twice
  LayerKind kind = LayerKind::Null;
  std::optional<std::size_t> parent;   // index in layers; a parent may stand after its children
  Channel position[3];                 // units of the description
  Channel rotation[3];                 // degrees about x, y, z: the linear part is Rz·Ry·Rx·S
  Channel scale[3] = {1.0, 1.0, 1.0};  // 1 is whole
  bool aimed = false;                  // a camera that first looks at `interest`, without a roll, and then
  Channel interest[3];                 // turns in that frame; a point in the space of `position`
  std::optional<Lens> lens;            // of a camera
  std::vector<StreamKeys> keys;        // only where a list of keys was asked for
};

// Numbers are not checked. Writers get only compositions that IsWritable() accepts (export/Format.h).
struct Composition {
  std::string name;          // any bytes
  double width = 1.0;        // pixels, square
  double height = 1.0;       // pixels
  double pixelAspect = 1.0;  // of the composition that shows this one
  double framesPerSecond = 24.0;
  double firstFrame = 1.0;      // the scene's own number of the first frame; may be a fraction
  std::size_t frames = 1;       // one apart; at least one
  double metersPerUnit = 0.01;  // of one unit of the lengths here
  Axes axes = Axes::Scene;
  std::vector<Layer> layers;

  // The scene's own number of a frame; `frame` counts from 0.
  double FrameNumber(std::size_t frame) const { return firstFrame + static_cast<double>(frame); }
};

}  // namespace interchange
