// A scene text through the whole importer, linked into the process, in the embedded host.
#pragma once

#include <filesystem>
#include <memory>
#include <sstream>
#include <string>
#include <string_view>
#include <vector>

#include "refhost/Host.h"
#include "tests/support/TemporaryFolder.h"

namespace testsupport {

// A file that is there as long as the object is, in a folder of its own.
class TemporaryFile {
 public:
  explicit TemporaryFile(std::string_view text, std::string_view name = "shot01.ma");

  const std::filesystem::path& path() const { return path_; }

 private:
  TemporaryFolder folder_;
  std::filesystem::path path_;
};

// One import in a host of its own; the host lives on, for looking at what it holds. One at a time.
struct ImportRun {
  std::unique_ptr<std::ostringstream> written;
  std::unique_ptr<refhost::Host> host;
  refhost::CallbackResult result;
  std::vector<std::string> trace;  // the suite calls of the import, without the lines around them
};

ImportRun ImportPath(const std::filesystem::path& scene, refhost::HostOptions options = {});
ImportRun ImportFile(const TemporaryFile& file, refhost::HostOptions options = {});
ImportRun ImportText(std::string_view text, refhost::HostOptions options = {});

// The same for another of the host's callbacks; the entry has no file.
ImportRun RunCallback(refhost::Callback callback, const std::filesystem::path& scene,
                      refhost::HostOptions options = {});

// Loads the importer into the host and makes the callback.
refhost::CallbackResult MakeCallback(refhost::Host& host, refhost::Callback callback,
                                     const std::filesystem::path& scene);

// Without a trace.
ImportRun ImportUntraced(const TemporaryFile& file, refhost::HostOptions options = {});

// The lines of a text, without their ends.
std::vector<std::string> LinesOf(const std::string& text);

// The suite calls of the last callback of a trace, without the lines around them.
std::vector<std::string> LastCallback(const std::string& trace);

// The value of a line's key as it stands there; "" when the line has no such key. Texts keep their quotes.
std::string_view Field(std::string_view line, std::string_view key);

// The layer of that name; null when there is none.
const refhost::Layer* FindLayer(const refhost::Host& host, std::string_view name);

// The lines whose call is the given one.
std::vector<std::string> CallsOf(const std::vector<std::string>& trace, std::string_view call);

}  // namespace testsupport
