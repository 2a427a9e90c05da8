// Plug-in ids, registrations, and calls that come out of turn.
#include "tests/refhost/RefusalScene.h"

namespace refhost {
namespace {

TEST(Refusals, PluginIdThatIsNotTheCallers) {
  expectRefusals({
      {3003, "ShowMessage: the plug-in id 8 is not 7",
       [](Scene&) { return kUtilitySuite7.ShowMessage(8, "text"); }},
      {3003, "NewMemHandle: the plug-in id 0 is not 7",
       [](Scene& s) { return kMemorySuite1.NewMemHandle(0, "n", 1, 0, &s.memory); }},
      {3003, "RegisterDeathHook: the plug-in id -7 is not 7",
       [](Scene&) { return kRegisterSuite6.RegisterDeathHook(-7, someHook, 0); }},
      {3003, "AcquireLayerStream: the plug-in id 9 is not 7",
       [](Scene& s) { return s.acquire(9, s.parent, HOST_STREAM_POSITION); }},
      {3003, "SetStreamValue: the plug-in id 10 is not 7",
       [](Scene& s) {
         const StreamValueRecord record{s.rotation, {}};
         return kStreamSuite8.SetStreamValue(10, s.rotation, &record);
       }},
  });
}

TEST(Refusals, StatesAndRegistrations) {
  expectRefusals({
      {3061, "AcquireSuite: there is no suite \"QZGP Memory Suite\" in version 2",
       [](Scene& s) {
         const void* suite = nullptr;
         return s.plugin.host().basicSuite()->AcquireSuite(QZGP_MEMORY_SUITE, 2, &suite);
       }},
      {3062, "ReleaseSuiteByName: the suite \"QZGP Memory Suite\" in version 1 is not held",
       [](Scene& s) { return s.plugin.host().basicSuite()->ReleaseSuiteByName(QZGP_MEMORY_SUITE, 1); }},
      {3062, "ReleaseSuiteByName: the suite \"Q\" in version 1 is not held",
       [](Scene& s) { return s.plugin.host().basicSuite()->ReleaseSuiteByName("Q", 1); }},
      {3041, "EndSilentErrors: no silent errors had begun with this state record",
       [](Scene& s) { return kUtilitySuite7.EndSilentErrors(0, &s.state); }},
      {3032, "UnlockMemHandle: mem:1 is not locked",
       [](Scene& s) { return kMemorySuite1.UnlockMemHandle(s.memory); }},
      {3033, "NewMemHandle: a size of -1 with flags 0",
       [](Scene& s) { return kMemorySuite1.NewMemHandle(kPluginId, "n", -1, 0, &s.memory); }},
      {3033, "NewMemHandle: a size of 1 with flags 2",
       [](Scene& s) { return kMemorySuite1.NewMemHandle(kPluginId, "n", 1, 2, &s.memory); }},
      {3036, "NewMemHandle: 4294967297 bytes are more than the 4294967280 that are left of 4294967296",
       [](Scene& s) { return kMemorySuite1.NewMemHandle(kPluginId, "n", 4294967297, 0, &s.memory); }},
      {3036,
       "NewMemHandle: 9223372036854775807 bytes are more than the 4294967280 that are left of 4294967296",
       [](Scene& s) { return kMemorySuite1.NewMemHandle(kPluginId, "n", INT64_MAX, 0, &s.memory); }},
      {3051, "RegisterImporterName: the importer's name is empty",
       [](Scene& s) { return kFileImportManagerSuite3.RegisterImporterName("", &s.importer); }},
      {3051, "RegisterImporterTypes: the extension \"ma\" is not a dot and letters",
       [](Scene& s) {
         return s.registerExtension(1, {{'m', 'a', 0, 0}});
       }},
      {3051, "RegisterImporterTypes: the extension \".\" is not a dot and letters",
       [](Scene& s) {
         return s.registerExtension(1, {{'.', 0, 'm', 'a'}});
       }},
      {3051, "RegisterImporterTypes: an importer needs a type and an extension at least",
       [](Scene& s) {
         return s.registerExtension(1, {{'.', 'm', 'a', 0}}, 0, 1);
       }},
      {3051, "RegisterImporterTypes: an importer needs a type and an extension at least",
       [](Scene& s) {
         return s.registerExtension(1, {{'.', 'm', 'a', 0}}, 1, -1);
       }},
      {3051, "RegisterImporterCallbacks: the count of callbacks is 3, not 2",
       [](Scene&) {
         return registerCallbacks(1, 3, {nullptr, someImport, someVerify});
       }},
      {3051, "RegisterImporterCallbacks: the first callback is not null",
       [](Scene&) {
         return registerCallbacks(1, 2, {someNone, someImport, someVerify});
       }},
      {3051, "RegisterImporterCallbacks: the import or the verify callback is null",
       [](Scene&) {
         return registerCallbacks(1, 2, {nullptr, nullptr, someVerify});
       }},
      {3051, "RegisterImporterCallbacks: the import or the verify callback is null",
       [](Scene&) {
         return registerCallbacks(1, 2, {nullptr, someImport, nullptr});
       }},
  });
}

TEST(Memory, LocksNestAndTheAddressStays) {
  Scene scene;
  void* first = nullptr;
  void* second = nullptr;
  EXPECT_EQ(kMemorySuite1.LockMemHandle(scene.memory, &first), 0);
  EXPECT_EQ(kMemorySuite1.LockMemHandle(scene.memory, &second), 0);
  EXPECT_EQ(first, second);
  EXPECT_EQ(kMemorySuite1.UnlockMemHandle(scene.memory), 0);
  EXPECT_EQ(kMemorySuite1.UnlockMemHandle(scene.memory), 0);
  EXPECT_EQ(kMemorySuite1.UnlockMemHandle(scene.memory), HOST_ERR_MEMORY_STATE);
}

TEST(Memory, LockedBlockCanBeFreed) {
  Scene scene;
  void* address = nullptr;
  EXPECT_EQ(kMemorySuite1.LockMemHandle(scene.memory, &address), 0);
  EXPECT_EQ(kMemorySuite1.FreeMemHandle(scene.memory), 0);
}

TEST(Memory, UnlockAfterAFailedLockIsAcceptedOnce) {
  Scene scene(withFailure(codeFailure("LockMemHandle", 1, 44)));
  void* address = nullptr;
  EXPECT_EQ(kMemorySuite1.LockMemHandle(scene.memory, &address), 44);
  EXPECT_EQ(kMemorySuite1.UnlockMemHandle(scene.memory), 0);
  EXPECT_EQ(kMemorySuite1.UnlockMemHandle(scene.memory), HOST_ERR_MEMORY_STATE);
}

}  // namespace
}  // namespace refhost
