// Runs the built tool in a folder of its own and catches all that comes out.
#pragma once

#include <gtest/gtest.h>

#include <filesystem>
#include <map>
#include <string>
#include <string_view>
#include <vector>

#include "tests/support/TemporaryFolder.h"

namespace mayascene_test {

struct ToolResult {
  int status = 0;   // the exit status; -1 when a signal ended the run
  int signal = 0;   // the signal that ended the run, or 0
  std::string out;  // standard output
  std::string err;  // standard error
};

// A test with a folder of its own, in which the tool runs. The user's configuration is in it too, so that no
// run reads or writes the tester's own.
class ToolTest : public ::testing::Test {
 protected:
  // Runs the tool with these arguments and waits for its end.
  ToolResult run(const std::vector<std::string>& arguments) const;

  // The same with both standard streams on one terminal, whose text is in `out`.
  ToolResult runOnTerminal(const std::vector<std::string>& arguments) const;

  // Starts the tool and returns its process id; end(id) waits for it.
  int start(const std::vector<std::string>& arguments) const;
  ToolResult end(int process) const;

  std::filesystem::path path(std::string_view name) const { return folder_.path() / name; }
  void write(std::string_view name, std::string_view text) const;
  std::string read(std::string_view name) const;
  std::vector<std::string> files() const;  // names in the folder, sorted

  std::map<std::string, std::string>
      environment;  // what the runs find; PATH, HOME, XDG_CONFIG_HOME and TERM have defaults
  std::vector<int> closedDescriptors;  // of 0, 1 and 2, what the runs find closed
  std::string workingFolder;           // where the runs start; empty: the test's own folder

 private:
  int spawn(const std::vector<std::string>& arguments, const std::string& out, const std::string& err) const;

  testsupport::TemporaryFolder folder_;
  testsupport::TemporaryFolder captured_;
};

// A scene of the given commands, in frames of film, 640 by 360 square pixels.
std::string sceneText(std::string_view commands);

// A camera at rest.
std::string_view stillCamera();

// A camera under a boom that turns by three keys.
std::string_view craneCamera();

}  // namespace mayascene_test
