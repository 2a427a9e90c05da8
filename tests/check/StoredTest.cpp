// Values and keys that a scene has and the layers of its import do not.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>

#include "tests/check/CheckedText.h"

namespace check_test {
namespace {

using diag::Code;
using testing::ElementsAre;
using testing::HasSubstr;

const check::CameOverLayer& LayerOf(const Checked& checked) {
  static const check::CameOverLayer none;
  EXPECT_FALSE(checked.cameOver().layers.empty());
  return checked.cameOver().layers.empty() ? none : checked.cameOver().layers[0];
}

TEST(StoredTest, AValueOfATransformThatIsNotReadIsSaidWithWhatComesOver) {
  const auto says = [](const Checked& checked) { return checked.SentenceOf(Code::StoredValueSkipped); };
  const Checked locked(CameraScene("\tsetAttr -l on \".t\" -type \"double3\" 1 2 3 ;\n"));
  EXPECT_EQ(says(locked),
            "\"shotCam\" gets 0, 0, 0 for translateX, translateY, translateZ, not 1, 2, 3: the import does "
            "not read a setAttr that begins with an option");
  EXPECT_EQ(locked.LineOf(Code::StoredValueSkipped), 4u);
  EXPECT_THAT(LayerOf(locked).position.value, ElementsAre(0, 0, 0));
  const Checked part(CameraScene("\tsetAttr \".t\" -type \"double3\" 4 5 6 ;\n\tsetAttr -k on \".tx\" 7;\n"));
  EXPECT_THAT(says(part), HasSubstr("gets 4 for translateX, not 7: the import does not read a setAttr that "
                                    "sets one component alone"));
  EXPECT_EQ(part.MarkedBy(Code::StoredValueSkipped), "7");
  EXPECT_THAT(LayerOf(part).position.value, ElementsAre(4, -5, -6));
  const Checked named(CameraScene("", "", "setAttr \"shotCam.sy\" 8;\n"));
  EXPECT_THAT(says(named), HasSubstr("gets 1 for scaleY, not 8: the import does not read a setAttr that "
                                     "names its node"));
  EXPECT_THAT(LayerOf(named).scale.value, ElementsAre(100, 100, 100));
  const Checked later(
      CameraScene("", "", "select -ne \"shotCam\";\n\tsetAttr \".r\" -type \"double3\" 0 9 0 ;\n"));
  EXPECT_THAT(says(later),
              HasSubstr("gets 0 for rotateY, not 9: the import does not read a setAttr that does "
                        "not follow its createNode"));
  EXPECT_EQ(LayerOf(later).rotateY.value[0], 0.0);
}

TEST(StoredTest, AValueOfACameraMayComeAfterOneOption) {
  const auto with = [](const char* shape, const char* rest = "") {
    return Checked(CameraScene("", shape, rest));
  };
  EXPECT_EQ(with("\tsetAttr -k off \".fl\" 50;\n").All(), "");
  const Checked twice = with("\tsetAttr -k off -l on \".fl\" 50;\n");
  EXPECT_THAT(twice.SentenceOf(Code::StoredValueSkipped), HasSubstr("gets 35 for focalLength, not 50"));
  EXPECT_EQ(LayerOf(twice).zoom.value, LayerOf(with("")).zoom.value);
  EXPECT_THAT(with("\tsetAttr \".hfa\" 2;\n").SentenceOf(Code::StoredValueSkipped),
              HasSubstr("gets 1.41732 for horizontalFilmAperture, not 2"));
  EXPECT_EQ(with("\tsetAttr \".hfa\" 1.41732;\n").All(), "");
  const char* const named = "setAttr \"shotCamShape.ff\" 2;\n";
  EXPECT_THAT(with("", named).SentenceOf(Code::StoredValueSkipped), HasSubstr("gets 1 for filmFit, not 2"));
  EXPECT_EQ(with("\tsetAttr \".ff\" 2;\n", named).CountOf(Code::StoredValueSkipped), 0u);
}

TEST(StoredTest, AValueThatComesOverAllTheSameIsNotComplainedOf) {
  const auto count = [](const char* transform, const std::string& rest = "") {
    return Checked(CameraScene(transform, "", rest)).CountOf(Code::StoredValueSkipped);
  };
  EXPECT_EQ(count("\tsetAttr \".tx\" 7;\n\tsetAttr \".t\" -type \"double3\" 5 6 7 ;\n"), 0u);
  EXPECT_EQ(
      count("\tsetAttr \".t\" -type \"double3\" 5 6 7 ;\n\tsetAttr -l on \".t\" -type \"double3\" 5 6 7 ;\n"),
      0u);
  EXPECT_EQ(count("\tsetAttr \".T\" -type \"double3\" 5 6 7 ;\n"), 0u);
  EXPECT_EQ(count("\tsetAttr -l on \".tx\" 0;\n\tsetAttr -k off \".v\";\n"), 0u);
  // Keys stand over the value, unless there is one alone, which the import does not take.
  EXPECT_EQ(count("\tsetAttr \".tx\" 7;\n", CurveOf("moveX", "1 7 2 8", "shotCam.tx")), 0u);
  EXPECT_EQ(count("\tsetAttr \".tx\" 7;\n", CurveOf("moveX", "1 7", "shotCam.tx")), 1u);
  EXPECT_EQ(count("\tsetAttr \".tx\" 7;\n", CurveOf("moveX", "1 9", "shotCam.tx")), 0u);
}

TEST(StoredTest, AnOffsetMatrixIsLost) {
  const char* const matrix = "\tsetAttr \".opm\" -type \"matrix\" 1 0 0 0 0 1 0 0 0 0 1 0 ";
  const Checked moved(CameraScene(matrix + std::string("9 0 0 1 ;\n")));
  EXPECT_EQ(moved.SentenceOf(Code::OffsetMatrixLost), "the offset parent matrix of \"shotCam\" is lost");
  EXPECT_EQ(moved.CountOf(Code::PictureShifts), 1u);
  EXPECT_EQ(Checked(CameraScene(matrix + std::string("0 0 0 1 ;\n"))).All(), "");
}

TEST(StoredTest, ALimitThatHoldsAValueIsLost) {
  const std::string limits = "\tsetAttr \".mxtl\" -type \"double3\" 4 1 1 ;\n\tsetAttr \".mnry\" -20;\n";
  const std::string enabled = "\tsetAttr \".xtxe\" yes;\n\tsetAttr \".mrye\" yes;\n";
  const std::string place = "\tsetAttr \".t\" -type \"double3\" 9 8 0 ;\n";
  const Checked held(CameraScene(place + limits + enabled, "",
                                 CurveOf("turnY", "1 -19 2 -21", "shotCam.ry", "animCurveTA")));
  ASSERT_EQ(held.CountOf(Code::LimitLost), 2u) << held.All();
  EXPECT_THAT(held.All(), HasSubstr("\"shotCam\" goes past a limit: translateX comes over as 9, where the "
                                    "scene holds it at 4 [MA0924]"));
  EXPECT_THAT(held.All(), HasSubstr("rotateY comes over as -21, where the scene holds it at -20 [MA0924]"));
  ASSERT_EQ(LayerOf(held).position.values.size(), 6u);
  EXPECT_EQ(LayerOf(held).position.values[3], 9.0);
  EXPECT_EQ(Checked(CameraScene(place + limits)).All(), "");  // switched off
  EXPECT_EQ(Checked(CameraScene("\tsetAttr \".t\" -type \"double3\" 3 8 0 ;\n" + limits + enabled)).All(),
            "");
}

TEST(StoredTest, AValueThatIsNotReadHasNeitherALimitNorRadians) {
  const std::string limit = "\tsetAttr \".mxtx\" 20;\n\tsetAttr \".xtxe\" yes;\n";
  const Checked limited(CameraScene("\tsetAttr \".tx\" 30;\n" + limit));
  EXPECT_THAT(limited.SentenceOf(Code::StoredValueSkipped), HasSubstr("gets 0 for translateX, not 30"));
  EXPECT_EQ(limited.CountOf(Code::LimitLost), 0u);
  std::string text = CameraScene("\tsetAttr \".r\" -type \"double3\" 0 0 0.25 ;\n\tsetAttr \".rz\" 2;\n");
  const Checked turned(text.replace(text.find("degree"), 6, "radian"));
  EXPECT_THAT(turned.SentenceOf(Code::RadiansLost), HasSubstr("rotateZ is 0.25 in radians"));
}

TEST(StoredTest, AnglesInRadiansAreSaidWithWhatIsLeftOfThem) {
  const auto radians = [](std::string text) { return text.replace(text.find("degree"), 6, "radian"); };
  const Checked turned(radians(CameraScene("\tsetAttr \".r\" -type \"double3\" 0 0.5 0.25 ;\n")));
  EXPECT_EQ(turned.SentenceOf(Code::RadiansLost),
            "\"shotCam\" hardly turns: rotateY is 0.5 in radians, and comes over as 0.00873 degrees");
  EXPECT_EQ(turned.LineOf(Code::RadiansLost), 4u);
  EXPECT_NEAR(LayerOf(turned).rotateY.value[0], -0.00873, 1e-5);
  const Checked keyed(
      radians(CameraScene("", "", CurveOf("turnX", "1 0 2 0.3", "shotCam.rx", "animCurveTA"))));
  EXPECT_EQ(keyed.MarkedBy(Code::RadiansLost), "1 0 2 0.3");
  EXPECT_EQ(Checked(radians(CameraScene("\tsetAttr \".t\" -type \"double3\" 1 2 3 ;\n"))).All(), "");
}

TEST(StoredTest, KeysThatLandOnOneTimeAreSaidWithTheirLines) {
  const std::string curve =
      "createNode animCurveTL -n \"moveX\";\n\tsetAttr \".tan\" 2;\n"
      "\tsetAttr -s 4 \".ktv[0:3]\" 1 0\n\t\t2.0001 1\n\t\t2.0004 5\n\t\t3 6;\n"
      "connectAttr \"moveX.o\" \"shotCam.tx\";\n";
  const Checked close(CameraScene("", "", curve));
  EXPECT_EQ(LayerOf(close).position.times.size(), 3u);
  EXPECT_EQ(
      close.SentenceOf(Code::KeysAtOneTime),
      "\"shotCam\" loses a key: those of \"moveX\" at 2.0001 (line 15) and 2.0004 (line 16) land on one "
      "time");
  EXPECT_EQ(close.MarkedBy(Code::KeysAtOneTime), "2.0004");
  const auto lost = [](const std::string& rest) {
    const Checked checked(CameraScene("", "", rest));
    const check::CameOverLayer& layer = LayerOf(checked);
    return std::pair(checked.CountOf(Code::KeysAtOneTime),
                     layer.position.times.empty() ? layer.zoom.times.size() : layer.position.times.size());
  };
  EXPECT_EQ(lost(CurveOf("moveX", "1 0 2.0001 1 2.0009 2 3 3", "shotCam.tx")), std::pair(0ul, 4ul));
  EXPECT_EQ(lost(CurveOf("moveX", "1 0 5 1 3 2 5 3 1 4", "shotCam.tx")), std::pair(2ul, 3ul));
  EXPECT_EQ(lost(CurveOf("zoom", "1 35 1.0001 40 3 50", "shotCamShape.fl", "animCurveTU")),
            std::pair(1ul, 2ul));
  // The first key of all begins the node's time: here it lands on that of another curve's second key.
  EXPECT_EQ(lost(CurveOf("moveX", "5 1", "shotCam.tx") + CurveOf("moveY", "1 0 5 1 9 2", "shotCam.ty")),
            std::pair(1ul, 2ul));
}

std::string Aimed(std::string_view transform, std::string_view target) {
  return CameraScene(transform, "",
                     "createNode transform -n \"point\";\n\tsetAttr \".t\" -type \"double3\" 20 0 -20 ;\n"
                     "createNode aimConstraint -n \"aim\" -p \"shotCam\";\n"
                     "\tsetAttr \".a\" -type \"double3\" 0 0 -1 ;\n"
                     "connectAttr \"aim.constraintRotate\" \"shotCam.rotate\";\n"
                     "connectAttr \"shotCam.translate\" \"aim.constraintTranslate\";\n" +
                         std::string(target));
}

TEST(StoredTest, AnAimedCameraWithAPivotStandsSomewhereElse) {
  const char* const pivot = "\tsetAttr \".rp\" -type \"double3\" 0 0 5 ;\n";
  const char* const target = "connectAttr \"point.translate\" \"aim.target[0].targetTranslate\";\n";
  const Checked moved(Aimed(pivot, target));
  EXPECT_THAT(moved.SentenceOf(Code::AimedPivotLost), HasSubstr("\"shotCam\" is aimed and has a pivot"));
  EXPECT_EQ(moved.MarkedBy(Code::AimedPivotLost), "0 0 5");
  EXPECT_EQ(moved.CountOf(Code::PictureShifts), 1u);
  EXPECT_EQ(Checked(Aimed("", target)).All(), "");
  EXPECT_EQ(Checked(CameraScene(pivot)).All(), "");
  // A pivot of the scale moves what is scaled.
  const std::string scaled = "\tsetAttr \".sp\" -type \"double3\" 0 0 5 ;\n";
  EXPECT_EQ(Checked(Aimed(scaled, target)).All(), "");
  EXPECT_EQ(Checked(Aimed(scaled + "\tsetAttr \".s\" -type \"double3\" 2 2 2 ;\n", target))
                .CountOf(Code::AimedPivotLost),
            1u);
}

TEST(StoredTest, ALookAtThatIsNotTakenIsSaidOnce) {
  // It looks at its own place, so that there is no answer.
  std::string text = Aimed("", "connectAttr \"point.t\" \"aim.tg[0].tt\";\n");
  text.replace(text.find("20 0 -20"), 8, "0 0 0");
  const Checked checked(text);
  EXPECT_EQ(checked.CountOf(Code::LookAtShortNames), 1u);
  EXPECT_EQ(checked.CountOf(Code::DriverWithoutAnswer), 0u) << checked.All();
  check::Options wanted;
  wanted.only = {Code::DriverWithoutAnswer};
  EXPECT_GE(Checked(text, wanted).CountOf(Code::DriverWithoutAnswer), 1u);
}

TEST(StoredTest, ALookAtThatIsTakenIsNotSaidToKeepAStoredValue) {
  // The import needs no weight; the evaluation does, and cannot compute what drives it.
  std::string text = CameraScene(
      "", "",
      "createNode transform -n \"point\";\n\tsetAttr \".t\" -type \"double3\" 5 6 -7 ;\n"
      "createNode aimConstraint -n \"aim\" -p \"shotCam\";\n\tsetAttr \".a\" -type \"double3\" 0 0 -1 ;\n"
      "connectAttr \"shotCam.translate\" \"aim.constraintTranslate\";\n"
      "connectAttr \"aim.w0\" \"aim.target[0].targetWeight\";\n"
      "connectAttr \"point.translate\" \"aim.target[0].targetTranslate\";\n");
  for (const char axis : {'X', 'Y', 'Z'}) {
    text += std::string("connectAttr \"aim.constraintRotate") + axis + "\" \"shotCam.rotate" + axis + "\";\n";
  }
  const Checked checked(text);
  ASSERT_EQ(checked.cameOver().layers.size(), 1u);
  EXPECT_TRUE(checked.cameOver().layers[0].aimed);
  EXPECT_EQ(checked.CountOf(Code::DriverWithoutAnswer), 0u) << checked.All();
  EXPECT_EQ(checked.CountOf(Code::ShiftNotMeasured), 1u);
}

}  // namespace
}  // namespace check_test
