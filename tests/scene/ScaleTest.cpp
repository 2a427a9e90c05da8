// Time grows in proportion to the text, also for texts that are made to be slow.
#include <ctime>
#include <functional>

#include "tests/scene/SceneFixture.h"

namespace scene {
namespace {

constexpr int kMany = 100000;

// What is quadratic takes minutes at this size, what is not well under a second.
constexpr double kMostSeconds = 10.0;

class ScaleTest : public SceneTest {
 protected:
  // The texts for 0, 1, 2 …, one after the other.
  static std::string Repeated(const std::function<std::string(const std::string&)>& text, int times = kMany) {
    std::string all;
    for (int i = 0; i < times; ++i) all += text(std::to_string(i));
    return all;
  }

  void ReadInTime(const std::string& text) {
    const std::clock_t before = std::clock();
    Read(text);
    EXPECT_LT(static_cast<double>(std::clock() - before) / CLOCKS_PER_SEC, kMostSeconds);
  }
};

TEST_F(ScaleTest, AChainOfParents) {
  ReadInTime("createNode transform -n \"n\";\n" + Repeated([](const std::string& i) {
               return "createNode transform -n \"n" + i + "\" -p \"" +
                      (i == "0" ? "n" : "n" + std::to_string(std::stoi(i) - 1)) + "\";\n";
             }));
  EXPECT_EQ(scene_.nodes().size(), std::size_t{kMany} + 1);
  EXPECT_GT(scene_.PathOf(static_cast<NodeId>(kMany)).size(), std::size_t{kMany} * 6);
}

TEST_F(ScaleTest, ACircleOfParents) {
  ReadInTime(Repeated([](const std::string& i) {
    return "createNode transform -n \"n" + i + "\" -p \"n" + std::to_string((std::stoi(i) + 1) % kMany) +
           "\";\n";
  }));
  EXPECT_EQ(collector().CountOf(diag::Code::ParentCircle), 1u);
}

TEST_F(ScaleTest, NodesMovedUnderADeepOne) {
  ReadInTime(Repeated([](const std::string& i) { return "createNode transform -n \"n" + i + "\";\n"; }) +
             Repeated([](const std::string& i) {
               return "parent \"n" + i + "\" \"n" + std::to_string((std::stoi(i) + 1) % kMany) + "\";\n";
             }));
  EXPECT_EQ(collector().CountOf(diag::Code::ParentCircle), 1u);
}

TEST_F(ScaleTest, NamesakesUnderDifferentParents) {
  ReadInTime(Repeated([](const std::string& i) {
               return "createNode transform -n \"p" + i + "\";\ncreateNode transform -n \"s\" -p \"p" + i +
                      "\";\n";
             }) +
             Repeated([](const std::string& i) { return "setAttr \"p" + i + "|s.tx\" 1;\n"; }));
  EXPECT_EQ(scene_.Number(At("|p99999|s"), "tx"), 1.0);
  EXPECT_EQ(collector().CountOf(diag::Code::AmbiguousName), 0u);
}

TEST_F(ScaleTest, PathsOfFrequentNames) {
  ReadInTime(Repeated([](const std::string& i) {
               return "createNode transform -n \"p" + i + "\";\ncreateNode transform -n \"s\" -p \"p" + i +
                      "\";\n";
             }) +
             Repeated([](const std::string& i) {
               return "setAttr \"s|s|s.t" + i + "\" 1;setAttr \"s|" + i + "s|s.tx\" 1;\n";
             }));
  EXPECT_EQ(scene_.Find("s|p5|s"), kNoNode);
  EXPECT_NE(scene_.Find("p5|s"), kNoNode);
}

TEST_F(ScaleTest, NamesThatAreTaken) {
  ReadInTime(Repeated([](const std::string&) { return "createNode transform -n \"a\";\n"; }));
  EXPECT_EQ(collector().CountOf(diag::Code::NameTaken), std::uint64_t{kMany} - 1);
  EXPECT_NE(scene_.Find("a99999"), kNoNode);
}

TEST_F(ScaleTest, NodesRenamedToAndFro) {
  ReadInTime(Repeated([](const std::string& i) {
               return "createNode transform -n \"n" + i + "\" -p \"p" + i + "\";\n";
             }) +
             Repeated([](const std::string& i) { return "rename \"n" + i + "\" \"x\";\n"; }) +
             Repeated([](const std::string&) { return "rename \"x\" \"y\";\nrename \"y\" \"x\";\n"; }));
  EXPECT_EQ(scene_.Find("y"), kNoNode);
}

TEST_F(ScaleTest, StringsAndCommentsLeftOpen) {
  ReadInTime(Repeated([](const std::string&) { return "fileInfo \"open;\n"; }) +
             Repeated([](const std::string&) { return "fileInfo /* open;\n"; }));
  EXPECT_EQ(collector().CountOf(diag::Code::OpenString), std::uint64_t{kMany});
  EXPECT_EQ(collector().CountOf(diag::Code::OpenComment), std::uint64_t{kMany});
}

TEST_F(ScaleTest, AStringWithALineLikeACommandOnEveryLine) {
  ReadInTime("createNode script -n \"s\";setAttr \".b\" -type \"string\" \"\n" +
             Repeated([](const std::string&) { return "select -r x;\n"; }) + "\";");
  EXPECT_EQ(scene_.Written(At("s"), "b")->String()->size(), std::size_t{kMany} * 13 + 1);
}

TEST_F(ScaleTest, LinesWithoutAnEnd) {
  ReadInTime(Repeated([](const std::string&) { return "<<<<<<< x\n%\nselect\n"; }));
  EXPECT_EQ(collector().CountOf(diag::Code::ConflictMark), std::uint64_t{kMany});
}

TEST_F(ScaleTest, AttributesAddedToOneNode) {
  ReadInTime("createNode transform -n \"a\";\n" + Repeated([](const std::string& i) {
               return "addAttr -ln \"long" + i + "\" -sn \"s" + i + "\";\n";
             }) +
             Repeated([](const std::string& i) { return "setAttr \".s" + i + "\" " + i + ";\n"; }));
  EXPECT_EQ(scene_.Number(0, "long77777"), 77777.0);
}

TEST_F(ScaleTest, ConnectionsMadeAndTakenOut) {
  ReadInTime("createNode transform -n \"a\";\ncreateNode blendWeighted -n \"b\";\n" +
             Repeated([](const std::string& i) { return "connectAttr \"a.tx\" \"b.i[" + i + "]\";\n"; }) +
             Repeated([](const std::string& i) { return "disconnectAttr \"a.tx\" \"b.i[" + i + "]\";\n"; },
                      kMany - 1));
  EXPECT_EQ(scene_.ConnectionsInto(At("b")).size(), 1u);
  EXPECT_EQ(SourceOf("b", "i[99999]"), "a.translateX");
}

TEST_F(ScaleTest, TargetsOfOneConstraint) {
  ReadInTime("createNode parentConstraint -n \"p\";\n" + Repeated([](const std::string& i) {
               return "setAttr \".tg[" + i + "].tw\" " + i + ";setAttr \".tg[" + i +
                      "].tot\" -type \"double3\" 1 " + i + " 3;\n";
             }));
  double weights = 0.0;
  double offsets = 0.0;
  const std::clock_t before = std::clock();
  for (std::int32_t i = 0; i < kMany; ++i) {
    weights += *scene_.Number(0, "tw", i);
    offsets += *scene_.Number(0, "toty", i);
  }
  EXPECT_LT(static_cast<double>(std::clock() - before) / CLOCKS_PER_SEC, kMostSeconds);
  EXPECT_EQ(weights, kMany * (kMany - 1.0) / 2);
  EXPECT_EQ(offsets, weights);
}

// Each range lies within the one before it.
TEST_F(ScaleTest, RangesWithinRanges) {
  ReadInTime("createNode animCurveTL -n \"k\";\n" + Repeated([](const std::string& i) {
               return "setAttr \".kit[" + i + ":" + std::to_string(2 * kMany - std::stoi(i)) + "]\" " + i +
                      ";\n";
             }));
  EXPECT_EQ(scene_.Number(0, "kit", 77777), 77777.0);
  EXPECT_TRUE(scene_.Written(0, "kit", 2 * kMany));
  EXPECT_FALSE(scene_.Written(0, "kit", 2 * kMany + 1));
}

TEST_F(ScaleTest, OneElementSetAgainAndAgain) {
  ReadInTime("createNode animCurveTL -n \"k\";\n" +
             Repeated([](const std::string& i) { return "setAttr \".kit[7]\" " + i + ";\n"; }));
  EXPECT_EQ(scene_.Number(0, "kit", 7), 99999.0);
}

TEST_F(ScaleTest, ChildrenAndConnectionsOfOneFosterParent) {
  ReadInTime(
      "file -rdi 1 -rfn \"heroRN\" \"hero.ma\";createNode reference -n \"heroRN\";\n"
      "createNode fosterParent -n \"f\";\n" +
      Repeated([](const std::string& i) {
        return "createNode transform -n \"n" + i + "\" -p \"f\";\nconnectAttr \"f.t\" \"n" + i + ".t\";\n";
      }) +
      "connectAttr \"f.msg\" \"heroRN.fp\";\n");
  EXPECT_EQ(collector().CountOf(diag::Code::ParentInReference), std::uint64_t{kMany});
  EXPECT_THAT(Diagnostics(),
              testing::Contains(testing::HasSubstr("belongs to the referenced file \"hero.ma\"")));
}

TEST_F(ScaleTest, NodesFromElsewhere) {
  ReadInTime("file -r -ns \"h\" \"h.ma\";\n" + Repeated([](const std::string& i) {
               return "connectAttr \"h:n" + i + ".t\" \"z" + i + ".t\";\ncreateNode transform -n \"z" + i +
                      "\";\n";
             }));
  EXPECT_EQ(SourceOf("z99999", "tx"), "h:n99999.translateX");
}

TEST_F(ScaleTest, OneLongLineOfManyDiagnostics) {
  ReadInTime(Repeated([](const std::string&) { return "fileInfo %;"; }));
  EXPECT_EQ(collector().CountOf(diag::Code::UnexpectedByte), std::uint64_t{kMany});
  EXPECT_EQ(collector().kept().size(), diag::Collector::kFullPerCode);
}

TEST_F(ScaleTest, ACommandOfManyWords) {
  ReadInTime("select" + Repeated([](const std::string& i) { return " n" + i; }) +
             ";createNode transform -n \"a\";");
  EXPECT_NE(scene_.Find("a"), kNoNode);
}

}  // namespace
}  // namespace scene
