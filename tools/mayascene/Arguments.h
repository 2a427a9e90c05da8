// What the user asks for on the command line.
#pragma once

#include <cstdint>
#include <optional>
#include <ostream>
#include <string>
#include <vector>

#include "bake/Options.h"
#include "check/Check.h"
#include "export/Format.h"
#include "refhost/Host.h"
#include "tools/mayascene/BakeCommand.h"
#include "tools/mayascene/ExitStatus.h"

namespace mayascene {

// What `import` and `verify` ask of the embedded host.
struct HostArguments {
  std::string module;        // empty: the one that is installed or built with the tool
  std::string preferences;   // empty: the user's own store
  std::string translations;  // empty: none
  std::string trace;         // empty: none; "-": standard output
  std::int32_t pluginId = 1;
  std::optional<std::int32_t> linearUnits;  // none: what the preference store holds
  std::int32_t zoomKeys = 0;
  bool permissive = false;
  std::optional<std::int32_t> mostLayers;  // none: the host's own limit; the same for the next two
  std::optional<std::int32_t> mostKeys;
  std::optional<std::int64_t> mostMemory;
  std::vector<refhost::Failure> failures;
  std::vector<refhost::RefusedSuite> refusedSuites;
  std::optional<refhost::Callback> during;  // none: the verb's own callback
};

struct ImportArguments {
  HostArguments host;
  std::vector<std::string> scenes;
  std::string json;  // empty: none; "-": standard output
  bool quiet = false;
  bool verbose = false;               // the outline shows every property; not with quiet
  std::optional<BakeArguments> bake;  // bake each scene first; its scenes and its output are not set
};

struct VerifyArguments {
  HostArguments host;
  std::vector<std::string> scenes;
  bool quiet = false;
};

struct CheckArguments {
  HostArguments host;
  check::Options options;
  std::vector<std::string> scenes;  // and folders of scenes
  std::string json;                 // empty: none; "-": standard output
  bool strict = false;
  bool quiet = false;
  bool verbose = false;
  std::optional<std::size_t> jobs;  // scenes at a time; none: as many as there are processors
  double timeout = 60.0;            // seconds for each scene
  // For a child process that checks a single scene for its parent.
  bool child = false;
  bool twoThreads = false;    // a processor is free: the scene is read while it is imported
  bool colourReport = false;  // the parent shows them on a terminal
  bool colourComplaints = false;
};

struct ExportArguments {
  HostArguments host;
  std::vector<std::string> scenes;
  std::string output;                           // a file, a folder, or "-" for standard output
  const interchange::Format* format = nullptr;  // null: that of the output's suffix
  std::optional<BakeArguments> bake;            // bake each scene first
  std::optional<bake::FrameSpan> frames;        // none: the first to the last keyed frame
  double scale = 1.0;                           // above 0
  std::optional<interchange::Axes> axes;        // none: those of the scene, or the format's own
  bool keys = false;
  bool strict = false;
  bool quiet = false;
  std::string words;  // the options as given, except the output and those of a bake: " -f csv --scale 2"
};

struct PrefsArguments {
  std::string preferences;                  // empty: the user's own store
  std::optional<std::int32_t> linearUnits;  // the value to set; none: show
};

// Exactly one of the six is set; or none, and the run is over: help was shown, or usage was wrong.
struct Arguments {
  std::optional<ImportArguments> import;
  std::optional<VerifyArguments> verify;
  std::optional<PrefsArguments> prefs;
  std::optional<BakeArguments> bake;
  std::optional<CheckArguments> check;
  std::optional<ExportArguments> exported;
  ExitStatus over = ExitStatus::Done;
};

// Help goes to `out`, complaints to `err`.
Arguments parseArguments(int argc, const char* const* argv, std::ostream& out, std::ostream& err);

}  // namespace mayascene
