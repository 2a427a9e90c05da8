// Every list call and every number scan of a reading made to fail in turn; and who owns the keys in any order
// of commands, names and errors.
#include <new>
#include <random>
#include <stdexcept>

#include "hostapi/ErrorCodes.h"
#include "hostutil/HostSetup.h"
#include "tests/maya/RichScene.h"
#include "tests/support/ReaderFixture.h"

namespace testsupport {
namespace {

using ::testing::AnyOf;
using ::testing::ElementsAre;
using ::testing::Gt;
using ::testing::IsEmpty;

constexpr HostError kRehearsedCode = 7123;

class FailureTest : public ReaderTest {
 protected:
  // How often a good reading of the text calls the service.
  std::int64_t CallsOf(std::int32_t service, const std::string& text) {
    const UtilityRehearsal counting;
    EXPECT_EQ(Read(text), 0);
    return HostUtilityCallCount(service);
  }

  void ExpectNothingLeft() {
    EndScene();
    EXPECT_THAT(HeldObjects(), IsEmpty());
    HostReleaseLeftovers();  // so that the next round is judged by itself
  }
};

struct Service {
  std::int32_t number;
  const char* name;
};

// The services that the reader calls while it reads.
constexpr Service kServices[] = {
    {HOST_UTILITY_ListCreate, "ListCreate"}, {HOST_UTILITY_ListAppend, "ListAppend"},
    {HOST_UTILITY_ListLock, "ListLock"},     {HOST_UTILITY_ListUnlock, "ListUnlock"},
    {HOST_UTILITY_ListCount, "ListCount"},   {HOST_UTILITY_NumberScan, "NumberScan"},
};

TEST_F(FailureTest, AReadingUsesListsAndScans) {
  for (const Service& service : kServices)
    EXPECT_THAT(CallsOf(service.number, RichScene()), Gt(0)) << service.name;
  EXPECT_THAT(CallsOf(HOST_UTILITY_ListCreate, RichScene()), Gt(5));
  EXPECT_THAT(CallsOf(HOST_UTILITY_ListAppend, RichScene()), Gt(10));
  EXPECT_THAT(CallsOf(HOST_UTILITY_NumberScan, RichScene()), Gt(20));
}

TEST_F(FailureTest, EveryFailedCallComesOutAsItsCodeAndLeavesNothing) {
  const std::string scene = RichScene();
  for (const Service& service : kServices) {
    const std::int64_t calls = CallsOf(service.number, scene);
    for (std::int64_t nth = 1; nth <= calls; ++nth) {
      SCOPED_TRACE(service.name + std::to_string(nth));
      {
        const UtilityRehearsal failing(service.number, nth, kRehearsedCode);
        EXPECT_EQ(Read(scene), kRehearsedCode);
        EXPECT_EQ(HostUtilityCallCount(service.number), nth);
      }
      EXPECT_THAT(Messages(), IsEmpty());
      ExpectNothingLeft();
    }
  }
}

TEST_F(FailureTest, EveryThrownExceptionComesThroughAndLeavesNothing) {
  const std::string scene = RichScene();
  for (const Service& service : kServices) {
    const std::int64_t calls = CallsOf(service.number, scene);
    for (std::int64_t nth = 1; nth <= calls; ++nth) {
      SCOPED_TRACE(service.name + std::to_string(nth));
      {
        const UtilityRehearsal failing(service.number, nth, 0, HOST_THROW_BAD_ALLOC);
        EXPECT_THROW(Read(scene), std::bad_alloc);
      }
      ExpectNothingLeft();
      {
        const UtilityRehearsal failing(service.number, nth, 0, HOST_THROW_RUNTIME_ERROR);
        EXPECT_THROW(Read(scene), std::runtime_error);
      }
      ExpectNothingLeft();
    }
  }
}

TEST_F(FailureTest, ACallThatDoesNothingAndSaysZeroIsSurvived) {
  const std::string scene = RichScene();
  for (const Service& service : kServices) {
    const std::int64_t calls = CallsOf(service.number, scene);
    for (std::int64_t nth = 0; nth <= calls; ++nth) {
      SCOPED_TRACE(service.name + std::to_string(nth));
      {
        const UtilityRehearsal failing(service.number, nth, 0);
        EXPECT_THAT(Read(scene), AnyOf(0, HOST_ERR_UTILITY_NULL, HOST_ERR_LIST_INDEX, HOST_ERR_LIST_LOCKED));
      }
      ExpectNothingLeft();
    }
  }
}

TEST_F(FailureTest, EveryCallFailingFromTheFirstOnIsItsCode) {
  for (const Service& service : kServices) {
    if (CallsOf(service.number, RichScene()) == 0) continue;
    const UtilityRehearsal failing(service.number, 0, kRehearsedCode);
    EXPECT_EQ(Read(RichScene()), kRehearsedCode) << service.name;
  }
}

// Commands that make, select, key and spoil curves, over three names that are one or two.
constexpr const char* kOwnershipCommands[] = {
    "createNode animCurveTL -n \"a\";\n",
    "createNode animCurveTA -n \"A\";\n",
    "createNode animCurveTU -n \"b\";\n",
    "createNode animCurveTL;\n",
    "createNode transform -n \"a\";\n",
    "createNode camera -n \"a\";\n",
    "createNode mesh -n \"a\";\n",
    "createNode \"transform\";\n",
    "setAttr \".ktv[0:1]\" 1 0 2 5;\n",
    "setAttr -s 1 \".ktv[2]\" 3 4;\n",
    "setAttr \".tan\" 18;\n",
    "setAttr \".ktv\";\n",
    "setAttr -k;\n",
    "setAttr \".t\" 1 2 3;\n",
    "setAttr \".fl\" 50;\n",
    "select -ne \"a\";\n",
    "select -ne :defaultResolution;\n",
    "select :;\n",
    "connectAttr \"a.o\" \"a.tx\";\n",
    "connectAttr \"b.o\" \"a.fl\";\n",
};

constexpr const char* kOwnershipErrors[] = {
    "",
    "setAttr \".ktv\" 1 0 2 --x;\n",
    "setAttr \".ktv\" 1 0 $;\n",
    "setAttr \".ktv\" 1 0 \"x",
    "setAttr \".ktv\" 1 0 ",
    "createNode animCurveTL -n \"a\"",
    "$\n",
    "word",
};

TEST_F(FailureTest, KeysHaveOneOwnerInAnyOrderOfCommandsNamesAndErrors) {
  std::mt19937 random(20240601);
  const auto pick = [&random](std::size_t count) { return static_cast<std::size_t>(random() % count); };
  for (int round = 0; round < 20000; ++round) {
    std::string text;
    for (std::size_t left = 1 + pick(12); left > 0; --left)
      text += kOwnershipCommands[pick(std::size(kOwnershipCommands))];
    text += kOwnershipErrors[pick(std::size(kOwnershipErrors))];
    const HostError code = Read(text);
    ASSERT_THAT(code, AnyOf(0, 1289985, 1289986, HOST_ERR_NUMBER_SYNTAX)) << text;
    // No two records hold the same keys.
    for (std::int64_t one = 0; one < CurveCount(); ++one) {
      for (std::int64_t other = 0; other < one; ++other) {
        if (CurveAt(one).keys == nullptr) continue;
        ASSERT_NE(CurveAt(one).keys, CurveAt(other).keys) << text;
      }
    }
    EndScene();
    ASSERT_THAT(HeldObjects(), IsEmpty()) << text;
  }
}

TEST_F(FailureTest, KeysHaveOneOwnerAlsoWhereAListFails) {
  const std::string scene =
      "createNode animCurveTL -n \"a\";\nsetAttr \".ktv\" 1 0 2 5;\ncreateNode animCurveTL -n \"a\";\n"
      "setAttr \".ktv\" 1 7 2 8;\nsetAttr \".ktv\" 3 9;\ncreateNode animCurveTL -n \"A\";\nsetAttr \".tan\" "
      "18;\n"
      "setAttr \".ktv\" 4 4;\nselect a;\ncreateNode animCurveTU;\nsetAttr \".ktv\" 1 1;\n";
  for (const Service& service : kServices) {
    const std::int64_t calls = CallsOf(service.number, scene);
    for (std::int64_t nth = 1; nth <= calls; ++nth) {
      for (const HostError code : {kRehearsedCode, 0}) {
        SCOPED_TRACE(service.name + std::to_string(nth));
        {
          const UtilityRehearsal failing(service.number, nth, code);
          const HostError result = Read(scene);
          if (code != 0) {
            EXPECT_EQ(result, code);
          }
        }
        ExpectNothingLeft();
      }
    }
  }
}

}  // namespace
}  // namespace testsupport
