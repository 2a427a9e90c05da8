// The verify callback, and the header test that it shares with the import.
#include <sys/stat.h>

#include "hostutil/HostFile.h"
#include "plugin/Globals.h"
#include "plugin/ImportDriver.h"
#include "tests/plugin/PluginRun.h"

using namespace mayaimport;

namespace testsupport {
namespace {

using ::testing::Contains;
using ::testing::ElementsAre;
using ::testing::HasSubstr;
using ::testing::IsEmpty;

class VerifyTest : public PluginTest {
 protected:
  // The answer; the code is 0 and nothing is shown.
  bool Takes(std::string_view bytes) {
    const refhost::CallbackResult result = Verify(Write("scene.ma", bytes));
    EXPECT_EQ(result.code, 0);
    EXPECT_THAT(result.messages, IsEmpty());
    EXPECT_THAT(result.leftovers, IsEmpty());
    return result.canImport;
  }

  void ExpectRefused(const refhost::CallbackResult& result, HostError code) {
    EXPECT_EQ(result.code, code);
    EXPECT_FALSE(result.canImport);
    EXPECT_THAT(result.messages, IsEmpty());
    EXPECT_THAT(result.leftovers, IsEmpty());
    EXPECT_EQ(CallsNamed("EndSilentErrors"), CallsNamed("BeginSilentErrors"));
  }
};

TEST_F(VerifyTest, AMayaAsciiFileIsTakenInAnyCase) {
  EXPECT_TRUE(Takes("//Maya ASCII 2020 scene\n"));
  EXPECT_TRUE(Takes("//MAYA ASC"));
  EXPECT_TRUE(Takes("//mAyAxxxxxxx"));
}

// The host's flag is one byte: 1 for yes, nothing else.
TEST_F(VerifyTest, TheAnswerIsOneOrZero) {
  Load();
  for (const bool maya : {true, false}) {
    const std::string path = Write("scene.ma", maya ? "//Maya ASCII" : "//May be it").string();
    const std::vector<HostUTF16Unit> units(path.c_str(), path.c_str() + path.size() + 1);
    host_->beginCallback(refhost::Callback::Verify, path);
    std::uint8_t taken = 77;
    EXPECT_EQ(VerifyFileCallback(units.data(), nullptr, &taken), 0);
    EXPECT_EQ(taken, maya ? 1 : 0);
    host_->endCallback(0);
  }
}

TEST_F(VerifyTest, AnyOtherFileIsNotTakenAndNothingIsShown) {
  EXPECT_FALSE(Takes("/*Maya ASCII 2020 scene"));
  EXPECT_FALSE(Takes("//May ASCII 2020 scene"));
  EXPECT_FALSE(Takes(" //Maya ASCII"));
  EXPECT_FALSE(Takes(std::string_view("//\0Maya ASCII", 13)));
  EXPECT_FALSE(Takes(std::string_view("\0\0\0\0\0\0\0\0\0\0", 10)));
  EXPECT_FALSE(Takes("FOR4........"));
}

TEST_F(VerifyTest, AFileShorterThanTenBytesIsAReadError) {
  for (std::size_t size = 0; size < 10; ++size) {
    const auto path = Write("scene.ma", std::string_view("//Maya ASC").substr(0, size));
    ExpectRefused(Verify(path), HOST_ERR_FILE_SHORT_READ);
  }
  EXPECT_TRUE(Takes("//Maya ASC"));
}

TEST_F(VerifyTest, WhatCannotBeOpenedIsAnOpenError) {
  ExpectRefused(Verify(folder() / "missing.ma"), HOST_ERR_FILE_OPEN);
  ExpectRefused(Verify(folder()), HOST_ERR_FILE_OPEN);
  const auto fifo = folder() / "fifo.ma";
  ASSERT_EQ(mkfifo(fifo.c_str(), 0600), 0);
  ExpectRefused(Verify(fifo), HOST_ERR_FILE_OPEN);
}

TEST_F(VerifyTest, AnEmptyPathIsNotTakenWithoutAnyCall) {
  const refhost::CallbackResult result = Verify("");
  ExpectRefused(result, 0);
  EXPECT_EQ(result.suiteCalls, 0);
  std::uint8_t taken = 1;
  const HostUTF16Unit empty[] = {0, 'x', 0};
  EXPECT_EQ(VerifyFileCallback(empty, nullptr, &taken), 0);
  EXPECT_EQ(taken, 0);
}

TEST_F(VerifyTest, ANullPathIsNotTaken) {
  Load();
  std::uint8_t taken = 1;
  EXPECT_EQ(VerifyFileCallback(nullptr, nullptr, &taken), 0);
  EXPECT_EQ(taken, 0);
}

TEST_F(VerifyTest, ANullResultIsThree) {
  Load();
  const HostUTF16Unit path[] = {'x', 0};
  EXPECT_EQ(VerifyFileCallback(path, nullptr, nullptr), 3);
}

TEST_F(VerifyTest, TheHeaderTestNeedsAFileAndAFlag) {
  Load();
  host_->beginCallback(refhost::Callback::Import, "x");
  {
    QZGP_SuiteHandler suites(host_->basicSuite());
    std::uint8_t flag = 1;
    EXPECT_EQ(CheckMayaHeader(nullptr, suites, false, &flag), 3);
    UTF16String* path = nullptr;
    ASSERT_EQ(UTF16StringMakeFromBytes("x", &path), 0);
    HostFile* file = nullptr;
    ASSERT_EQ(HostFileCreate(path, &file), 0);
    EXPECT_EQ(CheckMayaHeader(file, suites, false, nullptr), 3);
    EXPECT_EQ(HostFileDispose(file), 0);
    UTF16StringRelease(path);
  }
  EXPECT_EQ(host_->endCallback(0).suiteCalls, 0);
}

TEST_F(VerifyTest, TheCallsComeInTheirOrder) {
  EXPECT_TRUE(Verify(Write("scene.ma", kScene)).canImport);
  EXPECT_THAT(Calls(), ElementsAre("AcquireSuite QZGP Utility Suite 7", "BeginSilentErrors",
                                   "EndSilentErrors", "ReleaseSuiteByName QZGP Utility Suite 7"));
  EXPECT_THAT(LineOf("EndSilentErrors"), HasSubstr("\"report\":0"));
  EXPECT_EQ(host_->callCount("FileOpen"), 1);
  EXPECT_EQ(host_->callCount("FileRead"), 1);
  EXPECT_EQ(host_->callCount("FileClose"), 1);
  EXPECT_EQ(host_->callCount("FileDispose"), 1);
}

TEST_F(VerifyTest, WhenSilenceCannotBeginNothingElseIsDone) {
  const refhost::CallbackResult result =
      Verify(Write("scene.ma", kScene), {FailCall("BeginSilentErrors", 1, 51)});
  EXPECT_EQ(result.code, 51);
  EXPECT_FALSE(result.canImport);
  EXPECT_EQ(CallsNamed("EndSilentErrors"), 0u);
  EXPECT_EQ(host_->callCount("FileCreate"), 0);
  ExpectSound(result);
}

TEST_F(VerifyTest, WithoutTheUtilitySuiteTheCodeIsThirteen) {
  refhost::HostOptions options;
  options.refusedSuites = {{"QZGP Utility Suite", 7}};
  options.during = refhost::Callback::Verify;
  Load(options);
  const refhost::CallbackResult result = host_->verifyScene(Write("scene.ma", kScene));
  EXPECT_EQ(result.code, 13);
  EXPECT_FALSE(result.canImport);
  ExpectSound(result);
}

TEST_F(VerifyTest, EveryFailedFileServiceIsItsCodeAndTheSilenceEnds) {
  const auto path = Write("scene.ma", kScene);
  ExpectRefused(Verify(path, {FailCall("FileCreate", 1, 55)}), 55);
  EXPECT_EQ(host_->callCount("FileDispose"), 0);
  ExpectRefused(Verify(path, {FailCall("FileOpen", 1, 56)}), 56);
  EXPECT_EQ(host_->callCount("FileRead"), 0);
  EXPECT_EQ(host_->callCount("FileClose"), 1);
  ExpectRefused(Verify(path, {FailCall("FileRead", 1, 57)}), 57);
  EXPECT_EQ(host_->callCount("FileClose"), 1);
  ExpectRefused(Verify(path, {FailCall("FileClose", 1, 58)}), 58);
  ExpectRefused(Verify(path, {FailCall("FileRead", 1, 57), FailCall("FileClose", 1, 58)}), 57);
  ExpectRefused(Verify(path, {FailCall("StringMake", 1, 59)}), 59);
}

TEST_F(VerifyTest, AFileObjectThatIsNotMadeButSaysZeroIsNotTaken) {
  ExpectRefused(Verify(Write("scene.ma", kScene), {FailCall("FileCreate", 1, 0)}), 0);
  EXPECT_EQ(host_->callCount("FileDispose"), 0);
}

TEST_F(VerifyTest, TheAnswerStandsWhenOnlyTheEndFails) {
  const auto path = Write("scene.ma", kScene);
  for (const char* const call : {"EndSilentErrors", "FileDispose"}) {
    const refhost::CallbackResult result = Verify(path, {FailCall(call, 1, 61)});
    EXPECT_EQ(result.code, 61) << call;
    EXPECT_TRUE(result.canImport) << call;
    EXPECT_EQ(host_->callCount("FileDispose"), 1);
    ExpectSound(result);
  }
}

TEST_F(VerifyTest, TheFirstOfSeveralCodesIsReturned) {
  const auto path = Write("scene.ma", kScene);
  EXPECT_EQ(Verify(path, {FailCall("EndSilentErrors", 1, 61), FailCall("FileDispose", 1, 62)}).code, 61);
  EXPECT_EQ(Verify(path, {FailCall("FileOpen", 1, 60), FailCall("EndSilentErrors", 1, 61)}).code, 60);
}

TEST_F(VerifyTest, EveryThrownExceptionIsTranslatedAndTheSilenceEnds) {
  const auto path = Write("scene.ma", kScene);
  for (const char* const call : {"AcquireSuite", "BeginSilentErrors", "EndSilentErrors", "FileCreate",
                                 "FileOpen", "FileRead", "FileClose", "FileDispose", "StringMake"}) {
    SCOPED_TRACE(call);
    const refhost::CallbackResult memory = Verify(path, {ThrowCall(call, 1)});
    EXPECT_EQ(memory.code, HOST_ERR_EXCEPTION_MEMORY);
    ExpectSound(memory);
    const refhost::CallbackResult other =
        Verify(path, {ThrowCall(call, 1, refhost::Failure::Kind::RuntimeError)});
    EXPECT_EQ(other.code, HOST_ERR_EXCEPTION_OTHER);
    ExpectSound(other);
    const std::string name(call);
    if (name.starts_with("File") && name != "FileDispose") {
      EXPECT_FALSE(other.canImport);
      EXPECT_EQ(CallsNamed("EndSilentErrors"), 1u);
    }
  }
}

TEST_F(VerifyTest, AnUnknownExceptionIsSilentTooAndTheSilenceEnds) {
  const auto path = Write("scene.ma", kScene);
  for (const char* const call : {"AcquireSuite", "BeginSilentErrors", "EndSilentErrors", "FileCreate",
                                 "FileOpen", "FileRead", "FileClose", "FileDispose", "StringMake"}) {
    SCOPED_TRACE(call);
    const std::string name(call);
    const refhost::CallbackResult result = Verify(path, {ThrowCall(call, 1, refhost::Failure::Kind::Other)});
    EXPECT_EQ(result.code, HOST_ERR_EXCEPTION_OTHER);
    EXPECT_THAT(result.messages, ::testing::IsEmpty());
    EXPECT_EQ(result.canImport, name == "EndSilentErrors" || name == "FileDispose");
    const bool silent = name != "AcquireSuite" && name != "BeginSilentErrors";
    EXPECT_EQ(CallsNamed("EndSilentErrors"), silent ? 1u : 0u);
    EXPECT_EQ(host_->callCount("FileDispose"),
              silent && name != "FileCreate" && name != "StringMake" ? 1 : 0);
    ExpectSound(result);
  }
}

TEST_F(VerifyTest, EverySuiteCallFailingInTurnIsSound) {
  const auto path = Write("scene.ma", kScene);
  const std::int64_t calls = Verify(path).suiteCalls;
  ASSERT_EQ(calls, 4);
  const HostError expected[] = {13, kRehearsed, kRehearsed, 0};
  for (std::int64_t nth = 1; nth <= calls; ++nth) {
    const refhost::CallbackResult result = Verify(path, {FailAt(nth)});
    EXPECT_EQ(result.code, expected[nth - 1]) << nth;
    ExpectSound(result);
    ExpectSound(Verify(path, {FailAt(nth, 0)}));
  }
}

}  // namespace
}  // namespace testsupport
