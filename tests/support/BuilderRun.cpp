#include "tests/support/BuilderRun.h"

#include <stdlib.h>

#include <cstddef>
#include <stdexcept>
#include <utility>

#include "plugin/Entry.h"

using namespace mayaimport;

namespace testsupport {
namespace {

ImportRun Run(refhost::Callback callback, const std::filesystem::path& scene, refhost::HostOptions options,
              bool traced) {
  ImportRun run;
  run.written = std::make_unique<std::ostringstream>();
  options.during = callback;
  if (traced) options.trace = run.written.get();
  run.host = std::make_unique<refhost::Host>(std::move(options));
  run.result = MakeCallback(*run.host, callback, scene);
  if (traced) run.trace = LastCallback(run.written->str());
  return run;
}

ImportRun Import(const std::filesystem::path& scene, refhost::HostOptions options, bool traced) {
  return Run(refhost::Callback::Import, scene, std::move(options), traced);
}

// Where the value that starts there ends: at the "," or "}" that belongs to the line itself.
std::size_t EndOfValue(std::string_view line, std::size_t at) {
  bool quoted = false;
  int depth = 0;
  for (; at < line.size(); ++at) {
    const char c = line[at];
    if (quoted && c == '\\') {
      ++at;
    } else if (c == '"') {
      quoted = !quoted;
    } else if (!quoted && (c == '[' || c == '{')) {
      ++depth;
    } else if (!quoted && depth > 0 && (c == ']' || c == '}')) {
      --depth;
    } else if (!quoted && depth == 0 && (c == ',' || c == '}')) {
      break;
    }
  }
  return at;
}

}  // namespace

TemporaryFile::TemporaryFile(std::string_view text, std::string_view name)
    : path_(folder_.write(name, text)) {}

ImportRun ImportPath(const std::filesystem::path& scene, refhost::HostOptions options) {
  return Import(scene, std::move(options), true);
}

ImportRun ImportFile(const TemporaryFile& file, refhost::HostOptions options) {
  return Import(file.path(), std::move(options), true);
}

ImportRun ImportText(std::string_view text, refhost::HostOptions options) {
  return Import(TemporaryFile(text).path(), std::move(options), true);
}

ImportRun RunCallback(refhost::Callback callback, const std::filesystem::path& scene,
                      refhost::HostOptions options) {
  return Run(callback, scene, std::move(options), true);
}

refhost::CallbackResult MakeCallback(refhost::Host& host, refhost::Callback callback,
                                     const std::filesystem::path& scene) {
  refhost::CallbackResult entry;
  const bool loaded = host.load(MayaImportEntry, &entry);
  if (callback == refhost::Callback::Entry) return entry;
  if (!loaded || entry.code != 0) throw std::runtime_error("the importer's entry failed");
  return callback == refhost::Callback::Verify ? host.verifyScene(scene) : host.importScene(scene);
}

ImportRun ImportUntraced(const TemporaryFile& file, refhost::HostOptions options) {
  return Import(file.path(), std::move(options), false);
}

std::vector<std::string> LinesOf(const std::string& text) {
  std::vector<std::string> lines;
  std::istringstream stream(text);
  for (std::string line; std::getline(stream, line);) lines.push_back(line);
  return lines;
}

std::vector<std::string> LastCallback(const std::string& trace) {
  const std::size_t enter = trace.rfind("{\"call\":\"enter\"");
  if (enter == std::string::npos) throw std::runtime_error("the trace has no bracket");
  std::vector<std::string> lines = LinesOf(trace.substr(enter));
  lines.erase(lines.begin());
  if (!lines.empty() && lines.back().starts_with("{\"call\":\"leave\"")) lines.pop_back();
  return lines;
}

std::string_view Field(std::string_view line, std::string_view key) {
  const std::string quoted = '"' + std::string(key) + "\":";
  for (std::size_t at = 1; at < line.size();) {
    const std::size_t end = EndOfValue(line, at);
    if (line.substr(at, quoted.size()) == quoted) {
      return line.substr(at + quoted.size(), end - at - quoted.size());
    }
    at = end + 1;
  }
  return {};
}

const refhost::Layer* FindLayer(const refhost::Host& host, std::string_view name) {
  for (const refhost::Layer& layer : host.project().layers()) {
    if (layer.name == name) return &layer;
  }
  return nullptr;
}

std::vector<std::string> CallsOf(const std::vector<std::string>& trace, std::string_view call) {
  const std::string quoted = '"' + std::string(call) + '"';
  std::vector<std::string> lines;
  for (const std::string& line : trace) {
    if (Field(line, "call") == quoted) lines.push_back(line);
  }
  return lines;
}

}  // namespace testsupport
