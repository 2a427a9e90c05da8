// The project that the embedded host holds in memory: what imports have made, for reading.
//
// All objects belong to the Project and live as long as it does; pointers among them are never owning.
// Numbers ("number") count from 1 within each kind, in the order in which the host handed the objects out,
// and are the numbers of the call trace ("comp:1", "layer:7").
#pragma once

#include <cstddef>
#include <cstdint>
#include <deque>
#include <memory>
#include <string>
#include <vector>

#include "hostapi/HostTypes.h"
#include "hostapi/LayerStreams.h"
#include "refhost/KeyTimes.h"

namespace refhost {

struct Composition;
struct Layer;

// The film direction of a camera without a film size.
inline constexpr std::int32_t kFilmNeverSet = 0;

// The keys of one stream, sorted by time, no two at one time. values holds `dimension` numbers per key.
struct KeyColumns {
  KeyTimes times;
  std::vector<double> values;
};

// One animatable property of a layer.
struct Stream {
  std::int32_t id = HOST_STREAM_ANCHOR_POINT;  // LayerStreamId
  std::int32_t dimension = 0;                  // 1 or 3
  double value[3] = {0.0, 0.0, 0.0};           // the static value; stays when keys are added
  std::unique_ptr<KeyColumns> keys;            // null when the stream has none

  std::size_t keyCount() const { return keys ? keys->times.size() : 0; }
};

enum class LayerKind { Camera, Null, Composition };

struct Layer {
  std::int32_t number = 0;
  LayerKind kind = LayerKind::Null;
  std::string name;  // bytes as the importer gave them; may be empty or no UTF-8
  Composition* composition = nullptr;
  Layer* parent = nullptr;        // null: none
  Composition* source = nullptr;  // what a nested composition layer shows; else null
  bool threeDimensional = false;  // layer flag 0x800
  bool aimed = false;             // layer flag 8192: a camera that looks at its point of interest
  std::int32_t childCount = 0;    // layers whose parent this one is
  std::int32_t filmDirection = kFilmNeverSet;  // camera: HOST_FILM_HORIZONTAL or HOST_FILM_VERTICAL
  double filmSize = 0.0;                       // camera: points; 0 when never set
  std::vector<Stream> streams;                 // camera: 0, 1, 2, 3, 8, 9, 11; others: 0, 1, 2, 3, 8, 9

  const Stream* findStream(std::int32_t id) const;  // null when the layer has none of that id
};

struct Composition {
  std::int32_t number = 0;
  std::int32_t itemNumber = 0;  // 0 until the composition was asked for its item
  std::string name;             // UTF-8; what cannot be decoded is U+FFFD
  std::int32_t width = 0;       // pixels
  std::int32_t height = 0;      // pixels
  HostRatio pixelAspect{1, 1};
  T_Time duration{0, 1};
  HostRatio frameRate{1, 1};
  std::vector<Layer*> layers;  // in the order in which they were made
};

// A folder of the project: each imported scene has one of its own.
struct Folder {
  std::int32_t itemNumber = 0;
  std::vector<Composition*> compositions;  // in the order in which they were made
};

class Project {
 public:
  const std::deque<Folder>& folders() const { return folders_; }
  const std::deque<Composition>& compositions() const { return compositions_; }
  const std::deque<Layer>& layers() const { return layers_; }

 private:
  friend class ProjectEditor;
  std::deque<Folder> folders_;
  std::deque<Composition> compositions_;
  std::deque<Layer> layers_;
};

}  // namespace refhost
