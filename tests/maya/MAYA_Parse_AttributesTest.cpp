// "setAttr" on transforms: attributes, triples, and the record that receives them.
#include <cmath>

#include "hostapi/ErrorCodes.h"
#include "hostutil/HostSetup.h"
#include "tests/support/ReaderFixture.h"

namespace testsupport {
namespace {

using namespace std::string_view_literals;
using ::testing::Each;
using ::testing::ElementsAre;
using ::testing::IsEmpty;

using Triple = double (MAYA_Transform::*)[3];

class TransformAttributesTest : public ReaderTest {
 protected:
  // A transform "a" with a value of its own in every field, then the command.
  HostError ReadWith(std::string_view command) {
    return Read(
        "createNode transform -n \"a\";\nsetAttr \".t\" 11 12 13;\nsetAttr \".r\" 21 22 23;\n"
        "setAttr \".s\" 31 32 33;\nsetAttr \".rp\" 41 42 43;\nsetAttr \".sp\" 51 52 53;\n" +
        std::string(command) + "\n");
  }

  std::vector<double> Field(Triple field) { return Values(TransformAt(0).*field); }

  void ExpectUnchanged() {
    const MAYA_Transform transform = TransformAt(0);
    EXPECT_THAT(Values(transform.translate), ElementsAre(11, 12, 13));
    EXPECT_THAT(Values(transform.rotate), ElementsAre(21, 22, 23));
    EXPECT_THAT(Values(transform.scale), ElementsAre(31, 32, 33));
    EXPECT_THAT(Values(transform.rotatePivot), ElementsAre(41, 42, 43));
    EXPECT_THAT(Values(transform.scalePivot), ElementsAre(51, 52, 53));
  }
};

struct TripleRow {
  const char* shortName;
  const char* longName;
  Triple field;
  double missing;  // what a component that is not given becomes
};

const TripleRow kTriples[] = {
    {".t", ".translate", &MAYA_Transform::translate, 0.0},
    {".r", ".rotate", &MAYA_Transform::rotate, 0.0},
    {".s", ".scale", &MAYA_Transform::scale, 1.0},
    {".rp", ".rotatePivot", &MAYA_Transform::rotatePivot, 0.0},
    {".sp", ".scalePivot", &MAYA_Transform::scalePivot, 0.0},
};

TEST_F(TransformAttributesTest, EachAttributeInBothFormsAndAnyCaseFillsItsFieldAlone) {
  for (const TripleRow& row : kTriples) {
    for (const char* const name : {row.shortName, row.longName}) {
      for (const std::string& form : CaseChanges(name)) {
        SCOPED_TRACE(form);
        ASSERT_EQ(ReadWith("setAttr \"" + form + "\" -type \"double3\" 1.5 -2.5 1e3 ;"), 0);
        for (const TripleRow& other : kTriples) {
          if (other.field == row.field)
            EXPECT_THAT(Field(other.field), ElementsAre(1.5, -2.5, 1000));
          else
            EXPECT_GT(Field(other.field)[0], 10);
        }
      }
    }
  }
}

TEST_F(TransformAttributesTest, MissingComponentsTakeTheStartValueNotTheEarlierOne) {
  for (const TripleRow& row : kTriples) {
    SCOPED_TRACE(row.shortName);
    const double rest = row.missing;
    const std::string head = "setAttr \"" + std::string(row.shortName) + "\" -type \"double3\"";
    ASSERT_EQ(ReadWith(head + " 7;"), 0);
    EXPECT_THAT(Field(row.field), ElementsAre(7, rest, rest));
    ASSERT_EQ(ReadWith(head + " 7 8;"), 0);
    EXPECT_THAT(Field(row.field), ElementsAre(7, 8, rest));
    ASSERT_EQ(ReadWith(head + ";"), 0);
    EXPECT_THAT(Field(row.field), ElementsAre(rest, rest, rest));
  }
}

TEST_F(TransformAttributesTest, NumbersAfterTheThirdAreNeitherStoredNorScanned) {
  ASSERT_EQ(ReadWith("setAttr \".t\" -type \"double3\" 1 2 3 4;"), 0);
  EXPECT_THAT(Field(&MAYA_Transform::translate), ElementsAre(1, 2, 3));
  ASSERT_EQ(ReadWith("setAttr \".t\" 1 2 3 --x 1e999 4;"), 0);
  EXPECT_THAT(Field(&MAYA_Transform::translate), ElementsAre(1, 2, 3));
  {
    const UtilityRehearsal counting;
    ASSERT_EQ(Read("createNode transform;\nsetAttr \".s\" 1 2 3 4 5 6;\n"), 0);
  }
  EXPECT_EQ(HostUtilityCallCount(HOST_UTILITY_NumberScan), 3);
}

TEST_F(TransformAttributesTest, OtherTokensOfTheCommandArePassedOver) {
  ASSERT_EQ(ReadWith("setAttr \".r\" -k on -type \"double3\" ( 1 ) : /*0*/ + 2 createNode // 0\n 3 \"4\";"),
            0);
  EXPECT_THAT(Field(&MAYA_Transform::rotate), ElementsAre(1, 2, 3));
  EXPECT_EQ(TransformCount(), 1);
}

TEST_F(TransformAttributesTest, TheFirstTokenMustBeTheAttribute) {
  for (const char* const head :
       {"-k off \".t\"", "-l on \".t\"", "/*c*/ \".t\"", "5 \".t\"", "t", ": \".t\""}) {
    SCOPED_TRACE(head);
    ASSERT_EQ(ReadWith("setAttr " + std::string(head) + " 1 2 3;"), 0);
    ExpectUnchanged();
  }
  ASSERT_EQ(ReadWith("setAttr; \".t\" 1 2 3;"), 0);
  ExpectUnchanged();
}

TEST_F(TransformAttributesTest, IndexedDottedAndForeignNamesMatchNothing) {
  for (const char* const name : {".t[0]", ".tx", "t", "a.t", "..t", ".t ", "", ".", ".translates", ".v",
                                 ".fl", ".ktv", ".w", ".rpt"}) {
    SCOPED_TRACE(name);
    ASSERT_EQ(ReadWith("setAttr \"" + std::string(name) + "\" 1 2 3;"), 0);
    ExpectUnchanged();
  }
}

TEST_F(TransformAttributesTest, AnAttributeOf255BytesReadsAsEmpty) {
  ASSERT_EQ(ReadWith("setAttr \".t" + std::string(251, ' ') + "\" 1 2 3;"), 0);
  ExpectUnchanged();
}

TEST_F(TransformAttributesTest, AnUnknownAttributeLeavesTheRestToTheMainLoop) {
  ASSERT_EQ(ReadWith("setAttr \".v\" createNode camera -n \"c\";"), 0);
  EXPECT_EQ(CameraCount(), 1);
  ASSERT_EQ(ReadWith("setAttr \".t\" createNode camera -n \"c\";"), 0);
  EXPECT_EQ(CameraCount(), 0);
}

TEST_F(TransformAttributesTest, AFailedScanThrowsItsCodeAndKeepsWhatWasStored) {
  struct Row {
    const char* numbers;
    HostError code;
  };
  for (const Row& row : {Row{"--x 2 3", HOST_ERR_NUMBER_SYNTAX}, Row{"1 0x10 3", HOST_ERR_NUMBER_SYNTAX},
                         Row{"1 2 1.#QNAN", HOST_ERR_NUMBER_SYNTAX}, Row{"1e999 2 3", HOST_ERR_NUMBER_RANGE},
                         Row{"1 -1e309 3", HOST_ERR_NUMBER_RANGE}, Row{"1 . 3", HOST_ERR_NUMBER_SYNTAX}}) {
    SCOPED_TRACE(row.numbers);
    EXPECT_EQ(ReadWith("setAttr \".t\" " + std::string(row.numbers) + ";"), row.code);
    ExpectUnchanged();
    EXPECT_THAT(Values(scene().current.transform.translate), ElementsAre(11, 12, 13));
    EXPECT_THAT(Messages(), IsEmpty());
  }
}

TEST_F(TransformAttributesTest, ANumberMayHaveAFractionAnExponentAndLettersAfterIt) {
  ASSERT_EQ(ReadWith("setAttr \".t\" -.5 5. 23.976fps;"), 0);
  EXPECT_THAT(Field(&MAYA_Transform::translate), ElementsAre(-0.5, 5.0, 23.976));
  ASSERT_EQ(ReadWith("setAttr \".t\" 1e 1e-400 4.9e-324;"), 0);
  EXPECT_THAT(Field(&MAYA_Transform::translate), ElementsAre(1.0, 0.0, 4.9e-324));
}

TEST_F(TransformAttributesTest, ANumberOf255BytesReadsAsEmptyAndFails) {
  const std::string fits = "1." + std::string(252, '0');
  ASSERT_EQ(ReadWith("setAttr \".t\" " + fits + ";"), 0);
  EXPECT_THAT(Field(&MAYA_Transform::translate), ElementsAre(1, 0, 0));
  EXPECT_EQ(ReadWith("setAttr \".t\" " + fits + "0;"), HOST_ERR_NUMBER_SYNTAX);
  ExpectUnchanged();
}

TEST_F(TransformAttributesTest, ANumberEndsAtItsFirstNul) {
  ASSERT_EQ(ReadWith("setAttr \".t\" 6\0--x 7;"sv), 0);
  EXPECT_THAT(Field(&MAYA_Transform::translate), ElementsAre(6, 7, 0));
}

TEST_F(TransformAttributesTest, TheFirstOfSeveralEqualNamesReceivesEveryValue) {
  ASSERT_EQ(Read("createNode transform -n \"a\";\nsetAttr \".t\" 1 2 3;\ncreateNode transform -n \"b\";\n"
                 "createNode transform -n \"A\" -p \"b\";\nsetAttr \".r\" 4 5 6;\n"),
            0);
  // The copy of the third node replaces the first record as a whole.
  EXPECT_STREQ(TransformAt(0).name, "A");
  EXPECT_STREQ(TransformAt(0).parent, "b");
  EXPECT_THAT(Values(TransformAt(0).translate), Each(0.0));
  EXPECT_THAT(Values(TransformAt(0).rotate), ElementsAre(4, 5, 6));
  EXPECT_STREQ(TransformAt(2).name, "A");
  EXPECT_THAT(Values(TransformAt(2).rotate), Each(0.0));
}

TEST_F(TransformAttributesTest, OfUnnamedTransformsOnlyTheFirstReceivesValues) {
  ASSERT_EQ(Read("createNode transform;\ncreateNode transform -n \"x\";\ncreateNode transform;\n"
                 "setAttr \".t\" 1 2 3;\ncreateNode transform;\nsetAttr \".r\" 4 5 6;\n"),
            0);
  EXPECT_THAT(Values(TransformAt(0).translate), Each(0.0));
  EXPECT_THAT(Values(TransformAt(0).rotate), ElementsAre(4, 5, 6));
  for (const std::int64_t index : {1, 2, 3}) {
    EXPECT_THAT(Values(TransformAt(index).translate), Each(0.0));
    EXPECT_THAT(Values(TransformAt(index).rotate), Each(0.0));
  }
}

TEST_F(TransformAttributesTest, NamesAreFoldedInAsciiOnly) {
  ASSERT_EQ(Read("createNode transform -n \"\xc3\x89[\";\ncreateNode transform -n \"\xc3\xa9{\";\nsetAttr "
                 "\".t\" 1 2 3;\n"),
            0);
  EXPECT_THAT(Values(TransformAt(0).translate), Each(0.0));
  EXPECT_THAT(Values(TransformAt(1).translate), ElementsAre(1, 2, 3));
}

TEST_F(TransformAttributesTest, TheEndInPlaceOfTheAttributeIsNoError) {
  EXPECT_EQ(Read("createNode transform -n \"a\";\nsetAttr "), 0);
  EXPECT_EQ(Read("createNode transform -n \"a\";\nsetAttr \".v\" off "), 0);
  EXPECT_THAT(Messages(), IsEmpty());
}

TEST_F(TransformAttributesTest, TheEndInsideAKnownAttributeIsAnUnexpectedEnd) {
  for (const char* const numbers : {"", " ", " 1 2 ", " 1 2 3 ", " -type \"double3\""}) {
    EXPECT_EQ(Read("createNode transform -n \"a\";\nsetAttr \".t\"" + std::string(numbers)), 1289986);
    EXPECT_THAT(Messages(), ElementsAre(kUnexpectedEndText));
    EXPECT_THAT(Values(TransformAt(0).translate), Each(0.0));
  }
}

}  // namespace
}  // namespace testsupport
