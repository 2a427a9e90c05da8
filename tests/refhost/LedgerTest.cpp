// What a callback leaves behind, and what of it is kept by design.
#include <cmath>
#include <new>
#include <stdexcept>

#include "hostutil/HostFile.h"
#include "hostutil/RecordList.h"
#include "tests/refhost/StandIn.h"

namespace refhost {
namespace {

using ::testing::AllOf;
using ::testing::ElementsAre;
using ::testing::Field;
using ::testing::IsEmpty;
using ::testing::SizeIs;

auto leak(const char* description) {
  return AllOf(Field(&Leftover::description, description), Field(&Leftover::keptByDesign, false));
}

auto kept(const char* description) {
  return AllOf(Field(&Leftover::description, description), Field(&Leftover::keptByDesign, true));
}

HostFile* makeFile() {
  UTF16String* path = nullptr;
  HostFile* file = nullptr;
  EXPECT_EQ(UTF16StringMakeFromBytes("some.ma", &path), 0);
  EXPECT_EQ(HostFileCreate(path, &file), 0);
  UTF16StringRelease(path);
  return file;
}

TEST(Ledger, EverythingThatIsStillHeldIsListed) {
  StandIn plugin;
  VOR_Layer* layer = plugin.makeNull(plugin.makeComp());
  const void* suite = nullptr;
  const WNBasicSuite& basic = *plugin.host().basicSuite();
  basic.AcquireSuite(QZGP_LAYER_SUITE, 10, &suite);
  basic.AcquireSuite(QZGP_LAYER_SUITE, 10, &suite);
  basic.AcquireSuite(QZGP_MEMORY_SUITE, 1, &suite);
  VOR_Stream* stream = plugin.acquire(layer, HOST_STREAM_POSITION);
  plugin.acquire(layer, HOST_STREAM_ROTATION_X);
  VOR_AddKeyframesInfo* batch = plugin.open(stream);
  plugin.addKey(batch, stream, {1, 1}, 1.0);
  kStreamSuite7.ReleaseStream(stream);
  HostMemHandle* memory = nullptr;
  kMemorySuite1.NewMemHandle(kPluginId, "file buffer", 5312, 0, &memory);
  const CallbackResult result = plugin.leave();
  EXPECT_THAT(
      result.leftovers,
      ElementsAre(leak("suite QZGP Memory Suite 1 (held once)"),
                  leak("suite QZGP Layer Suite 10 (held 2 times)"), leak("stream:2 (X rotation of layer:1)"),
                  leak("batch:1 (position of layer:1, 1 keys)"), leak("mem:1 (file buffer, 5312 bytes)")));
  EXPECT_FALSE(result.ledgerClean());
}

TEST(Ledger, WhatWasGivenBackIsNotListed) {
  StandIn plugin;
  VOR_Layer* layer = plugin.makeNull(plugin.makeComp());
  const void* suite = nullptr;
  plugin.host().basicSuite()->AcquireSuite(QZGP_LAYER_SUITE, 10, &suite);
  plugin.host().basicSuite()->ReleaseSuiteByName(QZGP_LAYER_SUITE, 10);
  VOR_Stream* stream = plugin.acquire(layer, HOST_STREAM_POSITION);
  kKeyframeSuite3.EndKeyframeBatch(1, plugin.open(stream));
  kStreamSuite7.ReleaseStream(stream);
  HostMemHandle* memory = nullptr;
  kMemorySuite1.NewMemHandle(kPluginId, "file buffer", 2, 0, &memory);
  kMemorySuite1.FreeMemHandle(memory);
  const CallbackResult result = plugin.leave();
  EXPECT_THAT(result.leftovers, IsEmpty());
  EXPECT_TRUE(result.ledgerClean());
}

TEST(Ledger, IsFreshForEachCallback) {
  StandIn plugin;
  VOR_Layer* layer = plugin.makeNull(plugin.makeComp());
  VOR_Stream* stream = plugin.acquire(layer, HOST_STREAM_POSITION);
  VOR_AddKeyframesInfo* batch = plugin.open(stream);
  plugin.addKey(batch, stream, {1, 1}, 1.0);
  EXPECT_THAT(plugin.leave().leftovers, SizeIs(2));
  plugin.enterAgain(Callback::Import);
  EXPECT_EQ(kStreamSuite7.ReleaseStream(stream), HOST_ERR_BAD_HANDLE);
  EXPECT_EQ(kKeyframeSuite3.EndKeyframeBatch(1, batch), HOST_ERR_BAD_HANDLE);
  EXPECT_EQ(plugin.host().project().layers()[0].findStream(HOST_STREAM_POSITION)->keyCount(), 0U);
  // Its batch was dropped with it, so the stream is free for another.
  VOR_Stream* again = plugin.acquire(layer, HOST_STREAM_POSITION);
  kKeyframeSuite3.EndKeyframeBatch(1, plugin.open(again));
  kStreamSuite7.ReleaseStream(again);
  EXPECT_THAT(plugin.leave().leftovers, IsEmpty());
}

TEST(Ledger, OneFileObjectOfAnImportIsKeptByDesign) {
  StandIn plugin;
  makeFile();
  makeFile();
  const CallbackResult result = plugin.leave();
  ASSERT_THAT(result.leftovers, SizeIs(2));
  EXPECT_TRUE(result.leftovers[0].keptByDesign);
  EXPECT_FALSE(result.leftovers[1].keptByDesign);
}

TEST(Ledger, FileObjectOfAVerificationIsALeak) {
  StandIn plugin({}, Callback::Verify);
  makeFile();
  const CallbackResult result = plugin.leave();
  ASSERT_THAT(result.leftovers, SizeIs(1));
  EXPECT_FALSE(result.leftovers[0].keptByDesign);
}

TEST(Ledger, ListThatIsHeldIsALeakAndIsFreed) {
  StandIn plugin;
  RecordList* list = nullptr;
  ASSERT_EQ(RecordListCreate(8, 1, 0, &list), 0);
  const CallbackResult result = plugin.leave();
  ASSERT_THAT(result.leftovers, SizeIs(1));
  EXPECT_FALSE(result.ledgerClean());
  plugin.enterAgain(Callback::Import);
  EXPECT_TRUE(plugin.leave().ledgerClean());
}

struct CameraStreamCase {
  std::int32_t stream;
  const char* property;
};

void PrintTo(const CameraStreamCase& known, std::ostream* stream) { *stream << known.property; }

class CameraStreams : public ::testing::TestWithParam<CameraStreamCase> {};

TEST_P(CameraStreams, HandleWhoseValueWasRefusedIsKeptByDesign) {
  StandIn plugin;
  VOR_Stream* stream = plugin.acquire(plugin.makeCamera(plugin.makeComp()), GetParam().stream);
  const StreamValueRecord record{stream, {HUGE_VAL, 0.0, 0.0, 0.0}};
  EXPECT_EQ(kStreamSuite8.SetStreamValue(kPluginId, stream, &record), HOST_ERR_BAD_VALUE);
  const CallbackResult result = plugin.leave();
  EXPECT_THAT(result.leftovers, ElementsAre(kept(GetParam().property)));
  EXPECT_TRUE(result.ledgerClean());
}

TEST_P(CameraStreams, HandleWhoseValueThrewIsKeptByDesign) {
  Failure failure = codeFailure("SetStreamValue", 1, 0);
  failure.kind = Failure::Kind::RuntimeError;
  StandIn plugin(withFailure(failure));
  VOR_Stream* stream = plugin.acquire(plugin.makeCamera(plugin.makeComp()), GetParam().stream);
  const StreamValueRecord record{stream, {1.0, 0.0, 0.0, 0.0}};
  EXPECT_THROW(kStreamSuite8.SetStreamValue(kPluginId, stream, &record), std::runtime_error);
  EXPECT_THAT(plugin.leave().leftovers, ElementsAre(kept(GetParam().property)));
}

TEST_P(CameraStreams, HandleThatFoundNoSuiteForItsValueIsKeptByDesign) {
  HostOptions options;
  options.refusedSuites.push_back({QZGP_STREAM_SUITE, QZGP_STREAM_SUITE_8});
  StandIn plugin(options);
  VOR_Stream* stream = plugin.acquire(plugin.makeCamera(plugin.makeComp()), GetParam().stream);
  ASSERT_NE(stream, nullptr);
  const void* suite = nullptr;
  EXPECT_EQ(plugin.host().basicSuite()->AcquireSuite(QZGP_STREAM_SUITE, QZGP_STREAM_SUITE_8, &suite),
            HOST_ERR_SUITE_REFUSED);
  const CallbackResult result = plugin.leave();
  EXPECT_THAT(result.leftovers, ElementsAre(kept(GetParam().property)));
  EXPECT_THAT(result.refusals, IsEmpty());
}

TEST_P(CameraStreams, HandleThatWasAcquiredAfterTheSuiteWasMissedIsALeak) {
  StandIn plugin(withFailure(codeFailure("AcquireSuite", 1, 6)));
  VOR_Layer* camera = plugin.makeCamera(plugin.makeComp());
  const void* suite = nullptr;
  EXPECT_EQ(plugin.host().basicSuite()->AcquireSuite(QZGP_STREAM_SUITE, QZGP_STREAM_SUITE_8, &suite), 6);
  plugin.acquire(camera, GetParam().stream);
  EXPECT_THAT(plugin.leave().leftovers, ElementsAre(leak(GetParam().property)));
}

TEST_P(CameraStreams, HandleWhoseValueWasSetIsALeak) {
  StandIn plugin;
  VOR_Stream* stream = plugin.acquire(plugin.makeCamera(plugin.makeComp()), GetParam().stream);
  const StreamValueRecord record{stream, {1.0, 0.0, 0.0, 0.0}};
  EXPECT_EQ(kStreamSuite8.SetStreamValue(kPluginId, stream, &record), 0);
  EXPECT_THAT(plugin.leave().leftovers, ElementsAre(leak(GetParam().property)));
}

TEST_P(CameraStreams, HandleThatWasNeverUsedIsALeak) {
  StandIn plugin;
  plugin.acquire(plugin.makeCamera(plugin.makeComp()), GetParam().stream);
  EXPECT_THAT(plugin.leave().leftovers, ElementsAre(leak(GetParam().property)));
}

INSTANTIATE_TEST_SUITE_P(Ledger, CameraStreams,
                         ::testing::Values(CameraStreamCase{1, "stream:1 (position of layer:1)"},
                                           CameraStreamCase{11, "stream:1 (zoom of layer:1)"}));

TEST(Ledger, OtherStreamsWhoseValueWasRefusedAreLeaks) {
  StandIn plugin;
  VOR_CompItem* comp = plugin.makeComp();
  VOR_Layer* null = plugin.makeNull(comp);
  VOR_Layer* camera = plugin.makeCamera(comp);
  for (VOR_Stream* stream :
       {plugin.acquire(null, HOST_STREAM_POSITION), plugin.acquire(camera, HOST_STREAM_ANCHOR_POINT)}) {
    const StreamValueRecord record{stream, {HUGE_VAL, 0.0, 0.0, 0.0}};
    EXPECT_EQ(kStreamSuite8.SetStreamValue(kPluginId, stream, &record), HOST_ERR_BAD_VALUE);
  }
  EXPECT_THAT(plugin.leave().leftovers, ElementsAre(leak("stream:1 (position of layer:1)"),
                                                    leak("stream:2 (point of interest of layer:2)")));
}

TEST(Ledger, ZoomHandleThatFoundKeysIsKeptByDesign) {
  HostOptions options;
  options.zoomKeys = 2;
  StandIn plugin(options);
  VOR_Stream* stream = plugin.acquire(plugin.makeCamera(plugin.makeComp()), 11);
  std::int32_t count = 0;
  EXPECT_EQ(kKeyframeSuite3.GetStreamKeyframeCount(stream, &count), 0);
  EXPECT_EQ(count, 2);
  EXPECT_THAT(plugin.leave().leftovers, ElementsAre(kept("stream:1 (zoom of layer:1)")));
}

TEST(Ledger, ZoomHandleThatFoundNoKeysIsALeak) {
  StandIn plugin;
  VOR_Stream* stream = plugin.acquire(plugin.makeCamera(plugin.makeComp()), 11);
  std::int32_t count = -1;
  EXPECT_EQ(kKeyframeSuite3.GetStreamKeyframeCount(stream, &count), 0);
  EXPECT_THAT(plugin.leave().leftovers, ElementsAre(leak("stream:1 (zoom of layer:1)")));
}

TEST(Ledger, WhatCouldNotBeGivenBackIsKeptByDesign) {
  for (const Failure::Kind kind : {Failure::Kind::Code, Failure::Kind::BadAlloc}) {
    HostOptions options;
    for (const char* release : {"ReleaseSuiteByName", "ReleaseStream", "EndKeyframeBatch", "FreeMemHandle"}) {
      Failure failure = codeFailure(release, 1, 99);
      failure.kind = kind;
      options.failures.push_back(failure);
    }
    StandIn plugin(options);
    VOR_Stream* stream = plugin.acquire(plugin.makeNull(plugin.makeComp()), 3);
    VOR_AddKeyframesInfo* batch = plugin.open(stream);
    HostMemHandle* memory = nullptr;
    kMemorySuite1.NewMemHandle(kPluginId, "b", 3, 0, &memory);
    const void* suite = nullptr;
    const WNBasicSuite& basic = *plugin.host().basicSuite();
    basic.AcquireSuite(QZGP_MEMORY_SUITE, 1, &suite);
    const auto expectFailure = [kind](auto release) {
      if (kind == Failure::Kind::Code) {
        EXPECT_EQ(release(), 99);
      } else {
        EXPECT_THROW(release(), std::bad_alloc);
      }
    };
    expectFailure([&] { return kKeyframeSuite3.EndKeyframeBatch(1, batch); });
    expectFailure([&] { return kStreamSuite7.ReleaseStream(stream); });
    expectFailure([&] { return kMemorySuite1.FreeMemHandle(memory); });
    expectFailure([&] { return basic.ReleaseSuiteByName(QZGP_MEMORY_SUITE, 1); });
    EXPECT_THAT(
        plugin.leave().leftovers,
        ElementsAre(kept("suite QZGP Memory Suite 1 (held once)"), kept("stream:1 (Z rotation of layer:1)"),
                    kept("batch:1 (Z rotation of layer:1, 0 keys)"), kept("mem:1 (b, 3 bytes)")));
  }
}

TEST(Ledger, SecondHolderOfASuiteIsNotExcusedByTheFirst) {
  StandIn plugin(withFailure(codeFailure("ReleaseSuiteByName", 1, 99)));
  const void* suite = nullptr;
  const WNBasicSuite& basic = *plugin.host().basicSuite();
  basic.AcquireSuite(QZGP_MEMORY_SUITE, 1, &suite);
  basic.AcquireSuite(QZGP_MEMORY_SUITE, 1, &suite);
  EXPECT_EQ(basic.ReleaseSuiteByName(QZGP_MEMORY_SUITE, 1), 99);
  EXPECT_THAT(plugin.leave().leftovers, ElementsAre(leak("suite QZGP Memory Suite 1 (held 2 times)")));
}

TEST(Ledger, FileWhoseDisposalWasMadeToFailIsKeptByDesign) {
  HostOptions options = withFailure(codeFailure("FileDispose", 1, 12));
  options.during = Callback::Verify;
  StandIn plugin(options, Callback::Verify);
  EXPECT_EQ(HostFileDispose(makeFile()), 12);
  const CallbackResult result = plugin.leave();
  ASSERT_THAT(result.leftovers, SizeIs(1));
  EXPECT_TRUE(result.leftovers[0].keptByDesign);
}

}  // namespace
}  // namespace refhost
