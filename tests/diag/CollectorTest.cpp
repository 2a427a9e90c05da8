#include "diag/Collector.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>

namespace diag {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;
using testing::Pair;
using testing::SizeIs;

TEST(CollectorTest, ADiagnosticHasItsLineAndColumn) {
  const std::string text = "abc\ndefgh";
  Collector collector(text);
  collector.Report(Code::CommandCutOff, {6, 2}, {"createNode"});
  ASSERT_THAT(collector.kept(), SizeIs(1));
  const Diagnostic expected{
      .code = Code::CommandCutOff, .range = {6, 2}, .place = {2, 3}, .arguments = {"createNode"}};
  EXPECT_EQ(collector.kept()[0], expected);
}

TEST(CollectorTest, TheFirstFewOfEachCodeAreKeptAndTheRestCounted) {
  Collector collector("", 3);
  for (std::uint64_t i = 0; i < 5; ++i) collector.Report(Code::OpenString, {i, 1});
  for (std::uint64_t i = 0; i < 3; ++i) collector.Report(Code::NameTaken, {i, 1}, {"a", "b"});
  ASSERT_THAT(collector.kept(), SizeIs(6));
  EXPECT_EQ(collector.kept()[2].range.offset, 2u);
  EXPECT_EQ(collector.kept()[3].code, Code::NameTaken);
  EXPECT_EQ(collector.CountOf(Code::OpenString), 5u);
  EXPECT_EQ(collector.CountOf(Code::OpenComment), 0u);
  EXPECT_EQ(collector.CountOf(Severity::Warning), 5u);
  EXPECT_EQ(collector.CountOf(Severity::Note), 3u);
  EXPECT_EQ(collector.CountOf(Severity::Error), 0u);
  EXPECT_EQ(collector.count(), 8u);
  EXPECT_THAT(collector.NotKept(), ElementsAre(Pair(Code::OpenString, 2u)));
}

TEST(CollectorTest, AnEmptyOneHasNothing) {
  const Collector collector("abc");
  EXPECT_THAT(collector.kept(), IsEmpty());
  EXPECT_THAT(collector.NotKept(), IsEmpty());
  EXPECT_EQ(collector.count(), 0u);
}

TEST(CollectorTest, ALongArgumentIsCut) {
  Collector collector("");
  const std::string fits(Collector::kLongestArgument, 'x');
  collector.Report(Code::CommandCutOff, {}, {fits});
  collector.Report(Code::CommandCutOff, {}, {fits + 'y'});
  EXPECT_THAT(collector.kept()[0].arguments, ElementsAre(fits));
  EXPECT_THAT(collector.kept()[1].arguments, ElementsAre(fits + "..."));
}

}  // namespace
}  // namespace diag
