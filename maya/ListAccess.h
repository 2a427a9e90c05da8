// The host's lists as typed records. A code that a list returns is thrown.
#pragma once

#include <cstdint>

#include "hostutil/RecordList.h"
#include "plugin/ErrorCodes.h"

namespace mayaimport {

// A copy of a record; zero-filled where the host hands nothing out.
template <typename Record>
Record FetchRecord(const RecordList* list, std::int64_t index) {
  Record record{};
  ThrowOnError(RecordListGet(list, index, &record));
  return record;
}

// The number of records; 0 for a null list.
inline std::int64_t RecordCount(const RecordList* list) {
  std::int64_t count = 0;
  if (list != nullptr) ThrowOnError(RecordListCount(list, &count));
  return count;
}

// Makes an empty list.
template <typename Record>
void MakeList(RecordList** list) {
  constexpr std::int64_t kGrowthStep = 10;
  ThrowOnError(RecordListCreate(sizeof(Record), kGrowthStep, 0, list));
}

// Appends to a list that is made on first use.
template <typename Record>
void AppendRecord(RecordList** list, const Record& record) {
  if (*list == nullptr) MakeList<Record>(list);
  ThrowOnError(RecordListAppend(*list, &record));
}

// Changes a record in its place. Throws HOST_ERR_LIST_INDEX too when the list hands out no address.
template <typename Record, typename Change>
void ChangeRecord(RecordList* list, std::int64_t index, Change&& change) {
  void* record = nullptr;
  ThrowOnError(RecordListLock(list, index, &record));
  if (record == nullptr) ThrowCode(HOST_ERR_LIST_INDEX);
  change(*static_cast<Record*>(record));
  ThrowOnError(RecordListUnlock(list, index));
}

}  // namespace mayaimport
