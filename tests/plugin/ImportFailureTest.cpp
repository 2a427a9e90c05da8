// Every call of an import made to fail in turn.
#include "plugin/ImportDriver.h"
#include "tests/plugin/PluginRun.h"

using namespace mayaimport;

namespace testsupport {
namespace {

using ::testing::AnyOf;
using ::testing::ElementsAre;
using ::testing::IsEmpty;

class ImportFailureTest : public PluginTest {
 protected:
  ImportFailureTest() : path_(Write("scene.ma", kScene)) {}

  void ExpectNothingBuilt(std::vector<refhost::Failure> failures, HostError code) {
    const refhost::CallbackResult result = Import(path_, std::move(failures));
    EXPECT_EQ(result.code, code);
    EXPECT_THAT(CompositionNames(result), IsEmpty());
    EXPECT_THAT(result.messages, IsEmpty());
    ExpectSound(result);
  }

  std::filesystem::path path_;
};

TEST_F(ImportFailureTest, AFileObjectThatCannotBeMadeGoesOnWithoutABuffer) {
  ExpectNothingBuilt({FailCall("FileCreate", 1, 55)}, 55);
  EXPECT_EQ(host_->callCount("FileOpen"), 0);
  EXPECT_EQ(CallsNamed("NewMemHandle"), 0u);
  EXPECT_EQ(host_->callCount("StripExtension"), 1);
  ExpectNothingBuilt({FailCall("StringMake", 1, 54)}, 54);
}

TEST_F(ImportFailureTest, AFileObjectThatIsNotMadeButSaysZeroIsThree) {
  ExpectNothingBuilt({FailCall("FileCreate", 1, 0)}, 3);
  EXPECT_EQ(CallsNamed("NewMemHandle"), 0u);
}

TEST_F(ImportFailureTest, AFailedHeaderTestIsItsCode) {
  ExpectNothingBuilt({FailCall("FileOpen", 1, 56)}, 56);
  EXPECT_EQ(host_->callCount("FileClose"), 1);
  ExpectNothingBuilt({FailCall("FileRead", 1, 57)}, 57);
  EXPECT_EQ(host_->callCount("FileClose"), 1);
  ExpectNothingBuilt({FailCall("FileClose", 1, 58)}, 58);
  ExpectNothingBuilt({FailCall("FileSize", 1, 59)}, 59);
  EXPECT_EQ(CallsNamed("NewMemHandle"), 0u);
}

TEST_F(ImportFailureTest, AFailedReadLeavesAnEmptyText) {
  for (const char* const service : {"FileOpen", "FileRead", "FileClose"}) {
    SCOPED_TRACE(service);
    ExpectNothingBuilt({FailCall(service, 2, 66)}, 66);
    EXPECT_EQ(host_->callCount("FileClose"), 2);
    EXPECT_EQ(host_->callCount("FileName"), 1);
    EXPECT_EQ(host_->callCount("StripExtension"), 1);
    EXPECT_EQ(CallsNamed("UnlockMemHandle"), 1u);
    EXPECT_EQ(CallsNamed("FreeMemHandle"), 1u);
  }
  ExpectNothingBuilt({FailCall("FileRead", 2, 66), FailCall("FileClose", 2, 67)}, 66);
}

TEST_F(ImportFailureTest, ABufferThatCannotBeAllocatedIsItsCode) {
  ExpectNothingBuilt({FailCall("NewMemHandle", 1, 68)}, 68);
  EXPECT_EQ(CallsNamed("LockMemHandle"), 0u);
  EXPECT_EQ(CallsNamed("FreeMemHandle"), 0u);
  ExpectNothingBuilt({FailCall("NewMemHandle", 1, 0)}, 0);
  EXPECT_EQ(CallsNamed("LockMemHandle"), 0u);
}

TEST_F(ImportFailureTest, ABufferThatCannotBeLockedIsStillUnlockedAndFreed) {
  ExpectNothingBuilt({FailCall("LockMemHandle", 1, 69)}, 69);
  EXPECT_EQ(CallsNamed("UnlockMemHandle"), 1u);
  EXPECT_EQ(CallsNamed("FreeMemHandle"), 1u);
}

TEST_F(ImportFailureTest, AFailingNameIsThrownAndNothingIsParsedOrBuilt) {
  path_ = Write("scene.ma", std::string(kScene) + "{");
  ExpectNothingBuilt({FailCall("FileName", 1, 71)}, 71);
  EXPECT_EQ(host_->callCount("StripExtension"), 0);
  EXPECT_EQ(CallsNamed("FreeMemHandle"), 1u);
}

TEST_F(ImportFailureTest, AFailingExtensionRemovalIsThrownAndNothingIsBuilt) {
  ExpectNothingBuilt({FailCall("StripExtension", 1, 72)}, 72);
  // The scene was parsed before.
  path_ = Write("scene.ma", std::string(kScene) + "{");
  EXPECT_EQ(Import(path_, {FailCall("StripExtension", 1, 72)}).code, 1289985);
  EXPECT_EQ(host_->callCount("StripExtension"), 0);
}

TEST_F(ImportFailureTest, TheCodeOfParsingAndBuildingGoesBeforeThatOfTheFile) {
  ExpectNothingBuilt({FailCall("FileRead", 2, 66), FailCall("FileName", 1, 71)}, 71);
  ExpectNothingBuilt({FailCall("FileSize", 1, 66), FailCall("StripExtension", 1, 72)}, 72);
}

TEST_F(ImportFailureTest, FailuresToUnlockAndFreeChangeNothingOfTheResult) {
  for (const char* const call : {"UnlockMemHandle", "FreeMemHandle"}) {
    const refhost::CallbackResult result = Import(path_, {FailCall(call, 1)});
    EXPECT_EQ(result.code, 0) << call;
    EXPECT_EQ(CompositionNames(result).size(), 2u);
    EXPECT_EQ(CallsNamed("FreeMemHandle"), 1u);
    ExpectSound(result);
  }
}

// The codes that an import passes over: what only gives something back, and the message.
bool IsIgnored(const std::string& call) {
  return call.starts_with("ReleaseSuiteByName") || call == "UnlockMemHandle" || call == "FreeMemHandle" ||
         call == "ReleaseStream" || call == "EndKeyframeBatch" || call == "ShowMessage";
}

TEST_F(ImportFailureTest, EverySuiteCallFailingInTurnIsItsCodeOrIgnored) {
  const std::int64_t calls = Import(path_).suiteCalls;
  const std::vector<std::string> names = Calls();
  ASSERT_EQ(static_cast<std::size_t>(calls), names.size());
  ASSERT_GT(calls, 60);
  for (std::int64_t nth = 1; nth <= calls; ++nth) {
    const std::string& name = names[static_cast<std::size_t>(nth - 1)];
    SCOPED_TRACE(std::to_string(nth) + " " + name);
    const refhost::CallbackResult result = Import(path_, {FailAt(nth)});
    if (name == "ReleaseStream")
      EXPECT_THAT(result.code, AnyOf(0, kRehearsed));  // the lens throws it, all else passes over it
    else
      EXPECT_EQ(result.code, name.starts_with("AcquireSuite") ? 13 : IsIgnored(name) ? 0 : kRehearsed);
    ExpectSound(result);
    ExpectSound(Import(path_, {FailAt(nth, 0)}));
  }
}

TEST_F(ImportFailureTest, EveryThrownExceptionIsTranslatedAndLeavesNothing) {
  const std::int64_t calls = Import(path_).suiteCalls;
  const std::vector<std::string> names = Calls();
  for (std::int64_t nth = 1; nth <= calls; ++nth) {
    const std::string& name = names[static_cast<std::size_t>(nth - 1)];
    if (name.starts_with("ReleaseSuiteByName")) continue;  // ends the process
    SCOPED_TRACE(std::to_string(nth) + " " + name);
    const refhost::CallbackResult memory = Import(path_, {ThrowAt(nth, refhost::Failure::Kind::BadAlloc)});
    EXPECT_EQ(memory.code, HOST_ERR_EXCEPTION_MEMORY);
    EXPECT_EQ(memory.messages.size(), 1u);
    ExpectSound(memory);
    const refhost::CallbackResult other = Import(path_, {ThrowAt(nth, refhost::Failure::Kind::RuntimeError)});
    EXPECT_EQ(other.code, HOST_ERR_EXCEPTION_OTHER);
    ExpectSound(other);
  }
}

TEST_F(ImportFailureTest, AnUnknownExceptionLeavesTheTextLockedAndReleasesTheParsersSuites) {
  const refhost::CallbackResult result =
      Import(path_, {ThrowCall("CreateComp", 1, refhost::Failure::Kind::Other)});
  EXPECT_EQ(result.code, HOST_ERR_EXCEPTION_OTHER);
  EXPECT_TRUE(result.refusals.empty()) << "the host stops what leaves the callback, and says so";
  EXPECT_THAT(result.messages, IsEmpty());
  EXPECT_EQ(CallsNamed("UnlockMemHandle"), 0u);
  EXPECT_EQ(CallsNamed("FreeMemHandle"), 0u);
  ASSERT_EQ(result.leftovers.size(), 2u);
  EXPECT_EQ(result.leftovers[0].description,
            "mem:1 (file buffer, " + std::to_string(std::string(kScene).size() + 2) + " bytes)");
  EXPECT_FALSE(result.leftovers[0].keptByDesign);
  EXPECT_TRUE(result.leftovers[1].keptByDesign);  // the file object
  EXPECT_EQ(Import(path_).code, 0);
}

TEST_F(ImportFailureTest, AnUnknownExceptionPassesTheOpenBatchesButReleasesTheStreamInUse) {
  const refhost::CallbackResult result =
      Import(path_, {ThrowCall("SetBatchKeyframeValue", 3, refhost::Failure::Kind::Other)});
  EXPECT_EQ(result.code, HOST_ERR_EXCEPTION_OTHER);
  EXPECT_TRUE(result.refusals.empty()) << "the host stops what leaves the callback, and says so";
  std::size_t batches = 0;
  for (const refhost::Leftover& left : result.leftovers) {
    EXPECT_FALSE(left.description.starts_with("stream:")) << left.description;
    if (left.description.starts_with("batch:")) ++batches;
  }
  // The zoom has two keys of its own; the third value is the first of the five batches of the rig.
  EXPECT_EQ(batches, 5u);
  EXPECT_EQ(CallsNamed("EndKeyframeBatch"), 1u);
}

TEST_F(ImportFailureTest, EveryUtilityServiceFailingInTurnIsSound) {
  Import(path_);
  for (const char* const service :
       {"FileCreate", "FileOpen", "FileRead", "FileClose", "FileSize", "FileName", "StripExtension",
        "StringMake", "StringCopy", "StringFormat", "ListCreate", "ListAppend", "ListLock", "ListUnlock",
        "ListGet", "ListCount", "NumberScan", "MatrixDecompose", "RatioCompare"}) {
    Import(path_);
    const std::int64_t calls = host_->callCount(service);
    for (std::int64_t nth = 1; nth <= calls; ++nth) {
      SCOPED_TRACE(service + std::to_string(nth));
      const refhost::CallbackResult failed = Import(path_, {FailCall(service, nth)});
      EXPECT_EQ(failed.code, kRehearsed);
      ExpectSound(failed);
      const refhost::CallbackResult thrown = Import(path_, {ThrowCall(service, nth)});
      EXPECT_EQ(thrown.code, HOST_ERR_EXCEPTION_MEMORY);
      ExpectSound(thrown);
      ExpectSound(Import(path_, {FailCall(service, nth, 0)}));
    }
  }
}

using ImportDeathTest = ImportFailureTest;

TEST_F(ImportDeathTest, AnExceptionOutOfASuiteReleaseEndsTheProcess) {
  GTEST_FLAG_SET(death_test_style, "threadsafe");
  EXPECT_DEATH(Import(path_, {ThrowCall("ReleaseSuiteByName", 1)}), "");
}

}  // namespace
}  // namespace testsupport
