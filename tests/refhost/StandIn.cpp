#include "tests/refhost/StandIn.h"

#include <utility>

namespace refhost {
namespace {

const HostUTF16Unit kCompName[] = {'s', 'h', 'o', 't', 0};

HostOptions prepared(HostOptions options, std::ostream* trace) {
  options.pluginId = kPluginId;
  options.trace = trace;
  return options;
}

}  // namespace

StandIn::StandIn(HostOptions options, Callback callback, bool traced)
    : host_(prepared(std::move(options), traced ? &trace_ : nullptr)),
      folder_(host_.beginCallback(callback, "scene.ma")) {}

VOR_Item* StandIn::enterAgain(Callback callback) {
  folder_ = host_.beginCallback(callback, "again.ma");
  return folder_;
}

std::vector<std::string> StandIn::lines() const {
  std::istringstream in(trace_.str());
  std::vector<std::string> lines;
  for (std::string line; std::getline(in, line);) lines.push_back(line);
  if (!lines.empty()) lines.erase(lines.begin());
  return lines;
}

VOR_CompItem* StandIn::makeComp() {
  const HostRatio square{1, 1};
  const T_Time duration{10, 1};
  const HostRatio rate{25, 1};
  VOR_CompItem* comp = nullptr;
  EXPECT_EQ(kCompSuite21.CreateComp(folder_, kCompName, 640, 480, &square, &duration, &rate, &comp), 0);
  return comp;
}

VOR_Layer* StandIn::makeNull(VOR_CompItem* comp, const char* name) {
  const T_Time wholeLength{0, 0};
  VOR_Layer* layer = nullptr;
  EXPECT_EQ(kCompSuite9.NewNullLayer(name, comp, &wholeLength, &layer), 0);
  return layer;
}

VOR_Layer* StandIn::makeCamera(VOR_CompItem* comp) {
  VOR_Layer* layer = nullptr;
  EXPECT_EQ(kCompSuite9.NewCameraLayer("cam", comp, HOST_CAMERA_CENTER_ANYWHERE, HOST_CAMERA_CENTER_ANYWHERE,
                                       &layer),
            0);
  return layer;
}

VOR_Stream* StandIn::acquire(VOR_Layer* layer, std::int32_t id) {
  VOR_Stream* stream = nullptr;
  EXPECT_EQ(kStreamSuite7.AcquireLayerStream(kPluginId, layer, id, &stream), 0);
  return stream;
}

VOR_AddKeyframesInfo* StandIn::open(VOR_Stream* stream) {
  VOR_AddKeyframesInfo* batch = nullptr;
  EXPECT_EQ(kKeyframeSuite3.BeginKeyframeBatch(stream, &batch), 0);
  return batch;
}

void StandIn::addKey(VOR_AddKeyframesInfo* batch, VOR_Stream* stream, T_Time time, double x, double y,
                     double z) {
  std::int32_t index = -1;
  ASSERT_EQ(kKeyframeSuite3.AddBatchKeyframe(batch, HOST_TIME_MODE_COMP, &time, &index), 0);
  const StreamValueRecord record{stream, {x, y, z, 0.0}};
  ASSERT_EQ(kKeyframeSuite4.SetBatchKeyframeValue(batch, index, &record), 0);
}

HostOptions withFailure(const Failure& failure) {
  HostOptions options;
  options.failures.push_back(failure);
  return options;
}

Failure codeFailure(const char* operation, std::int64_t nth, HostError code) {
  Failure failure;
  failure.operation = operation;
  failure.nth = nth;
  failure.code = code;
  return failure;
}

}  // namespace refhost
