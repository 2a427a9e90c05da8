// The composition builder's members, called one by one in an import of the embedded host.
#pragma once

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <memory>
#include <sstream>
#include <string>
#include <string_view>
#include <vector>

#include "hostapi/ErrorCodes.h"
#include "hostapi/LayerStreams.h"
#include "maya/MAYA_Parse.h"
#include "refhost/Host.h"

using namespace mayaimport;

namespace testsupport {

inline constexpr std::int32_t kBuilderPluginId = 7;

// Streams by their numbers.
inline constexpr int kAnchor = HOST_STREAM_ANCHOR_POINT;
inline constexpr int kPosition = HOST_STREAM_POSITION;
inline constexpr int kScale = HOST_STREAM_SCALE;
inline constexpr int kZRotation = HOST_STREAM_ROTATION_Z;
inline constexpr int kXRotation = HOST_STREAM_ROTATION_X;
inline constexpr int kYRotation = HOST_STREAM_ROTATION_Y;
inline constexpr int kZoom = HOST_STREAM_ZOOM;

class BuilderTest : public ::testing::Test {
 protected:
  BuilderTest();

  // Nothing may be left behind but what the importer keeps by design.
  ~BuilderTest() override;

  // Begins an import in a new host, reads the text and acquires every suite that building uses, so that the
  // trace holds what a test calls and nothing else.
  void Begin(std::string_view text = "", refhost::HostOptions options = {});

  // The same without acquiring anything.
  void BeginCold(std::string_view text = "", refhost::HostOptions options = {});

  // Ends the parser and the import.
  refhost::CallbackResult End(HostError code = 0);

  MAYA_Parse& parser() { return *parser_; }
  refhost::Host& host() { return *host_; }
  VOR_Item* folder() { return folder_; }

  // Layers of a composition that the first of them makes. Their calls are not in the trace that TakeTrace
  // gives.
  VOR_CompItem* Comp();
  VOR_Layer* NewCamera(const char* name = "camera");
  VOR_Layer* NewNull(const char* name = "null");

  // The lines that the trace has grown by since the last time.
  std::vector<std::string> TakeTrace();

  // Copies of the records that were read.
  MAYA_Transform TransformAt(std::int64_t index);
  MAYA_Camera CameraAt(std::int64_t index);

  // A stream of the layer that was made last.
  const refhost::Stream& StreamOf(int id);

  // The keys of a stream of the layer that was made last: times as they are, and one component.
  std::vector<T_Time> KeyTimes(int id);
  std::vector<double> KeyValues(int id, std::size_t component = 0);

 private:
  std::ostringstream written_;
  std::size_t taken_ = 0;
  std::unique_ptr<refhost::Host> host_;
  std::string text_;
  std::unique_ptr<MAYA_Parse> parser_;
  VOR_Item* folder_ = nullptr;
  VOR_CompItem* comp_ = nullptr;
};

// The code that the work throws; 0 when it throws none.
template <typename Work>
HostError CodeOf(Work&& work) {
  try {
    work();
    return 0;
  } catch (int code) {
    return code;
  }
}

}  // namespace testsupport

// Times and ratios as tests want to see them; found by the types' own namespace.
inline bool operator==(const T_Time& a, const T_Time& b) { return a.value == b.value && a.scale == b.scale; }
inline bool operator==(const HostRatio& a, const HostRatio& b) {
  return a.numerator == b.numerator && a.denominator == b.denominator;
}
inline void PrintTo(const T_Time& time, std::ostream* out) { *out << time.value << '/' << time.scale; }
inline void PrintTo(const HostRatio& ratio, std::ostream* out) {
  *out << ratio.numerator << '/' << ratio.denominator;
}
