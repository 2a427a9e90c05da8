// Holds what came over against a scene, channel by channel: whatever differs must be said by a diagnostic
// that names the node.
#pragma once

#include <array>
#include <cstddef>
#include <initializer_list>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "check/Check.h"
#include "tests/check/PlainPlace.h"
#include "tests/check/PlainScene.h"

namespace check_test {

// How much was held against each other.
struct Compared {
  std::size_t scenes = 0;
  std::size_t layers = 0;
  std::size_t channels = 0;  // of layers: the nine of a place, the zoom, the point of interest
  std::size_t keys = 0;
  std::size_t ambiguous = 0;  // layers of nodes that a diagnostic calls ambiguous: not judged
  std::size_t stops = 0;
};

// Sines and cosines of two computations agree to this, of numbers near 1.
inline constexpr double kSamePlace = 1e-9;

// The numbers of a stream at a key; without a key, those of a stream that stands still.
inline Triple StreamAt(const check::CameOverStream& stream, std::optional<std::size_t> key,
                       std::size_t count) {
  Triple value{};
  for (std::size_t i = 0; i < count; ++i) value[i] = key ? stream.values[*key * count + i] : stream.value[i];
  return value;
}

class ChannelJudge {
 public:
  ChannelJudge(const PlainScene& scene, const check::CameOver& cameOver, const check::Report& report,
               Compared* compared);

  // The first contradiction in words; empty where there is none. The import ran to its end.
  std::string Run();

 private:
  using Codes = std::initializer_list<diag::Code>;

  struct Channel {
    const char* name;
    const char* longName;
    double neutral;
  };
  static const std::array<Channel, 9> kChannels;

  // Where the time of a layer begins, in the scene's unit. Infinite where nothing has keys; no value where
  // one of its nodes is ambiguous.
  using Start = std::optional<double>;

  // What one channel of a transform, or a focal length, comes from.
  struct Source {
    double stored = 0.0;
    bool skipped = false;              // the report says that the scene stores another number
    bool lost = false;                 // what drives it does not come over
    const PlainNode* curve = nullptr;  // that the import can follow
    std::size_t keys() const { return curve != nullptr ? curve->keys.size() / 2 : 0; }
    double time(std::size_t key) const { return curve->keys[2 * key]; }
    double value(std::size_t key) const { return curve->keys[2 * key + 1]; }
  };

  // A transform as the import can take it.
  struct Motion {
    std::vector<Source> channels;   // translate, rotate, scale
    std::vector<std::size_t> keys;  // their numbers in the scene; none: it stands still
    std::vector<double> times;      // of its keys, in the scene's unit
    bool together = true;           // all of its curves have their keys at these times
  };

  // ---- what the report says: ChannelJudgeWords.cpp ----
  bool Lies(const check::Finding& finding, const std::vector<Bytes>& text) const;
  bool Says(Codes codes, int node) const;
  bool SaysWith(Codes codes, std::initializer_list<std::string_view> arguments) const;
  bool SaysAt(Codes codes, Bytes text) const;
  bool SaysAnywhere(Codes codes) const;
  bool SaysOfChannel(int node, std::string_view channel, std::string_view driver) const;
  std::optional<double> NumberInstead(int node, const std::string& attribute) const;
  bool IsAmbiguous(int node) const;

  // ---- layers: ChannelJudge.cpp ----
  static bool IsCamera(const PlainNode& node);
  std::string JudgeCameras();
  std::string JudgeCamera(int shape, const check::CameOverLayer& layer, const check::CameraHead* head);
  std::string JudgeLocators();
  std::string JudgeLeftOver() const;
  std::string JudgeShapeAndChain(int shape, std::size_t layer, bool aimed);
  const check::CameOverLayer* TakeNext(check::LayerKind kind, std::string_view name);
  std::string JudgeHead(const check::CameraHead& head, const check::CameOverLayer& layer, int shape) const;

  // ---- places: ChannelJudgeMotion.cpp ----
  static bool AreTogether(const Motion& motion, std::size_t channels);
  void TakeKeys(int node, double first, const Source& lead, Motion* motion) const;
  Source SourceOf(int node, const std::string& attribute, double neutral) const;
  std::string ReadMotion(int node, int shape, bool aimed, Motion* motion) const;
  std::string JudgeDriver(int node, int shape, bool aimed, const Channel& channel) const;
  std::string JudgeAim(int node, int shape, const Motion& motion) const;
  std::string JudgeMotion(int node, int shape, bool aimed, const check::CameOverLayer& layer, Start start);
  std::string JudgeTimes(int node, const Motion& motion, const check::CameOverStream& stream,
                         Start start) const;
  PlainParts PartsAt(int node, const Motion& motion, std::optional<std::size_t> key) const;
  std::optional<double> FirstKeyOf(int node) const;
  Start StartOf(int shape) const;
  Start StartOfCameras() const;
  Start StartOfOthers(std::optional<double> first);

  // ---- zooms and points of interest: ChannelJudgeLens.cpp ----
  std::string JudgeZoom(int shape, const check::CameOverLayer& layer, Start start);
  double ZoomOfAnInch(int shape) const;
  std::string JudgeInterest(int transform, int shape, const check::CameOverLayer& layer);
  static bool IsLookAt(const PlainNode& node);
  int LookAtOf(int transform) const;
  int TargetOf(int lookAt) const;

  const PlainScene& scene_;
  const check::CameOver& cameOver_;
  const check::Report& report_;
  Compared& compared_;
  std::vector<bool> taken_;  // layers
  Start others_;             // where locators and targets begin; infinite before one is known
};

}  // namespace check_test
