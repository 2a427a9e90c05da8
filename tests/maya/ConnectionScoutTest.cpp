// The scout reads ahead in a text that is not checked yet: it stays within the text, and within a bound.
#include "maya/ConnectionScout.h"

#include <gtest/gtest.h>

#include <string>
#include <string_view>

#include "maya/SceneRecords.h"
#include "tests/scan/HostileTexts.h"
#include "tests/support/GuardedMemory.h"

using namespace mayaimport;

namespace testsupport {
namespace {

constexpr std::string_view kCommand = "connectAttr \"curve.o\" \"node.tx\";\n";

class ConnectionScoutTest : public ::testing::Test {
 protected:
  ConnectionScoutTest() {
    curves_.Append(0, "curve");
    transforms_.Append(0, "node");
  }

  // Looks ahead from every place of the text on, as if a command stood there. The text's NUL is the last byte
  // that may be read.
  void LookAheadEverywhere(std::string_view text) {
    const char* const end = room_.Put(text, 0);
    ConnectionScout scout;
    for (const char* at = end - text.size(); at <= end; ++at) {
      scout.LookAhead(at, end, curves_, transforms_);
      ConnectionScout().LookAhead(at, end, curves_, transforms_);
    }
  }

  // Looks ahead in a text of which no more than this beginning may be read.
  void LookAheadAtMost(std::string_view beginning) {
    const char* const text = room_.Hold(beginning, 0);
    ConnectionScout().LookAhead(text, text + beginning.size() + GuardedMemory::kForbiddenAfter - 1, curves_,
                                transforms_);
  }

  NameIndex curves_;
  NameIndex transforms_;
  GuardedMemory room_;
};

TEST_F(ConnectionScoutTest, ACommandCutAtAnyByteIsReadNoFurther) {
  std::string text;
  for (int i = 0; i < 3; ++i) text += kCommand;
  for (std::size_t size = 0; size <= text.size(); ++size) {
    LookAheadEverywhere(std::string_view(text).substr(0, size));
  }
}

TEST_F(ConnectionScoutTest, CommandsThatAreNotWholeAreReadNoFurther) {
  const std::string longName(kNameCapacity * 3, 'n');
  for (const std::string& command :
       {std::string("connectAttr \""), std::string("connectAttr \"\" \"\";"),
        std::string("connectAttr \".\" \"."),
        "connectAttr \"" + longName + "." + longName + "\" \"" + longName,
        std::string("connectAttr \"a.b\" \""), std::string("connectAttr \"a\\\".b\" \"c.d\";"),
        std::string(5000, '\n'), std::string(5000, '"')}) {
    LookAheadEverywhere("\n" + command);
    LookAheadEverywhere("\n" + command + "\n" + command + "\n");
  }
}

TEST_F(ConnectionScoutTest, RandomHostileTextsAreReadNoFurtherThanTheirEnd) {
  constexpr int kTexts = 5'000;
  HostileTexts texts(20261122);
  for (int i = 0; i < kTexts; ++i) {
    std::string text(texts.Next());
    for (int commands = texts.Pick(0, 4); commands > 0; --commands) {
      const auto place = static_cast<std::size_t>(texts.Pick(0, static_cast<int>(text.size())));
      text.insert(place, kCommand.substr(0, static_cast<std::size_t>(texts.Pick(1, 33))));
    }
    LookAheadEverywhere(text);
  }
}

TEST_F(ConnectionScoutTest, OneCommandIsLookedForInTwoThousandBytesHoweverLongTheTextIs) {
  constexpr std::size_t kBound = 2100;
  for (const std::string& head :
       {std::string(), std::string("\n"), std::string("\nconnectAttr \""), std::string("\nconnectAttr \"a."),
        std::string("\nconnectAttr \"a.b\" \""), std::string("\nconnectAttr \"a.b\" \"c.")}) {
    for (const char fill : {' ', 'n', ';'}) {
      std::string text = head;
      text.resize(kBound, fill);
      LookAheadAtMost(text);
    }
  }
}

TEST_F(ConnectionScoutTest, NoMoreThanEightCommandsAreLookedAtAhead) {
  std::string text = "\n";
  for (int i = 0; i < 8; ++i) text += kCommand;
  LookAheadAtMost(text + 'c');
}

}  // namespace
}  // namespace testsupport
