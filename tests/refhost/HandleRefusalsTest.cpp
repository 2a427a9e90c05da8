// Handles that break a promise: null, given back, of nobody, of another kind.
#include "tests/refhost/RefusalScene.h"

namespace refhost {
namespace {

template <typename Handle>
Handle* foreign() {
  static double notAHandle = 0.0;
  return reinterpret_cast<Handle*>(&notAHandle);
}

template <typename Handle, typename Other>
Handle* taken(Other* other) {
  return reinterpret_cast<Handle*>(other);
}

const std::vector<Refusal> kHandleRefusals = {
    {3001, "CreateComp: the folder is a null handle", [](Scene& s) { return s.createComp(nullptr); }},
    {3001, "CreateComp: the folder is no handle of this host",
     [](Scene& s) { return s.createComp(foreign<VOR_Item>()); }},
    {3001, "CreateComp: the folder is comp:1, which is no item handle",
     [](Scene& s) { return s.createComp(taken<VOR_Item>(s.comp)); }},
    {3001, "GetItemFromComp: the composition is a null handle",
     [](Scene&) {
       VOR_Item* item = nullptr;
       return kCompSuite9.GetItemFromComp(nullptr, &item);
     }},
    {3001, "NewCameraLayer: the composition is item:2, which is no comp handle",
     [](Scene& s) {
       VOR_Layer* layer = nullptr;
       return kCompSuite9.NewCameraLayer("c", taken<VOR_CompItem>(s.compItem), 0.0, 0.0, &layer);
     }},
    {3001, "NewNullLayer: the composition is no handle of this host",
     [](Scene&) {
       VOR_Layer* layer = nullptr;
       const T_Time time{0, 0};
       return kCompSuite9.NewNullLayer("n", foreign<VOR_CompItem>(), &time, &layer);
     }},
    {3001, "AddLayerFromItem: the item is a null handle",
     [](Scene& s) {
       VOR_Layer* layer = nullptr;
       return kLayerSuite10.AddLayerFromItem(nullptr, s.comp, &layer);
     }},
    {3001, "AddLayerFromItem: the composition is a null handle",
     [](Scene& s) {
       VOR_Layer* layer = nullptr;
       return kLayerSuite10.AddLayerFromItem(s.compItem, nullptr, &layer);
     }},
    {3001, "SetLayerFlag: the layer is a null handle",
     [](Scene&) { return kLayerSuite10.SetLayerFlag(nullptr, HOST_LAYER_FLAG_3D, 1); }},
    {3001, "SetLayerParent: the layer is a null handle",
     [](Scene& s) { return kLayerSuite10.SetLayerParent(nullptr, s.parent); }},
    {3001, "SetLayerParent: the parent is a null handle",
     [](Scene& s) { return kLayerSuite10.SetLayerParent(s.child, nullptr); }},
    {3001, "SetLayerParent: the parent is stream:1, which is no layer handle",
     [](Scene& s) { return kLayerSuite10.SetLayerParent(s.child, taken<VOR_Layer>(s.rotation)); }},
    {3001, "SetCameraFilmSize: the layer is no handle of this host",
     [](Scene& s) { return s.filmSize(foreign<VOR_Layer>(), 1, 1.0); }},
    {3001, "AcquireLayerStream: the layer is a null handle",
     [](Scene& s) { return s.acquire(kPluginId, nullptr, HOST_STREAM_POSITION); }},
    {3001, "ReleaseStream: the stream is a null handle",
     [](Scene&) { return kStreamSuite7.ReleaseStream(nullptr); }},
    {3001, "ReleaseStream: the stream is stream:3, which was given back before",
     [](Scene& s) { return kStreamSuite7.ReleaseStream(s.released); }},
    {3001, "SetStreamValue: the stream is stream:3, which was given back before",
     [](Scene& s) { return s.setValue(s.released, s.rotation, 1.0); }},
    {3001, "SetStreamValue: the record's stream is a null handle",
     [](Scene& s) { return s.setValue(s.rotation, nullptr, 1.0); }},
    {3001, "SetStreamValue: the record's stream is stream:2 and not stream:1",
     [](Scene& s) { return s.setValue(s.rotation, s.position, 1.0); }},
    {3001, "GetStreamKeyframeCount: the stream is batch:2, which is no stream handle",
     [](Scene& s) {
       std::int32_t count = 0;
       return kKeyframeSuite3.GetStreamKeyframeCount(taken<VOR_Stream>(s.batch), &count);
     }},
    {3001, "BeginKeyframeBatch: the stream is stream:3, which was given back before",
     [](Scene& s) {
       VOR_AddKeyframesInfo* batch = nullptr;
       return kKeyframeSuite3.BeginKeyframeBatch(s.released, &batch);
     }},
    {3001, "AddBatchKeyframe: the batch is batch:1, which was given back before",
     [](Scene& s) {
       return s.addKey(s.ended, 0, {1, 1});
     }},
    {3001, "SetBatchKeyframeValue: the batch is batch:1, which was given back before",
     [](Scene& s) { return s.setKey(s.ended, 0, s.position, 1.0); }},
    {3001, "SetBatchKeyframeValue: the record's stream is stream:3, which was given back before",
     [](Scene& s) { return s.setKey(s.batch, 0, s.released, 1.0); }},
    {3001, "EndKeyframeBatch: the batch is batch:1, which was given back before",
     [](Scene& s) { return kKeyframeSuite3.EndKeyframeBatch(1, s.ended); }},
    {3001, "EndKeyframeBatch: the batch is a null handle",
     [](Scene&) { return kKeyframeSuite3.EndKeyframeBatch(1, nullptr); }},
    {3001, "FreeMemHandle: the memory handle is mem:2, which was given back before",
     [](Scene& s) { return kMemorySuite1.FreeMemHandle(s.freed); }},
    {3001, "LockMemHandle: the memory handle is a null handle",
     [](Scene&) {
       void* address = nullptr;
       return kMemorySuite1.LockMemHandle(nullptr, &address);
     }},
    {3001, "UnlockMemHandle: the memory handle is no handle of this host",
     [](Scene&) { return kMemorySuite1.UnlockMemHandle(foreign<HostMemHandle>()); }},
    {3001, "GetPrefLong: the preference store is no handle of this host",
     [](Scene&) {
       std::int32_t value = 0;
       return kPersistentDataSuite3.GetPrefLong(foreign<HostPrefsStore>(), "S", "k", 0, &value);
     }},
    {3001, "GetPrefLong: the preference store is mem:1, which is no store handle",
     [](Scene& s) {
       std::int32_t value = 0;
       return kPersistentDataSuite3.GetPrefLong(taken<HostPrefsStore>(s.memory), "S", "k", 0, &value);
     }},
    {3001, "RegisterImporterTypes: there is no importer of the number 0",
     [](Scene& s) {
       return s.registerExtension(0, {{'.', 'm', 'a', 0}});
     }},
    {3001, "RegisterImporterCallbacks: there is no importer of the number 2",
     [](Scene&) {
       return registerCallbacks(2, 2, {nullptr, someImport, someVerify});
     }},
};

TEST(Refusals, NullStaleAndForeignHandlesAreDistinguished) { expectRefusals(kHandleRefusals); }

TEST(Refusals, PermissiveHostRefusesHandlesAsEver) {
  HostOptions options;
  options.permissive = true;
  expectRefusals(kHandleRefusals, options);
}

TEST(Refusals, ObjectsOfTheWrongKind) {
  expectRefusals({
      {3021, "CreateComp: item:2 is no folder", [](Scene& s) { return s.createComp(s.compItem); }},
      {3022, "AddLayerFromItem: item:1 is a folder and cannot be a layer",
       [](Scene& s) {
         VOR_Layer* layer = nullptr;
         return kLayerSuite10.AddLayerFromItem(s.plugin.folder(), s.comp, &layer);
       }},
      {3022, "AddLayerFromItem: comp:1 would contain itself",
       [](Scene& s) {
         VOR_Layer* layer = nullptr;
         return kLayerSuite10.AddLayerFromItem(s.compItem, s.comp, &layer);
       }},
      {3022, "AddLayerFromItem: comp:1 would contain itself",
       [](Scene& s) {
         VOR_Layer* layer = nullptr;
         VOR_Item* other = nullptr;
         kCompSuite9.GetItemFromComp(s.otherComp, &other);
         EXPECT_EQ(kLayerSuite10.AddLayerFromItem(s.compItem, s.otherComp, &layer), 0);
         return kLayerSuite10.AddLayerFromItem(other, s.comp, &layer);
       }},
      {3023, "SetCameraFilmSize: layer:1 is no camera layer",
       [](Scene& s) { return s.filmSize(s.parent, 1, 1.0); }},
      {3024, "AcquireLayerStream: layer:1 has no stream of the number 11",
       [](Scene& s) { return s.acquire(kPluginId, s.parent, HOST_STREAM_ZOOM); }},
      {3024, "AcquireLayerStream: layer:3 has no stream of the number -1",
       [](Scene& s) { return s.acquire(kPluginId, s.camera, -1); }},
      {3025, "SetLayerParent: layer:2 and layer:4 are not of one composition",
       [](Scene& s) { return kLayerSuite10.SetLayerParent(s.child, s.elsewhere); }},
      {3026, "SetLayerParent: layer:2 would become its own ancestor",
       [](Scene& s) { return kLayerSuite10.SetLayerParent(s.child, s.child); }},
      {3026, "SetLayerParent: layer:1 would become its own ancestor",
       [](Scene& s) {
         EXPECT_EQ(kLayerSuite10.SetLayerParent(s.child, s.parent), 0);
         EXPECT_EQ(kLayerSuite10.SetLayerParent(s.camera, s.child), 0);
         return kLayerSuite10.SetLayerParent(s.parent, s.camera);
       }},
      {3027, "BeginKeyframeBatch: the Z rotation of layer:1 already has an open batch",
       [](Scene& s) {
         VOR_AddKeyframesInfo* batch = nullptr;
         return kKeyframeSuite3.BeginKeyframeBatch(s.rotation, &batch);
       }},
      {3028, "SetBatchKeyframeValue: batch:2 holds no key of the index 1",
       [](Scene& s) { return s.setKey(s.batch, 1, s.rotation, 1.0); }},
      {3028, "SetBatchKeyframeValue: batch:2 holds no key of the index -1",
       [](Scene& s) { return s.setKey(s.batch, -1, s.rotation, 1.0); }},
      {3028, "SetBatchKeyframeValue: stream:2 is not of the stream that batch:2 was opened on",
       [](Scene& s) { return s.setKey(s.batch, 0, s.position, 1.0); }},
      {3029, "AddBatchKeyframe: the time mode 1 is not 0",
       [](Scene& s) {
         return s.addKey(s.batch, 1, {1, 1});
       }},
      {3016, "SetCameraFilmSize: the direction 0 is neither 1 nor 2",
       [](Scene& s) { return s.filmSize(s.camera, 0, 1.0); }},
      {3016, "SetCameraFilmSize: the direction 3 is neither 1 nor 2",
       [](Scene& s) { return s.filmSize(s.camera, 3, 1.0); }},
  });
}

}  // namespace
}  // namespace refhost
