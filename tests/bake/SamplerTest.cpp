#include "bake/Sampler.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>

#include "bake/Chains.h"
#include "tests/bake/BakeFixture.h"

namespace {

using bake::Link;
using bake_test::CurveOf;
using testing::DoubleNear;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::SizeIs;

constexpr std::size_t kFrames = 3;

struct Read {
  explicit Read(std::string lines)
      : text(std::move(lines)),
        ignored(text),
        scene(scene::Read(text, ignored)),
        evaluator(this->scene, &ignored) {}

  scene::NodeId At(std::string_view name) const { return scene.Find(name); }

  std::string text;
  diag::Collector ignored;
  scene::Scene scene;
  motion::Evaluator evaluator;
  bake::Sampler sampler{&evaluator, motion::Picture{}, 1.0};
};

const bake::FrameRange kRange{1.0, 1.0, kFrames};

TEST(Sampler, OnlyWhatMovesHasAValueForEachFrame) {
  Read read("createNode transform -n \"a\";\n\tsetAttr \".ty\" 5;\n" +
            CurveOf("animCurveTL", "c", "1 1 3 2", "a.tx"));
  const std::size_t track = read.sampler.AddLocal(read.At("a"));
  const std::size_t world = read.sampler.AddWorld(read.At("a"), true);
  read.sampler.Run(kRange);
  EXPECT_THAT(read.sampler.track(track).channels[bake::kTranslateX].values, ElementsAre(1, 1.5, 2));
  EXPECT_THAT(read.sampler.track(track).channels[bake::kTranslateY].values, ElementsAre(5));
  EXPECT_THAT(read.sampler.track(world).channels[bake::kTranslateX].values, ElementsAre(1, 1.5, 2));
  EXPECT_THAT(read.sampler.track(world).channels[bake::kScaleX].values, ElementsAre(1));
}

TEST(Sampler, AVeryLongRangeOfWhatStandsStillTakesOneValue) {
  Read read("createNode transform -n \"a\";\n\tsetAttr \".ro\" 2;\ncreateNode camera -n \"b\";\n");
  const std::size_t track = read.sampler.AddLocal(read.At("a"));
  const std::size_t lens = read.sampler.AddLens(read.At("b"));
  read.sampler.Run({1.0, 1.0, 1'000'000});
  for (const bake::Channel& channel : read.sampler.track(track).channels) {
    EXPECT_THAT(channel.values, SizeIs(1));
  }
  EXPECT_THAT(read.sampler.lens(lens).focalLength.values, ElementsAre(35));
}

TEST(Sampler, AMatrixThatIsNotFiniteIsNoticed) {
  Read read(
      "createNode transform -n \"a\";\n\tsetAttr \".tx\" 1e308;\ncreateNode transform -n \"b\" -p "
      "\"a\";\n\tsetAttr \".tx\" 1e308;\n");
  const std::size_t local = read.sampler.AddLocal(read.At("b"));
  const std::size_t world = read.sampler.AddWorld(read.At("b"), true);
  read.sampler.Run(kRange);
  EXPECT_TRUE(read.sampler.track(local).finite);
  EXPECT_FALSE(read.sampler.track(world).finite);
}

TEST(Chains, ALinkComesAfterThoseAboveItAndEachOnce) {
  Read read(
      "createNode transform -n \"top\";\ncreateNode transform -n \"left\" -p \"top\";\n"
      "createNode transform -n \"right\" -p \"top\";\n");
  bake::Chains chains(read.scene);
  EXPECT_EQ(chains.Add(read.At("left")), 1u);
  EXPECT_EQ(chains.Add(read.At("right")), 2u);
  EXPECT_EQ(chains.Add(read.At("left")), 1u);
  EXPECT_EQ(chains.Add(scene::kNoNode), Link::kNone);
  EXPECT_EQ(chains.links()[0].node, read.At("top"));
  EXPECT_EQ(chains.links()[2].above, 0u);
}

constexpr char kHeld[] =
    "createNode transform -n \"held\";\ncreateNode transform -n \"target\";\n"
    "createNode orientConstraint -n \"hold\" -p \"held\";\nconnectAttr \"target.r\" \"hold.tg[0].tr\";\n"
    "connectAttr \"hold.cr\" \"held.r\";\n";

TEST(Sampler, TheAnglesOfAConstraintGoOnPastHalfATurn) {
  Read read(kHeld + CurveOf("animCurveTA", "c", "1 170 3 190", "target.rz"));
  const std::size_t track = read.sampler.AddLocal(read.At("held"));
  read.sampler.Run(kRange);
  EXPECT_THAT(read.sampler.track(track).channels[bake::kRotateZ].values,
              ElementsAre(DoubleNear(170, 1e-12), DoubleNear(180, 1e-12), DoubleNear(190, 1e-12)));
}

TEST(Sampler, TheAnglesOfACurveStayHoweverFastItTurns) {
  Read read("createNode transform -n \"a\";\n" + CurveOf("animCurveTA", "c", "1 0 3 1440", "a.rz"));
  const std::size_t track = read.sampler.AddLocal(read.At("a"));
  read.sampler.Run(kRange);
  EXPECT_THAT(read.sampler.track(track).channels[bake::kRotateZ].values,
              ElementsAre(0, DoubleNear(720, 1e-9), 1440));
}

TEST(Chains, WhatHoldsAboveHoldsBelow) {
  Read read(
      "createNode transform -n \"large\";\n\tsetAttr \".sx\" 2;\ncreateNode transform -n \"a\" -p "
      "\"large\";\n"
      "createNode transform -n \"sheared\";\n\tsetAttr \".sh\" -type \"double3\" 1 0 0 ;\n"
      "createNode transform -n \"b\" -p \"sheared\";\n"
      "createNode transform -n \"moving\";\ncreateNode transform -n \"c\" -p \"moving\";\n"
      "createNode expression -n \"e\";\nconnectAttr \"e.out[0]\" \"moving.ty\";\n"
      "createNode transform -n \"d\" -p \"hero:root\";\n" +
      CurveOf("animCurveTL", "k", "1 1 3 2", "moving.tx"));
  bake::Chains chains(read.scene);
  const std::uint32_t a = chains.Add(read.At("a"));
  const std::uint32_t b = chains.Add(read.At("b"));
  const std::uint32_t c = chains.Add(read.At("c"));
  const std::uint32_t d = chains.Add(read.At("d"));
  chains.AskFor(&read.sampler);
  read.sampler.Run(kRange);
  chains.Judge(&read.sampler, motion::KeptBelow(read.evaluator));
  EXPECT_FALSE(chains.link(a).unscaled);
  EXPECT_TRUE(chains.link(a).square);
  EXPECT_FALSE(chains.link(b).square);
  EXPECT_TRUE(chains.link(c).moves);
  EXPECT_FALSE(chains.link(a).moves);
  EXPECT_TRUE(chains.link(d).cutOff);
  EXPECT_FALSE(chains.link(c).cutOff);
  EXPECT_THAT(chains.link(c).kept, SizeIs(1));
  EXPECT_THAT(chains.link(d).kept, IsEmpty());
}

}  // namespace
