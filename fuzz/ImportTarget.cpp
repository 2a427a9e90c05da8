// The whole import: file, module, embedded host. The module stays loaded; each run has a host of its own.
//
// Bytes 6 to 9 of a scene come after those that the header test compares. Here they choose the host's
// behaviour; " ASC", which an ordinary scene has there, is an ordinary host.
#include <cmath>
#include <cstdint>
#include <iterator>
#include <ostream>
#include <streambuf>
#include <string>
#include <string_view>

#include "fuzz/Bytes.h"
#include "fuzz/GuardedEntry.h"
#include "fuzz/LoadedModule.h"
#include "fuzz/MemoryFile.h"
#include "fuzz/Require.h"
#include "fuzz/Target.h"
#include "hostutil/HostSetup.h"
#include "refhost/Host.h"
#include "refhost/Operations.h"

namespace {

using fuzz::Require;

constexpr std::string_view kHeader = "//Maya";
constexpr std::string_view kOrdinary = " ASC";
constexpr std::size_t kHeaderBytes = kHeader.size() + kOrdinary.size();

// Everything that can be made to fail. An exception out of a release ends the process by design, so that one
// is left out. The empty name counts over all suite calls.
constexpr const char* kOperations[] = {"",
#define FUZZ_OPERATION(name, suite, version) \
  refhost::Operation::name == refhost::Operation::ReleaseSuiteByName ? "" : #name,
                                       REFHOST_OPERATION_TABLE(FUZZ_OPERATION)
#undef FUZZ_OPERATION
#define FUZZ_SERVICE(name) #name,
                                           HOST_UTILITY_TABLE(FUZZ_SERVICE)
#undef FUZZ_SERVICE
};

// Takes the trace, and checks every byte of it.
class TraceSink : public std::streambuf {
 protected:
  int_type overflow(int_type c) override {
    if (traits_type::eq_int_type(c, traits_type::eof())) return traits_type::not_eof(c);
    const char byte = traits_type::to_char_type(c);
    xsputn(&byte, 1);
    return c;
  }
  std::streamsize xsputn(const char* text, std::streamsize size) override {
    for (const char c : std::string_view(text, static_cast<std::size_t>(size))) {
      const auto byte = static_cast<unsigned char>(c);
      Require(byte >= 0x20 || byte == '\n', "a trace holds no control characters");
    }
    return size;
  }
};

struct Behaviour {
  bool permissive = false;
  bool verifies = false;
  bool traced = false;
  bool linear = false;
  bool zoomKeys = false;
  bool fails = false;
  refhost::Failure failure;
};

unsigned OptionByte(std::string_view scene, std::size_t index) {
  const auto byte = [](char c) { return static_cast<unsigned>(static_cast<unsigned char>(c)); };
  return scene.size() < kHeaderBytes ? 0u : byte(scene[kHeader.size() + index]) ^ byte(kOrdinary[index]);
}

refhost::Failure FailureOf(unsigned what, unsigned nth, unsigned how) {
  constexpr HostError kCodes[] = {0, 4711};
  refhost::Failure failure;
  failure.operation = kOperations[what % std::size(kOperations)];
  failure.nth = nth;
  if (failure.operation.empty()) {
    // One of these calls may be a release, so nothing is thrown.
    failure.nth = nth + 1;
    failure.onwards = (how & 2) != 0;
  } else if ((how & 2) != 0) {
    failure.kind = (how & 4) != 0 ? refhost::Failure::Kind::BadAlloc : refhost::Failure::Kind::RuntimeError;
  }
  failure.code = kCodes[how & 1];
  return failure;
}

Behaviour BehaviourOf(std::string_view scene) {
  const unsigned flags = OptionByte(scene, 0);
  Behaviour behaviour;
  behaviour.permissive = (flags & 1) != 0;
  behaviour.verifies = (flags & 2) != 0;
  behaviour.traced = (flags & 4) != 0;
  behaviour.linear = (flags & 8) != 0;
  behaviour.zoomKeys = (flags & 16) != 0;
  behaviour.fails = OptionByte(scene, 1) != 0;
  if (behaviour.fails)
    behaviour.failure = FailureOf(OptionByte(scene, 1), OptionByte(scene, 2), OptionByte(scene, 3));
  return behaviour;
}

refhost::HostOptions OptionsOf(const Behaviour& behaviour, std::ostream* trace) {
  refhost::HostOptions options;
  options.permissive = behaviour.permissive;
  options.linearUnits = behaviour.linear ? 1 : 0;
  options.zoomKeys = behaviour.zoomKeys ? 2 : 0;
  if (behaviour.traced) options.trace = trace;
  if (behaviour.fails) options.failures.push_back(behaviour.failure);
  return options;
}

void CheckKeys(const refhost::Stream& stream) {
  if (stream.keyCount() == 0) return;
  const auto& times = stream.keys->times;
  Require(stream.keys->values.size() == times.size() * static_cast<std::size_t>(stream.dimension),
          "every key has its values");
  for (std::size_t i = 1; i < times.size(); ++i) {
    const auto left = static_cast<long double>(times[i - 1].value) * times[i].scale;
    const auto right = static_cast<long double>(times[i].value) * times[i - 1].scale;
    Require(left < right, "keys are sorted by time, no two at one");
  }
}

void CheckProject(const refhost::Project& project) {
  for (const refhost::Layer& layer : project.layers()) {
    Require(layer.parent == nullptr || layer.parent->composition == layer.composition,
            "a parent is of the same composition");
    for (const refhost::Stream& stream : layer.streams) {
      for (const double value : stream.value)
        Require(std::isfinite(value), "a host that refuses holds finite values");
      CheckKeys(stream);
    }
  }
}

void CheckResult(const refhost::CallbackResult& result, const Behaviour& behaviour) {
  Require(result.ledgerClean(), "nothing is left behind but what is kept by design");
  const bool rehearsed = behaviour.fails && result.code == behaviour.failure.code;
  Require(result.code == 0 || rehearsed || !refhost::errorName(result.code).empty(),
          "a code is a documented one");
}

}  // namespace

int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  static fuzz::MemoryFile file;
  static TraceSink sink;
  static std::ostream trace(&sink);
  fuzz::SetModuleEntry(fuzz::LoadedModule());
  const std::string_view scene = fuzz::TextOf(data, size);
  const Behaviour behaviour = BehaviourOf(scene);
  file.Write(scene);

  refhost::Host host(OptionsOf(behaviour, &trace));
  refhost::CallbackResult loaded;
  Require(host.load(fuzz::GuardedEntry, &loaded) && loaded.code == 0, "the module can be loaded");
  if (behaviour.verifies) {
    const refhost::CallbackResult verified = host.verifyScene(file.path());
    CheckResult(verified, behaviour);
    Require(verified.messages.empty(), "verifying shows nothing");
  }
  CheckResult(host.importScene(file.path()), behaviour);
  if (!behaviour.permissive) CheckProject(host.project());
  CheckResult(host.unload(), behaviour);
  return 0;
}
