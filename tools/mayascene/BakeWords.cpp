#include "tools/mayascene/BakeWords.h"

#include <charconv>
#include <cmath>
#include <map>
#include <optional>
#include <string_view>

namespace mayascene {
namespace {

constexpr const char* kNames[] = {"--frames",   "--step",   "--camera", "--world",
                                  "--locators", "--report", "--strict"};

std::optional<double> numberOf(std::string_view text) {
  double number = 0.0;
  const auto read = std::from_chars(text.data(), text.data() + text.size(), number);
  const bool whole = read.ec == std::errc() && read.ptr == text.data() + text.size();
  return whole && std::isfinite(number) ? std::optional(number) : std::nullopt;
}

double stepOf(const std::string& text) {
  constexpr double kSmallest = 0.001;
  const auto step = numberOf(text);
  if (!step || *step < kSmallest) {
    throw CLI::ValidationError("--step", text + ": a step is a number of frames, at least 0.001");
  }
  return *step;
}

}  // namespace

bake::FrameSpan framesOf(const std::string& text) {
  const std::size_t colon = text.find(':');
  const std::string_view all = text;
  const auto first = numberOf(all.substr(0, colon));
  const auto last = colon == std::string::npos ? first : numberOf(all.substr(colon + 1));
  if (!first || !last || *last < *first) {
    throw CLI::ValidationError("--frames", text + ": the form is A:B, with A at most B");
  }
  return {*first, *last};
}

void addBakeOptions(CLI::App* verb, BakeWords* words, const std::string& group) {
  const auto grouped = [&](CLI::Option* option) {
    if (!group.empty()) option->group(group);
  };
  grouped(
      verb->add_option("--frames", words->frames, "the frames to bake (what the scene plays, and all keys)")
          ->option_text("A:B"));
  grouped(verb->add_option("--step", words->step, "frames from one key to the next (1); 0.25 for motion blur")
              ->option_text("S"));
  grouped(verb->add_option("--camera", words->cameras,
                           "only this camera: its name or path, or those of its\ntransform")
              ->allow_extra_args(false)
              ->option_text("NAME ..."));
  grouped(verb->add_flag("--world", words->world, "no parents: each camera with its place in the world"));
  grouped(verb->add_option("--locators", words->locators, "marked (with \"null\" in the name), all or none")
              ->option_text("WHICH")
              ->check(CLI::IsMember({"marked", "all", "none"})));
  grouped(verb->add_option("--report", words->report, "write what was baked, and how, as JSON")
              ->option_text("FILE"));
  grouped(verb->add_flag("--strict", words->strict, "warnings make the exit status 1"));
}

std::vector<std::string> givenBakeOptions(const CLI::App& verb) {
  std::vector<std::string> given;
  for (const char* name : kNames) {
    if (verb.count(name) != 0) given.emplace_back(name);
  }
  return given;
}

void translateBakeWords(const BakeWords& words, BakeArguments* bake) {
  const std::map<std::string, bake::Locators> locators = {
      {"marked", bake::Locators::kMarked}, {"all", bake::Locators::kAll}, {"none", bake::Locators::kNone}};
  const auto say = [bake](const std::string& option, const std::string& value) {
    if (!bake->words.empty()) bake->words += ' ';
    bake->words += option;
    if (!value.empty()) bake->words += ' ' + value;
  };
  if (!words.frames.empty()) {
    bake->options.frames = framesOf(words.frames);
    say("--frames", words.frames);
  }
  if (!words.step.empty()) {
    bake->options.step = stepOf(words.step);
    say("--step", words.step);
  }
  bake->options.cameras = words.cameras;
  for (const std::string& camera : words.cameras) say("--camera", camera);
  bake->options.world = words.world;
  if (words.world) say("--world", "");
  if (!words.locators.empty()) {
    bake->options.locators = locators.at(words.locators);
    say("--locators", words.locators);
  }
  bake->report = words.report;
  bake->strict = words.strict;
}

}  // namespace mayascene
