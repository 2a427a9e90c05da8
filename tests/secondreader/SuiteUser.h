// What one holder of suites can ask of the played host: each suite acquired at its first use and kept.
#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

#include "tests/secondreader/PlayedCall.h"
#include "tests/secondreader/PlayedHost.h"

namespace secondreader {

// In the order in which they are released.
enum Suite : std::size_t {
  kUtility7,
  kMemory1,
  kPersistentData3,
  kRegister6,
  kFileImportManager3,
  kComp21,
  kComp9,
  kLayer10,
  kCamera2,
  kStream7,
  kStream8,
  kKeyframe3,
  kKeyframe4,
  kSuiteCount,
};

struct CompSettings {
  Handle folder = 0;
  std::string name;  // UTF-8
  std::int32_t width = 0;
  std::int32_t height = 0;
  HostRatio pixelAspect{};
  T_Time duration{};
  HostRatio frameRate{};
};

class SuiteUser {
 public:
  explicit SuiteUser(PlayedHost& host) : host_(host) {}
  SuiteUser(const SuiteUser&) = delete;
  SuiteUser& operator=(const SuiteUser&) = delete;

  // Gives everything back. An exception on the way ends the process.
  void releaseAll();

  PlayedHost& host() { return host_; }

  // Utility, memory, preferences, registration. Each gives the call's code, or throws what it threw; a suite
  // that cannot be had is thrown as its code. A handle that is not handed out stays 0.
  HostError showMessage(const std::string& text);
  HostError beginSilentErrors();
  HostError endSilentErrors();
  HostError newMemHandle(std::int64_t size, Handle* handle);
  HostError freeMemHandle(Handle handle);
  HostError lockMemHandle(Handle handle, bool* address);
  HostError unlockMemHandle(Handle handle);
  HostError getAppPrefsBlob(bool* store);
  HostError getPrefLong(bool store);
  HostError registerDeathHook();
  HostError registerImporterName(const std::string& name, Handle* importer);
  HostError registerImporterTypes(Handle importer);
  HostError registerImporterCallbacks(Handle importer);

  // Compositions, layers, the camera.
  HostError createComp(const CompSettings& settings, Handle* comp);
  HostError getItemFromComp(Handle comp, Handle* item);
  HostError newCameraLayer(const std::string& name, Handle comp, Handle* layer);
  HostError newNullLayer(const std::string& name, Handle comp, Handle* layer);
  HostError addLayerFromItem(Handle item, Handle comp, Handle* layer);
  HostError setLayerFlag(Handle layer, std::int32_t flag, int value);
  HostError setLayerParent(Handle layer, Handle parent);
  HostError setCameraFilmSize(Handle layer, std::int32_t direction, double filmSize);

  // Streams and keys. Values are records of four, of which the fourth is 0.
  struct Value {
    Value(double x = 0.0, double y = 0.0, double z = 0.0, Rounding how = Rounding::None)
        : numbers{x, y, z, 0.0}, rounding(how) {}

    std::vector<double> numbers;
    Rounding rounding;
  };
  HostError acquireLayerStream(Handle layer, std::int32_t id, Handle* stream);
  HostError releaseStream(Handle stream);
  HostError setStreamValue(Handle stream, const Value& value);
  HostError getStreamKeyframeCount(Handle stream, std::int32_t* count);
  HostError beginKeyframeBatch(Handle stream, Handle* batch);
  HostError addBatchKeyframe(Handle batch, T_Time time, std::int32_t* index);
  HostError setBatchKeyframeValue(Handle batch, std::int32_t index, Handle stream, const Value& value);
  HostError endKeyframeBatch(Handle batch);

 private:
  // Acquires the suite unless it is held; throws the code of a missing suite.
  SuiteName use(Suite suite);

  PlayedHost& host_;
  std::array<bool, kSuiteCount> held_{};
};

// Runs work(suites) and then gives the suites back, also where the work throws.
template <typename Work>
void withSuites(PlayedHost& host, Work work) {
  SuiteUser suites(host);
  try {
    work(suites);
  } catch (const ProcessEnds&) {
    throw;
  } catch (...) {
    suites.releaseAll();
    throw;
  }
  suites.releaseAll();
}

}  // namespace secondreader
