#include "tools/mayascene/ExportWords.h"

#include <algorithm>
#include <charconv>
#include <cmath>
#include <filesystem>
#include <system_error>
#include <vector>

#include "export/Format.h"
#include "text/Letters.h"
#include "tools/mayascene/HostWords.h"
#include "tools/mayascene/OutputFile.h"

namespace mayascene {
namespace {

std::vector<std::string> formatNames() {
  std::vector<std::string> names;
  for (const interchange::Format& format : interchange::Formats()) names.emplace_back(format.name);
  return names;
}

// The formats, a line each, as help shows them.
std::string formatLines() {
  constexpr std::size_t kColumn = 6;
  std::string text = "Formats:";
  for (const interchange::Format& format : interchange::Formats()) {
    std::string name(format.name);
    name.resize(std::max(kColumn, name.size() + 1), ' ');
    text += "\n  " + name + std::string(format.sentence);
  }
  return text;
}

double scaleOf(const std::string& text) {
  constexpr double kSmallest = 1e-9, kLargest = 1e9;
  double scale = 0.0;
  const auto read = std::from_chars(text.data(), text.data() + text.size(), scale);
  const bool whole = read.ec == std::errc() && read.ptr == text.data() + text.size();
  if (!whole || !(scale >= kSmallest && scale <= kLargest)) {
    throw CLI::ValidationError("--scale", text + ": a scale is a number between 1e-9 and 1e9");
  }
  return scale;
}

// Refuses an output whose suffix names another format than the one that is written. Folders may have any
// name.
void checkEnding(const ExportArguments& arguments) {
  const std::string& output = arguments.output;
  std::error_code ignored;
  if (arguments.scenes.size() > 1 || std::filesystem::is_directory(output, ignored)) return;
  const std::string lowered = text::Lowered(output);
  if (lowered.ends_with(".ma") || lowered.ends_with(".mb")) {
    throw CLI::ValidationError("--output",
                               output + " has the suffix of a scene, and an export is not a scene");
  }
  const interchange::Format* const ending = interchange::FormatOfPath(output);
  if (ending == nullptr || arguments.format == nullptr || ending == arguments.format) return;
  throw CLI::ValidationError("--format", output + " has the suffix of " + std::string(ending->name) +
                                             ", and -f says " + std::string(arguments.format->name));
}

// The options of the command, as they are typed again; their values are words or numbers.
std::string wordsOf(const ExportWords& words, const ExportArguments& arguments) {
  std::string all;
  const auto say = [&all](const char* option, const std::string& value) {
    if (value.empty()) return;
    // A value that begins with a minus would be taken for an option.
    all += option + std::string(value.front() == '-' ? "=" : " ") + value;
  };
  say(" -f", words.format);
  say(" --frames", words.bake.frames);
  say(" --scale", words.scale);
  say(" --axes", words.axes);
  if (arguments.keys) all += " --keys";
  if (arguments.strict) all += " --strict";
  return all;
}

// Refuses options that the format does not take, and an output without a format.
void checkFormat(const ExportArguments& arguments) {
  const interchange::Format* format = arguments.format;
  if (format == nullptr) format = interchange::FormatOfPath(arguments.output);
  if (format == nullptr) {
    throw CLI::ValidationError("--format",
                               arguments.output + " has the suffix of no format; name a format with -f");
  }
  const std::string name(format->name);
  if (arguments.output == kStandardOutput && format->severalFiles) {
    throw CLI::ValidationError("--output",
                               name + " is several files, and standard output takes one: use glb");
  }
  if (format->ownAxes && arguments.axes == interchange::Axes::Host) {
    throw CLI::ValidationError("--axes", name + " always has the axes of the scene");
  }
  if (!format->listsKeys && arguments.keys) {
    throw CLI::ValidationError("--keys", name + " cannot hold a list of keys; csv can");
  }
}

}  // namespace

void addExportOptions(CLI::App* verb, ExportWords* words, ExportArguments* arguments) {
  verb->add_option("-o,--output", arguments->output, "the file; with several scenes a folder for them")
      ->required()
      ->option_text("OUT");
  verb->add_option("-f,--format", words->format, "the format (that of OUT's suffix): see below")
      ->option_text("FORMAT")
      ->check(CLI::IsMember(formatNames()));
  verb->add_option("--scale", words->scale, "multiplies all lengths (1)")->option_text("N");
  verb->add_option("--axes", words->axes,
                   "scene (y up, cameras look along -z; this is the\ndefault) or host (y down, along +z)")
      ->option_text("AXES")
      ->check(CLI::IsMember({"scene", "host"}));
  verb->add_flag("--keys", arguments->keys, "a list of keys instead of frames, in csv");
  verb->add_flag("-q,--quiet", arguments->quiet, "print nothing but errors");
  verb->add_flag("--bake", words->bakes, "bake each scene first: see mayascene bake");
  addUnits(verb, &arguments->host);
  addLimits(verb, &arguments->host);
  addBakeOptions(verb, &words->bake, "With --bake");
  verb->get_option("--frames")
      ->description("the frames to write (the first to the last key, or\nall of the bake)")
      ->group("Options");
  verb->get_option("--strict")->group("Options");
  verb->footer(formatLines());
}

void translateExportWords(const CLI::App& verb, const ExportWords& words, ExportArguments* arguments) {
  if (!words.bakes) {
    for (const std::string& given : givenBakeOptions(verb)) {
      if (given != "--frames" && given != "--strict") throw CLI::ValidationError(given, "needs --bake");
    }
  }
  if (!words.format.empty()) arguments->format = interchange::FindFormat(words.format);
  if (!words.scale.empty()) arguments->scale = scaleOf(words.scale);
  if (!words.axes.empty()) {
    arguments->axes = words.axes == "host" ? interchange::Axes::Host : interchange::Axes::Scene;
  }
  if (!words.bake.frames.empty()) arguments->frames = framesOf(words.bake.frames);
  if (words.bakes) translateBakeWords(words.bake, &arguments->bake.emplace());
  arguments->strict = words.bake.strict;
  arguments->words = wordsOf(words, *arguments);
  checkEnding(*arguments);
  checkFormat(*arguments);
}

}  // namespace mayascene
