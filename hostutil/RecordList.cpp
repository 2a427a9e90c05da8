// The record list: one block of memory that grows geometrically.
#include "hostutil/RecordList.h"

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <cstring>
#include <new>
#include <string>
#include <unordered_map>

#include "hostapi/ErrorCodes.h"
#include "hostutil/BlocksInternal.h"
#include "hostutil/RegistryInternal.h"
#include "hostutil/RehearsalInternal.h"

namespace {

// Distinguishes a list from other memory.
constexpr std::uint64_t kListMark = 0x5265634C69737431;

// The size of a key, a time and a value. Keys are copied most; a copy of constant size is faster.
constexpr std::int64_t kKeySize = 2 * sizeof(double);

}  // namespace

struct RecordList final : hostutil::LiveObject {
  RecordList(std::int64_t recordBytes, std::int64_t growthStep)
      : LiveObject(Kind::List), recordSize(recordBytes), growth(growthStep) {}
  ~RecordList() override { hostutil::FreeBlock(records, capacity * recordSize); }

  std::string Describe() const override {
    return "list of " + std::to_string(count) + " records of " + std::to_string(recordSize) + " bytes";
  }

  bool Holds(std::int64_t index) const {
    return static_cast<std::uint64_t>(index) < static_cast<std::uint64_t>(count);
  }
  unsigned char* At(std::int64_t index) const { return records + index * recordSize; }

  const std::uint64_t mark = kListMark;
  unsigned char* records = nullptr;
  std::int64_t count = 0;
  std::int64_t capacity = 0;
  const std::int64_t recordSize;
  const std::int64_t growth;
  std::int64_t locks = 0;  // of all records

  // Locks of one record at a time are counted in place; those of further records beside them, in the map.
  std::int64_t firstLocked = 0;
  std::int64_t firstLocks = 0;
  std::unordered_map<std::int64_t, std::int64_t> furtherLocks;
};

namespace {

// Reads memory that may be no list, which a sanitizer would otherwise report.
__attribute__((no_sanitize("vptr"))) bool IsList(const RecordList* list) {
  return list != nullptr && list->mark == kListMark;
}

std::int64_t MostRecords(std::int64_t recordSize) { return PTRDIFF_MAX / recordSize; }

std::size_t ByteCount(std::int64_t records, std::int64_t recordSize) {
  return static_cast<std::size_t>(records) * static_cast<std::size_t>(recordSize);
}

bool SetCapacity(RecordList* list, std::int64_t capacity) {
  void* records =
      hostutil::GrowBlock(list->records, list->capacity * list->recordSize, capacity * list->recordSize);
  if (records == nullptr) return false;
  list->records = static_cast<unsigned char*>(records);
  list->capacity = capacity;
  return true;
}

// Makes room for `wanted` more records: doubles the list, and adds the growth step or what is wanted where
// that is more. False when it cannot grow so far.
bool Grow(RecordList* list, std::int64_t wanted) {
  const std::int64_t room = MostRecords(list->recordSize) - list->capacity;
  const std::int64_t least = std::max(list->growth, wanted);
  if (room < least) return false;
  return SetCapacity(list, list->capacity + std::min(room, std::max(least, list->capacity)));
}

}  // namespace

HostError RecordListCreate(std::int64_t recordSize, std::int64_t growth, std::int64_t initial,
                           RecordList** list) {
  if (HostError code; hostutil::Rehearsed(HOST_UTILITY_ListCreate, &code)) {
    hostutil::HandOutNothing(list);
    return code;
  }
  if (list == nullptr) return HOST_ERR_UTILITY_NULL;
  *list = nullptr;
  if (recordSize < 1 || growth < 1 || initial < 0 || initial > MostRecords(recordSize)) {
    return HOST_ERR_LIST_MEMORY;
  }
  auto* made = new (std::nothrow) RecordList(recordSize, growth);
  if (made == nullptr) return HOST_ERR_LIST_MEMORY;
  if (initial > 0) {
    if (!SetCapacity(made, initial)) {
      delete made;
      return HOST_ERR_LIST_MEMORY;
    }
    std::memset(made->records, 0, ByteCount(initial, recordSize));
    made->count = initial;
  }
  *list = made;
  return HOST_ERR_NONE;
}

namespace {

HostError AppendRecords(RecordList* list, const void* records, std::int64_t count) {
  if (!IsList(list) || records == nullptr || count < 0) return HOST_ERR_UTILITY_NULL;
  if (list->locks != 0) return HOST_ERR_LIST_LOCKED;
  if (count == 0) return HOST_ERR_NONE;
  if (count > list->capacity - list->count && !Grow(list, count)) return HOST_ERR_LIST_MEMORY;
  std::memcpy(list->At(list->count), records, ByteCount(count, list->recordSize));
  list->count += count;
  return HOST_ERR_NONE;
}

}  // namespace

HostError RecordListAppend(RecordList* list, const void* record) {
  if (HostError code; hostutil::Rehearsed(HOST_UTILITY_ListAppend, &code)) return code;
  return AppendRecords(list, record, 1);
}

HostError RecordListAppendRun(RecordList* list, const void* records, std::int64_t count) {
  if (HostError code; hostutil::Rehearsed(HOST_UTILITY_ListAppend, &code)) return code;
  return AppendRecords(list, records, count);
}

void RecordListReserve(RecordList* list, std::int64_t count) {
  if (!IsList(list) || list->locks != 0 || count <= list->capacity - list->count) return;
  if (count <= MostRecords(list->recordSize) - list->count) SetCapacity(list, list->count + count);
}

namespace {

HostError CopyRecord(const RecordList* list, std::int64_t index, void* record) {
  if (!IsList(list) || record == nullptr) return HOST_ERR_UTILITY_NULL;
  if (!list->Holds(index)) return HOST_ERR_LIST_INDEX;
  if (list->recordSize == kKeySize) [[likely]] {
    std::memcpy(record, list->At(index), kKeySize);
  } else {
    std::memcpy(record, list->At(index), static_cast<std::size_t>(list->recordSize));
  }
  return HOST_ERR_NONE;
}

[[gnu::noinline]] HostError GetInRehearsal(const RecordList* list, std::int64_t index, void* record) {
  HostError code = HOST_ERR_NONE;
  return hostutil::IsPlannedToFail(HOST_UTILITY_ListGet, &code) ? code : CopyRecord(list, index, record);
}

}  // namespace

HostError RecordListGet(const RecordList* list, std::int64_t index, void* record) {
  if (hostutil::MayBePlanned(HOST_UTILITY_ListGet)) [[unlikely]]
    return GetInRehearsal(list, index, record);
  return CopyRecord(list, index, record);
}

HostError RecordListGetRun(const RecordList* list, std::int64_t index, std::int64_t count,
                           const void** records) {
  if (HostError code; hostutil::Rehearsed(HOST_UTILITY_ListGet, &code)) {
    hostutil::HandOutNothing(records);
    return code;
  }
  if (records == nullptr) return HOST_ERR_UTILITY_NULL;
  *records = nullptr;
  if (!IsList(list)) return HOST_ERR_UTILITY_NULL;
  if (index < 0 || count < 1 || index > list->count - count) return HOST_ERR_LIST_INDEX;
  *records = list->At(index);
  return HOST_ERR_NONE;
}

HostError RecordListLock(RecordList* list, std::int64_t index, void** record) {
  if (HostError code; hostutil::Rehearsed(HOST_UTILITY_ListLock, &code)) {
    hostutil::HandOutNothing(record);
    return code;
  }
  if (record == nullptr) return HOST_ERR_UTILITY_NULL;
  *record = nullptr;
  if (!IsList(list)) return HOST_ERR_UTILITY_NULL;
  if (!list->Holds(index)) return HOST_ERR_LIST_INDEX;
  if (list->firstLocks == 0 || list->firstLocked == index) {
    list->firstLocked = index;
    ++list->firstLocks;
  } else {
    try {
      ++list->furtherLocks[index];
    } catch (const std::bad_alloc&) {
      return HOST_ERR_LIST_MEMORY;
    }
  }
  ++list->locks;
  *record = list->At(index);
  return HOST_ERR_NONE;
}

HostError RecordListUnlock(RecordList* list, std::int64_t index) {
  if (HostError code; hostutil::Rehearsed(HOST_UTILITY_ListUnlock, &code)) return code;
  if (!IsList(list)) return HOST_ERR_UTILITY_NULL;
  if (list->firstLocks > 0 && list->firstLocked == index) {
    --list->firstLocks;
  } else {
    const auto found = list->furtherLocks.find(index);
    if (found == list->furtherLocks.end()) return HOST_ERR_LIST_INDEX;
    if (--found->second == 0) list->furtherLocks.erase(found);
  }
  --list->locks;
  return HOST_ERR_NONE;
}

const void* RecordListPeek(const RecordList* list, std::int64_t index) {
  return IsList(list) && list->Holds(index) ? list->At(index) : nullptr;
}

HostError RecordListCount(const RecordList* list, std::int64_t* count) {
  if (HostError code; hostutil::Rehearsed(HOST_UTILITY_ListCount, &code)) {
    hostutil::HandOutNothing(count);
    return code;
  }
  if (count == nullptr) return HOST_ERR_UTILITY_NULL;
  *count = 0;
  if (!IsList(list)) return HOST_ERR_UTILITY_NULL;
  *count = list->count;
  return HOST_ERR_NONE;
}

HostError RecordListDispose(RecordList* list) {
  if (list == nullptr) return HOST_ERR_NONE;
  if (!IsList(list)) return HOST_ERR_UTILITY_NULL;
  delete list;
  return HOST_ERR_NONE;
}
