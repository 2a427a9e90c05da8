#include "motion/KeptBelow.h"

#include <string>

#include "tests/motion/EvaluatorFixture.h"

namespace {

using motion::KeptBelow;
using motion::NumberId;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::SizeIs;

class KeptBelowTest : public testmotion::EvaluatorTest {
 protected:
  std::vector<std::string> SentencesOf(const std::vector<NumberId>& numbers,
                                       const std::vector<motion::MatrixId>& matrices = {}) {
    evaluator().MoveTo(1.0);
    std::vector<std::string> sentences;
    for (const motion::Kept& kept : KeptBelow(evaluator()).Of(numbers, matrices)) {
      sentences.push_back(SentenceOf(evaluator(), kept));
    }
    return sentences;
  }
};

TEST_F(KeptBelowTest, EachReasonIsSaid) {
  Read(
      "createNode transform -n \"a\";\ncreateNode expression -n \"shake\";\n"
      "connectAttr \"shake.out[0]\" \"a.tx\";\nconnectAttr \"a.ty\" \"a.ty\";\n"
      "createNode pointConstraint -n \"hold\" -p \"a\";\nconnectAttr \"hold.ctz\" \"a.tz\";\n");
  const motion::MatrixId world = evaluator().World(At("a"));
  EXPECT_THAT(SentencesOf({}, {world}),
              ElementsAre("\"|a.translateX\" is driven by \"|shake.out[0]\" (expression), which cannot be "
                          "computed here",
                          "\"|a.translateY\" drives itself",
                          "\"|a|hold.constraintTranslateZ\" gives \"|a.translateZ\" no value, so its stored "
                          "one is kept"));
}

TEST_F(KeptBelowTest, EachIsThereOnceAndFarFewerThanVeryMany) {
  std::string text = "createNode expression -n \"shake\";\n";
  constexpr int kNodes = 100;
  for (int i = 0; i < kNodes; ++i) {
    const std::string name = "n" + std::to_string(i);
    text += "createNode transform -n \"" + name + "\"" +
            (i == 0 ? std::string() : " -p \"n" + std::to_string(i - 1) + "\"") +
            ";\nconnectAttr \"shake.out[0]\" \"" + name + ".tx\";\n";
  }
  Read(text);
  const motion::MatrixId third = evaluator().World(At("n2"));
  const motion::MatrixId last = evaluator().World(At("n99"));
  EXPECT_THAT(
      SentencesOf({}, {third, third}),
      ElementsAre(HasSubstr("|n2.translateX"), HasSubstr("|n1.translateX"), HasSubstr("|n0.translateX")));
  EXPECT_THAT(SentencesOf({}, {last}), SizeIs(KeptBelow::kMost));
}

TEST_F(KeptBelowTest, ManyValuesUnderADeepRigTakeNoMoreThanBoth) {
  constexpr int kDeep = 20000;
  std::string text =
      "createNode expression -n \"shake\";\ncreateNode transform -n \"n0\";\n"
      "connectAttr \"shake.out[0]\" \"n0.tx\";\n";
  for (int i = 1; i < kDeep; ++i) {
    text += "createNode transform -n \"n" + std::to_string(i) + "\" -p \"n" + std::to_string(i - 1) + "\";\n";
  }
  Read(text);
  std::vector<motion::MatrixId> worlds;
  for (int i = 0; i < kDeep; ++i) worlds.push_back(evaluator().World(At("n" + std::to_string(i))));
  const KeptBelow below(evaluator());
  for (const motion::MatrixId world : worlds) ASSERT_EQ(below.Of({}, {world}).size(), 1u);
}

}  // namespace
