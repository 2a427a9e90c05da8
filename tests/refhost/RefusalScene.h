// What the tests of the host's refusals share: a project with every kind of handle, and a table row for a
// broken promise.
#pragma once

#include <cstdint>
#include <functional>
#include <utility>
#include <vector>

#include "tests/refhost/StandIn.h"

namespace refhost {

inline constexpr HostUTF16Unit kName[] = {'n', 0};

// A project in which every kind of handle is there: live, given back, and of nobody.
struct Scene {
  explicit Scene(HostOptions options = {}) : plugin(std::move(options)) {
    kCompSuite9.GetItemFromComp(comp, &compItem);
    kMemorySuite1.NewMemHandle(kPluginId, "block", 16, 0, &memory);
    kMemorySuite1.NewMemHandle(kPluginId, "freed", 16, 0, &freed);
    kMemorySuite1.FreeMemHandle(freed);
    kStreamSuite7.ReleaseStream(released);
    kKeyframeSuite3.EndKeyframeBatch(1, ended);
    kPersistentDataSuite3.GetAppPrefsBlob(&store);
    kFileImportManagerSuite3.RegisterImporterName("Importer", &importer);
    const T_Time time{0, 1};
    std::int32_t index = -1;
    kKeyframeSuite3.AddBatchKeyframe(batch, 0, &time, &index);
  }

  StandIn plugin;
  VOR_CompItem* comp = plugin.makeComp();                                 // comp:1
  VOR_CompItem* otherComp = plugin.makeComp();                            // comp:2
  VOR_Layer* parent = plugin.makeNull(comp);                              // layer:1
  VOR_Layer* child = plugin.makeNull(comp);                               // layer:2
  VOR_Layer* camera = plugin.makeCamera(comp);                            // layer:3
  VOR_Layer* elsewhere = plugin.makeNull(otherComp);                      // layer:4
  VOR_Stream* rotation = plugin.acquire(parent, HOST_STREAM_ROTATION_Z);  // stream:1
  VOR_Stream* position = plugin.acquire(parent, HOST_STREAM_POSITION);    // stream:2
  VOR_Stream* released = plugin.acquire(parent, HOST_STREAM_SCALE);       // stream:3
  VOR_AddKeyframesInfo* ended = plugin.open(position);                    // batch:1
  VOR_AddKeyframesInfo* batch = plugin.open(rotation);                    // batch:2, with one key
  VOR_Item* compItem = nullptr;                                           // item:2
  HostMemHandle* memory = nullptr;                                        // mem:1
  HostMemHandle* freed = nullptr;                                         // mem:2
  HostPrefsStore* store = nullptr;                                        // store:1
  HostImporterId importer = 0;                                            // importer:1

  HostRatio aspect{1, 1};
  T_Time duration{10, 1};
  HostRatio rate{25, 1};
  std::int32_t width = 64;
  std::int32_t height = 48;
  HostSilentErrorState state{};

  HostError createComp(VOR_Item* folder) {
    VOR_CompItem* made = nullptr;
    return kCompSuite21.CreateComp(folder, kName, width, height, &aspect, &duration, &rate, &made);
  }
  HostError newNull(T_Time time) {
    VOR_Layer* made = nullptr;
    return kCompSuite9.NewNullLayer("n", comp, &time, &made);
  }
  HostError newCamera(double x, double y) {
    VOR_Layer* made = nullptr;
    return kCompSuite9.NewCameraLayer("c", comp, x, y, &made);
  }
  HostError filmSize(VOR_Layer* layer, std::int32_t direction, double size) {
    return kCameraSuite2.SetCameraFilmSize(layer, direction, &size);
  }
  HostError acquire(std::int32_t pluginId, VOR_Layer* layer, std::int32_t id) {
    VOR_Stream* made = nullptr;
    return kStreamSuite7.AcquireLayerStream(pluginId, layer, id, &made);
  }
  HostError setValue(VOR_Stream* stream, VOR_Stream* recorded, double x, double y = 0.0) {
    const StreamValueRecord record{recorded, {x, y, 0.0, 0.0}};
    return kStreamSuite8.SetStreamValue(kPluginId, stream, &record);
  }
  HostError addKey(VOR_AddKeyframesInfo* to, std::int32_t mode, T_Time time) {
    std::int32_t index = 0;
    return kKeyframeSuite3.AddBatchKeyframe(to, mode, &time, &index);
  }
  HostError setKey(VOR_AddKeyframesInfo* to, std::int32_t index, VOR_Stream* recorded, double x) {
    const StreamValueRecord record{recorded, {x, 0.0, 0.0, 0.0}};
    return kKeyframeSuite4.SetBatchKeyframeValue(to, index, &record);
  }
  HostError registerExtension(HostImporterId id, HostImporterExtension extension, std::int32_t typeCount = 1,
                              std::int32_t extensionCount = 1) {
    const HostImporterType type{1, 2};
    return kFileImportManagerSuite3.RegisterImporterTypes(id, typeCount, &type, extensionCount, &extension);
  }
};

// Callbacks to register; never called.
inline HostError someHook(std::intptr_t) { return 0; }
inline HostError someImport(const HostUTF16Unit*, void*, void*, VOR_Item*) { return 0; }
inline HostError someVerify(const HostUTF16Unit*, void*, std::uint8_t*) { return 0; }
inline void someNone() {}

inline HostError registerCallbacks(HostImporterId importer, std::int32_t count,
                                   HostImporterCallbacks callbacks) {
  return kFileImportManagerSuite3.RegisterImporterCallbacks(importer, count, &callbacks);
}

struct Refusal {
  HostError code;
  const char* sentence;
  std::function<HostError(Scene&)> call;
};

// Makes each call in a fresh scene and expects its code and, as the only refusal, its sentence.
void expectRefusals(const std::vector<Refusal>& refusals, const HostOptions& options = {});

}  // namespace refhost
