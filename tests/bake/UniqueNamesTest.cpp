#include "bake/UniqueNames.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>

namespace {

using bake::UniqueNames;
using testing::EndsWith;
using testing::SizeIs;

TEST(UniqueNames, AFreeNameStays) {
  UniqueNames names;
  EXPECT_EQ(names.Take("ns:shotCam"), "ns:shotCam");
  EXPECT_EQ(names.Take("shotCam"), "shotCam");
}

TEST(UniqueNames, NamesThatDifferInCaseAloneAreNumbered) {
  UniqueNames names;
  EXPECT_EQ(names.Take("Cam"), "Cam");
  EXPECT_EQ(names.Take("cam"), "cam_2");
  EXPECT_EQ(names.Take("CAM"), "CAM_3");
}

TEST(UniqueNames, ANumberThatIsTakenIsPassedOver) {
  UniqueNames names;
  EXPECT_EQ(names.Take("cam_2"), "cam_2");
  EXPECT_EQ(names.Take("cam"), "cam");
  EXPECT_EQ(names.Take("cam"), "cam_3");
}

TEST(UniqueNames, TheNameThatTheImporterDropsIsNeverGiven) {
  UniqueNames names;
  EXPECT_EQ(names.Take("perspShape"), "perspShape_2");
  EXPECT_EQ(names.Take("PERSPSHAPE"), "PERSPSHAPE_3");
}

TEST(UniqueNames, WhatCannotStandInANameBecomesAnUnderscore) {
  UniqueNames names;
  EXPECT_EQ(names.Take("a\"b.c|d\\e\nf"), "a_b_c_d_e_f");
  EXPECT_EQ(names.Take("\xc3\xa4hnlich"), "\xc3\xa4hnlich");
}

TEST(UniqueNames, AnEmptyNameIsANode) {
  UniqueNames names;
  EXPECT_EQ(names.Take(""), "node");
  EXPECT_EQ(names.Take(""), "node_2");
}

TEST(UniqueNames, ALongNameIsCutAt200BytesAlsoWithANumber) {
  UniqueNames names;
  const std::string name(300, 'x');
  EXPECT_EQ(names.Take(name), std::string(200, 'x'));
  EXPECT_EQ(names.Take(name), std::string(189, 'x') + "_2");
}

// Each would try all numbers of those before it.
TEST(UniqueNames, LongNamesThatBeginAlikeCountTogether) {
  UniqueNames names;
  const std::string beginning(195, 'x');
  for (int i = 10'000; i < 30'000; ++i) {
    const std::string name = beginning + std::to_string(i);
    EXPECT_EQ(names.Take(name), name);
    EXPECT_EQ(names.Take(name), std::string(189, 'x') + "_" + std::to_string(i - 10'000 + 2));
  }
}

TEST(UniqueNames, NoCharacterIsCutInTwo) {
  UniqueNames names;
  const std::string name = std::string(199, 'x') + "\xc3\xa4";
  EXPECT_EQ(names.Take(name), std::string(199, 'x'));
}

TEST(UniqueNames, ManyNodesOfOneNameAreNumberedInTheirOrder) {
  UniqueNames names;
  for (int i = 0; i < 9'999; ++i) names.Take("cam");
  EXPECT_EQ(names.Take("cam"), "cam_10000");
}

}  // namespace
