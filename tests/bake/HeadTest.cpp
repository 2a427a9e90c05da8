#include "bake/Head.h"

#include <gtest/gtest.h>

#include <string>
#include <string_view>

#include "motion/Camera.h"

namespace {

struct Read {
  explicit Read(std::string_view scene)
      : text(scene), diagnostics(text), head(bake::ReadHead(scene::Read(text, diagnostics), &diagnostics)) {}

  std::string text;
  diag::Collector diagnostics;
  bake::Head head;
};

TEST(Head, UnitsThatAreSetStay) {
  const Read read("currentUnit -l inch -a radian -t 23.976fps;\n");
  EXPECT_EQ(read.head.linearUnit, "inch");
  EXPECT_EQ(read.head.timeUnit, "23.976fps");
  EXPECT_EQ(read.head.unitsPerFrame, 1.0);
}

TEST(Head, UnitsThatAreNotSetHaveDefaults) {
  const Read read("");
  EXPECT_EQ(read.head.linearUnit, "centimeter");
  EXPECT_EQ(read.head.timeUnit, "film");
}

TEST(Head, AWordThatIsNoUnitHasTheDefault) {
  const Read read("currentUnit -l furlong -t weekly;\n");
  EXPECT_EQ(read.head.linearUnit, "centimeter");
  EXPECT_EQ(read.head.timeUnit, "film");
}

TEST(Head, TheGameRateIsWrittenAsANumber) {
  EXPECT_EQ(Read("currentUnit -t game;\n").head.timeUnit, "15fps");
}

TEST(Head, AClockUnitBecomesFilmWithAWarning) {
  struct Case {
    const char* word;
    double unitsPerFrame;
  };
  for (const Case& one : {Case{"sec", 1.0 / 24.0}, Case{"min", 1.0 / 1440.0}, Case{"hour", 1.0 / 86400.0},
                          Case{"millisec", 1000.0 / 24.0}}) {
    const Read read("currentUnit -t " + std::string(one.word) + ";\n");
    EXPECT_EQ(read.head.timeUnit, "film") << one.word;
    EXPECT_DOUBLE_EQ(read.head.unitsPerFrame, one.unitsPerFrame) << one.word;
    EXPECT_EQ(read.diagnostics.CountOf(diag::Code::ClockTimeUnit), 1u) << one.word;
  }
}

TEST(Head, TheResolutionIsReadAndDefaultsHoldWhereItIsNotSet) {
  const Read said(
      "select -ne :defaultResolution;\n\tsetAttr \".w\" 720.9;\n\tsetAttr \".h\" 486;\n"
      "\tsetAttr \".dar\" 1.333;\n\tsetAttr \".pa\" 0.5;\n");
  EXPECT_EQ(said.head.picture.width, 720);
  EXPECT_EQ(said.head.picture.height, 486);
  EXPECT_DOUBLE_EQ(motion::PixelAspect(said.head.picture), 1.333 * 486 / 720);
  const Read silent("");
  EXPECT_EQ(silent.head.picture.width, 960);
  EXPECT_EQ(silent.head.picture.height, 540);
  EXPECT_EQ(motion::PixelAspect(silent.head.picture), 1);
}

TEST(Head, AResolutionThatIsNotPositiveHasTheDefault) {
  const Read read(
      "select -ne :defaultResolution;\n\tsetAttr \".w\" 0;\n\tsetAttr \".h\" -3;\n\tsetAttr \".dar\" no;\n");
  EXPECT_EQ(read.head.picture.width, 960);
  EXPECT_EQ(read.head.picture.height, 540);
  EXPECT_EQ(read.head.picture.deviceAspect, 1.7777777);
}

TEST(Head, ASceneOfAnEarlierVersionHasItsResolution) {
  const Read read("requires maya \"2012\";\n");
  EXPECT_EQ(read.head.picture.width, 640);
  EXPECT_EQ(read.head.picture.height, 480);
  EXPECT_EQ(read.head.picture.deviceAspect, 1.3333333);
}

TEST(Head, WhatPlaysIsCountedInFramesOfTheBake) {
  const std::string script =
      "createNode script -n \"sceneConfigurationScriptNode\";\n\tsetAttr \".b\" -type \"string\" "
      "\"playbackOptions -min ";
  const Read read("currentUnit -t sec;\n" + script + "0.5 -max 2 \";\n");
  ASSERT_TRUE(read.head.playback.has_value());
  EXPECT_DOUBLE_EQ(read.head.playback->first, 12);
  EXPECT_DOUBLE_EQ(read.head.playback->last, 48);
  EXPECT_FALSE(Read(script + "2 -max 1 \";\n").head.playback.has_value());
}

}  // namespace
