#include "tools/mayascene/HostWords.h"

#include <cstdint>
#include <map>
#include <optional>
#include <string_view>
#include <utility>

#include "refhost/Rehearsal.h"
#include "tools/mayascene/CommandTable.h"

namespace mayascene {
namespace {

constexpr std::int32_t kMostZoomKeys = 1'000'000;
constexpr std::int64_t kMostMemory = INT64_MAX - 1;  // a number that is too large is read as the largest one

template <typename Parsed>
using Parser = std::optional<Parsed> (*)(std::string_view, std::string*);

template <typename Parsed>
void parseEach(const std::string& option, const std::vector<std::string>& words, Parser<Parsed> parse,
               std::vector<Parsed>* parsed) {
  for (const std::string& word : words) {
    std::string complaint;
    std::optional<Parsed> one = parse(word, &complaint);
    if (!one) throw CLI::ValidationError(option, complaint);
    parsed->push_back(std::move(*one));
  }
}

CLI::Option* addRepeated(CLI::App* verb, const std::string& name, std::vector<std::string>* words,
                         const std::string& form, const std::string& description) {
  return verb->add_option(name, *words, description)->allow_extra_args(false)->option_text(form + " ...");
}

}  // namespace

void addPreferences(CLI::App* verb, std::string* file) {
  verb->add_option("--preferences", *file, "the preference store, instead of the user's own")
      ->option_text("FILE");
}

void addUnits(CLI::App* verb, HostArguments* host) {
  verb->add_option(
          "--linear-units", host->linearUnits,
          "for this run: 1 converts distances from the scene's\nlinear unit to points, 0 takes them as "
          "they stand")
      ->option_text("N");
  addPreferences(verb, &host->preferences);
}

void addHostOptions(CLI::App* verb, HostArguments* host, HostWords* words) {
  addUnits(verb, host);
  const std::string own(kHostGroup), group(kRehearsalGroup);
  verb->add_option("--translations", host->translations, "the host's translations, lines of KEY=TEXT")
      ->option_text("FILE")
      ->group(own);
  verb->add_option("--module", host->module, "the import module, instead of the one beside the tool")
      ->option_text("FILE")
      ->group(own);
  verb->add_option("--trace", host->trace, "write every call of the importer; - is standard output")
      ->option_text("FILE")
      ->group(own);
  verb->add_option("--plugin-id", host->pluginId, "the plug-in id that the host gives (1)")
      ->option_text("N")
      ->group(own);
  verb->add_flag("--permissive", host->permissive, "record any number instead of refusing it")->group(own);

  addRepeated(verb, "--fail", &words->fail, "OPERATION:NTH=CODE",
              "the NTH call (0: each) of the operation fails with CODE")
      ->group(group);
  addRepeated(verb, "--fail-at", &words->failAt, "K[+]=CODE",
              "the K-th suite call fails with CODE; +: and all after it")
      ->group(group);
  addRepeated(verb, "--throw", &words->throwing, "OPERATION:NTH=KIND",
              "the call throws instead: bad_alloc, runtime_error or other")
      ->group(group);
  addRepeated(verb, "--throw-at", &words->throwAt, "K[+]=KIND", "the K-th suite call throws")->group(group);
  addRepeated(verb, "--refuse", &words->refuse, "SUITE:VERSION", "the suite cannot be acquired")
      ->group(group);
  verb->add_option("--zoom-keys", host->zoomKeys, "keys that each new camera layer has on its zoom")
      ->option_text("N")
      ->check(CLI::Range(std::int32_t{0}, kMostZoomKeys))
      ->group(group);
  verb->add_option("--during", words->during,
                   "the callback that the rehearsal is for: entry, import,\nverify or death")
      ->option_text("CALLBACK")
      ->check(CLI::IsMember({"entry", "import", "verify", "death"}))
      ->group(group);
}

// The defaults that the texts name are those of refhost::HostOptions.
void addLimits(CLI::App* verb, HostArguments* host) {
  const std::string group(kLimitsGroup);
  verb->add_option("--most-layers", host->mostLayers, "layers that the project takes (2000000)")
      ->option_text("N")
      ->check(CLI::NonNegativeNumber)
      ->group(group);
  verb->add_option("--most-keys", host->mostKeys, "keys that the project takes (100000000)")
      ->option_text("N")
      ->check(CLI::NonNegativeNumber)
      ->group(group);
  verb->add_option("--most-memory", host->mostMemory,
                   "bytes that the importer holds at one time (4294967296)")
      ->option_text("N")
      ->check(CLI::Range(std::int64_t{0}, kMostMemory))
      ->group(group);
}

void translateHostWords(const HostWords& words, HostArguments* host) {
  parseEach<refhost::Failure>("--fail", words.fail, refhost::parseFail, &host->failures);
  parseEach<refhost::Failure>("--fail-at", words.failAt, refhost::parseFailAt, &host->failures);
  parseEach<refhost::Failure>("--throw", words.throwing, refhost::parseThrow, &host->failures);
  parseEach<refhost::Failure>("--throw-at", words.throwAt, refhost::parseThrowAt, &host->failures);
  parseEach<refhost::RefusedSuite>("--refuse", words.refuse, refhost::parseRefuse, &host->refusedSuites);
  const std::map<std::string, refhost::Callback> callbacks = {{"entry", refhost::Callback::Entry},
                                                              {"import", refhost::Callback::Import},
                                                              {"verify", refhost::Callback::Verify},
                                                              {"death", refhost::Callback::Death}};
  if (!words.during.empty()) host->during = callbacks.at(words.during);
}

}  // namespace mayascene
