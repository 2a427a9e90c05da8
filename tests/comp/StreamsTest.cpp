#include "tests/support/BuilderFixture.h"
#include "tests/support/BuilderRun.h"
#include "tests/support/ThrowsOther.h"

namespace testsupport {
namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;

// Lines of the trace as they are written, in the pieces that these tests vary.
std::string Acquired(int layer, int id, int stream) {
  return "{\"call\":\"AcquireLayerStream\",\"suite\":\"QZGP Stream Suite\",\"version\":7,\"pluginId\":7,"
         "\"layer\":\"layer:" +
         std::to_string(layer) + "\",\"streamId\":" + std::to_string(id) +
         ",\"stream\":\"stream:" + std::to_string(stream) + "\",\"error\":0}";
}
std::string NotAcquired(int layer, int id, HostError error) {
  return "{\"call\":\"AcquireLayerStream\",\"suite\":\"QZGP Stream Suite\",\"version\":7,\"pluginId\":7,"
         "\"layer\":\"layer:" +
         std::to_string(layer) + "\",\"streamId\":" + std::to_string(id) +
         ",\"stream\":null,\"error\":" + std::to_string(error) + "}";
}
std::string Released(int stream, HostError error = 0) {
  return "{\"call\":\"ReleaseStream\",\"suite\":\"QZGP Stream Suite\",\"version\":7,\"stream\":\"stream:" +
         std::to_string(stream) + "\",\"error\":" + std::to_string(error) + "}";
}
std::string Set(int stream, const std::string& value, const std::string& error = "0") {
  return "{\"call\":\"SetStreamValue\",\"suite\":\"QZGP Stream Suite\",\"version\":8,\"pluginId\":7,"
         "\"stream\":\"stream:" +
         std::to_string(stream) + "\",\"value\":" + value + ",\"error\":" + error + "}";
}
std::string Begun(int stream, int batch) {
  return "{\"call\":\"BeginKeyframeBatch\",\"suite\":\"QZGP Keyframe Suite\",\"version\":3,"
         "\"stream\":\"stream:" +
         std::to_string(stream) + "\",\"batch\":\"batch:" + std::to_string(batch) + "\",\"error\":0}";
}
std::string Added(int batch, const std::string& time, int index) {
  return "{\"call\":\"AddBatchKeyframe\",\"suite\":\"QZGP Keyframe Suite\",\"version\":3,"
         "\"batch\":\"batch:" +
         std::to_string(batch) + "\",\"timeMode\":0,\"time\":" + time +
         ",\"index\":" + std::to_string(index) + ",\"error\":0}";
}
std::string Valued(int batch, int index, int stream, const std::string& value) {
  return "{\"call\":\"SetBatchKeyframeValue\",\"suite\":\"QZGP Keyframe Suite\",\"version\":4,"
         "\"batch\":\"batch:" +
         std::to_string(batch) + "\",\"index\":" + std::to_string(index) +
         ",\"stream\":\"stream:" + std::to_string(stream) + "\",\"value\":" + value + ",\"error\":0}";
}
std::string Ended(int batch, HostError error = 0) {
  return "{\"call\":\"EndKeyframeBatch\",\"suite\":\"QZGP Keyframe Suite\",\"version\":3,\"commit\":1,"
         "\"batch\":\"batch:" +
         std::to_string(batch) + "\",\"error\":" + std::to_string(error) + "}";
}

refhost::HostOptions Failing(const std::string& operation, HostError code, std::int64_t nth = 1) {
  refhost::Failure failure;
  failure.operation = operation;
  failure.nth = nth;
  failure.code = code;
  refhost::HostOptions options;
  options.failures.push_back(failure);
  return options;
}

refhost::HostOptions Throwing(const std::string& operation, refhost::Failure::Kind kind) {
  refhost::HostOptions options = Failing(operation, 0);
  options.failures[0].kind = kind;
  return options;
}

class StreamsTest : public BuilderTest {};

TEST_F(StreamsTest, AOneDimensionalValueFillsTheFirstOfFourComponents) {
  Begin();
  VOR_Layer* const layer = NewNull();
  parser().SetOneDStream(layer, kXRotation, 12.5);
  EXPECT_THAT(TakeTrace(), ElementsAre(Acquired(1, 8, 1), Set(1, "[12.5,0,0,0]"), Released(1)));
}

TEST_F(StreamsTest, ATwoDimensionalValueFillsTheFirstTwo) {
  Begin();
  VOR_Layer* const layer = NewNull();
  parser().SetTwoDStream(layer, kAnchor, 1.5, -2.25);
  EXPECT_THAT(TakeTrace(), ElementsAre(Acquired(1, 0, 1), Set(1, "[1.5,-2.25,0,0]"), Released(1)));
}

TEST_F(StreamsTest, AThreeDimensionalValueFillsTheFirstThree) {
  Begin();
  VOR_Layer* const layer = NewCamera();
  parser().SetThreeDStream(layer, kPosition, 1.5, -2.25, 1e300);
  EXPECT_THAT(TakeTrace(), ElementsAre(Acquired(1, 1, 1), Set(1, "[1.5,-2.25,1e+300,0]"), Released(1)));
}

TEST_F(StreamsTest, EveryCallAcquiresItsStreamAnew) {
  Begin();
  VOR_Layer* const layer = NewNull();
  parser().SetOneDStream(layer, kZRotation, 1.0);
  parser().SetOneDStream(layer, kZRotation, 2.0);
  EXPECT_THAT(TakeTrace(), ElementsAre(Acquired(1, 3, 1), Set(1, "[1,0,0,0]"), Released(1), Acquired(1, 3, 2),
                                       Set(2, "[2,0,0,0]"), Released(2)));
}

TEST_F(StreamsTest, TwoVersionsOfTheStreamAndOfTheKeyframeSuiteAreHeldSideBySide) {
  BeginCold();
  VOR_Layer* const layer = NewNull();
  parser().SetOneDStream(layer, kZRotation, 1.0);
  VOR_AddKeyframesInfo* batch = nullptr;
  parser().StartAddingKeyframes(layer, kZRotation, &batch);
  constexpr T_Time kTime{1, 24};
  parser().InsertOneDKeyframe(batch, layer, kZRotation, &kTime, 3.0);
  parser().EndAddingKeyframes(batch);
  std::vector<std::string> suites;
  for (const std::string& line : CallsOf(TakeTrace(), "AcquireSuite")) {
    suites.push_back(std::string(Field(line, "suite")) + std::string(Field(line, "version")));
  }
  EXPECT_THAT(suites, ElementsAre("\"QZGP Stream Suite\"7", "\"QZGP Stream Suite\"8",
                                  "\"QZGP Keyframe Suite\"3", "\"QZGP Keyframe Suite\"4"));
}

TEST_F(StreamsTest, AHostErrorFromSetStreamValueStillReleasesTheStreamOnce) {
  Begin("", Failing("SetStreamValue", 4321));
  VOR_Layer* const layer = NewNull();
  EXPECT_EQ(CodeOf([&] { parser().SetThreeDStream(layer, kScale, 1.0, 2.0, 3.0); }), 4321);
  EXPECT_THAT(TakeTrace(), ElementsAre(Acquired(1, 2, 1), Set(1, "[1,2,3,0]", "4321"), Released(1)));
}

TEST_F(StreamsTest, AnErrorFromAcquireLayerStreamIsThrownWithoutARelease) {
  Begin("", Failing("AcquireLayerStream", 4321));
  VOR_Layer* const layer = NewNull();
  EXPECT_EQ(CodeOf([&] { parser().SetOneDStream(layer, kXRotation, 1.0); }), 4321);
  EXPECT_THAT(TakeTrace(), ElementsAre(NotAcquired(1, 8, 4321)));
}

TEST_F(StreamsTest, ANullStreamIsNotReleased) {
  Begin("", Failing("AcquireLayerStream", 0));
  VOR_Layer* const layer = NewNull();
  EXPECT_NE(CodeOf([&] { parser().SetOneDStream(layer, kXRotation, 1.0); }), 0);
  EXPECT_THAT(CallsOf(TakeTrace(), "ReleaseStream"), IsEmpty());
}

TEST_F(StreamsTest, AFailedReleaseChangesNothing) {
  Begin("", Failing("ReleaseStream", 4321));
  VOR_Layer* const layer = NewNull();
  EXPECT_EQ(CodeOf([&] { parser().SetOneDStream(layer, kXRotation, 1.0); }), 0);
  EXPECT_THAT(TakeTrace(), ElementsAre(Acquired(1, 8, 1), Set(1, "[1,0,0,0]"), Released(1, 4321)));
}

TEST_F(StreamsTest, AStandardExceptionFromTheHostIsReportedAndBecomesItsCode) {
  Begin("", Throwing("SetStreamValue", refhost::Failure::Kind::BadAlloc));
  VOR_Layer* const layer = NewNull();
  EXPECT_EQ(CodeOf([&] { parser().SetOneDStream(layer, kXRotation, 1.0); }), HOST_ERR_EXCEPTION_MEMORY);
  EXPECT_THAT(TakeTrace(), ElementsAre(Acquired(1, 8, 1), Set(1, "[1,0,0,0]", "\"bad_alloc\""), Released(1)));
  EXPECT_EQ(End().messages.size(), 1u);

  Begin("", Throwing("SetStreamValue", refhost::Failure::Kind::RuntimeError));
  VOR_Layer* const other = NewNull();
  EXPECT_EQ(CodeOf([&] { parser().SetOneDStream(other, kXRotation, 1.0); }), HOST_ERR_EXCEPTION_OTHER);
  EXPECT_EQ(CallsOf(TakeTrace(), "ReleaseStream").size(), 1u);
  EXPECT_EQ(End().messages.size(), 1u);
}

TEST_F(StreamsTest, AnyOtherExceptionPassesThroughAndTheStreamIsReleased) {
  Begin("", Throwing("SetStreamValue", refhost::Failure::Kind::Other));
  VOR_Layer* const layer = NewNull();
  EXPECT_TRUE(ThrowsOther([&] { parser().SetOneDStream(layer, kXRotation, 1.0); }));
  EXPECT_THAT(TakeTrace(), ElementsAre(Acquired(1, 8, 1), Set(1, "[1,0,0,0]", "\"other\""), Released(1)));
  EXPECT_THAT(End().messages, IsEmpty());
}

TEST_F(StreamsTest, AnyOtherExceptionPassesThroughAlsoWhereTheReleaseThrowsToo) {
  refhost::HostOptions options = Throwing("SetStreamValue", refhost::Failure::Kind::Other);
  options.failures.push_back(Throwing("ReleaseStream", refhost::Failure::Kind::Other).failures[0]);
  Begin("", options);
  VOR_Layer* const layer = NewNull();
  EXPECT_TRUE(ThrowsOther([&] { parser().SetOneDStream(layer, kXRotation, 1.0); }));
  EXPECT_EQ(CallsOf(TakeTrace(), "ReleaseStream").size(), 1u);
}

TEST_F(StreamsTest, AMissingValueSuiteIsThirteenAndTheStreamIsReleased) {
  refhost::HostOptions options;
  options.refusedSuites.push_back({"QZGP Stream Suite", 8});
  BeginCold("", options);
  VOR_Layer* const layer = NewNull();
  EXPECT_EQ(CodeOf([&] { parser().SetOneDStream(layer, kXRotation, 1.0); }), 13);
  const std::vector<std::string> trace = TakeTrace();
  EXPECT_EQ(CallsOf(trace, "AcquireLayerStream").size(), 1u);
  EXPECT_EQ(CallsOf(trace, "ReleaseStream").size(), 1u);
}

TEST_F(StreamsTest, AFailedAcquisitionOfASuiteIsTriedAgainAtTheNextUse) {
  BeginCold("", Failing("AcquireSuite", 5, 2));  // the first is the composition suite's
  VOR_CompItem* const comp = Comp();
  ASSERT_NE(comp, nullptr);
  constexpr T_Time kOwnLength{0, 0};
  VOR_Layer* layer = nullptr;
  EXPECT_EQ(CodeOf([&] { parser().CompSuite9(); }), 13);
  EXPECT_EQ(CodeOf([&] { parser().CompSuite9().NewNullLayer("n", comp, &kOwnLength, &layer); }), 0);
  EXPECT_NE(layer, nullptr);
}

TEST_F(StreamsTest, ABatchIsOpenedOnAStreamThatIsReleasedAtOnce) {
  Begin();
  VOR_Layer* const layer = NewNull();
  VOR_AddKeyframesInfo* batch = nullptr;
  parser().StartAddingKeyframes(layer, kPosition, &batch);
  EXPECT_THAT(TakeTrace(), ElementsAre(Acquired(1, 1, 1), Begun(1, 1), Released(1)));
  constexpr T_Time kEarly{500, 24000};
  constexpr T_Time kLate{1000, 24000};
  parser().InsertThreeDKeyframe(batch, layer, kPosition, &kEarly, 1.5, 2.5, 3.5);
  parser().InsertThreeDKeyframe(batch, layer, kPosition, &kLate, 4.5, 5.5, 6.5);
  parser().EndAddingKeyframes(batch);
  EXPECT_THAT(TakeTrace(),
              ElementsAre(Acquired(1, 1, 2), Added(1, "[500,24000]", 0), Valued(1, 0, 2, "[1.5,2.5,3.5,0]"),
                          Released(2), Acquired(1, 1, 3), Added(1, "[1000,24000]", 1),
                          Valued(1, 1, 3, "[4.5,5.5,6.5,0]"), Released(3), Ended(1)));
  EXPECT_THAT(KeyTimes(kPosition), ElementsAre(kEarly, kLate));
}

TEST_F(StreamsTest, AOneDimensionalKeyFillsTheFirstComponent) {
  Begin();
  VOR_Layer* const layer = NewNull();
  VOR_AddKeyframesInfo* batch = nullptr;
  parser().StartAddingKeyframes(layer, kYRotation, &batch);
  TakeTrace();
  constexpr T_Time kTime{7, 25};
  parser().InsertOneDKeyframe(batch, layer, kYRotation, &kTime, -90.0);
  EXPECT_THAT(TakeTrace(), ElementsAre(Acquired(1, 9, 2), Added(1, "[7,25]", 0),
                                       Valued(1, 0, 2, "[-90,0,0,0]"), Released(2)));
  parser().EndAddingKeyframes(batch);
}

TEST_F(StreamsTest, BatchesOfSeveralStreamsOfOneLayerCanBeOpenAtOnce) {
  Begin();
  VOR_Layer* const layer = NewNull();
  VOR_AddKeyframesInfo* scale = nullptr;
  VOR_AddKeyframesInfo* turn = nullptr;
  parser().StartAddingKeyframes(layer, kScale, &scale);
  parser().StartAddingKeyframes(layer, kXRotation, &turn);
  constexpr T_Time kTime{1, 1};
  parser().InsertThreeDKeyframe(scale, layer, kScale, &kTime, 10.0, 20.0, 30.0);
  parser().InsertOneDKeyframe(turn, layer, kXRotation, &kTime, 45.0);
  parser().EndAddingKeyframes(scale);
  parser().EndAddingKeyframes(turn);
  EXPECT_EQ(KeyValues(kScale, 1).size(), 1u);
  EXPECT_EQ(KeyValues(kXRotation).size(), 1u);
}

TEST_F(StreamsTest, AFailedBeginStillReleasesTheStreamAndHandsOutNoBatch) {
  Begin("", Failing("BeginKeyframeBatch", 4321));
  VOR_Layer* const layer = NewNull();
  VOR_AddKeyframesInfo* batch = nullptr;
  EXPECT_EQ(CodeOf([&] { parser().StartAddingKeyframes(layer, kPosition, &batch); }), 4321);
  EXPECT_EQ(batch, nullptr);
  EXPECT_EQ(CallsOf(TakeTrace(), "ReleaseStream").size(), 1u);
}

TEST_F(StreamsTest, ABatchThatReceivedNoKeysIsStillEndedWithTheCommitFlag) {
  Begin();
  VOR_Layer* const layer = NewNull();
  VOR_AddKeyframesInfo* batch = nullptr;
  parser().StartAddingKeyframes(layer, kPosition, &batch);
  TakeTrace();
  parser().EndAddingKeyframes(batch);
  EXPECT_THAT(TakeTrace(), ElementsAre(Ended(1)));
  EXPECT_EQ(StreamOf(kPosition).keyCount(), 0u);
}

TEST_F(StreamsTest, AFailureToEndABatchIsIgnored) {
  Begin("", Failing("EndKeyframeBatch", 4321));
  VOR_Layer* const layer = NewNull();
  VOR_AddKeyframesInfo* batch = nullptr;
  parser().StartAddingKeyframes(layer, kPosition, &batch);
  TakeTrace();
  EXPECT_EQ(CodeOf([&] { parser().EndAddingKeyframes(batch); }), 0);
  EXPECT_THAT(TakeTrace(), ElementsAre(Ended(1, 4321)));
}

TEST_F(StreamsTest, AStreamThatTheLayerLacksFailsBeforeAKeyIsAdded) {
  Begin();
  VOR_Layer* const layer = NewNull();
  VOR_AddKeyframesInfo* batch = nullptr;
  parser().StartAddingKeyframes(layer, kPosition, &batch);
  TakeTrace();
  constexpr T_Time kTime{1, 1};
  EXPECT_EQ(CodeOf([&] { parser().InsertOneDKeyframe(batch, layer, kZoom, &kTime, 1.0); }),
            HOST_ERR_NO_SUCH_STREAM);
  EXPECT_THAT(TakeTrace(), ElementsAre(NotAcquired(1, 11, HOST_ERR_NO_SUCH_STREAM)));
  parser().EndAddingKeyframes(batch);
}

TEST_F(StreamsTest, AFailedKeyIsNotGivenAValueAndItsStreamIsReleased) {
  Begin("", Failing("AddBatchKeyframe", 4321));
  VOR_Layer* const layer = NewNull();
  VOR_AddKeyframesInfo* batch = nullptr;
  parser().StartAddingKeyframes(layer, kXRotation, &batch);
  TakeTrace();
  constexpr T_Time kTime{1, 1};
  EXPECT_EQ(CodeOf([&] { parser().InsertOneDKeyframe(batch, layer, kXRotation, &kTime, 1.0); }), 4321);
  const std::vector<std::string> trace = TakeTrace();
  EXPECT_THAT(CallsOf(trace, "SetBatchKeyframeValue"), IsEmpty());
  EXPECT_EQ(CallsOf(trace, "ReleaseStream").size(), 1u);
  parser().EndAddingKeyframes(batch);
}

TEST_F(StreamsTest, AFailedKeyValueIsThrownAndItsStreamIsReleased) {
  Begin("", Failing("SetBatchKeyframeValue", 4321));
  VOR_Layer* const layer = NewNull();
  VOR_AddKeyframesInfo* batch = nullptr;
  parser().StartAddingKeyframes(layer, kPosition, &batch);
  TakeTrace();
  constexpr T_Time kTime{1, 1};
  EXPECT_EQ(CodeOf([&] { parser().InsertThreeDKeyframe(batch, layer, kPosition, &kTime, 1.0, 2.0, 3.0); }),
            4321);
  EXPECT_EQ(CallsOf(TakeTrace(), "ReleaseStream").size(), 1u);
  parser().EndAddingKeyframes(batch);
}

}  // namespace
}  // namespace testsupport
