// The trace, compared as whole lines.
#include <cmath>
#include <cstdint>
#include <limits>

#include "refhost/Trace.h"
#include "tests/refhost/StandIn.h"

namespace refhost {
namespace {

using ::testing::ElementsAre;

std::string numberLine(double value) {
  const HandleCodec codec(0);
  TraceLine line(codec, "X", true);
  line.number("n", &value);
  line.end();
  return line.line();
}

TEST(Trace, DoublesAreInTheirShortestForm) {
  const double infinity = std::numeric_limits<double>::infinity();
  const std::pair<double, const char*> cases[] = {
      {0.0, "0"},
      {-0.0, "-0"},
      {1.0, "1"},
      {636.3812, "636.3812"},
      {0.1, "0.1"},
      {1.0 / 3.0, "0.3333333333333333"},
      {1e300, "1e+300"},
      {-2147483648.0, "-2147483648"},
      {std::numeric_limits<double>::denorm_min(), "5e-324"},
      {infinity, "\"inf\""},
      {-infinity, "\"-inf\""},
      {std::nan(""), "\"nan\""},
  };
  for (const auto& [value, text] : cases) {
    EXPECT_EQ(numberLine(value), std::string("{\"call\":\"X\",\"n\":") + text + "}\n");
  }
}

TEST(Trace, BasicSuiteNamesTheSuiteOfTheCall) {
  StandIn plugin;
  const void* suite = nullptr;
  const WNBasicSuite& basic = *plugin.host().basicSuite();
  basic.AcquireSuite("QZGP Memory Suite", 1, &suite);
  EXPECT_EQ(suite, &kMemorySuite1);
  basic.AcquireSuite("QZGP \"Other\" Suite", 4, &suite);
  basic.ReleaseSuiteByName("QZGP Memory Suite", 1);
  EXPECT_THAT(
      plugin.lines(),
      ElementsAre(R"({"call":"AcquireSuite","suite":"QZGP Memory Suite","version":1,"error":0})",
                  R"({"call":"AcquireSuite","suite":"QZGP \"Other\" Suite","version":4,"error":3061})",
                  R"({"call":"ReleaseSuiteByName","suite":"QZGP Memory Suite","version":1,"error":0})"));
}

TEST(Trace, UtilityAndMemoryCalls) {
  StandIn plugin;
  HostSilentErrorState state{};
  HostMemHandle* handle = nullptr;
  void* address = nullptr;
  kUtilitySuite7.ShowMessage(kPluginId, "a\nb");
  kUtilitySuite7.BeginSilentErrors(&state);
  kUtilitySuite7.EndSilentErrors(0, &state);
  kMemorySuite1.NewMemHandle(kPluginId, "file buffer", 5312, 0, &handle);
  kMemorySuite1.LockMemHandle(handle, &address);
  kMemorySuite1.UnlockMemHandle(handle);
  kMemorySuite1.FreeMemHandle(handle);
  EXPECT_THAT(
      plugin.lines(),
      ElementsAre(
          R"({"call":"ShowMessage","suite":"QZGP Utility Suite","version":7,"pluginId":7,"text":"a\u000ab","error":0})",
          R"({"call":"BeginSilentErrors","suite":"QZGP Utility Suite","version":7,"error":0})",
          R"({"call":"EndSilentErrors","suite":"QZGP Utility Suite","version":7,"report":0,"error":0})",
          R"({"call":"NewMemHandle","suite":"QZGP Memory Suite","version":1,"pluginId":7,"name":"file buffer","size":5312,"flags":0,"handle":"mem:1","error":0})",
          R"({"call":"LockMemHandle","suite":"QZGP Memory Suite","version":1,"handle":"mem:1","error":0})",
          R"({"call":"UnlockMemHandle","suite":"QZGP Memory Suite","version":1,"handle":"mem:1","error":0})",
          R"({"call":"FreeMemHandle","suite":"QZGP Memory Suite","version":1,"handle":"mem:1","error":0})"));
}

HostError ignoredHook(std::intptr_t) { return 0; }
HostError ignoredImport(const HostUTF16Unit*, void*, void*, VOR_Item*) { return 0; }
HostError ignoredVerify(const HostUTF16Unit*, void*, std::uint8_t*) { return 0; }

TEST(Trace, RegistrationCalls) {
  StandIn plugin({}, Callback::Entry);
  HostPrefsStore* store = nullptr;
  std::int32_t value = -1;
  HostImporterId importer = 0;
  const HostImporterType type{0x4D415941, 0x4D615961};
  const HostImporterExtension extension{{'.', 'm', 'a', '\0'}};
  const HostImporterCallbacks callbacks{nullptr, ignoredImport, ignoredVerify};
  kPersistentDataSuite3.GetAppPrefsBlob(&store);
  kPersistentDataSuite3.GetPrefLong(store, HOST_PREF_SECTION, HOST_PREF_LINEAR_UNITS, 0, &value);
  kRegisterSuite6.RegisterDeathHook(kPluginId, ignoredHook, 0);
  kFileImportManagerSuite3.RegisterImporterName("Maya Scene", &importer);
  kFileImportManagerSuite3.RegisterImporterTypes(importer, 1, &type, 1, &extension);
  kFileImportManagerSuite3.RegisterImporterCallbacks(importer, 2, &callbacks);
  EXPECT_THAT(
      plugin.lines(),
      ElementsAre(
          R"({"call":"GetAppPrefsBlob","suite":"QZGP Persistent Data Suite","version":3,"store":"store:1","error":0})",
          R"({"call":"GetPrefLong","suite":"QZGP Persistent Data Suite","version":3,"store":"store:1","section":"Maya Camera","key":"Use Linear Units","default":0,"value":0,"error":0})",
          R"({"call":"RegisterDeathHook","suite":"QZGP Register Suite","version":6,"pluginId":7,"refcon":0,"error":0})",
          R"({"call":"RegisterImporterName","suite":"QZGP File Import Manager Suite","version":3,"name":"Maya Scene","importer":"importer:1","error":0})",
          R"({"call":"RegisterImporterTypes","suite":"QZGP File Import Manager Suite","version":3,"importer":"importer:1","types":[{"type":"MAYA","creator":"MaYa"}],"extensions":[".ma"],"error":0})",
          R"({"call":"RegisterImporterCallbacks","suite":"QZGP File Import Manager Suite","version":3,"importer":"importer:1","count":2,"error":0})"));
}

TEST(Trace, APreferenceWithoutAStoreIsTheDefault) {
  StandIn plugin({}, Callback::Entry);
  std::int32_t value = -1;
  kPersistentDataSuite3.GetPrefLong(nullptr, "S", "k", 4, &value);
  EXPECT_THAT(
      plugin.lines(),
      ElementsAre(
          R"({"call":"GetPrefLong","suite":"QZGP Persistent Data Suite","version":3,"store":null,"section":"S","key":"k","default":4,"value":4,"error":0})"));
}

TEST(Trace, CompositionAndLayerCalls) {
  StandIn plugin;
  const HostUTF16Unit name[] = {'S', 0xE9, 0xDC80, 0};
  const HostRatio aspect{900, 1000};
  const T_Time duration{48000, 24000};
  const HostRatio rate{24, 1};
  const T_Time wholeLength{0, 0};
  const double filmSize = 102.024;
  VOR_CompItem* comp = nullptr;
  VOR_CompItem* other = nullptr;
  VOR_Item* item = nullptr;
  VOR_Layer* camera = nullptr;
  VOR_Layer* null = nullptr;
  VOR_Layer* nested = nullptr;
  kCompSuite21.CreateComp(plugin.folder(), name, 648, 486, &aspect, &duration, &rate, &comp);
  kCompSuite21.CreateComp(plugin.folder(), name + 1, 720, 487, &rate, &duration, &aspect, &other);
  kCompSuite9.GetItemFromComp(comp, &item);
  kLayerSuite10.AddLayerFromItem(item, other, &nested);
  kCompSuite9.NewCameraLayer("cam\xFFShape", comp, -2147483648.0, 1.5, &camera);
  kCameraSuite2.SetCameraFilmSize(camera, HOST_FILM_HORIZONTAL, &filmSize);
  kCompSuite9.NewNullLayer("rig", comp, &wholeLength, &null);
  kLayerSuite10.SetLayerFlag(null, HOST_LAYER_FLAG_3D, 1);
  kLayerSuite10.SetLayerParent(camera, null);
  EXPECT_THAT(
      plugin.lines(),
      ElementsAre(
          R"({"call":"CreateComp","suite":"QZGP Comp Suite","version":21,"folder":"item:1","name":"Sé�","width":648,"height":486,"pixelAspect":[900,1000],"duration":[48000,24000],"frameRate":[24,1],"comp":"comp:1","error":0})",
          R"({"call":"CreateComp","suite":"QZGP Comp Suite","version":21,"folder":"item:1","name":"é�","width":720,"height":487,"pixelAspect":[24,1],"duration":[48000,24000],"frameRate":[900,1000],"comp":"comp:2","error":0})",
          R"({"call":"GetItemFromComp","suite":"QZGP Comp Suite","version":9,"comp":"comp:1","item":"item:2","error":0})",
          R"({"call":"AddLayerFromItem","suite":"QZGP Layer Suite","version":10,"item":"item:2","comp":"comp:2","layer":"layer:1","error":0})",
          R"({"call":"NewCameraLayer","suite":"QZGP Comp Suite","version":9,"name":"cam�Shape","comp":"comp:1","center":[-2147483648,1.5],"layer":"layer:2","error":0})",
          R"({"call":"SetCameraFilmSize","suite":"QZGP Camera Suite","version":2,"layer":"layer:2","direction":1,"filmSize":102.024,"error":0})",
          R"({"call":"NewNullLayer","suite":"QZGP Comp Suite","version":9,"name":"rig","comp":"comp:1","time":[0,0],"layer":"layer:3","error":0})",
          R"({"call":"SetLayerFlag","suite":"QZGP Layer Suite","version":10,"layer":"layer:3","flag":2048,"value":1,"error":0})",
          R"({"call":"SetLayerParent","suite":"QZGP Layer Suite","version":10,"layer":"layer:2","parent":"layer:3","error":0})"));
}

TEST(Trace, StreamAndKeyframeCalls) {
  StandIn plugin;
  VOR_Layer* layer = plugin.makeNull(plugin.makeComp());
  const std::size_t before = plugin.lines().size();
  VOR_Stream* stream = plugin.acquire(layer, HOST_STREAM_POSITION);
  const StreamValueRecord record{stream, {636.3812, -0.0, 3.0, 4.0}};
  kStreamSuite8.SetStreamValue(kPluginId, stream, &record);
  std::int32_t count = -1;
  kKeyframeSuite3.GetStreamKeyframeCount(stream, &count);
  VOR_AddKeyframesInfo* batch = plugin.open(stream);
  kStreamSuite7.ReleaseStream(stream);
  VOR_Stream* again = plugin.acquire(layer, HOST_STREAM_POSITION);
  plugin.addKey(batch, again, {500, 24000}, 1.0, 2.0, 1e-7);
  kKeyframeSuite3.EndKeyframeBatch(1, batch);
  std::vector<std::string> lines = plugin.lines();
  lines.erase(lines.begin(), lines.begin() + static_cast<std::ptrdiff_t>(before));
  EXPECT_THAT(
      lines,
      ElementsAre(
          R"({"call":"AcquireLayerStream","suite":"QZGP Stream Suite","version":7,"pluginId":7,"layer":"layer:1","streamId":1,"stream":"stream:1","error":0})",
          R"({"call":"SetStreamValue","suite":"QZGP Stream Suite","version":8,"pluginId":7,"stream":"stream:1","value":[636.3812,-0,3,4],"error":0})",
          R"({"call":"GetStreamKeyframeCount","suite":"QZGP Keyframe Suite","version":3,"stream":"stream:1","count":0,"error":0})",
          R"({"call":"BeginKeyframeBatch","suite":"QZGP Keyframe Suite","version":3,"stream":"stream:1","batch":"batch:1","error":0})",
          R"({"call":"ReleaseStream","suite":"QZGP Stream Suite","version":7,"stream":"stream:1","error":0})",
          R"({"call":"AcquireLayerStream","suite":"QZGP Stream Suite","version":7,"pluginId":7,"layer":"layer:1","streamId":1,"stream":"stream:2","error":0})",
          R"({"call":"AddBatchKeyframe","suite":"QZGP Keyframe Suite","version":3,"batch":"batch:1","timeMode":0,"time":[500,24000],"index":0,"error":0})",
          R"({"call":"SetBatchKeyframeValue","suite":"QZGP Keyframe Suite","version":4,"batch":"batch:1","index":0,"stream":"stream:2","value":[1,2,1e-07,0],"error":0})",
          R"({"call":"EndKeyframeBatch","suite":"QZGP Keyframe Suite","version":3,"commit":1,"batch":"batch:1","error":0})"));
}

TEST(Trace, FailedCallHandsOutNull) {
  StandIn plugin;
  VOR_Item* item = nullptr;
  kCompSuite9.GetItemFromComp(nullptr, &item);
  EXPECT_EQ(
      plugin.lastLine(),
      R"({"call":"GetItemFromComp","suite":"QZGP Comp Suite","version":9,"comp":null,"item":null,"error":3001})");
  std::int32_t index = 0;
  kKeyframeSuite3.AddBatchKeyframe(nullptr, 0, nullptr, &index);
  EXPECT_EQ(
      plugin.lastLine(),
      R"({"call":"AddBatchKeyframe","suite":"QZGP Keyframe Suite","version":3,"batch":null,"timeMode":0,"time":null,"index":null,"error":3001})");
  kKeyframeSuite4.SetBatchKeyframeValue(nullptr, 3, nullptr);
  EXPECT_EQ(
      plugin.lastLine(),
      R"({"call":"SetBatchKeyframeValue","suite":"QZGP Keyframe Suite","version":4,"batch":null,"index":3,"stream":null,"value":null,"error":3001})");
}

TEST(Trace, NullArgumentsOfEveryCallAreWrittenAsNull) {
  StandIn plugin;
  plugin.host().basicSuite()->AcquireSuite(nullptr, 3, nullptr);
  kCompSuite21.CreateComp(plugin.folder(), nullptr, 1, 2, nullptr, nullptr, nullptr, nullptr);
  kFileImportManagerSuite3.RegisterImporterTypes(0, 1, nullptr, 1, nullptr);
  kCameraSuite2.SetCameraFilmSize(nullptr, HOST_FILM_HORIZONTAL, nullptr);
  kUtilitySuite7.ShowMessage(kPluginId, nullptr);
  EXPECT_THAT(
      plugin.lines(),
      ElementsAre(
          R"({"call":"AcquireSuite","suite":null,"version":3,"error":3002})",
          R"({"call":"CreateComp","suite":"QZGP Comp Suite","version":21,"folder":"item:1","name":null,"width":1,"height":2,"pixelAspect":null,"duration":null,"frameRate":null,"comp":null,"error":3002})",
          R"({"call":"RegisterImporterTypes","suite":"QZGP File Import Manager Suite","version":3,"importer":null,"types":null,"extensions":null,"error":3001})",
          R"({"call":"SetCameraFilmSize","suite":"QZGP Camera Suite","version":2,"layer":null,"direction":1,"filmSize":null,"error":3001})",
          R"({"call":"ShowMessage","suite":"QZGP Utility Suite","version":7,"pluginId":7,"text":null,"error":3002})"));
}

TEST(Trace, ForeignHandleIsWrittenAsForeign) {
  StandIn plugin;
  int local = 0;
  kStreamSuite7.ReleaseStream(reinterpret_cast<VOR_Stream*>(&local));
  EXPECT_EQ(
      plugin.lastLine(),
      R"({"call":"ReleaseStream","suite":"QZGP Stream Suite","version":7,"stream":"foreign","error":3001})");
}

TEST(Trace, InfinitiesOfAPermissiveHostAreStrings) {
  HostOptions options;
  options.permissive = true;
  StandIn plugin(options);
  VOR_Layer* camera = plugin.makeCamera(plugin.makeComp());
  VOR_Stream* stream = plugin.acquire(camera, HOST_STREAM_ZOOM);
  const StreamValueRecord record{stream, {HUGE_VAL, -HUGE_VAL, std::nan(""), 0.0}};
  kStreamSuite8.SetStreamValue(kPluginId, stream, &record);
  EXPECT_EQ(
      plugin.lastLine(),
      R"({"call":"SetStreamValue","suite":"QZGP Stream Suite","version":8,"pluginId":7,"stream":"stream:1","value":["inf","-inf","nan",0],"error":0})");
}

TEST(Trace, CallbacksAreBracketed) {
  std::ostringstream trace;
  HostOptions options;
  options.trace = &trace;
  Host host(options);
  host.beginCallback(Callback::Entry, "");
  host.endCallback(5);
  host.beginCallback(Callback::Import, "dir/a\xFF\"b.ma");
  host.endCallback(0);
  host.beginCallback(Callback::Verify, "v.ma");
  host.endCallback(-1);
  host.beginCallback(Callback::Import, "second.ma");
  host.endCallback(1289986);
  host.beginCallback(Callback::Death, "");
  host.endCallback(0);
  EXPECT_EQ(trace.str(),
            "{\"call\":\"enter\",\"callback\":\"GPMain_MayaImport\"}\n"
            "{\"call\":\"leave\",\"callback\":\"GPMain_MayaImport\",\"error\":5}\n"
            "{\"call\":\"enter\",\"callback\":\"ImportFileCallback\",\"path\":\"dir/a\xEF\xBF\xBD\\\"b.ma\","
            "\"folder\":\"item:1\"}\n"
            "{\"call\":\"leave\",\"callback\":\"ImportFileCallback\",\"error\":0}\n"
            "{\"call\":\"enter\",\"callback\":\"VerifyFileCallback\",\"path\":\"v.ma\"}\n"
            "{\"call\":\"leave\",\"callback\":\"VerifyFileCallback\",\"canImport\":false,\"error\":-1}\n"
            "{\"call\":\"enter\",\"callback\":\"ImportFileCallback\",\"path\":\"second.ma\",\"folder\":"
            "\"item:2\"}\n"
            "{\"call\":\"leave\",\"callback\":\"ImportFileCallback\",\"error\":1289986}\n"
            "{\"call\":\"enter\",\"callback\":\"DeathHook\"}\n"
            "{\"call\":\"leave\",\"callback\":\"DeathHook\",\"error\":0}\n");
}

}  // namespace
}  // namespace refhost
