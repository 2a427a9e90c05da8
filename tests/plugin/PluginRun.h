// The plug-in, linked into the test, under the embedded host.
#pragma once

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <filesystem>
#include <memory>
#include <sstream>
#include <string>
#include <string_view>
#include <vector>

#include "hostapi/ErrorCodes.h"
#include "refhost/Host.h"
#include "tests/support/TemporaryFolder.h"

namespace testsupport {

inline constexpr std::int32_t kRunPluginId = 7;
inline constexpr HostError kRehearsed = 7321;

// A camera above which stands a transform, with keys on both.
inline constexpr const char* kScene =
    "//Maya ASCII 2020 scene\n"
    "createNode transform -n \"rig\";\n\tsetAttr \".t\" -type \"double3\" 1 2 3 ;\n"
    "createNode transform -n \"cam\" -p \"rig\";\n"
    "createNode camera -n \"camShape\" -p \"cam\";\n\tsetAttr \".fl\" 50;\n"
    "createNode animCurveTL -n \"rig_tx\";\n\tsetAttr -s 2 \".ktv[0:1]\" 1 0 10 100;\n"
    "createNode animCurveTU -n \"cam_fl\";\n\tsetAttr -s 2 \".ktv[0:1]\" 1 35 10 50;\n"
    "connectAttr \"rig_tx.o\" \"rig.tx\";\nconnectAttr \"cam_fl.o\" \"camShape.fl\";\n";

inline refhost::Failure FailCall(const char* operation, std::int64_t nth, HostError code = kRehearsed) {
  return {operation, nth, false, refhost::Failure::Kind::Code, code};
}
inline refhost::Failure ThrowCall(const char* operation, std::int64_t nth,
                                  refhost::Failure::Kind kind = refhost::Failure::Kind::BadAlloc) {
  return {operation, nth, false, kind, 0};
}
inline refhost::Failure FailAt(std::int64_t nth, HostError code = kRehearsed) {
  return {"", nth, false, refhost::Failure::Kind::Code, code};
}
inline refhost::Failure ThrowAt(std::int64_t nth, refhost::Failure::Kind kind) {
  return {"", nth, false, kind, 0};
}

class PluginTest : public ::testing::Test {
 protected:
  PluginTest();
  ~PluginTest() override;

  // Loads the plug-in into a new host. The options' plug-in id, and trace, are the test's own.
  refhost::CallbackResult Load(refhost::HostOptions options = {});

  // Loads it and makes the callback with these failures.
  refhost::CallbackResult Import(const std::filesystem::path& path,
                                 std::vector<refhost::Failure> failures = {});
  refhost::CallbackResult Verify(const std::filesystem::path& path,
                                 std::vector<refhost::Failure> failures = {});

  // Ends the host, and what a death hook that was not registered left.
  void EndHost();

  std::filesystem::path Write(const std::string& name, std::string_view bytes) const;

  // The calls that the trace holds for the last callback: name, and for the basic suite what it was about.
  std::vector<std::string> Calls() const;
  std::size_t CallsNamed(std::string_view name) const;
  // The first line of that call, or "".
  std::string LineOf(std::string_view name) const;

  std::vector<std::string> CompositionNames(const refhost::CallbackResult& result) const;

  // Whatever was made to fail: no exception left the plug-in, and nothing was left behind.
  void ExpectSound(const refhost::CallbackResult& result) const;

  const std::filesystem::path& folder() const { return folder_.path(); }

  std::unique_ptr<refhost::Host> host_;

 private:
  std::vector<std::string> Lines() const;

  TemporaryFolder folder_;
  std::ostringstream trace_;
};

}  // namespace testsupport
