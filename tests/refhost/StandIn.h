// Stands in for the plug-in: one host in a callback, and short forms for what most tests need first.
#pragma once

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cstdint>
#include <sstream>
#include <string>
#include <vector>

#include "hostapi/ErrorCodes.h"
#include "hostapi/LayerStreams.h"
#include "refhost/Host.h"
#include "refhost/SuiteRegistry.h"

namespace refhost {

inline constexpr std::int32_t kPluginId = 7;

class StandIn {
 public:
  // Begins the callback at once. The options' plug-in id and trace are the stand-in's own.
  explicit StandIn(HostOptions options = {}, Callback callback = Callback::Import, bool traced = true);

  Host& host() { return host_; }
  VOR_Item* folder() { return folder_; }

  CallbackResult leave() { return host_.endCallback(0); }
  VOR_Item* enterAgain(Callback callback);

  // The trace so far, without the line that entered the callback.
  std::vector<std::string> lines() const;
  std::string lastLine() const { return lines().back(); }

  // Each of these succeeds or fails the test.
  VOR_CompItem* makeComp();  // 640 x 480 pixels
  VOR_Layer* makeNull(VOR_CompItem* comp, const char* name = "null");
  VOR_Layer* makeCamera(VOR_CompItem* comp);
  VOR_Stream* acquire(VOR_Layer* layer, std::int32_t id);
  VOR_AddKeyframesInfo* open(VOR_Stream* stream);

  // Adds one key with its value through the given handle of the stream.
  static void addKey(VOR_AddKeyframesInfo* batch, VOR_Stream* stream, T_Time time, double x, double y = 0.0,
                     double z = 0.0);

 private:
  std::ostringstream trace_;
  Host host_;
  VOR_Item* folder_;
};

HostOptions withFailure(const Failure& failure);
Failure codeFailure(const char* operation, std::int64_t nth, HostError code);

}  // namespace refhost
