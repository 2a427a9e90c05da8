#include "plugin/QZGP_SuiteHandler.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <functional>
#include <optional>

#include "tests/support/FakeHost.h"

using namespace mayaimport;

namespace testsupport {
namespace {

using ::testing::ElementsAre;
using ::testing::ElementsAreArray;
using ::testing::Eq;
using ::testing::IsEmpty;
using ::testing::Throws;

struct Access {
  SuiteKey key;
  const void* (*table)(QZGP_SuiteHandler&);
};

// In the order of release.
const std::vector<Access>& Accesses() {
  static const std::vector<Access> kAccesses = {
      {{"QZGP Utility Suite", 7}, [](QZGP_SuiteHandler& h) -> const void* { return &h.UtilitySuite7(); }},
      {{"QZGP Memory Suite", 1}, [](QZGP_SuiteHandler& h) -> const void* { return &h.MemorySuite1(); }},
      {{"QZGP Persistent Data Suite", 3},
       [](QZGP_SuiteHandler& h) -> const void* { return &h.PersistentDataSuite3(); }},
      {{"QZGP Register Suite", 6}, [](QZGP_SuiteHandler& h) -> const void* { return &h.RegisterSuite6(); }},
      {{"QZGP File Import Manager Suite", 3},
       [](QZGP_SuiteHandler& h) -> const void* { return &h.FileImportManagerSuite3(); }},
      {{"QZGP Comp Suite", 21}, [](QZGP_SuiteHandler& h) -> const void* { return &h.CompSuite21(); }},
      {{"QZGP Comp Suite", 9}, [](QZGP_SuiteHandler& h) -> const void* { return &h.CompSuite9(); }},
      {{"QZGP Layer Suite", 10}, [](QZGP_SuiteHandler& h) -> const void* { return &h.LayerSuite10(); }},
      {{"QZGP Camera Suite", 2}, [](QZGP_SuiteHandler& h) -> const void* { return &h.CameraSuite2(); }},
      {{"QZGP Stream Suite", 7}, [](QZGP_SuiteHandler& h) -> const void* { return &h.StreamSuite7(); }},
      {{"QZGP Stream Suite", 8}, [](QZGP_SuiteHandler& h) -> const void* { return &h.StreamSuite8(); }},
      {{"QZGP Keyframe Suite", 3}, [](QZGP_SuiteHandler& h) -> const void* { return &h.KeyframeSuite3(); }},
      {{"QZGP Keyframe Suite", 4}, [](QZGP_SuiteHandler& h) -> const void* { return &h.KeyframeSuite4(); }},
  };
  return kAccesses;
}

class SuiteHandlerTest : public ::testing::Test {
 protected:
  FakeHost host_;
};

using SuiteHandlerDeathTest = SuiteHandlerTest;

TEST_F(SuiteHandlerTest, NothingIsAcquiredBeforeItIsUsed) {
  { QZGP_SuiteHandler handler(host_.basicSuite()); }
  EXPECT_THAT(host_.acquisitions, IsEmpty());
  EXPECT_THAT(host_.releases, IsEmpty());
}

TEST_F(SuiteHandlerTest, EverySuiteIsAcquiredOnceByNameAndVersionAndReleasedOnce) {
  for (const Access& access : Accesses()) {
    SCOPED_TRACE(access.key.first);
    host_.acquisitions.clear();
    host_.releases.clear();
    {
      QZGP_SuiteHandler handler(host_.basicSuite());
      const void* const table = host_.table(access.key.first, access.key.second);
      EXPECT_EQ(access.table(handler), table);
      EXPECT_EQ(access.table(handler), table);
      EXPECT_THAT(host_.acquisitions, ElementsAre(access.key));
      EXPECT_THAT(host_.releases, IsEmpty());
    }
    EXPECT_THAT(host_.acquisitions, ElementsAre(access.key));
    EXPECT_THAT(host_.releases, ElementsAre(access.key));
  }
}

TEST_F(SuiteHandlerTest, ReleasesComeInTheirFixedOrderWhateverTheOrderOfUse) {
  std::vector<SuiteKey> order;
  for (const Access& access : Accesses()) order.push_back(access.key);
  {
    QZGP_SuiteHandler handler(host_.basicSuite());
    for (auto access = Accesses().rbegin(); access != Accesses().rend(); ++access) access->table(handler);
  }
  EXPECT_THAT(host_.releases, ElementsAreArray(order));
  EXPECT_THAT(host_.held, IsEmpty());
}

TEST_F(SuiteHandlerTest, ANullTableIsAMissingSuiteAndIsNotReleased) {
  for (const Access& access : Accesses()) {
    host_.nullTables.insert(access.key);
    {
      QZGP_SuiteHandler handler(host_.basicSuite());
      EXPECT_THAT([&] { access.table(handler); }, Throws<int>(Eq(13))) << access.key.first;
    }
    EXPECT_THAT(host_.releases, IsEmpty());
  }
}

TEST_F(SuiteHandlerTest, AFailedAcquisitionIsAMissingSuiteAndIsTriedAgainAtTheNextUse) {
  for (const Access& access : Accesses()) {
    host_.acquisitions.clear();
    host_.releases.clear();
    {
      QZGP_SuiteHandler handler(host_.basicSuite());
      host_.acquireErrors[access.key] = 99;
      EXPECT_THAT([&] { access.table(handler); }, Throws<int>(Eq(13)));
      EXPECT_THAT([&] { access.table(handler); }, Throws<int>(Eq(13)));
      host_.acquireErrors.clear();
      EXPECT_EQ(access.table(handler), host_.table(access.key.first, access.key.second));
    }
    EXPECT_THAT(host_.acquisitions, ElementsAre(access.key, access.key, access.key));
    EXPECT_THAT(host_.releases, ElementsAre(access.key));
  }
}

TEST_F(SuiteHandlerTest, AHandlerKeepsItsOwnAcquisitions) {
  QZGP_SuiteHandler one(host_.basicSuite());
  QZGP_SuiteHandler other(host_.basicSuite());
  one.UtilitySuite7();
  other.UtilitySuite7();
  EXPECT_EQ(host_.acquisitions.size(), 2u);
}

TEST_F(SuiteHandlerTest, ANullBasicSuiteIsAMissingSuite) {
  EXPECT_THAT([] { QZGP_SuiteHandler handler(nullptr); }, Throws<int>(Eq(13)));
  EXPECT_THAT([] { QZGP_SuiteHandler::MissingSuiteError(); }, Throws<int>(Eq(13)));
}

TEST_F(SuiteHandlerDeathTest, AnExceptionOutOfAReleaseEndsTheProcess) {
  GTEST_FLAG_SET(death_test_style, "threadsafe");
  EXPECT_DEATH(
      {
        try {
          QZGP_SuiteHandler handler(host_.basicSuite());
          handler.UtilitySuite7();
          host_.releaseThrows = true;
        } catch (...) {
        }
      },
      "");
}

}  // namespace
}  // namespace testsupport
