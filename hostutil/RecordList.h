/* The host's growable list of fixed-size records.
 *
 * Records are plain data, copied by value in and out, and lie one after the other in memory: the address
 * of a locked record is also that of the run of records that follows it. The list grows by at least its
 * growth step and geometrically, so that n appends cost O(n).
 *
 * Ownership: the caller of RecordListCreate owns the list until RecordListDispose; the library frees what
 * is left when the host releases its leftovers. A null list or pointer is HOST_ERR_UTILITY_NULL, and so is
 * an object that is no list: every list carries a mark, which each operation checks. A list that was disposed
 * of is not detected; the caller must not use it. What an operation hands out is null or 0 when it fails,
 * except that RecordListGet then leaves the record as it was.
 */
#ifndef HOSTUTIL_RECORDLIST_H
#define HOSTUTIL_RECORDLIST_H

#include "hostapi/HostTypes.h"
#include "hostutil/Export.h"

#ifdef __cplusplus
extern "C" {
#endif

typedef struct RecordList RecordList;

/* Makes a list of records of recordSize bytes (1 or more) that grows by at least `growth` records (1 or
 * more) and starts with `initial` zero-filled ones (0 or more). HOST_ERR_LIST_MEMORY when there is no memory
 * for it, and for sizes out of these ranges. */
HOSTUTIL_API HostError RecordListCreate(int64_t recordSize, int64_t growth, int64_t initial,
                                        RecordList** list);

/* Appends a copy of the record, which must not lie in the list itself. HOST_ERR_LIST_MEMORY when the list
 * cannot grow (it is then unchanged), HOST_ERR_LIST_LOCKED while any record is locked. */
HOSTUTIL_API HostError RecordListAppend(RecordList* list, const void* record);

/* Appends copies of `count` records (0 or more) that lie one after the other, and not in the list itself;
 * all or, after a failure, none. Fails as RecordListAppend does; a rehearsal takes the whole run for one call
 * of it. */
HOSTUTIL_API HostError RecordListAppendRun(RecordList* list, const void* records, int64_t count);

/* Makes room for `count` more records, so that appending them does not grow the list. A hint: it does nothing
 * where there is no memory, or while a record is locked. */
HOSTUTIL_API void RecordListReserve(RecordList* list, int64_t count);

/* Copies record `index` (from 0) out. HOST_ERR_LIST_INDEX when there is none. */
HOSTUTIL_API HostError RecordListGet(const RecordList* list, int64_t index, void* record);

/* Hands out the address of `count` records (1 or more) from `index` on, which lie one after the other, for
 * reading. It is valid until the list grows or ends. HOST_ERR_LIST_INDEX when there are fewer. A
 * rehearsal takes the whole run for one call of RecordListGet. */
HOSTUTIL_API HostError RecordListGetRun(const RecordList* list, int64_t index, int64_t count,
                                        const void** records);

/* Hands out the address of record `index`, for reading and writing; it stays the same until the matching
 * unlock. Locks nest, and several records can be locked. HOST_ERR_LIST_INDEX when there is no such record,
 * HOST_ERR_LIST_MEMORY when there is no memory to count the lock. */
HOSTUTIL_API HostError RecordListLock(RecordList* list, int64_t index, void** record);

/* Ends one lock of record `index`. HOST_ERR_LIST_INDEX when there is no such record or it is not locked. */
HOSTUTIL_API HostError RecordListUnlock(RecordList* list, int64_t index);

/* The address of record `index` for reading, or null when there is none. Takes no lock and cannot fail, also
 * not in a rehearsal: for owners that clean up or search. Valid until the next append. */
HOSTUTIL_API const void* RecordListPeek(const RecordList* list, int64_t index);

/* Hands out the number of records. */
HOSTUTIL_API HostError RecordListCount(const RecordList* list, int64_t* count);

/* Ends the list and frees its records. Null is accepted and does nothing. */
HOSTUTIL_API HostError RecordListDispose(RecordList* list);

#ifdef __cplusplus
}
#endif

#endif
