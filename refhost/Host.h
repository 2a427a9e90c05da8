// The embedded host: loads the import module, serves it as its host, and keeps the project that it makes.
//
// One Host at a time per process: the suites are C tables without a context argument, so they serve the Host
// that exists. Not for use from several threads.
#pragma once

#include <cstdint>
#include <filesystem>
#include <iosfwd>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "hostapi/HostTypes.h"
#include "hostapi/WNBasicSuite.h"
#include "refhost/Project.h"

namespace refhost {

// The calls of the host into the plug-in.
enum class Callback { Entry, Import, Verify, Death };

// One failure to rehearse; parsed by Rehearsal.h from the forms that the command line takes.
struct Failure {
  enum class Kind { Code, BadAlloc, RuntimeError, Other };
  std::string operation;  // a suite call or utility service; empty: counted over all suite calls
  std::int64_t nth = 1;   // from 1; 0 is every call (only with an operation)
  bool onwards = false;   // this call and all after it (only without an operation)
  Kind kind = Kind::Code;
  HostError code = 0;  // with Kind::Code
};

struct RefusedSuite {
  std::string name;
  std::int32_t version = 0;
};

// How the host runs. The defaults are those of an ordinary run.
struct HostOptions {
  std::filesystem::path module;  // the import module; not used by load(entry)
  std::int32_t pluginId = 1;
  std::filesystem::path preferences;        // the preference store; empty: in memory only
  std::optional<std::int32_t> linearUnits;  // stands for the stored preference, for this run only
  std::vector<std::pair<std::string, std::string>> translations;  // key, text
  std::ostream* trace = nullptr;  // where the call trace goes; null: nowhere. Outlives the Host.
  std::vector<Failure> failures;
  std::vector<RefusedSuite> refusedSuites;
  Callback during = Callback::Import;  // the callback that failures and refused suites are for
  std::int32_t zoomKeys = 0;           // keys that each new camera layer has on its zoom stream
  bool permissive = false;             // record any number instead of refusing it

  // Limits. What goes beyond one is refused with a code and a sentence; what exists stays.
  std::int32_t mostLayers = 2'000'000;  // layers in the project
  std::int32_t mostKeys = 100'000'000;  // keys in the project and in open batches
  std::int64_t mostMemory = std::int64_t{1}
                            << 32;  // bytes of memory handles at one time; twice the largest file
};

// Something that a callback left behind.
struct Leftover {
  std::string description;  // such as "stream:3 (position of layer:2)"
  bool keptByDesign = false;
  bool importFile = false;  // the file object that every import keeps
};

// The result of one callback. The texts are UTF-8.
struct CallbackResult {
  HostError code = 0;                 // what the callback returned
  std::int64_t line = 0;              // of the scene, from 1, where the failure was found; 0: not known
  bool canImport = false;             // verify only
  std::vector<std::string> messages;  // shown to the user, in order
  std::vector<std::string> refusals;  // a sentence for each call that was refused, in order
  std::vector<Leftover> leftovers;    // the ledger after the callback
  const Folder* folder = nullptr;     // import only: where the scene went
  std::int64_t suiteCalls = 0;        // trace lines between enter and leave

  bool ledgerClean() const;  // whether all leftovers are kept by design
};

class Host {
 public:
  // Throws std::invalid_argument when a failure names an operation that the host does not have, and
  // std::logic_error while another Host lives.
  explicit Host(HostOptions options);
  ~Host();  // unloads the module; calls the death hook first if unload() did not
  Host(const Host&) = delete;
  Host& operator=(const Host&) = delete;

  // Loads the module and calls its entry. False with a sentence in *failure when the module or its entry
  // cannot be found; then nothing was called.
  bool load(CallbackResult* result, std::string* failure);

  // The same with an entry that is linked into the process, for tests.
  bool load(HostError (*entry)(const WNBasicSuite*, std::int32_t, std::int32_t, std::int32_t, void*),
            CallbackResult* result);

  // Calls the importer's callbacks. Each import goes into a folder item of its own. A host without a
  // registered importer returns HOST_ERR_REGISTRATION.
  CallbackResult importScene(const std::filesystem::path& path);
  CallbackResult verifyScene(const std::filesystem::path& path);

  // Calls the death hook, if one was registered, and unloads the module.
  CallbackResult unload();

  // What the plug-in registered: display name, extensions with their dots. Empty before.
  const std::string& importerName() const;
  const std::vector<std::string>& importerExtensions() const;

  const Project& project() const;

  // The value of the preference "Use Linear Units" that the plug-in read last since its entry was called. 0
  // when it read none: it did not ask, or the call failed.
  std::int32_t linearUnits() const;

  // How often a suite call or a utility service was called in the last callback that the rehearsal is for.
  std::int64_t callCount(std::string_view operation) const;

  // The root of the suites, for tests that stand in for the plug-in. Valid while the Host lives.
  const WNBasicSuite* basicSuite() const;

  // For tests that stand in for the plug-in: the calls between the two count as those of a callback, so that
  // handles, folder, rehearsal and ledger work as they do in an import.
  VOR_Item* beginCallback(Callback callback, const std::filesystem::path& path);
  CallbackResult endCallback(HostError code);

 private:
  struct State;
  std::unique_ptr<State> state_;
};

// The name and the sentence of a code, or "" when it is in no table.
std::string_view errorName(HostError code);
std::string_view errorSentence(HostError code);

}  // namespace refhost
