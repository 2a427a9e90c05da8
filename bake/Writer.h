// The text of a baked scene.
#pragma once

#include <cstddef>
#include <cstdint>
#include <ostream>
#include <string>
#include <string_view>
#include <vector>

#include "bake/Bake.h"
#include "bake/Head.h"
#include "bake/Track.h"
#include "bake/UniqueNames.h"

namespace bake {

// Writes commands in the order of the calls; the curves of a node are written right after it and connected at
// the end. A write that fails shows in the stream's state.
class Writer {
 public:
  // Both must outlive the writer.
  Writer(std::ostream& out, const FrameRange& frames);

  // The beginning of the file; comes first.
  void Begin(const Origin& origin, const Head& head);

  // A transform with its curves. Names are those that TakeName gave; an empty parent is the world.
  void Transform(const std::string& name, const std::string& parent, std::string_view path,
                 const Track& track);
  void Camera(const std::string& name, const std::string& parent, std::string_view path,
              const LensTrack& lens);
  void Locator(const std::string& name, const std::string& parent, std::string_view path);

  // A name that no other node of the bake has.
  std::string TakeName(std::string_view wanted) { return names_.Take(wanted); }

  // The resolution, what plays, and the connections; comes last.
  void End(const Head& head);

 private:
  struct Moving {
    std::string plug;   // ".tx"
    std::string curve;  // what the curve is called
    const char* type;   // of the curve
    const Channel* keys;
  };

  void CreateNode(std::string_view type, const std::string& name, const std::string& parent,
                  std::string_view path);
  void Triple(const char* attribute, const Track& track, std::size_t firstSlot);
  void Curves(const std::string& node, const std::vector<Moving>& channels);
  void Keys(const Channel& channel);
  void AppendKeys(const Channel& channel, std::size_t first, std::size_t last);
  void MakeTimes();
  void Number(double value);
  void Text(std::string_view text) { buffer_ += text; }
  void Flush();

  std::ostream& out_;
  const FrameRange& frames_;
  UniqueNames names_;
  std::string buffer_;
  std::string connections_;
  std::string times_;                    // of all keys, each after the white space before it
  std::vector<std::uint32_t> timeEnds_;  // in times_, by key
};

}  // namespace bake
