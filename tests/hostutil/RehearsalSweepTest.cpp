// Every service made to fail in every way.
#include <gtest/gtest.h>

#include <cstdint>
#include <cstring>
#include <functional>
#include <memory>
#include <new>
#include <set>
#include <stdexcept>
#include <string>
#include <vector>

#include "TemporaryFolder.h"
#include "UtilityTest.h"
#include "hostutil/HostSetup.h"
#include "tests/support/ThrowsOther.h"

namespace hostutil_tests {
namespace {

// Objects for one call. They end with the leftovers.
struct Scene {
  Scene() {
    file = MakeFile(folder.Write("scene.ma", "abcdef"));
    openFile = MakeFile(folder.Path("scene.ma"));
    EXPECT_EQ(HostFileOpen(openFile, HOST_FILE_READ), HOST_ERR_NONE);
    text = MakeText("shot.ma");
    EXPECT_EQ(RecordListCreate(sizeof(std::int64_t), 4, 3, &list), HOST_ERR_NONE);
    void* locked = nullptr;
    EXPECT_EQ(RecordListLock(list, 1, &locked), HOST_ERR_NONE);
    EXPECT_EQ(RecordListCreate(sizeof(std::int64_t), 4, 3, &openList), HOST_ERR_NONE);
    EXPECT_EQ(MatrixSetIdentity(&matrix), HOST_ERR_NONE);
    EXPECT_EQ(MatrixTranslate(&matrix, 1, 2, 3), HOST_ERR_NONE);
    before = matrix;
  }
  Scene(const Scene&) = delete;
  Scene& operator=(const Scene&) = delete;

  TemporaryFolder folder;
  HostFile* file = nullptr;
  HostFile* openFile = nullptr;
  UTF16String* text = nullptr;
  RecordList* list = nullptr;      // its record 1 is locked
  RecordList* openList = nullptr;  // nothing is locked
  TransformMatrix matrix{};
  TransformMatrix before{};  // the matrix as the call found it

  // What calls hand out; none of it null or zero beforehand.
  HostFile* madeFile = reinterpret_cast<HostFile*>(1);
  UTF16String* madeText = reinterpret_cast<UTF16String*>(1);
  RecordList* madeList = reinterpret_cast<RecordList*>(1);
  HostStringTable* madeTable = reinterpret_cast<HostStringTable*>(1);
  void* address = reinterpret_cast<void*>(1);
  const void* run = reinterpret_cast<void*>(1);
  std::int64_t number = 99;
  std::int32_t order = 99;
  double value = 99;
  std::int64_t record = 99;
  char buffer[8] = "???????";
  MatrixComponents components{{9, 9, 9}, {9, 9, 9}, {9, 9, 9}, {9, 9, 9}};
};

// A function of the library as a fault point: how to call it on a scene, and how to see that it did nothing.
struct FaultPoint {
  const char* function;
  std::int32_t service;
  std::function<HostError(Scene*)> call;
  std::function<bool(Scene*)> didNothing;  // and handed out null or zero
};

template <typename Record>
bool AllZero(const Record& record) {
  const Record zero{};
  return std::memcmp(&record, &zero, sizeof zero) == 0;
}

bool MatrixUntouched(Scene* s) { return std::memcmp(&s->matrix, &s->before, sizeof s->before) == 0; }

std::int64_t CountOf(const RecordList* list) {
  std::int64_t count = -1;
  EXPECT_EQ(RecordListCount(list, &count), HOST_ERR_NONE);
  return count;
}

const std::int64_t kSeven = 7;
const std::int64_t kRun[] = {7, 8};

const PivotedTransform kPivoted = {{1, 2, 3}, {4, 5, 6}, {7, 8, 9}, {0.1, 0.2, 0.3}, {10, 11, 12}};

HostError CallRegister(Scene* s) {
  const char* const entries[] = {"key=text"};
  const HostError code = HostRegisterStringTable("Sweep", entries, 1, &s->madeTable);
  if (code == HOST_ERR_NONE && s->madeTable != nullptr) HostUnregisterStringTable(s->madeTable);
  return code;
}

HostError CallUnits(Scene* s) {
  const HostUTF16Unit units[] = {'a', 0};
  return UTF16StringMakeFromUnits(units, &s->madeText);
}

HostError CallCompare(Scene* s) {
  const HostRatio small{1, 2};
  const HostRatio large{2, 3};
  return HostRatioCompare(&small, &large, &s->order);
}

bool NoText(Scene* s) { return s->madeText == nullptr; }
bool EmptyBuffer(Scene* s) { return std::memcmp(s->buffer, "\0??????", 7) == 0; }

bool StillClosed(Scene* s) { return HostFileOpen(s->file, HOST_FILE_READ) == HOST_ERR_NONE; }

// Nothing was read: the file is still at its start.
bool NothingRead(Scene* s) {
  char bytes[3] = "";
  return std::memcmp(s->buffer, "\0\0\0????", 7) == 0 && HostFileRead(s->openFile, 3, bytes) == 0 &&
         std::memcmp(bytes, "abc", 3) == 0;
}

bool StillOpen(Scene* s) {
  char byte = '?';
  return HostFileRead(s->openFile, 1, &byte) == HOST_ERR_NONE;
}

bool StillLocked(Scene* s) {
  return RecordListUnlock(s->list, 1) == HOST_ERR_NONE && RecordListUnlock(s->list, 1) == HOST_ERR_LIST_INDEX;
}

const std::vector<FaultPoint>& FaultPoints() {
  static const std::vector<FaultPoint> points = {
      {"HostFileCreate", HOST_UTILITY_FileCreate,
       [](Scene* s) { return HostFileCreate(s->text, &s->madeFile); },
       [](Scene* s) { return s->madeFile == nullptr; }},
      {"HostFileOpen", HOST_UTILITY_FileOpen, [](Scene* s) { return HostFileOpen(s->file, HOST_FILE_READ); },
       StillClosed},
      {"HostFileRead", HOST_UTILITY_FileRead,
       [](Scene* s) { return HostFileRead(s->openFile, 3, s->buffer); }, NothingRead},
      {"HostFileClose", HOST_UTILITY_FileClose, [](Scene* s) { return HostFileClose(s->openFile); },
       StillOpen},
      {"HostFileSize", HOST_UTILITY_FileSize, [](Scene* s) { return HostFileSize(s->file, &s->number); },
       [](Scene* s) { return s->number == 0; }},
      {"HostFileName", HOST_UTILITY_FileName, [](Scene* s) { return HostFileName(s->file, &s->madeText); },
       NoText},
      {"HostFileDispose", HOST_UTILITY_FileDispose, [](Scene* s) { return HostFileDispose(s->openFile); },
       StillOpen},
      {"HostStripExtension", HOST_UTILITY_StripExtension,
       [](Scene* s) { return HostStripExtension(s->text, 1, &s->madeText); }, NoText},
      {"HostRegisterStringTable", HOST_UTILITY_RegisterStringTable, CallRegister,
       [](Scene* s) { return s->madeTable == nullptr; }},
      {"RecordListCreate", HOST_UTILITY_ListCreate,
       [](Scene* s) { return RecordListCreate(8, 1, 0, &s->madeList); },
       [](Scene* s) { return s->madeList == nullptr; }},
      {"RecordListAppend", HOST_UTILITY_ListAppend,
       [](Scene* s) { return RecordListAppend(s->openList, &kSeven); },
       [](Scene* s) { return CountOf(s->openList) == 3; }},
      {"RecordListAppendRun", HOST_UTILITY_ListAppend,
       [](Scene* s) { return RecordListAppendRun(s->openList, kRun, 2); },
       [](Scene* s) { return CountOf(s->openList) == 3; }},
      {"RecordListGet", HOST_UTILITY_ListGet, [](Scene* s) { return RecordListGet(s->list, 0, &s->record); },
       [](Scene* s) { return s->record == 99; }},
      {"RecordListGetRun", HOST_UTILITY_ListGet,
       [](Scene* s) { return RecordListGetRun(s->list, 1, 2, &s->run); },
       [](Scene* s) { return s->run == nullptr; }},
      {"RecordListLock", HOST_UTILITY_ListLock,
       [](Scene* s) { return RecordListLock(s->openList, 0, &s->address); },
       [](Scene* s) {
         return s->address == nullptr && RecordListAppend(s->openList, &kSeven) == HOST_ERR_NONE;
       }},
      {"RecordListUnlock", HOST_UTILITY_ListUnlock, [](Scene* s) { return RecordListUnlock(s->list, 1); },
       StillLocked},
      {"RecordListCount", HOST_UTILITY_ListCount,
       [](Scene* s) { return RecordListCount(s->list, &s->number); },
       [](Scene* s) { return s->number == 0; }},
      {"UTF16StringMakeFromUnits", HOST_UTILITY_StringMake, CallUnits, NoText},
      {"UTF16StringMakeFromBytes", HOST_UTILITY_StringMake,
       [](Scene* s) { return UTF16StringMakeFromBytes("a", &s->madeText); }, NoText},
      {"HostStringCopy", HOST_UTILITY_StringCopy, [](Scene* s) { return HostStringCopy(s->buffer, 8, "ab"); },
       EmptyBuffer},
      {"HostStringFormat", HOST_UTILITY_StringFormat,
       [](Scene* s) { return HostStringFormat(s->buffer, 8, "^^1", "ab", "cd"); }, EmptyBuffer},
      {"UTF16StringFormat", HOST_UTILITY_StringFormat,
       [](Scene* s) { return UTF16StringFormat("^^1", s->text, s->text, &s->madeText); }, NoText},
      {"HostNumberScan", HOST_UTILITY_NumberScan, [](Scene* s) { return HostNumberScan("7", 1, &s->value); },
       [](Scene* s) { return s->value == 0.0; }},
      {"MatrixSetIdentity", HOST_UTILITY_MatrixSetIdentity,
       [](Scene* s) { return MatrixSetIdentity(&s->matrix); }, [](Scene* s) { return AllZero(s->matrix); }},
      {"MatrixTranslate", HOST_UTILITY_MatrixTranslate,
       [](Scene* s) { return MatrixTranslate(&s->matrix, 4, 5, 6); }, MatrixUntouched},
      {"MatrixScale", HOST_UTILITY_MatrixScale, [](Scene* s) { return MatrixScale(&s->matrix, 4, 5, 6); },
       MatrixUntouched},
      {"MatrixRotateAxis", HOST_UTILITY_MatrixRotateAxis,
       [](Scene* s) { return MatrixRotateAxis(&s->matrix, 1, 0, 0, 1); }, MatrixUntouched},
      {"MatrixDecompose", HOST_UTILITY_MatrixDecompose,
       [](Scene* s) { return MatrixDecompose(&s->matrix, &s->components, nullptr); },
       [](Scene* s) { return AllZero(s->components); }},
      {"MatrixDecomposePivoted", HOST_UTILITY_MatrixDecompose,
       [](Scene* s) { return MatrixDecomposePivoted(&kPivoted, &s->components); },
       [](Scene* s) { return AllZero(s->components); }},
      {"HostRatioCompare", HOST_UTILITY_RatioCompare, CallCompare, [](Scene* s) { return s->order == 0; }},
  };
  return points;
}

class RehearsalSweepTest : public UtilityTest {};

constexpr std::size_t kCalls = 4;

// Four calls of the function, each on a scene of its own; only the calls are part of the rehearsal.
void Rehearse(const FaultPoint& point, const HostUtilityFailure& failure) {
  SCOPED_TRACE(point.function);
  std::vector<std::unique_ptr<Scene>> scenes;
  for (std::size_t i = 0; i < kCalls; ++i) scenes.push_back(std::make_unique<Scene>());
  const auto fails = [&](std::size_t i) {
    return failure.nth == 0 || failure.nth == static_cast<std::int64_t>(i) + 1;
  };
  WithFailure(failure, [&] {
    for (std::size_t i = 0; i < kCalls; ++i) {
      Scene* const scene = scenes[i].get();
      if (!fails(i)) {
        EXPECT_EQ(point.call(scene), HOST_ERR_NONE) << "call " << i + 1;
      } else if (failure.thrown == HOST_THROW_BAD_ALLOC) {
        EXPECT_THROW(point.call(scene), std::bad_alloc) << "call " << i + 1;
      } else if (failure.thrown == HOST_THROW_RUNTIME_ERROR) {
        EXPECT_THROW(point.call(scene), std::runtime_error) << "call " << i + 1;
      } else if (failure.thrown == HOST_THROW_OTHER) {
        EXPECT_TRUE(testsupport::ThrowsOther([&] { point.call(scene); })) << "call " << i + 1;
      } else {
        EXPECT_EQ(point.call(scene), failure.code) << "call " << i + 1;
      }
    }
    EXPECT_EQ(HostUtilityCallCount(point.service), static_cast<std::int64_t>(kCalls));
  });
  for (std::size_t i = 0; i < kCalls; ++i) {
    if (fails(i) && failure.thrown != HOST_THROW_NOTHING) continue;
    EXPECT_EQ(point.didNothing(scenes[i].get()), fails(i)) << "call " << i + 1;
  }
  HostReleaseLeftovers();
}

TEST_F(RehearsalSweepTest, TheNthCallOfEveryServiceReturnsTheCodeAndDoesNothing) {
  for (const FaultPoint& point : FaultPoints()) {
    for (std::int64_t nth = 1; nth <= static_cast<std::int64_t>(kCalls); ++nth) {
      Rehearse(point, {point.service, nth, 4711, HOST_THROW_NOTHING});
    }
  }
}

TEST_F(RehearsalSweepTest, EveryCallOfEveryServiceCanFail) {
  for (const FaultPoint& point : FaultPoints()) Rehearse(point, {point.service, 0, -5, HOST_THROW_NOTHING});
}

TEST_F(RehearsalSweepTest, WithCodeZeroEveryServiceDoesNothingAndHandsOutNothing) {
  for (const FaultPoint& point : FaultPoints()) {
    Rehearse(point, {point.service, 2, 0, HOST_THROW_NOTHING});
    Rehearse(point, {point.service, 0, 0, HOST_THROW_NOTHING});
  }
}

TEST_F(RehearsalSweepTest, EveryServiceCanThrowEveryException) {
  for (const FaultPoint& point : FaultPoints()) {
    for (const std::int32_t thrown : {HOST_THROW_BAD_ALLOC, HOST_THROW_RUNTIME_ERROR, HOST_THROW_OTHER}) {
      Rehearse(point, {point.service, 3, 4711, thrown});
      Rehearse(point, {point.service, 0, 4711, thrown});
    }
  }
}

TEST_F(RehearsalSweepTest, EveryServiceOfTheTableHasAFaultPoint) {
  std::set<std::int32_t> covered;
  for (const FaultPoint& point : FaultPoints()) covered.insert(point.service);
  EXPECT_EQ(covered.size(), static_cast<std::size_t>(HOST_UTILITY_COUNT));
}

TEST_F(RehearsalSweepTest, AServiceCountsAsItselfOnly) {
  for (const FaultPoint& point : FaultPoints()) {
    Scene scene;
    HostBeginRehearsal();
    EXPECT_EQ(point.call(&scene), HOST_ERR_NONE);
    HostEndRehearsal();
    for (std::int32_t service = 0; service < HOST_UTILITY_COUNT; ++service) {
      EXPECT_EQ(HostUtilityCallCount(service), service == point.service ? 1 : 0) << point.function;
    }
    HostReleaseLeftovers();
  }
}

TEST_F(RehearsalSweepTest, ACallWithNullPointersIsAFaultPointToo) {
  HostBeginRehearsal();
  EXPECT_EQ(RecordListAppend(nullptr, nullptr), HOST_ERR_UTILITY_NULL);
  EXPECT_EQ(HostFileOpen(nullptr, HOST_FILE_READ), HOST_ERR_UTILITY_NULL);
  EXPECT_EQ(HostUtilityCallCount(HOST_UTILITY_ListAppend), 1);
  EXPECT_EQ(HostUtilityCallCount(HOST_UTILITY_FileOpen), 1);
}

TEST_F(RehearsalSweepTest, ARehearsedFailureTakesNullPlacesToHandOutTo) {
  for (std::int32_t service = 0; service < HOST_UTILITY_COUNT; ++service) {
    const HostUtilityFailure failure{service, 0, 4711, HOST_THROW_NOTHING};
    ASSERT_EQ(HostAddUtilityFailure(&failure), HOST_ERR_NONE);
  }
  HostBeginRehearsal();
  EXPECT_EQ(HostFileCreate(nullptr, nullptr), 4711);
  EXPECT_EQ(HostFileRead(nullptr, 8, nullptr), 4711);
  EXPECT_EQ(HostFileSize(nullptr, nullptr), 4711);
  EXPECT_EQ(HostFileName(nullptr, nullptr), 4711);
  EXPECT_EQ(HostFileDispose(nullptr), 4711);
  EXPECT_EQ(HostStripExtension(nullptr, 1, nullptr), 4711);
  EXPECT_EQ(HostRegisterStringTable(nullptr, nullptr, 1, nullptr), 4711);
  EXPECT_EQ(RecordListCreate(8, 1, 0, nullptr), 4711);
  EXPECT_EQ(RecordListGetRun(nullptr, 0, 1, nullptr), 4711);
  EXPECT_EQ(RecordListLock(nullptr, 0, nullptr), 4711);
  EXPECT_EQ(RecordListCount(nullptr, nullptr), 4711);
  EXPECT_EQ(UTF16StringMakeFromUnits(nullptr, nullptr), 4711);
  EXPECT_EQ(UTF16StringMakeFromBytes(nullptr, nullptr), 4711);
  EXPECT_EQ(UTF16StringFormat(nullptr, nullptr, nullptr, nullptr), 4711);
  EXPECT_EQ(HostStringCopy(nullptr, 8, nullptr), 4711);
  EXPECT_EQ(HostStringFormat(nullptr, 8, nullptr, nullptr, nullptr), 4711);
  EXPECT_EQ(HostNumberScan(nullptr, 0, nullptr), 4711);
  EXPECT_EQ(MatrixSetIdentity(nullptr), 4711);
  EXPECT_EQ(MatrixDecompose(nullptr, nullptr, nullptr), 4711);
  EXPECT_EQ(MatrixDecomposePivoted(nullptr, nullptr), 4711);
  EXPECT_EQ(HostRatioCompare(nullptr, nullptr, nullptr), 4711);
}

TEST_F(RehearsalSweepTest, ABufferWithoutRoomIsNotWrittenByARehearsedFailure) {
  char buffer[] = "?";
  WithFailure({HOST_UTILITY_StringCopy, 0, 0, HOST_THROW_NOTHING}, [&] {
    EXPECT_EQ(HostStringCopy(buffer, 0, "a"), HOST_ERR_NONE);
    EXPECT_EQ(HostStringCopy(buffer, -1, "a"), HOST_ERR_NONE);
  });
  WithFailure({HOST_UTILITY_FileRead, 0, 0, HOST_THROW_NOTHING},
              [&] { EXPECT_EQ(HostFileRead(nullptr, -1, buffer), HOST_ERR_NONE); });
  EXPECT_EQ(buffer[0], '?');
}

// These have no fault point: owners clean up with them, and they cannot fail.
TEST_F(RehearsalSweepTest, WhatIsNoFaultPointGoesOnUnderEveryFailure) {
  Scene scene;
  HostStringTable* table = nullptr;
  const char* const entries[] = {"key=text"};
  ASSERT_EQ(HostRegisterStringTable("Sweep", entries, 1, &table), HOST_ERR_NONE);
  for (std::int32_t service = 0; service < HOST_UTILITY_COUNT; ++service) {
    const HostUtilityFailure failure{service, 0, 0, HOST_THROW_BAD_ALLOC};
    ASSERT_EQ(HostAddUtilityFailure(&failure), HOST_ERR_NONE);
  }
  HostBeginRehearsal();
  EXPECT_NE(RecordListPeek(scene.list, 0), nullptr);
  EXPECT_EQ(RecordListDispose(scene.list), HOST_ERR_NONE);
  EXPECT_STREQ(HostLocalizedString(table, 0), "text");
  EXPECT_EQ(HostUnregisterStringTable(table), HOST_ERR_NONE);
  EXPECT_EQ(HostCompareNoCase("a", "A"), 0);
  EXPECT_EQ(HostTranslateAndReport(HOST_EXCEPTION_OTHER, "x"), HOST_ERR_EXCEPTION_OTHER);
  EXPECT_EQ(UTF16StringLength(scene.text), 7);
  EXPECT_EQ(UTF16StringUnits(scene.text)[0], 's');
  UTF16StringRetain(scene.text);
  UTF16StringRelease(scene.text);
  for (std::int32_t service = 0; service < HOST_UTILITY_COUNT; ++service) {
    EXPECT_EQ(HostUtilityCallCount(service), 0);
  }
  HostEndRehearsal();
  HostReleaseLeftovers();
}

}  // namespace
}  // namespace hostutil_tests
