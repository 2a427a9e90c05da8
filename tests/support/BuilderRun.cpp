#include "tests/support/BuilderRun.h"

#include <stdlib.h>

#include <cstddef>
#include <stdexcept>
#include <utility>

#include "plugin/Entry.h"

namespace testsupport {
namespace {

ImportRun Import(const std::filesystem::path& scene, refhost::HostOptions options, bool traced) {
  ImportRun run;
  run.written = std::make_unique<std::ostringstream>();
  if (traced) options.trace = run.written.get();
  run.host = std::make_unique<refhost::Host>(std::move(options));
  refhost::CallbackResult entry;
  if (!run.host->load(MayaImportEntry, &entry) || entry.code != 0) {
    throw std::runtime_error("the importer's entry failed");
  }
  run.written->str("");
  run.result = run.host->importScene(scene);
  if (!traced) return run;
  run.trace = LinesOf(run.written->str());
  if (run.trace.size() < 2) throw std::runtime_error("the trace has no bracket");
  run.trace.erase(run.trace.begin());
  run.trace.pop_back();
  return run;
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

ImportRun ImportUntraced(const TemporaryFile& file, refhost::HostOptions options) {
  return Import(file.path(), std::move(options), false);
}

std::vector<std::string> LinesOf(const std::string& text) {
  std::vector<std::string> lines;
  std::istringstream stream(text);
  for (std::string line; std::getline(stream, line);) lines.push_back(line);
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
