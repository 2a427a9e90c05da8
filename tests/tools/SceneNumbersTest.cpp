// The scene's own numbers beside its compositions in JSON.
#include <gtest/gtest.h>

#include <nlohmann/json.hpp>
#include <string>

#include "tests/tools/ToolRun.h"

namespace {

using mayascene_test::ToolTest;
using nlohmann::json;

std::string curve(const std::string& plug, const std::string& keys, int count) {
  const std::string name = "curve_" + plug.substr(0, plug.find('.'));
  return "createNode animCurveTL -n \"" + name + "\";\n\tsetAttr -s " + std::to_string(count) +
         " \".ktv[0:" + std::to_string(count - 1) + "]\" " + keys + ";\nconnectAttr \"" + name + ".o\" \"" +
         plug + "\";\n";
}

// A camera under a boom, and a light that no import takes.
std::string rig(const std::string& units) {
  return "//Maya ASCII 2023 scene\n" + units +
         "createNode transform -n \"boom\";\ncreateNode transform -n \"cam\" -p \"boom\";\n"
         "createNode camera -n \"camShape\" -p \"cam\";\ncreateNode transform -n \"light\";\n";
}

class SceneNumbersTest : public ToolTest {
 protected:
  json numbersOf(const std::string& scene, const std::vector<std::string>& options = {}) {
    write("rig.ma", scene);
    std::vector<std::string> words = {"import", "--quiet", "--json", "-", "rig.ma"};
    words.insert(words.end(), options.begin(), options.end());
    json found = json::object();
    const json document = json::parse(run(words).out)["scenes"][0];
    for (const char* member : {"firstFrame", "lastFrame", "linearUnit"}) {
      if (document.contains(member)) found[member] = document[member];
    }
    return found;
  }
};

TEST_F(SceneNumbersTest, TheSmallestFirstKeyOfWhatCameOverIsTimeZero) {
  const std::string scene = rig("currentUnit -l meter -a degree -t pal;\n") +
                            curve("light.tx", "-50 0 2 7.5", 2) + curve("boom.tx", "101 0 103.5 7.5", 2) +
                            curve("cam.ty", "120 1 121 2 122 3", 3);
  EXPECT_EQ(numbersOf(scene),
            json::parse(R"({"firstFrame": 101, "lastFrame": 103.5, "linearUnit": "meter"})"));
}

TEST_F(SceneNumbersTest, ABakeBeginsAtItsOwnFirstFrame) {
  const std::string scene =
      rig("currentUnit -l in -a degree -t film;\n") + curve("boom.tx", "11 0 14 7.5", 2);
  EXPECT_EQ(numbersOf(scene, {"--bake"}),
            json::parse(R"({"firstFrame": 11, "lastFrame": 14, "linearUnit": "in"})"));
  EXPECT_EQ(numbersOf(scene, {"--bake", "--frames", "3:8", "--step", "0.5"}),
            json::parse(R"({"firstFrame": 3, "lastFrame": 8, "linearUnit": "in"})"));
}

TEST_F(SceneNumbersTest, TimeThatCountsNoFramesBeginsAtItsOwnZero) {
  const std::string scene = rig("currentUnit -l cm -a degree -t sec;\n") + curve("boom.tx", "2 0 3 7.5", 2);
  EXPECT_EQ(numbersOf(scene), json::parse(R"({"firstFrame": 0, "lastFrame": 90, "linearUnit": "cm"})"));
}

TEST_F(SceneNumbersTest, WithoutKeysThereIsTheUnitAlone) {
  EXPECT_EQ(numbersOf(rig("")), json::parse(R"({"linearUnit": "cm"})"));
  EXPECT_EQ(numbersOf(rig("currentUnit -l parsec;\n")), json::parse(R"({"linearUnit": "cm"})"));
}

TEST_F(SceneNumbersTest, ASceneOfWhichNothingIsMadeHasNone) {
  EXPECT_EQ(numbersOf("//Maya ASCII 2023 scene\ncreateNode transform -n \"rig\";\n"), json::object());
  EXPECT_EQ(numbersOf("no scene\n"), json::object());
}

}  // namespace
