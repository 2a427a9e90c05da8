// Failures on demand: which call they hit, and what the call then does.
#include <iterator>
#include <new>
#include <stdexcept>

#include "hostutil/HostNumbers.h"
#include "hostutil/HostSetup.h"
#include "tests/refhost/StandIn.h"
#include "tests/support/ThrowsOther.h"

namespace refhost {
namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;

HostError show() { return kUtilitySuite7.ShowMessage(kPluginId, "text"); }

std::vector<HostError> showTimes(int times) {
  std::vector<HostError> errors;
  for (int i = 0; i < times; ++i) errors.push_back(show());
  return errors;
}

Failure atCall(std::int64_t nth, bool onwards, HostError code) {
  Failure failure;
  failure.nth = nth;
  failure.onwards = onwards;
  failure.code = code;
  return failure;
}

TEST(Rehearsal, NthCallOfTheOperationFailsAndDoesNothing) {
  StandIn plugin(withFailure(codeFailure("ShowMessage", 2, 512)));
  EXPECT_THAT(showTimes(3), ElementsAre(0, 512, 0));
  EXPECT_THAT(plugin.leave().messages, ElementsAre("text", "text"));
}

TEST(Rehearsal, ZeroIsEveryCallOfTheOperation) {
  StandIn plugin(withFailure(codeFailure("ShowMessage", 0, 512)));
  EXPECT_THAT(showTimes(3), ElementsAre(512, 512, 512));
  EXPECT_NE(plugin.makeComp(), nullptr);
}

TEST(Rehearsal, CallsOfOtherOperationsAreNotCounted) {
  StandIn plugin(withFailure(codeFailure("ShowMessage", 2, 512)));
  plugin.makeComp();
  EXPECT_EQ(show(), 0);
  plugin.makeComp();
  EXPECT_EQ(show(), 512);
}

TEST(Rehearsal, KthCallOfAllFails) {
  StandIn plugin(withFailure(atCall(3, false, 77)));
  const void* suite = nullptr;
  EXPECT_EQ(plugin.host().basicSuite()->AcquireSuite(QZGP_MEMORY_SUITE, 1, &suite), 0);
  EXPECT_EQ(show(), 0);
  EXPECT_EQ(plugin.host().basicSuite()->ReleaseSuiteByName(QZGP_MEMORY_SUITE, 1), 77);
  EXPECT_EQ(show(), 0);
}

TEST(Rehearsal, KthCallAndAllAfterItFail) {
  StandIn plugin(withFailure(atCall(2, true, 77)));
  EXPECT_THAT(showTimes(4), ElementsAre(0, 77, 77, 77));
}

TEST(Rehearsal, OfTwoFailuresForOneCallTheFirstGivenCounts) {
  HostOptions options;
  options.failures = {codeFailure("ShowMessage", 1, 5), atCall(1, true, 6)};
  StandIn plugin(options);
  EXPECT_THAT(showTimes(2), ElementsAre(5, 6));
}

TEST(Rehearsal, FailedCallLeavesWhatItWouldHandOutAlone) {
  StandIn plugin(withFailure(codeFailure("GetItemFromComp", 1, 5)));
  VOR_CompItem* comp = plugin.makeComp();
  VOR_Item* item = plugin.folder();
  EXPECT_EQ(kCompSuite9.GetItemFromComp(comp, &item), 5);
  EXPECT_EQ(item, plugin.folder());
  EXPECT_EQ(
      plugin.lastLine(),
      R"({"call":"GetItemFromComp","suite":"QZGP Comp Suite","version":9,"comp":"comp:1","item":null,"error":5})");
}

TEST(Rehearsal, FailureOfCodeZeroHandsOutNullAndReturnsZero) {
  HostOptions options;
  options.failures.push_back(atCall(1, true, 0));
  StandIn plugin(options);
  int local = 0;
  const void* suite = &local;
  EXPECT_EQ(plugin.host().basicSuite()->AcquireSuite(QZGP_MEMORY_SUITE, 1, &suite), 0);
  EXPECT_EQ(suite, nullptr);
  HostMemHandle* memory = reinterpret_cast<HostMemHandle*>(&local);
  EXPECT_EQ(kMemorySuite1.NewMemHandle(kPluginId, "n", 5, 0, &memory), 0);
  EXPECT_EQ(memory, nullptr);
  void* address = &local;
  EXPECT_EQ(kMemorySuite1.LockMemHandle(nullptr, &address), 0);
  EXPECT_EQ(address, nullptr);
  std::int32_t index = 9;
  const T_Time time{1, 2};
  EXPECT_EQ(kKeyframeSuite3.AddBatchKeyframe(nullptr, 0, &time, &index), 0);
  EXPECT_EQ(index, 0);
  EXPECT_EQ(
      plugin.lastLine(),
      R"({"call":"AddBatchKeyframe","suite":"QZGP Keyframe Suite","version":3,"batch":null,"timeMode":0,"time":[1,2],"index":null,"error":0})");
  const CallbackResult result = plugin.leave();
  EXPECT_THAT(result.refusals, IsEmpty());
  EXPECT_THAT(result.leftovers, IsEmpty());
}

TEST(Rehearsal, NullPointerForWhatIsHandedOutIsLeftAlone) {
  StandIn plugin(withFailure(atCall(1, true, 0)));
  EXPECT_EQ(kCompSuite9.GetItemFromComp(nullptr, nullptr), 0);
  EXPECT_EQ(
      plugin.lastLine(),
      R"({"call":"GetItemFromComp","suite":"QZGP Comp Suite","version":9,"comp":null,"item":null,"error":0})");
}

TEST(Rehearsal, NumberOfAHandleThatWasNotHandedOutIsTheNextOnes) {
  StandIn plugin(withFailure(codeFailure("AcquireLayerStream", 2, 5)));
  VOR_Layer* layer = plugin.makeNull(plugin.makeComp());
  plugin.acquire(layer, HOST_STREAM_POSITION);
  VOR_Stream* none = nullptr;
  EXPECT_EQ(kStreamSuite7.AcquireLayerStream(kPluginId, layer, HOST_STREAM_POSITION, &none), 5);
  plugin.acquire(layer, HOST_STREAM_POSITION);
  EXPECT_THAT(plugin.lastLine(), ::testing::HasSubstr("\"stream\":\"stream:2\""));
}

TEST(Rehearsal, ThrownExceptionsAreNamedInTheTrace) {
  HostOptions options;
  Failure failure = codeFailure("GetAppPrefsBlob", 1, 0);
  failure.kind = Failure::Kind::BadAlloc;
  options.failures.push_back(failure);
  failure = atCall(2, false, 0);
  failure.kind = Failure::Kind::RuntimeError;
  options.failures.push_back(failure);
  failure = atCall(3, true, 0);
  failure.kind = Failure::Kind::Other;
  options.failures.push_back(failure);
  StandIn plugin(options);
  HostPrefsStore* store = nullptr;
  EXPECT_THROW(kPersistentDataSuite3.GetAppPrefsBlob(&store), std::bad_alloc);
  EXPECT_THROW(kPersistentDataSuite3.GetAppPrefsBlob(&store), std::runtime_error);
  EXPECT_TRUE(testsupport::ThrowsOther([] { show(); }));
  EXPECT_THAT(
      plugin.lines(),
      ElementsAre(
          R"({"call":"GetAppPrefsBlob","suite":"QZGP Persistent Data Suite","version":3,"store":null,"error":"bad_alloc"})",
          R"({"call":"GetAppPrefsBlob","suite":"QZGP Persistent Data Suite","version":3,"store":null,"error":"runtime_error"})",
          R"({"call":"ShowMessage","suite":"QZGP Utility Suite","version":7,"pluginId":7,"text":"text","error":"other"})"));
}

TEST(Rehearsal, ExceptionIsThrownWithoutATraceToo) {
  Failure failure = codeFailure("ReleaseStream", 1, 0);
  failure.kind = Failure::Kind::BadAlloc;
  Host host(withFailure(failure));
  host.beginCallback(Callback::Import, "a.ma");
  EXPECT_THROW(kStreamSuite7.ReleaseStream(nullptr), std::bad_alloc);
  host.endCallback(0);
}

TEST(Rehearsal, WorksOnlyInTheCallbackThatItIsFor) {
  HostOptions options = withFailure(codeFailure("ShowMessage", 0, 5));
  options.refusedSuites.push_back({QZGP_MEMORY_SUITE, 1});
  options.during = Callback::Verify;
  StandIn plugin(options, Callback::Import);
  const void* suite = nullptr;
  const WNBasicSuite& basic = *plugin.host().basicSuite();
  EXPECT_EQ(show(), 0);
  EXPECT_EQ(basic.AcquireSuite(QZGP_MEMORY_SUITE, 1, &suite), 0);
  plugin.leave();
  plugin.enterAgain(Callback::Verify);
  EXPECT_EQ(show(), 5);
  EXPECT_EQ(basic.AcquireSuite(QZGP_MEMORY_SUITE, 1, &suite), HOST_ERR_SUITE_REFUSED);
  EXPECT_EQ(basic.AcquireSuite(QZGP_LAYER_SUITE, 10, &suite), 0);
  plugin.leave();
  EXPECT_EQ(show(), 0);
}

TEST(Rehearsal, CountStartsAnewWithEachCallback) {
  StandIn plugin(withFailure(codeFailure("ShowMessage", 2, 5)));
  EXPECT_THAT(showTimes(2), ElementsAre(0, 5));
  plugin.leave();
  plugin.enterAgain(Callback::Import);
  EXPECT_THAT(showTimes(3), ElementsAre(0, 5, 0));
}

TEST(Rehearsal, RefusedSuiteIsTracedWithItsError) {
  HostOptions options;
  options.refusedSuites.push_back({QZGP_STREAM_SUITE, 8});
  StandIn plugin(options);
  const void* suite = nullptr;
  plugin.host().basicSuite()->AcquireSuite(QZGP_STREAM_SUITE, 8, &suite);
  EXPECT_EQ(plugin.lastLine(),
            R"({"call":"AcquireSuite","suite":"QZGP Stream Suite","version":8,"error":3061})");
  EXPECT_THAT(plugin.leave().refusals, IsEmpty());
}

HostError scan(const char* text) {
  double number = 0.0;
  return HostNumberScan(text, 1, &number);
}

TEST(Rehearsal, UtilityServicesFailInTheCallbackOnly) {
  StandIn plugin(withFailure(codeFailure("NumberScan", 2, 2222)));
  EXPECT_EQ(scan("1"), 0);
  EXPECT_EQ(scan("1"), 2222);
  EXPECT_EQ(scan("1"), 0);
  EXPECT_EQ(plugin.host().callCount("NumberScan"), 3);
  EXPECT_EQ(plugin.leave().suiteCalls, 0);
  EXPECT_EQ(scan("1"), 0);
  EXPECT_EQ(plugin.host().callCount("NumberScan"), 3);
}

TEST(Rehearsal, UtilityServicesThrow) {
  Failure failure = codeFailure("NumberScan", 0, 0);
  failure.kind = Failure::Kind::BadAlloc;
  StandIn plugin(withFailure(failure));
  EXPECT_THROW(scan("1"), std::bad_alloc);
}

TEST(Rehearsal, FailuresOfAnEarlierHostAreForgotten) {
  { StandIn earlier(withFailure(codeFailure("NumberScan", 0, 2222))); }
  StandIn plugin;
  EXPECT_EQ(scan("1"), 0);
}

TEST(Rehearsal, CallsAreCountedByOperation) {
  StandIn plugin;
  plugin.makeNull(plugin.makeComp());
  show();
  show();
  Host& host = plugin.host();
  EXPECT_EQ(host.callCount("ShowMessage"), 2);
  EXPECT_EQ(host.callCount("CreateComp"), 1);
  EXPECT_EQ(host.callCount("NewNullLayer"), 1);
  EXPECT_EQ(host.callCount("SetStreamValue"), 0);
  EXPECT_EQ(host.callCount("NoSuchCall"), 0);
  EXPECT_EQ(plugin.leave().suiteCalls, 4);
  // The counts are those of the last import, and stay through callbacks that the rehearsal is not for.
  plugin.enterAgain(Callback::Verify);
  show();
  EXPECT_EQ(plugin.leave().suiteCalls, 1);
  EXPECT_EQ(host.callCount("ShowMessage"), 2);
}

TEST(Rehearsal, OperationThatTheHostDoesNotHaveIsNoRehearsal) {
  EXPECT_THROW(Host{withFailure(codeFailure("NoSuchCall", 1, 5))}, std::invalid_argument);
  EXPECT_NO_THROW(Host{HostOptions{}});
}

struct NamedCall {
  Operation operation;
  HostError (*call)(const WNBasicSuite& basic);
};

// Each operation with nothing but null and 0: a rehearsed call looks at none of its arguments.
const NamedCall kCalls[] = {
    {Operation::AcquireSuite, [](auto& basic) { return basic.AcquireSuite(nullptr, 0, nullptr); }},
    {Operation::ReleaseSuiteByName, [](auto& basic) { return basic.ReleaseSuiteByName(nullptr, 0); }},
    {Operation::ShowMessage, [](auto&) { return kUtilitySuite7.ShowMessage(0, nullptr); }},
    {Operation::BeginSilentErrors, [](auto&) { return kUtilitySuite7.BeginSilentErrors(nullptr); }},
    {Operation::EndSilentErrors, [](auto&) { return kUtilitySuite7.EndSilentErrors(0, nullptr); }},
    {Operation::NewMemHandle, [](auto&) { return kMemorySuite1.NewMemHandle(0, nullptr, 0, 0, nullptr); }},
    {Operation::FreeMemHandle, [](auto&) { return kMemorySuite1.FreeMemHandle(nullptr); }},
    {Operation::LockMemHandle, [](auto&) { return kMemorySuite1.LockMemHandle(nullptr, nullptr); }},
    {Operation::UnlockMemHandle, [](auto&) { return kMemorySuite1.UnlockMemHandle(nullptr); }},
    {Operation::GetAppPrefsBlob, [](auto&) { return kPersistentDataSuite3.GetAppPrefsBlob(nullptr); }},
    {Operation::GetPrefLong,
     [](auto&) { return kPersistentDataSuite3.GetPrefLong(nullptr, nullptr, nullptr, 0, nullptr); }},
    {Operation::RegisterDeathHook, [](auto&) { return kRegisterSuite6.RegisterDeathHook(0, nullptr, 0); }},
    {Operation::RegisterImporterName,
     [](auto&) { return kFileImportManagerSuite3.RegisterImporterName(nullptr, nullptr); }},
    {Operation::RegisterImporterTypes,
     [](auto&) { return kFileImportManagerSuite3.RegisterImporterTypes(0, 0, nullptr, 0, nullptr); }},
    {Operation::RegisterImporterCallbacks,
     [](auto&) { return kFileImportManagerSuite3.RegisterImporterCallbacks(0, 0, nullptr); }},
    {Operation::CreateComp,
     [](auto&) {
       return kCompSuite21.CreateComp(nullptr, nullptr, 0, 0, nullptr, nullptr, nullptr, nullptr);
     }},
    {Operation::GetItemFromComp, [](auto&) { return kCompSuite9.GetItemFromComp(nullptr, nullptr); }},
    {Operation::NewCameraLayer,
     [](auto&) { return kCompSuite9.NewCameraLayer(nullptr, nullptr, 0.0, 0.0, nullptr); }},
    {Operation::NewNullLayer,
     [](auto&) { return kCompSuite9.NewNullLayer(nullptr, nullptr, nullptr, nullptr); }},
    {Operation::AddLayerFromItem,
     [](auto&) { return kLayerSuite10.AddLayerFromItem(nullptr, nullptr, nullptr); }},
    {Operation::SetLayerFlag, [](auto&) { return kLayerSuite10.SetLayerFlag(nullptr, 0, 0); }},
    {Operation::SetLayerParent, [](auto&) { return kLayerSuite10.SetLayerParent(nullptr, nullptr); }},
    {Operation::SetCameraFilmSize,
     [](auto&) { return kCameraSuite2.SetCameraFilmSize(nullptr, 0, nullptr); }},
    {Operation::AcquireLayerStream,
     [](auto&) { return kStreamSuite7.AcquireLayerStream(0, nullptr, 0, nullptr); }},
    {Operation::ReleaseStream, [](auto&) { return kStreamSuite7.ReleaseStream(nullptr); }},
    {Operation::SetStreamValue, [](auto&) { return kStreamSuite8.SetStreamValue(0, nullptr, nullptr); }},
    {Operation::GetStreamKeyframeCount,
     [](auto&) { return kKeyframeSuite3.GetStreamKeyframeCount(nullptr, nullptr); }},
    {Operation::BeginKeyframeBatch,
     [](auto&) { return kKeyframeSuite3.BeginKeyframeBatch(nullptr, nullptr); }},
    {Operation::AddBatchKeyframe,
     [](auto&) { return kKeyframeSuite3.AddBatchKeyframe(nullptr, 0, nullptr, nullptr); }},
    {Operation::SetBatchKeyframeValue,
     [](auto&) { return kKeyframeSuite4.SetBatchKeyframeValue(nullptr, 0, nullptr); }},
    {Operation::EndKeyframeBatch, [](auto&) { return kKeyframeSuite3.EndKeyframeBatch(0, nullptr); }},
};

TEST(Rehearsal, EveryOperationFailsOnDemandByItsName) {
  static_assert(std::size(kCalls) == kOperationCount);
  for (const NamedCall& named : kCalls) {
    const char* name = factsOf(named.operation).name;
    for (const HostError code : {512, 0}) {
      StandIn plugin(withFailure(codeFailure(name, 1, code)));
      EXPECT_EQ(named.call(*plugin.host().basicSuite()), code) << name;
      EXPECT_THAT(plugin.lastLine(), ::testing::StartsWith(std::string("{\"call\":\"") + name + "\""));
      EXPECT_THAT(plugin.lastLine(), ::testing::EndsWith(",\"error\":" + std::to_string(code) + "}"));
      EXPECT_EQ(plugin.host().callCount(name), 1);
      EXPECT_THAT(plugin.leave().refusals, IsEmpty()) << name;
    }
  }
}

TEST(Rehearsal, EveryOperationThrowsOnDemand) {
  for (const NamedCall& named : kCalls) {
    const char* name = factsOf(named.operation).name;
    Failure failure = codeFailure(name, 1, 0);
    failure.kind = Failure::Kind::RuntimeError;
    HostOptions options = withFailure(failure);
    failure.nth = 2;
    failure.kind = Failure::Kind::Other;
    options.failures.push_back(failure);
    StandIn plugin(options);
    const auto call = [&] { named.call(*plugin.host().basicSuite()); };
    EXPECT_THROW(call(), std::runtime_error) << name;
    EXPECT_THAT(plugin.lastLine(), ::testing::EndsWith(",\"error\":\"runtime_error\"}")) << name;
    EXPECT_TRUE(testsupport::ThrowsOther(call)) << name;
    EXPECT_THAT(plugin.lastLine(), ::testing::EndsWith(",\"error\":\"other\"}")) << name;
  }
}

TEST(Rehearsal, EveryUtilityServiceIsKnownByItsName) {
  const char* const services[] = {
#define SERVICE_NAME(name) #name,
      HOST_UTILITY_TABLE(SERVICE_NAME)
#undef SERVICE_NAME
  };
  for (const char* service : services) {
    EXPECT_NO_THROW(StandIn(withFailure(codeFailure(service, 1, 5)))) << service;
  }
}

}  // namespace
}  // namespace refhost
