// The import callback: what is read, built, shown and returned.
#include "plugin/ImportDriver.h"

#include <sys/stat.h>

#include "tests/plugin/PluginRun.h"
#include "tests/support/UtilityCalls.h"

using namespace mayaimport;

namespace testsupport {
namespace {

using ::testing::ElementsAre;
using ::testing::HasSubstr;
using ::testing::IsEmpty;

constexpr const char* kOnlyMayaText = "Only Baked Maya Ascii files are supported.";

class ImportTest : public PluginTest {
 protected:
  void ExpectNothingBuilt(const refhost::CallbackResult& result, HostError code) {
    EXPECT_EQ(result.code, code);
    EXPECT_THAT(CompositionNames(result), IsEmpty());
    EXPECT_THAT(result.messages, IsEmpty());
    ExpectSound(result);
    EXPECT_EQ(CallsNamed("FreeMemHandle"), CallsNamed("NewMemHandle"));
  }
};

TEST_F(ImportTest, AFileNamedSceneYieldsACompositionNamedScene) {
  const refhost::CallbackResult result = Import(Write("scene.ma", kScene));
  EXPECT_EQ(result.code, 0);
  EXPECT_THAT(CompositionNames(result), ::testing::UnorderedElementsAre("scene", "Square scene"));
  EXPECT_THAT(result.messages, IsEmpty());
  EXPECT_THAT(result.refusals, IsEmpty());
  ExpectSound(result);
}

TEST_F(ImportTest, TheNameLosesItsLastExtensionOnly) {
  const std::string square = std::string(kScene) + "select -ne :defaultResolution;\nsetAttr \".pa\" 1;\n";
  EXPECT_THAT(CompositionNames(Import(Write("shot.v01.ma", square))), ElementsAre("shot.v01"));
  EXPECT_THAT(CompositionNames(Import(Write("noextension", square))), ElementsAre("noextension"));
  EXPECT_THAT(CompositionNames(Import(Write(".ma", square))), ElementsAre(""));
  EXPECT_THAT(CompositionNames(Import(Write("K\xc3\xa4mera 1.MA", square))), ElementsAre("K\xc3\xa4mera 1"));
}

TEST_F(ImportTest, TheExtensionIsRemovedOnceWithFlag1) {
  TakeUtilityCalls();
  Import(Write("scene.ma", kScene));
  EXPECT_THAT(TakeUtilityCalls().stripFlags, ElementsAre(1));
}

TEST_F(ImportTest, TheBufferIsTwoBytesLargerThanTheFileAndFreedAtTheEnd) {
  const std::string text = kScene;
  Import(Write("scene.ma", text));
  EXPECT_THAT(LineOf("NewMemHandle"),
              HasSubstr("\"pluginId\":7,\"name\":\"file buffer\",\"size\":" +
                        std::to_string(text.size() + 2) + ",\"flags\":0,\"handle\":\"mem:1\""));
  const std::vector<std::string> calls = Calls();
  const std::vector<std::string> head(calls.begin(), calls.begin() + 3);
  EXPECT_THAT(head, ElementsAre("AcquireSuite QZGP Memory Suite 1", "NewMemHandle", "LockMemHandle"));
  const std::vector<std::string> tail(calls.end() - 3, calls.end());
  EXPECT_THAT(tail,
              ElementsAre("UnlockMemHandle", "FreeMemHandle", "ReleaseSuiteByName QZGP Memory Suite 1"));
}

TEST_F(ImportTest, TheFileObjectIsNotDisposedOf) {
  const refhost::CallbackResult result = Import(Write("scene.ma", kScene));
  EXPECT_EQ(host_->callCount("FileDispose"), 0);
  ASSERT_EQ(result.leftovers.size(), 1u);
  EXPECT_TRUE(result.leftovers[0].keptByDesign);
}

TEST_F(ImportTest, AFileThatIsNoMayaAsciiIsReportedToTheUserAndIsNoFailure) {
  const refhost::CallbackResult result = Import(Write("scene.ma", "FOR4 not a scene; createNode camera;\n"));
  EXPECT_EQ(result.code, 0);
  EXPECT_THAT(result.messages, ElementsAre(kOnlyMayaText));
  EXPECT_THAT(CompositionNames(result), IsEmpty());
  // The empty text goes the whole way of a scene.
  EXPECT_THAT(LineOf("NewMemHandle"), HasSubstr("\"size\":2,"));
  EXPECT_EQ(host_->callCount("FileSize"), 0);
  EXPECT_EQ(host_->callCount("FileName"), 1);
  EXPECT_EQ(host_->callCount("StripExtension"), 1);
  ExpectSound(result);
}

TEST_F(ImportTest, TheHeaderIsComparedWithoutRegardToCase) {
  const refhost::CallbackResult result =
      Import(Write("scene.ma", "//MAYA ascii\ncreateNode camera -n \"c\";\n"));
  EXPECT_EQ(result.code, 0);
  EXPECT_EQ(CompositionNames(result).size(), 2u);
}

TEST_F(ImportTest, TheMessageIsShownUpTo1023Bytes) {
  const auto path = Write("scene.ma", "no scene at all");
  for (const std::size_t size : {1023u, 1024u}) {
    refhost::HostOptions options;
    options.translations = {{"$$$/QZ/Maya_Import/LStr/0001", std::string(size, 'm')}};
    Load(options);
    const refhost::CallbackResult result = host_->importScene(path);
    EXPECT_EQ(result.code, 0);
    EXPECT_EQ(result.messages.size(), size == 1023 ? 1u : 0u);
  }
  EXPECT_EQ(Import(path, {FailCall("ShowMessage", 1)}).code, 0);
}

TEST_F(ImportTest, TheReadersMessagesAreShownWholeWhateverTheirLength) {
  constexpr const char* kUnequalKeys =
      "createNode camera -n \"lens\" -p \"rig\";\ncreateNode transform -n \"rig\";\n"
      "createNode animCurveTL -n \"x\";\nsetAttr \".ktv[0:1]\" 1 0 2 0;\n"
      "createNode animCurveTL -n \"y\";\nsetAttr \".ktv[0:2]\" 1 0 2 0 3 0;\n"
      "connectAttr \"x.o\" \"rig.tx\";\nconnectAttr \"y.o\" \"rig.ty\";\n";
  const struct {
    const char* key;
    const char* commands;
    HostError code;
  } rows[] = {{"$$$/QZ/Maya_Import/LStr/0003", "_name\n", HOST_ERR_MAYA_SYNTAX},
              {"$$$/QZ/Maya_Import/LStr/0004", "createNode \"", HOST_ERR_MAYA_UNEXPECTED_END},
              {"$$$/QZ/Maya_Import/LStr/0005", kUnequalKeys, HOST_ERR_MAYA_KEY_COUNTS}};
  for (const auto& row : rows) {
    for (const std::size_t size : {1023u, 1024u, 70000u}) {
      refhost::HostOptions options;
      options.translations = {{row.key, std::string(size, 'm')}};
      Load(options);
      const refhost::CallbackResult result =
          host_->importScene(Write("scene.ma", std::string("//Maya ASCII\n") + row.commands));
      EXPECT_EQ(result.code, row.code);
      EXPECT_THAT(result.messages, ElementsAre(std::string(size, 'm')));
    }
  }
}

TEST_F(ImportTest, AShortFileIsAReadErrorWithoutAMessage) {
  ExpectNothingBuilt(Import(Write("scene.ma", "//Maya AS")), HOST_ERR_FILE_SHORT_READ);
  EXPECT_EQ(CallsNamed("NewMemHandle"), 0u);
  EXPECT_EQ(host_->callCount("FileName"), 1);
  ExpectNothingBuilt(Import(Write("scene.ma", "")), HOST_ERR_FILE_SHORT_READ);
}

TEST_F(ImportTest, WhatCannotBeOpenedIsAnOpenError) {
  ExpectNothingBuilt(Import(folder() / "missing.ma"), HOST_ERR_FILE_OPEN);
  ExpectNothingBuilt(Import(folder()), HOST_ERR_FILE_OPEN);
  const auto fifo = folder() / "fifo.ma";
  ASSERT_EQ(mkfifo(fifo.c_str(), 0600), 0);
  ExpectNothingBuilt(Import(fifo), HOST_ERR_FILE_OPEN);
}

TEST_F(ImportTest, ALexicalErrorIsShownAndReturnedAndNothingIsBuilt) {
  const refhost::CallbackResult reading = Import(Write("scene.ma", std::string(kScene) + "{"));
  EXPECT_EQ(reading.code, 1289985);
  EXPECT_THAT(reading.messages, ElementsAre("Error reading Maya file."));
  EXPECT_THAT(CompositionNames(reading), IsEmpty());
  EXPECT_EQ(CallsNamed("UnlockMemHandle"), 1u);
  EXPECT_EQ(CallsNamed("FreeMemHandle"), 1u);
  ExpectSound(reading);

  const refhost::CallbackResult end = Import(Write("scene.ma", std::string(kScene) + "// End"));
  EXPECT_EQ(end.code, 1289986);
  EXPECT_THAT(end.messages, ElementsAre("Unexpected end of maya file."));
  ExpectSound(end);
}

TEST_F(ImportTest, TheTextEndsWhereTheFileEnds) {
  // An embedded NUL in a word is part of it; the file's own end is the end.
  const std::string text = "//Maya ASCII\nab" + std::string(1, '\0') + "cd;\ncreateNode camera -n \"c\";\n";
  EXPECT_EQ(CompositionNames(Import(Write("scene.ma", text))).size(), 2u);
  EXPECT_EQ(Import(Write("scene.ma", "//Maya ASCII\nword")).code, 1289986);
}

TEST_F(ImportTest, AMissingSuiteIsThirteen) {
  for (const refhost::RefusedSuite& suite :
       {refhost::RefusedSuite{"QZGP Memory Suite", 1}, refhost::RefusedSuite{"QZGP Comp Suite", 21},
        refhost::RefusedSuite{"QZGP Comp Suite", 9}, refhost::RefusedSuite{"QZGP Layer Suite", 10},
        refhost::RefusedSuite{"QZGP Camera Suite", 2}, refhost::RefusedSuite{"QZGP Stream Suite", 7},
        refhost::RefusedSuite{"QZGP Stream Suite", 8}, refhost::RefusedSuite{"QZGP Keyframe Suite", 3},
        refhost::RefusedSuite{"QZGP Keyframe Suite", 4}}) {
    SCOPED_TRACE(suite.name + std::to_string(suite.version));
    refhost::HostOptions options;
    options.refusedSuites = {suite};
    options.during = refhost::Callback::Import;
    Load(options);
    const refhost::CallbackResult result = host_->importScene(Write("scene.ma", kScene));
    EXPECT_EQ(result.code, 13);
    ExpectSound(result);
  }
}

TEST_F(ImportTest, ASecondImportKnowsNothingOfAFailedOne) {
  Load();
  EXPECT_EQ(host_->importScene(Write("bad.ma", std::string(kScene) + "{")).code, 1289985);
  const refhost::CallbackResult result = host_->importScene(Write("good.ma", kScene));
  EXPECT_EQ(result.code, 0);
  EXPECT_EQ(CompositionNames(result).size(), 2u);
}

TEST_F(ImportTest, AnEmptyPathCannotBeOpened) { EXPECT_EQ(Import("").code, HOST_ERR_FILE_OPEN); }

TEST_F(ImportTest, ANullPathIsAnEmptyOne) {
  Load();
  VOR_Item* const folder = host_->beginCallback(refhost::Callback::Import, "");
  EXPECT_EQ(ImportFileCallback(nullptr, nullptr, nullptr, folder), HOST_ERR_FILE_OPEN);
  ExpectSound(host_->endCallback(HOST_ERR_FILE_OPEN));
}

}  // namespace
}  // namespace testsupport
