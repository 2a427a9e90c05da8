// mayascene export, from outside.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "tests/tools/ToolRun.h"

namespace {

using mayascene_test::ToolTest;
using testing::AllOf;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::Not;
using testing::StartsWith;

// A camera under a boom in the unit, keyed from frame 11 on.
std::string rig(const std::string& unit) {
  return "//Maya ASCII 2023 scene\ncurrentUnit -l " + unit +
         " -a degree -t film;\nselect -ne :defaultResolution;\n\tsetAttr \".w\" 640;\n\tsetAttr \".h\" 360;\n"
         "\tsetAttr \".pa\" 1;\ncreateNode transform -n \"boom\";\n\tsetAttr \".t\" -type \"double3\" 0 2 "
         "0;\n"
         "createNode transform -n \"cam\" -p \"boom\";\ncreateNode camera -n \"camShape\" -p \"cam\";\n"
         "createNode animCurveTL -n \"c1\";\n\tsetAttr \".tan\" 2;\n\tsetAttr -s 3 \".ktv[0:2]\" 11 0 12 1 "
         "13 4;\n"
         "connectAttr \"c1.o\" \"cam.tz\";\n"
         "createNode animCurveTA -n \"c2\";\n\tsetAttr \".tan\" 2;\n\tsetAttr -s 3 \".ktv[0:2]\" 11 0 12 -10 "
         "13 -20;\n"
         "connectAttr \"c2.o\" \"cam.rx\";\n";
}

class ExportCommandTest : public ToolTest {
 protected:
  // The columns frame, tx … rz of the camera's row of a frame in a written table.
  std::string rowOf(const std::string& file, const std::string& frame) {
    const std::string text = '\n' + read(file);
    const std::size_t at = text.find("\ncamShape," + frame + ',');
    if (at == std::string::npos) return "none in " + text;
    std::size_t end = at;
    for (int commas = 0; commas < 9; ++commas) end = text.find(',', end + 1);
    return text.substr(at + 10, end - at - 10);
  }
};

TEST_F(ExportCommandTest, FramesAndLengthsAreTheScenesOwn) {
  for (const char* unit : {"cm", "m", "km", "in", "ft", "mm"}) {
    write("shot.ma", rig(unit));
    for (const char* converted : {"0", "1"}) {
      const auto result =
          run({"export", "shot.ma", "-o", "shot.csv", "--linear-units", converted, "--quiet"});
      EXPECT_EQ(result.status, 0) << result.err;
      EXPECT_EQ(result.err, "");
      EXPECT_EQ(rowOf("shot.csv", "11"), "11,0.4583333333333333,0,0,0,0,0,0");
      const std::string row = rowOf("shot.csv", "13");
      ASSERT_THAT(row, StartsWith("13,0.5416666666666666,0,0,")) << unit << converted;
      EXPECT_NEAR(std::stod(row.substr(26)), 4.0, 1e-14) << unit << converted;
    }
  }
}

TEST_F(ExportCommandTest, RotationsAreTheScenesOwn) {
  write("shot.ma", rig("cm"));
  EXPECT_EQ(run({"export", "shot.ma", "-o", "shot.csv", "--quiet"}).status, 0);
  EXPECT_EQ(rowOf("shot.csv", "12"), "12,0.5,0,0,1,-10,0,0");
}

TEST_F(ExportCommandTest, HostAxesAndScaleTurnAndStretchPlaces) {
  write("shot.ma", rig("cm"));
  EXPECT_EQ(run({"export", "shot.ma", "-o", "shot.csv", "--axes", "host", "--scale", "10", "--quiet"}).status,
            0);
  EXPECT_EQ(rowOf("shot.csv", "13"), "13,0.5416666666666666,0,0,-40,-20,0,0");
}

TEST_F(ExportCommandTest, FramesAreChosenInTheScenesNumbers) {
  write("shot.ma", rig("cm"));
  EXPECT_EQ(run({"export", "shot.ma", "-o", "shot.csv", "--frames", "12:14", "--quiet"}).status, 0);
  EXPECT_THAT(rowOf("shot.csv", "11"), HasSubstr("none"));
  EXPECT_EQ(rowOf("shot.csv", "12"), "12,0.5,0,0,1,-10,0,0");
  EXPECT_EQ(rowOf("shot.csv", "14"), "14,0.5833333333333334,0,0,4,-20,0,0");
}

TEST_F(ExportCommandTest, ABakeIsExportedFromItsFirstToItsLastFrame) {
  write("shot.ma", rig("cm"));
  const auto result = run({"export", "--bake", "--frames", "10:15", "shot.ma", "-o", "shot.csv"});
  EXPECT_EQ(result.status, 0) << result.err;
  EXPECT_THAT(result.err, HasSubstr("shot.ma: written to shot.csv"));
  EXPECT_THAT(rowOf("shot.csv", "10"), StartsWith("10,0.4166666666666667,0,0,0,"));
  EXPECT_THAT(rowOf("shot.csv", "15"), HasSubstr(",0,0,4,-20,0,0"));
}

TEST_F(ExportCommandTest, FramesWithoutKeysAreNamed) {
  write("shot.ma", rig("cm"));
  const auto said = [this](const char* frames, const char* option) {
    return run({"export", "shot.ma", "-o", "shot.csv", "--frames", frames, option}).err;
  };
  const auto before =
      HasSubstr("note: frames 5 to 10 hold the values of the first key, which is on frame 11");
  const auto after = HasSubstr("note: frame 14 holds the values of the last key, which is on frame 13");
  EXPECT_THAT(said("5:14", "--strict"), AllOf(before, after));
  EXPECT_THAT(said("11:13", "--strict"), Not(HasSubstr("MA1124")));
  EXPECT_THAT(said("11:13.5", "--strict"), Not(HasSubstr("MA1124")));
  EXPECT_THAT(said("5:14", "--bake"), Not(HasSubstr("MA1124")));
  EXPECT_THAT(said("5:14", "--keys"), Not(HasSubstr("MA1124")));
  EXPECT_THAT(said("20:22.5", "--strict"), HasSubstr("frames 20 to 22 hold the values of the last key"));
  EXPECT_THAT(said("2:4", "--strict"),
              AllOf(HasSubstr("frames 2 to 4 hold the values of the first key"), Not(HasSubstr("last key"))));
}

TEST_F(ExportCommandTest, AListWithoutKeysIsAWarning) {
  write("shot.ma", rig("cm"));
  const auto none = run({"export", "shot.ma", "-o", "k.csv", "--keys", "--frames", "14:20"});
  EXPECT_EQ(none.status, 0);
  EXPECT_THAT(none.err, HasSubstr("warning: camShape: none of its keys lies in the frames 14 to 20, so the "
                                  "list has none [MA1117]"));
  EXPECT_EQ(run({"export", "shot.ma", "-o", "k.csv", "--keys", "--frames", "14:20", "--strict"}).status, 1);
  const auto one = run({"export", "shot.ma", "-o", "k.csv", "--keys", "--frames", "13:20", "--strict"});
  EXPECT_EQ(one.status, 0) << one.err;
  write("still.ma", mayascene_test::sceneText(mayascene_test::stillCamera()));
  const auto still = run({"export", "still.ma", "-o", "k.csv", "--keys", "--strict"});
  EXPECT_EQ(still.status, 1);
  EXPECT_THAT(still.err, HasSubstr("warning: no layer has keys: the list is empty [MA1118]"));
}

TEST_F(ExportCommandTest, SecondsAreTheSameInEveryFormat) {
  write("shot.ma", rig("cm"));
  for (const char* format : {"x.csv", "x.gltf", "x.usda"}) {
    EXPECT_EQ(run({"export", "shot.ma", "-o", format, "--quiet"}).status, 0);
  }
  EXPECT_THAT(rowOf("x.csv", "11"), StartsWith("11,0.4583333333333333,"));
  EXPECT_THAT(rowOf("x.csv", "13"), StartsWith("13,0.5416666666666666,"));
  EXPECT_THAT(read("x.gltf"), HasSubstr("\"firstSeconds\": 0.4583333333333333"));
  EXPECT_THAT(read("x.gltf"), HasSubstr("\"max\": [0.5416666"));
  EXPECT_THAT(read("x.usda"),
              AllOf(HasSubstr("startTimeCode = 11\n"), HasSubstr("timeCodesPerSecond = 24\n")));
}

TEST_F(ExportCommandTest, StandardOutputTakesOneFileWhole) {
  write("shot.ma", rig("cm"));
  for (const std::string format : {"glb", "usda", "csv", "chan"}) {
    EXPECT_EQ(run({"export", "shot.ma", "-o", "file." + format, "--quiet"}).status, 0);
    const auto result = run({"export", "shot.ma", "-f", format, "-o", "-"});
    EXPECT_EQ(result.status, 0) << result.err;
    EXPECT_EQ(result.out, read("file." + format)) << format;
    EXPECT_THAT(result.err, HasSubstr("shot.ma: written to standard output\n"));
  }
  const auto two = run({"export", "shot.ma", "-f", "gltf", "-o", "-"});
  EXPECT_EQ(two.status, 2);
  EXPECT_THAT(two.err, HasSubstr("gltf is several files, and standard output takes one: use glb"));
  std::string pair = rig("cm");
  pair += "createNode transform -n \"eye\";\ncreateNode camera -n \"eyeShape\" -p \"eye\";\n";
  write("pair.ma", pair);
  const auto cameras = run({"export", "pair.ma", "-f", "chan", "-o", "-"});
  EXPECT_EQ(cameras.status, 5);
  EXPECT_EQ(cameras.out, "");
  EXPECT_THAT(cameras.err, HasSubstr("standard output cannot take the several files"));
  const auto scenes = run({"export", "shot.ma", "pair.ma", "-f", "csv", "-o", "-"});
  EXPECT_EQ(scenes.status, 2);
  EXPECT_THAT(scenes.err,
              HasSubstr("standard output cannot take the outputs of several scenes: name a folder"));
}

TEST_F(ExportCommandTest, KeysAreListedAsTheyAre) {
  write("shot.ma", rig("cm"));
  EXPECT_EQ(run({"export", "shot.ma", "-o", "shot.csv", "--keys", "--quiet"}).status, 0);
  EXPECT_THAT(read("shot.csv"), HasSubstr("\ncamShape,position,13,0.5416666666666666,0,0,4,"));
  EXPECT_THAT(read("shot.csv"), HasSubstr("\ncamShape,xRotation,12,0.5,-10,,,"));
}

TEST_F(ExportCommandTest, AChanFileHasTheCamerasPlaceInTheWorld) {
  write("shot.ma", rig("cm"));
  const auto result = run({"export", "shot.ma", "-o", "shot.chan"});
  EXPECT_EQ(result.status, 0) << result.err;
  EXPECT_THAT(read("shot.chan"), StartsWith("11\t0\t2\t0\t0\t0\t0\t"));
  EXPECT_THAT(result.err, HasSubstr("rotation order XYZ"));
}

TEST_F(ExportCommandTest, SeveralScenesGoIntoAFolderUnderTheirNames) {
  std::filesystem::create_directories(path("a"));
  write("shot.ma", rig("cm"));
  write("a/SHOT.ma", rig("cm"));
  EXPECT_EQ(run({"export", "-f", "csv", "shot.ma", "a/SHOT.ma", "-o", "out", "--quiet"}).status, 0);
  EXPECT_TRUE(std::filesystem::exists(path("out/shot.csv")));
  EXPECT_TRUE(std::filesystem::exists(path("out/SHOT_2.csv")));
}

TEST_F(ExportCommandTest, WhatDoesNotGoTogetherIsWrongUsage) {
  write("shot.ma", rig("cm"));
  const std::vector<std::vector<std::string>> wrong = {{"-o", "shot"},
                                                       {"-o", "shot.ma", "-f", "csv"},
                                                       {"-o", "x.csv", "--step", "2"},
                                                       {"-o", "x.csv", "--scale", "0"},
                                                       {"-o", "x.chan", "--axes", "host"},
                                                       {"-o", "x.chan", "--keys"},
                                                       {"-o", "x.csv", "-f", "fbx"},
                                                       {"-o", "x.ma", "-f", "csv"},
                                                       {"-o", "x.MB", "-f", "csv"},
                                                       {"-o", "x.gltf", "-f", "csv"},
                                                       {"-o", "x.GLB", "-f", "gltf"},
                                                       {"-o", "x.csv", "--frames", "5:1"}};
  for (std::vector<std::string> words : wrong) {
    words.insert(words.begin(), {"export", "shot.ma"});
    EXPECT_EQ(run(words).status, 2) << words[3];
  }
  EXPECT_THAT(files(), ElementsAre("shot.ma"));
}

TEST_F(ExportCommandTest, EveryFormatTakesTheAxesOfTheScene) {
  write("shot.ma", rig("cm"));
  for (const std::string format : {"gltf", "glb", "usda", "chan", "csv"}) {
    const auto plain = run({"export", "shot.ma", "-o", "plain." + format, "--quiet"});
    const auto said = run({"export", "shot.ma", "-o", "said." + format, "--axes", "scene", "--quiet"});
    EXPECT_EQ(plain.status, 0) << plain.err;
    EXPECT_EQ(said.status, 0) << said.err;
    if (format == "gltf") continue;  // it names the file of its data
    EXPECT_EQ(read("plain." + format), read("said." + format));
  }
}

TEST_F(ExportCommandTest, AFolderMayHaveAnyNameAndASuffixMayHaveCapitals) {
  write("shot.ma", rig("cm"));
  std::filesystem::create_directories(path("takes.ma"));
  EXPECT_EQ(run({"export", "-f", "csv", "shot.ma", "-o", "takes.ma", "--quiet"}).status, 0);
  EXPECT_TRUE(std::filesystem::exists(path("takes.ma/shot.csv")));
  EXPECT_EQ(run({"export", "-f", "csv", "shot.ma", "-o", "x.CSV", "--quiet"}).status, 0);
}

TEST_F(ExportCommandTest, AReportAndAFurtherOutputAreNeverOneFileHoweverTheyAreNamed) {
  write("shot.ma", rig("cm"));
  std::filesystem::create_directories(path("real"));
  std::filesystem::create_directory_symlink("real", path("link"));
  for (const std::string& report : {path("r.bin").string(), std::string("real/../r.bin")}) {
    const auto result = run({"export", "--bake", "--report", report, "shot.ma", "-o", "r.gltf"});
    EXPECT_EQ(result.status, 5) << result.err;
    EXPECT_THAT(result.err, HasSubstr("r.bin is a scene or the report"));
    EXPECT_FALSE(std::filesystem::exists(path("r.gltf")));
  }
  const auto linked = run({"export", "--bake", "--report", "link/r.bin", "shot.ma", "-o", "real/r.gltf"});
  EXPECT_EQ(linked.status, 5) << linked.err;
  EXPECT_FALSE(std::filesystem::exists(path("real/r.gltf")));
}

TEST_F(ExportCommandTest, TheDataOfTwoOutputsAreTwoFilesWhateverTheirLetters) {
  write("shot.ma", rig("cm"));
  const std::string one = "\xe5\xa0\xb4\xe4\xb8\x80", two = "\xe5\xa0\xb4\xe4\xba\x8c";
  for (const std::string& name : {one, two}) {
    EXPECT_EQ(run({"export", "shot.ma", "-o", name + ".gltf", "--quiet"}).status, 0);
  }
  EXPECT_THAT(files(), ElementsAre("shot.ma", one + ".bin", one + ".gltf", two + ".bin", two + ".gltf"));
}

TEST_F(ExportCommandTest, WhereOneOutputCannotBeWrittenNoneAppears) {
  write("shot.ma", rig("cm"));
  std::filesystem::create_symlink("/dev/full", path("full.gltf"));
  const auto result = run({"export", "shot.ma", "-o", "full.gltf"});
  EXPECT_EQ(result.status, 5) << result.err;
  EXPECT_THAT(files(), ElementsAre("full.gltf", "shot.ma"));
}

TEST_F(ExportCommandTest, FilmOffsetAndSqueezeAreThoseOfTheSceneAndNoneIsGivenTwice) {
  std::string scene = rig("cm");
  scene.insert(scene.find("createNode animCurveTL"),
               "\tsetAttr \".hfo\" 0.25;\n\tsetAttr \".vfo\" -0.125;\n\tsetAttr \".lsr\" 1.5;\n");
  write("shot.ma", scene);
  EXPECT_EQ(run({"export", "shot.ma", "-o", "shot.usda", "--quiet"}).status, 0);
  EXPECT_THAT(read("shot.usda"), HasSubstr("float horizontalApertureOffset = 6.35\n"));
  EXPECT_THAT(read("shot.usda"), HasSubstr("float verticalApertureOffset = -3.175\n"));
  EXPECT_THAT(read("shot.usda"), HasSubstr("custom double squeeze = 1.5\n"));
  EXPECT_EQ(run({"export", "--bake", "shot.ma", "-o", "baked.usda", "--quiet"}).status, 0);
  EXPECT_THAT(read("baked.usda"), HasSubstr("float horizontalApertureOffset = 6.35\n"));
  EXPECT_THAT(read("baked.usda"), HasSubstr("float verticalApertureOffset = -3.175\n"));
  EXPECT_THAT(read("baked.usda"), Not(HasSubstr("squeeze")));
}

TEST_F(ExportCommandTest, AFilmOffsetThatMovesIsNotKnown) {
  std::string scene = rig("cm");
  scene.insert(scene.find("createNode animCurveTL"), "\tsetAttr \".hfo\" 0.25;\n");
  write("shot.ma", scene + "connectAttr \"c1.o\" \"camShape.vfo\";\n");
  EXPECT_EQ(run({"export", "shot.ma", "-o", "shot.usda", "--quiet"}).status, 0);
  EXPECT_THAT(read("shot.usda"), Not(HasSubstr("ApertureOffset")));
}

TEST_F(ExportCommandTest, WhatCannotBeExportedLeavesNoFile) {
  write("empty.ma", "//Maya ASCII 2023 scene\ncreateNode transform -n \"rig\";\n");
  write("notes.ma", "just some notes\n");
  write("persp.ma", mayascene_test::sceneText("createNode camera -n \"perspShape\";\n"));
  EXPECT_EQ(run({"export", "empty.ma", "-o", "x.csv"}).status, 1);
  EXPECT_EQ(run({"export", "notes.ma", "-o", "x.csv"}).status, 1);
  const auto still = run({"export", "persp.ma", "-o", "x.csv"});
  EXPECT_EQ(still.status, 1);
  EXPECT_THAT(still.err, HasSubstr("persp.ma: nothing is written: it has no camera and no null\n"));
  EXPECT_EQ(run({"export", "missing.ma", "-o", "x.csv"}).status, 3);
  EXPECT_EQ(run({"export", "empty.ma", "-o", "no/such/x.csv"}).status, 1);
  EXPECT_THAT(files(), ElementsAre("empty.ma", "notes.ma", "persp.ma"));
}

TEST_F(ExportCommandTest, ManyFramesAreWrittenOnlyWhereTheyAreAskedFor) {
  std::string scene = rig("cm");
  scene.replace(scene.find("13 4"), 4, "900000 4");
  scene.replace(scene.find("13 -20"), 6, "900000 -20");
  write("long.ma", scene);
  const auto result = run({"export", "long.ma", "-o", "long.csv"});
  EXPECT_EQ(result.status, 1);
  EXPECT_THAT(result.err, HasSubstr("MA1106"));
  EXPECT_EQ(run({"export", "long.ma", "-o", "long.csv", "--frames", "11:12", "--quiet"}).status, 0);
  EXPECT_EQ(run({"export", "long.ma", "-o", "long.csv", "--keys", "--quiet"}).status, 0);
}

TEST_F(ExportCommandTest, KeysBetweenFramesAreAWarning) {
  write("shot.ma", rig("cm"));
  const std::vector<std::string> words = {"export", "--bake", "--step", "0.5", "shot.ma", "-o", "shot.csv"};
  const auto result = run(words);
  EXPECT_EQ(result.status, 0);
  EXPECT_THAT(result.err, HasSubstr("MA1107"));
  std::vector<std::string> strict = words;
  strict.emplace_back("--strict");
  EXPECT_EQ(run(strict).status, 1);
}

TEST_F(ExportCommandTest, KeysBetweenFramesThatWereNotAskedForAreNoWarning) {
  std::string scene = rig("cm");
  for (const char* last : {" 13 4", " 13 -20"}) {
    scene.replace(scene.find("-s 3 \".ktv[0:2]\""), 16, "-s 4 \".ktv[0:3]\"");
    scene.insert(scene.find(last) + std::string(last).size(), " 20.25 5");
  }
  write("shot.ma", scene);
  const auto some = run({"export", "shot.ma", "-o", "shot.csv", "--frames", "11:13", "--strict"});
  EXPECT_EQ(some.status, 0);
  EXPECT_THAT(some.err, Not(HasSubstr("MA1107")));
  // The last frame that is written is 20, and the key lies in what was asked for.
  const auto more = run({"export", "shot.ma", "-o", "shot.csv", "--frames", "11:20.5", "--strict"});
  EXPECT_EQ(more.status, 1);
  EXPECT_THAT(more.err, HasSubstr("MA1107"));
}

}  // namespace
