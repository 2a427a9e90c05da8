// What the services do when there is no memory: each allocation of each is made to fail in turn.
#include "LimitedMemory.h"

#include <cstdint>

#include "UtilityTest.h"

namespace hostutil_tests {
namespace {

class ExhaustedMemoryTest : public UtilityTest {
 protected:
  // Calls it with room for 0, 1, 2, ... allocations until it succeeds; returns how often it failed, each time
  // with the code.
  template <typename Call>
  static int FailuresUntilItSucceeds(HostError expected, Call call) {
    constexpr int kMost = 100;
    for (int allocations = 0; allocations < kMost; ++allocations) {
      HostError code = HOST_ERR_NONE;
      {
        const LimitedMemory limited(allocations);
        code = call();
      }
      if (RefusedAllocations() == 0) {
        EXPECT_EQ(code, HOST_ERR_NONE) << allocations << " allocations are enough";
        return allocations;
      }
      EXPECT_EQ(code, expected) << "with " << allocations << " allocations";
    }
    ADD_FAILURE() << "never has enough";
    return kMost;
  }
};

// Longer than what a std::string keeps in place.
constexpr const char* kLongName = "/a/folder/with/a/long/name/that/does/not/fit/in/place/scene.ma";

TEST_F(ExhaustedMemoryTest, ATextIsMadeOrNullIsHandedOut) {
  UTF16String* text = nullptr;
  EXPECT_GT(FailuresUntilItSucceeds(HOST_ERR_TEXT_MEMORY,
                                    [&] {
                                      EXPECT_EQ(text, nullptr);
                                      return UTF16StringMakeFromBytes(kLongName, &text);
                                    }),
            1);
  EXPECT_EQ(ShownAndReleased(text), kLongName);
}

TEST_F(ExhaustedMemoryTest, AFileIsMadeOrNullIsHandedOut) {
  UTF16String* path = MakeText(kLongName);
  HostFile* file = nullptr;
  EXPECT_GT(FailuresUntilItSucceeds(HOST_ERR_TEXT_MEMORY,
                                    [&] {
                                      EXPECT_EQ(file, nullptr);
                                      return HostFileCreate(path, &file);
                                    }),
            2);
  UTF16StringRelease(path);
  ASSERT_EQ(Ledger().size(), 1u) << "what could not be made whole is not held";
  EXPECT_EQ(Ledger()[0].description, std::string("file ") + kLongName);
  EXPECT_EQ(HostFileDispose(file), HOST_ERR_NONE);
}

TEST_F(ExhaustedMemoryTest, AFilesNameIsMadeOrNullIsHandedOut) {
  HostFile* file = MakeFile(kLongName);
  UTF16String* name = nullptr;
  EXPECT_GT(FailuresUntilItSucceeds(HOST_ERR_TEXT_MEMORY,
                                    [&] {
                                      EXPECT_EQ(name, nullptr);
                                      return HostFileName(file, &name);
                                    }),
            1);
  EXPECT_EQ(ShownAndReleased(name), "scene.ma");
  EXPECT_EQ(HostFileDispose(file), HOST_ERR_NONE);
}

TEST_F(ExhaustedMemoryTest, AStringTableIsRegisteredWholeOrNotAtAll) {
  const char* const entries[] = {"$$$/a/key/that/does/not/fit/in/place=and a text that does not fit either",
                                 "$$$/another/key/that/does/not/fit=another text that does not fit in place"};
  HostStringTable* table = nullptr;
  EXPECT_GT(FailuresUntilItSucceeds(HOST_ERR_STRING_TABLE,
                                    [&] {
                                      EXPECT_EQ(table, nullptr);
                                      return HostRegisterStringTable("exhausted", entries, 2, &table);
                                    }),
            4);
  EXPECT_STREQ(HostLocalizedString(table, 1), "another text that does not fit in place");
  EXPECT_EQ(HostUnregisterStringTable(table), HOST_ERR_NONE);
}

TEST_F(ExhaustedMemoryTest, ATranslationIsSetOrRefused) {
  const char* const entries[] = {"$$$/a/key/that/does/not/fit/in/place=default"};
  HostStringTable* table = nullptr;
  ASSERT_EQ(HostRegisterStringTable("exhausted", entries, 1, &table), HOST_ERR_NONE);
  const int failures = FailuresUntilItSucceeds(HOST_ERR_TEXT_MEMORY, [&] {
    return HostSetTranslation("$$$/a/key/that/does/not/fit/in/place",
                              "a translation of more than a few letters");
  });
  EXPECT_GT(failures, 1);
  EXPECT_STREQ(HostLocalizedString(table, 0), "a translation of more than a few letters");
  EXPECT_EQ(HostUnregisterStringTable(table), HOST_ERR_NONE);
}

TEST_F(ExhaustedMemoryTest, AFailureIsPlannedOrRefused) {
  const HostUtilityFailure failure{HOST_UTILITY_ListCount, 1, 77, HOST_THROW_NOTHING};
  {
    const LimitedMemory none(0);
    // After failures that were planned and cleared before there may be room left.
    for (int i = 0; i < 100 && RefusedAllocations() == 0; ++i) {
      const HostError code = HostAddUtilityFailure(&failure);
      EXPECT_EQ(code, RefusedAllocations() == 0 ? HOST_ERR_NONE : HOST_ERR_EXCEPTION_MEMORY);
    }
  }
  EXPECT_GT(RefusedAllocations(), 0);
}

TEST_F(ExhaustedMemoryTest, AListIsMadeOrNullIsHandedOut) {
  RecordList* list = nullptr;
  EXPECT_EQ(FailuresUntilItSucceeds(HOST_ERR_LIST_MEMORY,
                                    [&] {
                                      EXPECT_EQ(list, nullptr);
                                      return RecordListCreate(16, 1, 3, &list);
                                    }),
            1);
  EXPECT_EQ(RecordListDispose(list), HOST_ERR_NONE);
}

TEST_F(ExhaustedMemoryTest, ALockIsCountedOrRefused) {
  RecordList* list = nullptr;
  ASSERT_EQ(RecordListCreate(16, 1, 3, &list), HOST_ERR_NONE);
  void* record = nullptr;
  ASSERT_EQ(RecordListLock(list, 0, &record), HOST_ERR_NONE) << "the first record's locks need no memory";
  void* other = nullptr;
  EXPECT_GE(FailuresUntilItSucceeds(HOST_ERR_LIST_MEMORY,
                                    [&] {
                                      EXPECT_EQ(other, nullptr);
                                      return RecordListLock(list, 2, &other);
                                    }),
            1);
  EXPECT_EQ(RecordListUnlock(list, 2), HOST_ERR_NONE);
  EXPECT_EQ(RecordListUnlock(list, 2), HOST_ERR_LIST_INDEX) << "it was locked once";
  EXPECT_EQ(RecordListUnlock(list, 0), HOST_ERR_NONE);
  EXPECT_EQ(RecordListAppend(list, "sixteen bytes..."), HOST_ERR_NONE) << "nothing is locked";
  EXPECT_EQ(RecordListDispose(list), HOST_ERR_NONE);
}

TEST_F(ExhaustedMemoryTest, TheLedgerStillNamesTheKinds) {
  HostFile* file = MakeFile(kLongName);
  RecordList* list = nullptr;
  ASSERT_EQ(RecordListCreate(16, 1, 3, &list), HOST_ERR_NONE);
  struct Seen {
    int lines = 0;
    bool isFile = false;
    bool isList = false;
  } seen;
  {
    const LimitedMemory none(0);
    HostVisitLedger(
        [](void* context, std::int32_t, const char* description, std::int32_t) {
          auto* const into = static_cast<Seen*>(context);
          ++into->lines;
          into->isFile = into->isFile || std::string_view(description) == "file";
          into->isList = into->isList || std::string_view(description) == "list";
        },
        &seen);
  }
  EXPECT_EQ(seen.lines, 2);
  EXPECT_TRUE(seen.isFile);
  EXPECT_TRUE(seen.isList);
  EXPECT_EQ(RecordListDispose(list), HOST_ERR_NONE);
  EXPECT_EQ(HostFileDispose(file), HOST_ERR_NONE);
}

}  // namespace
}  // namespace hostutil_tests
