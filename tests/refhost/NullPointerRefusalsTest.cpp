// Null where a value is read or handed out.
#include "tests/refhost/RefusalScene.h"

namespace refhost {
namespace {

TEST(Refusals, NullPointers) {
  expectRefusals({
      {3002, "AcquireSuite: the name is a null pointer",
       [](Scene& s) {
         const void* suite = nullptr;
         return s.plugin.host().basicSuite()->AcquireSuite(nullptr, 1, &suite);
       }},
      {3002, "AcquireSuite: the place for the suite is a null pointer",
       [](Scene& s) { return s.plugin.host().basicSuite()->AcquireSuite(QZGP_MEMORY_SUITE, 1, nullptr); }},
      {3002, "ReleaseSuiteByName: the name is a null pointer",
       [](Scene& s) { return s.plugin.host().basicSuite()->ReleaseSuiteByName(nullptr, 1); }},
      {3002, "ShowMessage: the text is a null pointer",
       [](Scene&) { return kUtilitySuite7.ShowMessage(kPluginId, nullptr); }},
      {3002, "BeginSilentErrors: the state record is a null pointer",
       [](Scene&) { return kUtilitySuite7.BeginSilentErrors(nullptr); }},
      {3002, "EndSilentErrors: the state record is a null pointer",
       [](Scene&) { return kUtilitySuite7.EndSilentErrors(0, nullptr); }},
      {3002, "NewMemHandle: the name is a null pointer",
       [](Scene& s) { return kMemorySuite1.NewMemHandle(kPluginId, nullptr, 1, 0, &s.memory); }},
      {3002, "NewMemHandle: the place for the handle is a null pointer",
       [](Scene&) { return kMemorySuite1.NewMemHandle(kPluginId, "n", 1, 0, nullptr); }},
      {3002, "LockMemHandle: the place for the address is a null pointer",
       [](Scene& s) { return kMemorySuite1.LockMemHandle(s.memory, nullptr); }},
      {3002, "GetAppPrefsBlob: the place for the store is a null pointer",
       [](Scene&) { return kPersistentDataSuite3.GetAppPrefsBlob(nullptr); }},
      {3002, "GetPrefLong: the section is a null pointer",
       [](Scene& s) {
         std::int32_t value = 0;
         return kPersistentDataSuite3.GetPrefLong(s.store, nullptr, "k", 0, &value);
       }},
      {3002, "GetPrefLong: the key is a null pointer",
       [](Scene& s) {
         std::int32_t value = 0;
         return kPersistentDataSuite3.GetPrefLong(s.store, "S", nullptr, 0, &value);
       }},
      {3002, "GetPrefLong: the place for the value is a null pointer",
       [](Scene& s) { return kPersistentDataSuite3.GetPrefLong(s.store, "S", "k", 0, nullptr); }},
      {3002, "RegisterDeathHook: the death hook is a null pointer",
       [](Scene&) { return kRegisterSuite6.RegisterDeathHook(kPluginId, nullptr, 0); }},
      {3002, "RegisterImporterName: the name is a null pointer",
       [](Scene& s) { return kFileImportManagerSuite3.RegisterImporterName(nullptr, &s.importer); }},
      {3002, "RegisterImporterName: the place for the importer is a null pointer",
       [](Scene&) { return kFileImportManagerSuite3.RegisterImporterName("n", nullptr); }},
      {3002, "RegisterImporterTypes: the array of types is a null pointer",
       [](Scene& s) {
         const HostImporterExtension extension{{'.', 'm', 'a', 0}};
         return kFileImportManagerSuite3.RegisterImporterTypes(s.importer, 1, nullptr, 1, &extension);
       }},
      {3002, "RegisterImporterTypes: the array of extensions is a null pointer",
       [](Scene& s) {
         const HostImporterType type{1, 2};
         return kFileImportManagerSuite3.RegisterImporterTypes(s.importer, 1, &type, 1, nullptr);
       }},
      {3002, "RegisterImporterCallbacks: the set of callbacks is a null pointer",
       [](Scene& s) { return kFileImportManagerSuite3.RegisterImporterCallbacks(s.importer, 2, nullptr); }},
      {3002, "CreateComp: the name is a null pointer",
       [](Scene& s) {
         VOR_CompItem* comp = nullptr;
         return kCompSuite21.CreateComp(s.plugin.folder(), nullptr, 1, 1, &s.aspect, &s.duration, &s.rate,
                                        &comp);
       }},
      {3002, "CreateComp: the pixel aspect is a null pointer",
       [](Scene& s) {
         VOR_CompItem* comp = nullptr;
         return kCompSuite21.CreateComp(s.plugin.folder(), kName, 1, 1, nullptr, &s.duration, &s.rate, &comp);
       }},
      {3002, "CreateComp: the duration is a null pointer",
       [](Scene& s) {
         VOR_CompItem* comp = nullptr;
         return kCompSuite21.CreateComp(s.plugin.folder(), kName, 1, 1, &s.aspect, nullptr, &s.rate, &comp);
       }},
      {3002, "CreateComp: the frame rate is a null pointer",
       [](Scene& s) {
         VOR_CompItem* comp = nullptr;
         return kCompSuite21.CreateComp(s.plugin.folder(), kName, 1, 1, &s.aspect, &s.duration, nullptr,
                                        &comp);
       }},
      {3002, "CreateComp: the place for the composition is a null pointer",
       [](Scene& s) {
         return kCompSuite21.CreateComp(s.plugin.folder(), kName, 1, 1, &s.aspect, &s.duration, &s.rate,
                                        nullptr);
       }},
      {3002, "GetItemFromComp: the place for the item is a null pointer",
       [](Scene& s) { return kCompSuite9.GetItemFromComp(s.comp, nullptr); }},
      {3002, "NewCameraLayer: the name is a null pointer",
       [](Scene& s) { return kCompSuite9.NewCameraLayer(nullptr, s.comp, 0.0, 0.0, &s.camera); }},
      {3002, "NewCameraLayer: the place for the layer is a null pointer",
       [](Scene& s) { return kCompSuite9.NewCameraLayer("c", s.comp, 0.0, 0.0, nullptr); }},
      {3002, "NewNullLayer: the name is a null pointer",
       [](Scene& s) { return kCompSuite9.NewNullLayer(nullptr, s.comp, &s.duration, &s.parent); }},
      {3002, "NewNullLayer: the time is a null pointer",
       [](Scene& s) { return kCompSuite9.NewNullLayer("n", s.comp, nullptr, &s.parent); }},
      {3002, "NewNullLayer: the place for the layer is a null pointer",
       [](Scene& s) { return kCompSuite9.NewNullLayer("n", s.comp, &s.duration, nullptr); }},
      {3002, "AddLayerFromItem: the place for the layer is a null pointer",
       [](Scene& s) { return kLayerSuite10.AddLayerFromItem(s.compItem, s.otherComp, nullptr); }},
      {3002, "SetCameraFilmSize: the film size is a null pointer",
       [](Scene& s) { return kCameraSuite2.SetCameraFilmSize(s.camera, HOST_FILM_HORIZONTAL, nullptr); }},
      {3002, "AcquireLayerStream: the place for the stream is a null pointer",
       [](Scene& s) {
         return kStreamSuite7.AcquireLayerStream(kPluginId, s.parent, HOST_STREAM_POSITION, nullptr);
       }},
      {3002, "SetStreamValue: the value record is a null pointer",
       [](Scene& s) { return kStreamSuite8.SetStreamValue(kPluginId, s.rotation, nullptr); }},
      {3002, "GetStreamKeyframeCount: the place for the count is a null pointer",
       [](Scene& s) { return kKeyframeSuite3.GetStreamKeyframeCount(s.rotation, nullptr); }},
      {3002, "BeginKeyframeBatch: the place for the batch is a null pointer",
       [](Scene& s) { return kKeyframeSuite3.BeginKeyframeBatch(s.position, nullptr); }},
      {3002, "AddBatchKeyframe: the time is a null pointer",
       [](Scene& s) {
         std::int32_t index = 0;
         return kKeyframeSuite3.AddBatchKeyframe(s.batch, 0, nullptr, &index);
       }},
      {3002, "AddBatchKeyframe: the place for the index is a null pointer",
       [](Scene& s) { return kKeyframeSuite3.AddBatchKeyframe(s.batch, 0, &s.duration, nullptr); }},
      {3002, "SetBatchKeyframeValue: the value record is a null pointer",
       [](Scene& s) { return kKeyframeSuite4.SetBatchKeyframeValue(s.batch, 0, nullptr); }},
  });
}

}  // namespace
}  // namespace refhost
