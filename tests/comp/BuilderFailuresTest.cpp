// What each operation of the builder owes the host after a failure, one sentence after the other.
#include "hostutil/HostSetup.h"
#include "tests/support/BuilderFixture.h"
#include "tests/support/BuilderRun.h"
#include "tests/support/BuilderScene.h"

namespace testsupport {
namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;
using ::testing::SizeIs;

constexpr HostError kRehearsed = -77;

refhost::HostOptions Failing(const std::string& operation, std::int64_t nth,
                             refhost::Failure::Kind kind = refhost::Failure::Kind::Code) {
  refhost::HostOptions options;
  options.failures.push_back({operation, nth, false, kind, kRehearsed});
  return options;
}

std::string Scene(const std::string& nodes) { return SceneHead() + RenderSize(640, 480) + nodes; }

const SceneKeys kTenKeys = KeysFrom(1, {0, 1, 2, 3, 4, 5, 6, 7, 8, 9});

std::string TenKeys() {
  return Scene(TransformText("rig") + CameraText("lens", "rig") + Animation("rig.tx", kTenKeys));
}

std::size_t KeysOf(const ImportRun& run, int stream) {
  return run.host->project().layers().front().findStream(stream)->keyCount();
}

std::vector<std::string> Kept(const ImportRun& run) {
  std::vector<std::string> kept;
  for (const refhost::Leftover& left : run.result.leftovers) {
    if (left.description.rfind("stream", 0) == 0) kept.push_back(left.description);
  }
  return kept;
}

// The nth keyframe call of a stream in the order of insertion: five streams a key.
constexpr std::int64_t InsertionOf(int key, int streamPlace) { return 5 * key + streamPlace + 1; }

TEST(BuilderFailuresTest, AFailureWhileInsertingKey5Of10KeepsKeys0To4InAllFiveStreams) {
  const ImportRun run = ImportText(TenKeys(), Failing("AddBatchKeyframe", InsertionOf(5, 0)));
  EXPECT_EQ(run.result.code, kRehearsed);
  for (const int id : {kScale, kXRotation, kYRotation, kZRotation, kPosition}) EXPECT_EQ(KeysOf(run, id), 5u);
  EXPECT_THAT(CallsOf(run.trace, "EndKeyframeBatch"), SizeIs(5));
}

TEST(BuilderFailuresTest, Key5StaysInTheStreamsThatWereInsertedBeforeTheFailingOne) {
  const ImportRun run = ImportText(TenKeys(), Failing("AddBatchKeyframe", InsertionOf(5, 3)));
  EXPECT_EQ(run.result.code, kRehearsed);
  EXPECT_EQ(KeysOf(run, kScale), 6u);
  EXPECT_EQ(KeysOf(run, kXRotation), 6u);
  EXPECT_EQ(KeysOf(run, kYRotation), 6u);
  EXPECT_EQ(KeysOf(run, kZRotation), 5u);
  EXPECT_EQ(KeysOf(run, kPosition), 5u);
}

TEST(BuilderFailuresTest, AKeyThatNeverGotItsValueIsNotKept) {
  const ImportRun run = ImportText(TenKeys(), Failing("SetBatchKeyframeValue", InsertionOf(5, 1)));
  EXPECT_EQ(run.result.code, kRehearsed);
  EXPECT_EQ(KeysOf(run, kScale), 6u);
  EXPECT_EQ(KeysOf(run, kXRotation), 5u);
}

TEST(BuilderFailuresTest, ABatchThatCannotBeOpenedClosesTheOnesThatAre) {
  const ImportRun run = ImportText(TenKeys(), Failing("BeginKeyframeBatch", 3));
  EXPECT_EQ(run.result.code, kRehearsed);
  EXPECT_THAT(CallsOf(run.trace, "AddBatchKeyframe"), IsEmpty());
  std::vector<std::string> ended;
  for (const std::string& line : CallsOf(run.trace, "EndKeyframeBatch"))
    ended.emplace_back(Field(line, "batch"));
  EXPECT_THAT(ended, ElementsAre("\"batch:1\"", "\"batch:2\""));
}

TEST(BuilderFailuresTest, ABatchWhoseClosingThrowsDoesNotKeepTheOthersFromBeingClosed) {
  const ImportRun run =
      ImportText(TenKeys(), Failing("EndKeyframeBatch", 2, refhost::Failure::Kind::RuntimeError));
  EXPECT_EQ(run.result.code, HOST_ERR_EXCEPTION_OTHER);
  EXPECT_THAT(CallsOf(run.trace, "EndKeyframeBatch"), SizeIs(5));
  EXPECT_EQ(KeysOf(run, kXRotation), 0u);
  EXPECT_EQ(KeysOf(run, kPosition), 10u);
}

TEST(BuilderFailuresTest, ABatchWhoseClosingFailsIsNoFailure) {
  const ImportRun run = ImportText(TenKeys(), Failing("EndKeyframeBatch", 2));
  EXPECT_EQ(run.result.code, 0);
  EXPECT_EQ(KeysOf(run, kPosition), 10u);
}

TEST(BuilderFailuresTest, AMatrixThatFailsBetweenTwoKeysKeepsTheKeysBeforeIt) {
  const ImportRun run =
      ImportText(TenKeys(), Failing("MatrixDecompose", 1 + 4));  // the static pose is the first
  EXPECT_EQ(run.result.code, kRehearsed);
  EXPECT_EQ(KeysOf(run, kScale), 3u);
  EXPECT_EQ(KeysOf(run, kPosition), 3u);
}

TEST(BuilderFailuresTest, AMissingKeyframeSuiteIsThirteenAndOpensNothing) {
  refhost::HostOptions options;
  options.refusedSuites.push_back({"QZGP Keyframe Suite", 3});
  const ImportRun run = ImportText(TenKeys(), options);
  EXPECT_EQ(run.result.code, 13);
  EXPECT_THAT(run.host->project().layers(), SizeIs(1));
}

TEST(BuilderFailuresTest, AMatrixThatFailsStopsBeforeTheFirstStream) {
  const ImportRun run =
      ImportText(Scene(TransformText("rig") + CameraText("lens", "rig")), Failing("MatrixDecompose", 1));
  EXPECT_EQ(run.result.code, kRehearsed);
  EXPECT_THAT(CallsOf(run.trace, "AcquireLayerStream"), SizeIs(2));  // the lens
}

TEST(BuilderFailuresTest, EveryTransformIsOneMatrixCall) {
  const ImportRun run = ImportText(TenKeys(), {});
  EXPECT_EQ(run.result.code, 0);
  EXPECT_EQ(run.host->callCount("MatrixDecompose"), 1 + 10);  // the static pose, and the keys
  for (const char* const service :
       {"MatrixSetIdentity", "MatrixTranslate", "MatrixScale", "MatrixRotateAxis"}) {
    EXPECT_EQ(run.host->callCount(service), 0) << service;
  }
}

// For each failing list read between the opening of the batches and their first key, when the runs of keys
// are fetched: the batches that were closed.
std::vector<std::size_t> BatchesClosedAfterAFailedRun(const std::string& scene) {
  std::vector<std::size_t> closed;
  const std::int64_t reads = ImportText(scene, {}).host->callCount("ListGet");
  for (std::int64_t nth = 1; nth <= reads; ++nth) {
    const ImportRun run = ImportText(scene, Failing("ListGet", nth));
    EXPECT_EQ(run.result.code, kRehearsed);
    EXPECT_TRUE(run.result.ledgerClean());
    const bool opened = !CallsOf(run.trace, "BeginKeyframeBatch").empty();
    if (!opened || !CallsOf(run.trace, "AddBatchKeyframe").empty()) continue;
    closed.push_back(CallsOf(run.trace, "EndKeyframeBatch").size());
  }
  return closed;
}

TEST(BuilderFailuresTest, BatchesAreClosedAfterAFailedFetchOfTheKeysOfAChannel) {
  EXPECT_THAT(BatchesClosedAfterAFailedRun(TenKeys() + Animation("rig.ry", {{1, 77}})), ElementsAre(5, 5));
}

TEST(BuilderFailuresTest, TheBatchOfAPointOfInterestIsClosedAfterAFailedFetchToo) {
  const std::string scene = Scene(TransformText("rig") + TransformText("target") + ConstraintText("aim") +
                                  CameraText("lens", "rig") + Aim("aim", "rig", "target"));
  EXPECT_THAT(BatchesClosedAfterAFailedRun(scene + Animation("target.tx", kTenKeys) +
                                           Animation("target.ry", {{1, 77}})),
              ElementsAre(1, 1));
}

TEST(BuilderFailuresTest, AFailureAfterTheFirstStreamLeavesTheEarlierStreamsSet) {
  // The lens sets two values, the anchor point is the third and the scale the fourth.
  const ImportRun run = ImportText(Scene(TransformText("rig") + Triple(".s", 2, 3, 4) +
                                         Triple(".r", 50, 0, 0) + CameraText("lens", "rig")),
                                   Failing("SetStreamValue", 5));
  EXPECT_EQ(run.result.code, kRehearsed);
  const refhost::Layer& layer = run.host->project().layers().front();
  EXPECT_NEAR(layer.findStream(kScale)->value[1], 300.0, 1e-9);
  EXPECT_DOUBLE_EQ(layer.findStream(kXRotation)->value[0], 0.0);
  EXPECT_THAT(Kept(run), IsEmpty());
}

TEST(BuilderFailuresTest, SetCameraLeavesItsPositionStreamUnreleasedWhenTheValueCannotBeSet) {
  const ImportRun run = ImportText(TenKeys(), Failing("SetStreamValue", 1));
  EXPECT_EQ(run.result.code, kRehearsed);
  EXPECT_THAT(CallsOf(run.trace, "ReleaseStream"), IsEmpty());
  EXPECT_THAT(Kept(run), ElementsAre("stream:1 (position of layer:1)"));
  EXPECT_TRUE(run.result.ledgerClean());
}

TEST(BuilderFailuresTest, SetCameraLeavesItsZoomStreamUnreleasedWhenTheValueCannotBeSet) {
  const ImportRun run = ImportText(TenKeys(), Failing("SetStreamValue", 2, refhost::Failure::Kind::BadAlloc));
  EXPECT_EQ(run.result.code, HOST_ERR_EXCEPTION_MEMORY);
  EXPECT_THAT(CallsOf(run.trace, "ReleaseStream"), SizeIs(1));
  EXPECT_THAT(Kept(run), ElementsAre("stream:2 (zoom of layer:1)"));
  EXPECT_TRUE(run.result.ledgerClean());
}

TEST(BuilderFailuresTest, SetCameraThrowsTheCodeOfAFailedRelease) {
  for (const std::int64_t nth : {1, 2}) {
    EXPECT_EQ(ImportText(TenKeys(), Failing("ReleaseStream", nth)).result.code, kRehearsed);
  }
  EXPECT_EQ(ImportText(TenKeys(), Failing("ReleaseStream", 3)).result.code, 0);  // of the static pose
}

TEST(BuilderFailuresTest, AFailedZoomKeyKeepsTheKeysBeforeItReleasesTheStreamAndSkipsTheTransform) {
  const ImportRun run = ImportText(Scene(TransformText("rig") + CameraText("lens", "rig") +
                                         Animation("lens.fl", kTenKeys) + Animation("rig.tx", kTenKeys)),
                                   Failing("SetBatchKeyframeValue", 4));
  EXPECT_EQ(run.result.code, kRehearsed);
  EXPECT_EQ(KeysOf(run, kZoom), 3u);
  EXPECT_EQ(KeysOf(run, kPosition), 0u);
  EXPECT_THAT(CallsOf(run.trace, "BeginKeyframeBatch"), SizeIs(1));
  EXPECT_THAT(CallsOf(run.trace, "EndKeyframeBatch"), SizeIs(1));
  EXPECT_THAT(Kept(run), IsEmpty());
}

TEST(BuilderFailuresTest, AZoomStreamIsReleasedAfterAFailureWithoutABatch) {
  for (const char* const operation : {"GetStreamKeyframeCount", "BeginKeyframeBatch"}) {
    const ImportRun run =
        ImportText(Scene(CameraText("lens", "") + Animation("lens.fl", kTenKeys)), Failing(operation, 1));
    EXPECT_EQ(run.result.code, kRehearsed) << operation;
    EXPECT_THAT(CallsOf(run.trace, "EndKeyframeBatch"), IsEmpty()) << operation;
    EXPECT_THAT(Kept(run), IsEmpty()) << operation;
    EXPECT_THAT(CallsOf(run.trace, "ReleaseStream"), SizeIs(3)) << operation;
  }
}

TEST(BuilderFailuresTest, AnExceptionOutOfTheReleaseOfAZoomStreamGoesBeforeTheCodeThatWasKept) {
  using Kind = refhost::Failure::Kind;
  const auto codeWith = [](Kind kind) {
    refhost::HostOptions options = Failing("GetStreamKeyframeCount", 1, Kind::BadAlloc);
    options.failures.push_back({"ReleaseStream", 3, false, kind, kRehearsed});
    return ImportText(Scene(CameraText("lens", "") + Animation("lens.fl", kTenKeys)), options).result.code;
  };
  EXPECT_EQ(codeWith(Kind::RuntimeError), HOST_ERR_EXCEPTION_OTHER);
  EXPECT_EQ(codeWith(Kind::Code), HOST_ERR_EXCEPTION_MEMORY);
}

TEST(BuilderFailuresTest, DifferentKeyCountsAreReportedOnceAndWhatWasMadeStays) {
  const ImportRun run = ImportText(Scene(TransformText("arm") + TransformText("rig", "arm") +
                                         CameraText("lens", "rig") + Animation("arm.tx", {{1, 0}, {2, 1}}) +
                                         Animation("arm.sz", {{1, 0}, {2, 1}, {3, 2}})));
  EXPECT_EQ(run.result.code, 1289987);
  EXPECT_THAT(run.result.messages, ElementsAre("Inconsistant number of keyframes for Maya camera."));
  EXPECT_THAT(run.host->project().layers(), SizeIs(2));
}

TEST(BuilderFailuresTest, AMessageThatCannotBeShownChangesNothing) {
  const ImportRun run =
      ImportText(Scene(TransformText("rig") + CameraText("lens", "rig") +
                       Animation("rig.tx", {{1, 0}, {2, 1}}) + Animation("rig.sz", {{1, 0}, {2, 1}, {3, 2}})),
                 Failing("ShowMessage", 1));
  EXPECT_EQ(run.result.code, 1289987);
  EXPECT_THAT(run.result.messages, IsEmpty());
}

TEST(BuilderFailuresTest, WhereTheNameCannotBeMadeNothingIsBuilt) {
  for (const char* const service : {"FileName", "StripExtension"}) {
    const ImportRun run = ImportText(TenKeys(), Failing(service, 1));
    EXPECT_EQ(run.result.code, kRehearsed) << service;
    EXPECT_THAT(run.host->project().compositions(), IsEmpty()) << service;
  }
}

TEST(BuilderFailuresTest, AFailedComparisonOfTheAspectIsThrownBeforeACompositionIsMade) {
  const ImportRun run = ImportText(TenKeys(), Failing("RatioCompare", 1));
  EXPECT_EQ(run.result.code, kRehearsed);
  EXPECT_THAT(run.host->project().compositions(), IsEmpty());
}

TEST(BuilderFailuresTest, ASquareNameThatCannotBeMadeIsThrownBeforeACompositionIsMade) {
  const ImportRun run = ImportText(SceneHead() + RenderSize(720, 486, 0.9) + CameraText("lens", ""),
                                   Failing("StringFormat", 1));
  EXPECT_EQ(run.result.code, kRehearsed);
  EXPECT_THAT(run.host->project().compositions(), IsEmpty());
}

// Steps that stand after the text's lock: whatever fails, the text is empty, and is unlocked and freed.
TEST(BuilderFailuresTest, AFailureToReadTheTextLeavesAnEmptyOneAndTheRemainingStepsStillRun) {
  for (const char* const service : {"FileOpen", "FileRead", "FileClose"}) {
    const ImportRun run = ImportText(TenKeys(), Failing(service, 2));  // the first is the header test's
    EXPECT_EQ(run.result.code, kRehearsed) << service;
    EXPECT_THAT(run.host->project().compositions(), IsEmpty()) << service;
    EXPECT_THAT(CallsOf(run.trace, "UnlockMemHandle"), SizeIs(1)) << service;
    EXPECT_THAT(CallsOf(run.trace, "FreeMemHandle"), SizeIs(1)) << service;
    EXPECT_EQ(run.host->callCount("FileName"), 1) << service;
    EXPECT_EQ(run.host->callCount("StripExtension"), 1) << service;
  }
}

TEST(BuilderFailuresTest, AFailedLockStillLeadsToUnlockAndFree) {
  const ImportRun run = ImportText(TenKeys(), Failing("LockMemHandle", 1));
  EXPECT_EQ(run.result.code, kRehearsed);
  EXPECT_THAT(CallsOf(run.trace, "UnlockMemHandle"), SizeIs(1));
  EXPECT_THAT(CallsOf(run.trace, "FreeMemHandle"), SizeIs(1));
}

// Members called one by one, with a failure that begins only then.
class LateFailureTest : public BuilderTest {
 protected:
  ~LateFailureTest() override { HostClearUtilityFailures(); }

  // The next call of the service fails.
  static void FailNext(std::int32_t service) {
    const HostUtilityFailure failure{service, HostUtilityCallCount(service) + 1, kRehearsed,
                                     HOST_THROW_NOTHING};
    ASSERT_EQ(HostAddUtilityFailure(&failure), 0);
  }
};

TEST_F(LateFailureTest, AFailedListReadWhileMeasuringTheDurationIsThrown) {
  for (const std::int32_t service : {HOST_UTILITY_ListGet, HOST_UTILITY_ListCount}) {
    Begin(Animation("a.tx", kTenKeys));
    FailNext(service);
    EXPECT_EQ(CodeOf([&] { parser().FindLongestAnimation(); }), kRehearsed);
    HostClearUtilityFailures();
  }
}

TEST_F(LateFailureTest, AFailedListReadOfTheCamerasTransformIsThrownAfterTheLensIsSet) {
  Begin(TransformText("rig") + CameraText("lens", "rig"));
  const MAYA_Camera camera = CameraAt(0);
  VOR_Layer* const layer = NewCamera();
  FailNext(HOST_UTILITY_ListGet);
  EXPECT_EQ(CodeOf([&] { parser().SetCamera(layer, &camera); }), kRehearsed);
  EXPECT_THAT(TakeTrace(), SizeIs(8));
}

TEST_F(LateFailureTest, AFailedListReadOfTheConstrainedTransformIsThrown) {
  Begin(TransformText("rig") + TransformText("target") + ConstraintText("aim") + CameraText("lens", "rig") +
        Aim("aim", "rig", "target"));
  const MAYA_Camera camera = CameraAt(0);
  const MAYA_Transform constraint = TransformAt(2);
  VOR_Layer* const layer = NewCamera();
  FailNext(HOST_UTILITY_ListGet);
  EXPECT_EQ(CodeOf([&] { parser().SetCameraLookAt(layer, &camera, &constraint); }), kRehearsed);
  EXPECT_THAT(TakeTrace(), IsEmpty());
}

TEST_F(LateFailureTest, AFailedListReadOfACurveIsThrownWithoutAMessage) {
  Begin(TransformText("n") + Animation("n.tx", kTenKeys));
  const MAYA_Transform node = TransformAt(0);
  FailNext(HOST_UTILITY_ListGet);
  EXPECT_EQ(CodeOf([&] { parser().VerifyAnimInfo(&node); }), kRehearsed);
  EXPECT_THAT(End().messages, IsEmpty());
}

}  // namespace
}  // namespace testsupport
