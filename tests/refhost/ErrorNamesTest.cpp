#include <gtest/gtest.h>

#include <set>
#include <string>

#include "hostapi/ErrorCodes.h"
#include "refhost/Host.h"

namespace refhost {
namespace {

TEST(ErrorNames, EveryCodeOfTheTableHasItsNameAndSentence) {
#define EXPECT_WORDS(name, number, sentence) \
  EXPECT_EQ(errorName(number), #name);       \
  EXPECT_EQ(errorSentence(HOST_ERR_##name), sentence);
  HOST_ERROR_TABLE(EXPECT_WORDS)
#undef EXPECT_WORDS
}

TEST(ErrorNames, NoTwoCodesShareANumber) {
  std::multiset<int> numbers;
#define COLLECT_NUMBER(name, number, sentence) numbers.insert(number);
  HOST_ERROR_TABLE(COLLECT_NUMBER)
#undef COLLECT_NUMBER
  for (const int number : numbers) EXPECT_EQ(numbers.count(number), 1U) << number;
}

TEST(ErrorNames, CodeOfNoTableHasNoWords) {
  EXPECT_EQ(errorName(0), "");
  EXPECT_EQ(errorSentence(0), "");
  EXPECT_EQ(errorName(-5), "");
}

}  // namespace
}  // namespace refhost
