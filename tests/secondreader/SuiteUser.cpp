// The suites themselves, and those of the plug-in's own life: messages, memory, preferences, registration.
#include "tests/secondreader/SuiteUser.h"

#include "hostapi/PersistentDataSuite.h"

namespace secondreader {
namespace {

constexpr SuiteName kNames[kSuiteCount] = {
    {"QZGP Utility Suite", 7},
    {"QZGP Memory Suite", 1},
    {"QZGP Persistent Data Suite", 3},
    {"QZGP Register Suite", 6},
    {"QZGP File Import Manager Suite", 3},
    {"QZGP Comp Suite", 21},
    {"QZGP Comp Suite", 9},
    {"QZGP Layer Suite", 10},
    {"QZGP Camera Suite", 2},
    {"QZGP Stream Suite", 7},
    {"QZGP Stream Suite", 8},
    {"QZGP Keyframe Suite", 3},
    {"QZGP Keyframe Suite", 4},
};

}  // namespace

SuiteName SuiteUser::use(Suite suite) {
  const SuiteName name = kNames[suite];
  if (held_[suite]) return name;
  PlayedCall call(host_, "AcquireSuite", name);
  call.demand(!call.goesOn() || !host_.plan.refuses(name.name, name.version), HOST_ERR_SUITE_REFUSED);
  const bool given = call.goesOn();
  if (call.finish() != HOST_ERR_NONE || !given) throw int{HOST_ERR_MISSING_SUITE};
  held_[suite] = true;
  return name;
}

void SuiteUser::releaseAll() {
  try {
    for (std::size_t suite = 0; suite < kSuiteCount; ++suite) {
      if (!held_[suite]) continue;
      PlayedCall call(host_, "ReleaseSuiteByName", kNames[suite]);
      if (!call.goesOn()) host_.keptSuites.insert(suite);
      call.finish();
    }
  } catch (const std::exception&) {
    throw ProcessEnds{};
  } catch (const UnknownException&) {
    throw ProcessEnds{};
  }
}

HostError SuiteUser::showMessage(const std::string& text) {
  PlayedCall call(host_, "ShowMessage", use(kUtility7));
  if (call.goesOn() && !host_.silent) host_.messages.push_back(text);
  call.line().integer("pluginId", host_.options.pluginId).text("text", text);
  return call.finish();
}

HostError SuiteUser::beginSilentErrors() {
  PlayedCall call(host_, "BeginSilentErrors", use(kUtility7));
  if (call.goesOn()) host_.silent = true;
  return call.finish();
}

HostError SuiteUser::endSilentErrors() {
  PlayedCall call(host_, "EndSilentErrors", use(kUtility7));
  if (call.goesOn() && call.demand(host_.silent, HOST_ERR_SILENT_ERRORS)) host_.silent = false;
  call.line().integer("report", 0);
  return call.finish();
}

HostError SuiteUser::newMemHandle(std::int64_t size, Handle* handle) {
  PlayedCall call(host_, "NewMemHandle", use(kMemory1));
  if (call.goesOn()) host_.heldMemory = *handle = ++host_.memories;
  call.line().integer("pluginId", host_.options.pluginId).text("name", "file buffer");
  call.line().integer("size", size).integer("flags", 0);
  call.handed("handle", "mem", *handle);
  return call.finish();
}

HostError SuiteUser::freeMemHandle(Handle handle) {
  PlayedCall call(host_, "FreeMemHandle", use(kMemory1));
  if (!call.goesOn()) ++host_.keptMemory;
  host_.heldMemory = 0;  // nor is it reported where the call was made to fail
  call.line().handle("handle", "mem", handle);
  return call.finish();
}

HostError SuiteUser::lockMemHandle(Handle handle, bool* address) {
  PlayedCall call(host_, "LockMemHandle", use(kMemory1));
  *address = call.goesOn();
  call.line().handle("handle", "mem", handle);
  return call.finish();
}

HostError SuiteUser::unlockMemHandle(Handle handle) {
  PlayedCall call(host_, "UnlockMemHandle", use(kMemory1));
  call.line().handle("handle", "mem", handle);
  return call.finish();
}

HostError SuiteUser::getAppPrefsBlob(bool* store) {
  PlayedCall call(host_, "GetAppPrefsBlob", use(kPersistentData3));
  *store = call.goesOn();
  call.handed("store", "store", 1);
  return call.finish();
}

HostError SuiteUser::getPrefLong(bool store) {
  PlayedCall call(host_, "GetPrefLong", use(kPersistentData3));
  const std::int32_t standard = host_.linearUnits;
  const bool rehearsed = !call.goesOn();
  if (!rehearsed && store) host_.linearUnits = host_.options.linearUnits.value_or(standard);
  call.line().handle("store", "store", store ? 1 : 0);
  call.line()
      .text("section", HOST_PREF_SECTION)
      .text("key", HOST_PREF_LINEAR_UNITS)
      .integer("default", standard);
  call.handedInteger("value", host_.linearUnits);
  const HostError code = call.finish();
  if (rehearsed && code == HOST_ERR_NONE) host_.linearUnits = 0;
  return code;
}

HostError SuiteUser::registerDeathHook() {
  PlayedCall call(host_, "RegisterDeathHook", use(kRegister6));
  if (call.goesOn()) host_.deathHook = true;
  call.line().integer("pluginId", host_.options.pluginId).integer("refcon", 0);
  return call.finish();
}

HostError SuiteUser::registerImporterName(const std::string& name, Handle* importer) {
  PlayedCall call(host_, "RegisterImporterName", use(kFileImportManager3));
  if (call.goesOn() && call.demand(!name.empty(), HOST_ERR_REGISTRATION)) {
    *importer = 1;
    host_.importerName = name;
  }
  call.line().text("name", name);
  call.handed("importer", "importer", *importer);
  return call.finish();
}

HostError SuiteUser::registerImporterTypes(Handle importer) {
  PlayedCall call(host_, "RegisterImporterTypes", use(kFileImportManager3));
  if (call.goesOn() && call.demand(importer != 0, HOST_ERR_BAD_HANDLE)) host_.extensions = 1;
  call.line().handle("importer", "importer", importer);
  call.line().plain("types", R"([{"type":"MAYA","creator":"MaYa"}])").plain("extensions", R"([".ma"])");
  return call.finish();
}

HostError SuiteUser::registerImporterCallbacks(Handle importer) {
  PlayedCall call(host_, "RegisterImporterCallbacks", use(kFileImportManager3));
  if (call.goesOn() && call.demand(importer != 0, HOST_ERR_BAD_HANDLE)) host_.importerUsable = true;
  call.line().handle("importer", "importer", importer).integer("count", 2);
  return call.finish();
}

}  // namespace secondreader
