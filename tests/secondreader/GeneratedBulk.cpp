// Parts that only large scenes have: long spins, many nodes of few names, many connections, long commands
// that the importer skips.
#include "tests/secondreader/SceneGenerator.h"

namespace secondreader {
namespace {

constexpr std::string_view kAxes[] = {".rx", ".ry", ".rz"};
constexpr int kHuge = 4;  // percent of the large scenes
constexpr int kHugeFactor = 20;

}  // namespace

void SceneGenerator::bulk() {
  switch (dice_.between(0, 3)) {
    case 0:
      return longSpin();
    case 1:
      return manyNodes();
    case 2:
      return manyConnections();
    default:
      return longCommand();
  }
}

// A transform that turns on in one direction, with a camera below it.
void SceneGenerator::longSpin() {
  const std::string name = newName("spinner");
  const std::string driver = newName("spin");
  createNode("transform", name, "");
  transforms_.push_back(name);
  createNode("camera", newName("spinShape"), name);
  createNode("animCurveTA", driver, "");
  curves_.push_back(driver);
  const int keys = dice_.between(20, 400);
  int step = dice_.between(-179, 179);
  word("setAttr -s " + std::to_string(keys));
  quoted(".ktv[0:" + std::to_string(keys - 1) + "]");
  int turned = 0;
  for (int key = 0; key < keys; ++key) {
    word(std::to_string(key));
    word(std::to_string(turned) + (dice_.chance(30) ? ".5" : ""));
    turned += step;
    if (dice_.chance(1)) step = dice_.between(-179, 179);
  }
  end();
  for (int count = dice_.between(1, 3); count > 0; --count) {
    connect(driver + ".o", name + std::string(dice_.oneOf(kAxes)));
  }
}

void SceneGenerator::manyNodes() {
  static constexpr std::string_view kTypes[] = {"transform", "animCurveTL", "locator", "camera", "mesh"};
  const int factor = dice_.chance(kHuge) ? kHugeFactor : 1;
  const int names = dice_.between(1, 200 * factor);
  for (int count = factor * dice_.between(50, 300); count > 0; --count) {
    const std::string name = "many" + std::to_string(dice_.between(1, names));
    const std::string parent = "many" + std::to_string(dice_.between(1, names));
    const std::string_view type = dice_.chance(4) ? "camera" : dice_.oneOf(kTypes);
    createNode(type == "camera" && dice_.chance(90) ? "transform" : type, anyCase(name), parent);
    if (dice_.chance(30)) words("setAttr \".t\" 1 2 3;");
    if (dice_.chance(30)) words("setAttr \".ktv\" 1 2 3 4;");
    if (dice_.chance(10)) connect("many1.o", name + ".ty");
  }
}

void SceneGenerator::manyConnections() {
  static constexpr std::string_view kAttributes[] = {".o",  ".tx", ".message", ".crx",
                                                     ".ct", ".rz", ".iog",     ".w"};
  const int factor = dice_.chance(kHuge) ? kHugeFactor : 1;
  for (int count = factor * dice_.between(50, 300); count > 0; --count) {
    const auto plug = [&](const std::vector<std::string>& names) {
      const bool known = dice_.chance(30) && !names.empty();
      return (known ? dice_.oneOf(names) : "shader" + std::to_string(dice_.between(1, 90))) +
             std::string(dice_.oneOf(kAttributes));
    };
    const std::string source = plug(dice_.chance(50) ? curves_ : transforms_);
    connect(source, plug(dice_.chance(80) ? transforms_ : cameras_));
    if (dice_.chance(5)) otherCommand();
  }
}

void SceneGenerator::longCommand() {
  static constexpr std::string_view kParts[] = {
      "0.5",
      "-1.25e-3",
      "\"a ; createNode \\\" \"",
      "on",
      "(",
      ")",
      ":",
      "mesh",
      "-type",
      "/* ; \" */",
      "// \" ;\n",
      "\"polyFaces\"",
      "f",
      "4 0 1 2 3",
      "setAttribute",
      "x;y",
      "aVeryLongWordThatNobodyReadsAtAllAndThatGoesOnForMoreThanThirtyTwoBytes",
      "+"};
  static constexpr std::string_view kKeywords[] = {
      "select", "setAttr \".t\" 9;",     "currentUnit -t pal;",
      "file",   "createNode transform;", "connectAttr \"a.o\" \"b.t\";"};
  createNode("mesh", newName("mesh"), "");
  word("setAttr");
  quoted(".vrts[0:999]");
  for (int count = dice_.between(100, 1500); count > 0; --count) {
    if (dice_.chance(3)) text_ += std::string(dice_.below(70), dice_.chance(50) ? ' ' : '\n');
    if (odd() && dice_.chance(2)) {
      words(dice_.oneOf(kKeywords));
    } else {
      words(dice_.oneOf(kParts));
    }
  }
  end();
}

}  // namespace secondreader
