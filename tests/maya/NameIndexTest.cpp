#include "maya/NameIndex.h"

#include <gtest/gtest.h>

#include <cstdint>
#include <set>
#include <string>
#include <vector>

#include "maya/SceneRecords.h"

using namespace mayaimport;

namespace testsupport {
namespace {

class NameIndexTest : public ::testing::Test {
 protected:
  // Takes in the next record of the list, of that name.
  std::int32_t Add(const std::string& name) { return index_.Append(count_++, name); }

  std::int32_t Find(const std::string& name) const { return index_.Find(name); }

 private:
  NameIndex index_;
  std::int32_t count_ = 0;
};

TEST_F(NameIndexTest, AnEmptyIndexFindsNothing) {
  EXPECT_EQ(Find("a"), kNoIndex);
  EXPECT_EQ(Find(""), kNoIndex);
}

TEST_F(NameIndexTest, AppendGivesTheFirstRecordOfTheName) {
  EXPECT_EQ(Add("a"), 0);
  EXPECT_EQ(Add("b"), 1);
  EXPECT_EQ(Add("A"), 0);
  EXPECT_EQ(Add("B"), 1);
  EXPECT_EQ(Add("c"), 4);
  EXPECT_EQ(Add("a"), 0);
}

TEST_F(NameIndexTest, FindGivesTheFirstRecordInAnyCase) {
  Add("Camera1");
  Add("camera1");
  Add("CAMERA2");
  EXPECT_EQ(Find("cAMERA1"), 0);
  EXPECT_EQ(Find("camera2"), 2);
  EXPECT_EQ(Find("camera"), kNoIndex);
  EXPECT_EQ(Find("camera11"), kNoIndex);
}

TEST_F(NameIndexTest, TheEmptyNameIsANameLikeAnyOther) {
  Add("a");
  EXPECT_EQ(Find(""), kNoIndex);
  EXPECT_EQ(Add(""), 1);
  EXPECT_EQ(Add(""), 1);
  EXPECT_EQ(Find(""), 1);
}

TEST_F(NameIndexTest, OnlyTheLettersAToZAreFolded) {
  EXPECT_EQ(Add("[x"), 0);
  EXPECT_EQ(Add("{x"), 1);
  EXPECT_EQ(Add("@"), 2);
  EXPECT_EQ(Add("`"), 3);
  EXPECT_EQ(Add("\xc3\x89"), 4);
  EXPECT_EQ(Add("\xc3\xa9"), 5);
  EXPECT_EQ(Add("_"), 6);
  EXPECT_EQ(Add("\x7f"), 7);
  EXPECT_EQ(Add("0"), 8);
  EXPECT_EQ(Add("\x10"), 9);
  EXPECT_EQ(Find("{X"), 1);
}

TEST_F(NameIndexTest, TheLongestNamesAreDistinguished) {
  const std::string common(254, 'n');
  EXPECT_EQ(Add(common + "a"), 0);
  EXPECT_EQ(Add(common + "b"), 1);
  EXPECT_EQ(Add(common), 2);
  EXPECT_EQ(Find(common + "B"), 1);
}

TEST_F(NameIndexTest, ManyNamesAreAllFound) {
  constexpr std::int32_t kNames = 20000;
  for (std::int32_t number = 0; number < kNames; ++number)
    ASSERT_EQ(Add("node_" + std::to_string(number)), number);
  for (std::int32_t number = 0; number < kNames; ++number)
    ASSERT_EQ(Find("NODE_" + std::to_string(number)), number);
  EXPECT_EQ(Find("node_" + std::to_string(kNames)), kNoIndex);
}

TEST_F(NameIndexTest, ANameLongerThanARecordHoldsIsNeverFound) {
  Add(std::string(255, 'n'));
  EXPECT_EQ(Find(std::string(255, 'N')), 0);
  EXPECT_EQ(Find(std::string(256, 'n')), kNoIndex);
  EXPECT_EQ(Find(std::string(5000, 'n')), kNoIndex);
}

TEST_F(NameIndexTest, AnEmbeddedNulIsPartOfAName) {
  EXPECT_EQ(Add("rig"), 0);
  EXPECT_EQ(Find(std::string("rig\0", 4)), kNoIndex);
  EXPECT_EQ(Add(std::string("rig\0", 4)), 1);
  EXPECT_EQ(Find("RIG"), 0);
}

// The hash is drawn anew in each run. Once in some hundred thousand draws it does not see one difference
// between names: all names with just that difference then meet. So the limits are not 0.
void ExpectMeetings(const std::vector<std::string>& names, std::size_t atMost) {
  std::set<std::uint32_t> hashes;
  for (const std::string& name : names) hashes.insert(NameIndex::Hash(name));
  EXPECT_GE(hashes.size() + atMost, names.size());
}

TEST_F(NameIndexTest, NamesThatDifferInTheHighestBitsHardlyMeet) {
  constexpr std::size_t kPairs = 12;  // of words of eight bytes; each pair differs in three bits or in none
  std::vector<std::string> names;
  for (unsigned choice = 0; choice < 1u << kPairs; ++choice) {
    std::string name(kPairs * 16, 'n');
    for (std::size_t pair = 0; pair < kPairs; ++pair) {
      if ((choice >> pair & 1) == 0) continue;
      for (const std::size_t byte : {7u, 11u, 15u}) name[pair * 16 + byte] = static_cast<char>('n' ^ 0x80);
    }
    names.push_back(name);
  }
  ExpectMeetings(names, names.size() / 10);
}

TEST_F(NameIndexTest, NamesThatDifferInOneBitOrTwoHardlyMeet) {
  constexpr std::size_t kBytes = 24;
  std::vector<std::string> names;
  for (std::size_t first = 0; first < kBytes * 8; ++first) {
    for (std::size_t second = first + 1; second < kBytes * 8; ++second) {
      std::string name(kBytes, '\x80');  // its variants hold no letters whose case is folded
      for (const std::size_t bit : {first, second})
        name[bit / 8] = static_cast<char>(name[bit / 8] ^ (1 << bit % 8));
      if (name.find_first_of("ABCDEFGHIJKLMNOPQRSTUVWXYZ") == std::string::npos) names.push_back(name);
    }
  }
  // A byte that does not count makes more meet.
  ExpectMeetings(names, names.size() / 50);
}

TEST_F(NameIndexTest, NumberedNamesHardlyMeet) {
  std::vector<std::string> names;
  for (int number = 0; number < 50'000; ++number)
    names.push_back("crowd_locatorShape_" + std::to_string(number));
  ExpectMeetings(names, names.size() / 10);
}

TEST_F(NameIndexTest, NamesThatOnlyTheirLengthDistinguishesHardlyMeet) {
  std::vector<std::string> names;
  for (std::size_t size = 0; size < kNameCapacity; ++size) names.push_back(std::string(size, '\0'));
  ExpectMeetings(names, names.size() / 10);
}

}  // namespace
}  // namespace testsupport
