// Imports a scene text through the loaded module, as a user's import does, and shows what came of it.
#pragma once

#include <string>

#include "hostapi/LayerStreams.h"
#include "tests/support/LoadedHost.h"

namespace docs_test {

class SceneImport {
 public:
  // `text` is the whole file, byte for byte. The file is named shot.ma.
  explicit SceneImport(const std::string& text, refhost::HostOptions options = {});

  const refhost::CallbackResult& result() const { return result_; }
  const refhost::Project& project() const { return host_.project(); }

  // The first layer of that name; null, and a failed test, when there is none.
  const refhost::Layer* Layer(const std::string& name) const;
  std::size_t LayersNamed(const std::string& name) const;

  // A component of a stream's static value, and its keys.
  double Value(const std::string& layer, std::int32_t streamId, int component = 0) const;
  double KeyValue(const std::string& layer, std::int32_t streamId, std::size_t key, int component = 0) const;
  T_Time KeyTime(const std::string& layer, std::int32_t streamId, std::size_t key) const;
  std::size_t KeyCount(const std::string& layer, std::int32_t streamId) const;

 private:
  const refhost::Stream* Stream(const std::string& layer, std::int32_t streamId) const;

  testsupport::LoadedHost host_;
  refhost::CallbackResult result_;
};

// A scene in square pixels (640 by 480) and frames of 1/24 s, with these commands.
std::string Scene(const std::string& commands);

// A camera "camShape" under a transform "cam" that has these attributes; the camera is left current.
std::string Camera(const std::string& transformAttributes = "");

// A curve with these times and values.
std::string Curve(const std::string& name, const std::string& keys);

// Wires a curve to a channel.
std::string Drive(const std::string& curve, const std::string& plug);

// The host's numbers of the streams.
inline constexpr std::int32_t kPointOfInterest = HOST_STREAM_ANCHOR_POINT;
inline constexpr std::int32_t kPosition = HOST_STREAM_POSITION;
inline constexpr std::int32_t kScale = HOST_STREAM_SCALE;
inline constexpr std::int32_t kRotationZ = HOST_STREAM_ROTATION_Z;
inline constexpr std::int32_t kRotationX = HOST_STREAM_ROTATION_X;
inline constexpr std::int32_t kRotationY = HOST_STREAM_ROTATION_Y;
inline constexpr std::int32_t kZoom = HOST_STREAM_ZOOM;

// The zoom of a camera with all defaults in Scene(): 35 mm over 1.4173 inches, 640 pixels wide.
inline constexpr double kDefaultZoom = 640.0 * 35.0 / 25.4 / 1.4173;

}  // namespace docs_test
