// The second reader alone, on scenes whose calls can be counted by hand.
#include "tests/secondreader/SecondReader.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>

#include "hostapi/ErrorCodes.h"

namespace secondreader {
namespace {

using ::testing::Contains;
using ::testing::ElementsAre;
using ::testing::HasSubstr;
using ::testing::IsEmpty;

Prediction predicted(std::string_view scene, std::vector<refhost::Failure> failures = {}) {
  refhost::HostOptions options;
  options.pluginId = 7;
  options.failures = std::move(failures);
  return predict(options, "/folder/shot.ma", scene);
}

refhost::Failure failAt(std::int64_t nth, HostError code) {
  return {"", nth, false, refhost::Failure::Kind::Code, code};
}

std::vector<std::string> textsOf(const Prediction& prediction) {
  std::vector<std::string> texts;
  for (const PredictedLine& line : prediction.trace) texts.push_back(line.text);
  return texts;
}

// The names of the calls of the import, those of the suites' own acquisition and release left out.
std::vector<std::string> importCalls(const Prediction& prediction) {
  const std::vector<std::string> lines = textsOf(prediction);
  const auto isImport = [](const std::string& line) {
    return line.find(R"("enter","callback":"ImportFileCallback")") != std::string::npos;
  };
  std::vector<std::string> names;
  for (auto line = std::find_if(lines.begin(), lines.end(), isImport); line != lines.end(); ++line) {
    const std::size_t begin = line->find(R"(:")") + 2;
    const std::string name = line->substr(begin, line->find('"', begin) - begin);
    if (name == "leave") break;
    if (name != "enter" && name != "AcquireSuite" && name != "ReleaseSuiteByName") names.push_back(name);
  }
  return names;
}

TEST(SecondReaderTest, ACameraAloneGetsItsLensAndNothingElse) {
  const Prediction prediction = predicted(
      "//Maya ASCII\ncreateNode camera -n \"k\";\nselect defaultResolution;\nsetAttr \".w\" 640 \".pa\" "
      "1;\n");
  EXPECT_EQ(prediction.imports.front().code, 0);
  EXPECT_TRUE(prediction.verify.canImport);
  EXPECT_THAT(importCalls(prediction),
              ElementsAre("NewMemHandle", "LockMemHandle", "CreateComp", "NewCameraLayer", "SetLayerFlag",
                          "AcquireLayerStream", "SetStreamValue", "ReleaseStream", "SetCameraFilmSize",
                          "AcquireLayerStream", "SetStreamValue", "ReleaseStream", "UnlockMemHandle",
                          "FreeMemHandle"));
  EXPECT_THAT(textsOf(prediction),
              Contains(HasSubstr(
                  R"("folder":"item:1","name":"shot","width":640,"height":486,"pixelAspect":[1000,1000],)"
                  R"("duration":[29970,2997],"frameRate":[30,1],"comp":"comp:1","error":0})")));
  // Horizontal aperture 1.4173 inches of 72 points; 640 pixels of it seen through 35 millimetres.
  EXPECT_THAT(textsOf(prediction), Contains(HasSubstr(R"("direction":1,"filmSize":102.045)")));
  EXPECT_THAT(textsOf(prediction), Contains(HasSubstr(R"("stream":"stream:2","value":[622.23)")));
}

TEST(SecondReaderTest, WidePixelsMakeASquareCompositionFirst) {
  const Prediction prediction = predicted("//Maya ASCII\ncreateNode camera -n \"perspShape\";\n");
  EXPECT_THAT(importCalls(prediction),
              ElementsAre("NewMemHandle", "LockMemHandle", "CreateComp", "CreateComp", "GetItemFromComp",
                          "AddLayerFromItem", "UnlockMemHandle", "FreeMemHandle"));
  EXPECT_THAT(textsOf(prediction), Contains(HasSubstr(R"("name":"Square shot","width":654,"height":486,)"
                                                      R"("pixelAspect":[1,1])")));
  EXPECT_THAT(textsOf(prediction),
              Contains(HasSubstr(R"("name":"shot","width":720,"height":486,"pixelAspect":[909,1000])")));
}

TEST(SecondReaderTest, ATextThatEndsInACommandIsAnError) {
  const Prediction prediction = predicted("//Maya ASCII\ncreateNode camera -n \"k\"\n");
  EXPECT_EQ(prediction.imports.front().code, HOST_ERR_MAYA_UNEXPECTED_END);
  EXPECT_THAT(prediction.imports.front().messages, ElementsAre("Unexpected end of maya file."));
}

TEST(SecondReaderTest, AFailedCallIsTheCodeOfTheImport) {
  // Memory suite, allocation, lock; the fourth call asks for the first suite of compositions.
  const Prediction prediction =
      predicted("//Maya ASCII\ncreateNode camera -n \"k\";\n", {failAt(4, 99), failAt(5, 98)});
  EXPECT_EQ(prediction.imports.front().code, HOST_ERR_MISSING_SUITE);
  EXPECT_THAT(importCalls(prediction),
              ElementsAre("NewMemHandle", "LockMemHandle", "UnlockMemHandle", "FreeMemHandle"));
}

TEST(SecondReaderTest, AnExceptionOutOfAReleaseEndsTheProcess) {
  refhost::Failure failure = failAt(1, 0);
  failure.operation = "ReleaseSuiteByName";
  failure.kind = refhost::Failure::Kind::BadAlloc;
  EXPECT_TRUE(predicted("//Maya ASCII\n", {failure}).processEnds);
  EXPECT_FALSE(predicted("//Maya ASCII\n").processEnds);
}

TEST(SecondReaderTest, AFileThatIsNoSceneMakesNothing) {
  const Prediction prediction = predicted("no scene at all\n");
  EXPECT_EQ(prediction.imports.front().code, 0);
  EXPECT_FALSE(prediction.verify.canImport);
  EXPECT_THAT(prediction.verify.messages, IsEmpty());
  EXPECT_THAT(prediction.imports.front().messages, ElementsAre("Only Baked Maya Ascii files are supported."));
  EXPECT_THAT(importCalls(prediction), ElementsAre("ShowMessage", "NewMemHandle", "LockMemHandle",
                                                   "UnlockMemHandle", "FreeMemHandle"));
}

}  // namespace
}  // namespace secondreader
