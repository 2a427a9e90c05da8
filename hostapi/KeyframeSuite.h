/* "QZGP Keyframe Suite": keys on streams, added in batches. Versions 3 and 4 are both in use. */
#ifndef HOSTAPI_KEYFRAMESUITE_H
#define HOSTAPI_KEYFRAMESUITE_H

#include <assert.h>
#include <stddef.h>

#include "hostapi/HostTypes.h"
#include "hostapi/StreamSuite.h"

#ifdef __cplusplus
extern "C" {
#endif

#define QZGP_KEYFRAME_SUITE "QZGP Keyframe Suite"
#define QZGP_KEYFRAME_SUITE_3 3
#define QZGP_KEYFRAME_SUITE_4 4

/* The only time mode: key times are times of the composition. */
#define HOST_TIME_MODE_COMP 0

typedef struct QZGP_KeyframeSuite3 {
  /* Slot 0. Counts the keys that the stream holds; those of an open batch are not among them.
   * Codes: HOST_ERR_BAD_HANDLE, HOST_ERR_BAD_POINTER. */
  HostError (*GetStreamKeyframeCount)(VOR_Stream* stream, int32_t* count);

  void (*reserved1[11])(void);

  /* Slot 12 (this interface's own choice). Opens a batch on the stream. One batch at a time can be open
   * on a stream. The caller owns the batch until EndKeyframeBatch; it outlives the stream handle.
   * Codes: HOST_ERR_BAD_HANDLE, HOST_ERR_BAD_POINTER, HOST_ERR_BATCH_OPEN, HOST_ERR_MEMORY. */
  HostError (*BeginKeyframeBatch)(VOR_Stream* stream, VOR_AddKeyframesInfo** batch);

  /* Slot 13 (this interface's own choice). Adds a key without a value and hands out its index in the
   * batch: 0, 1, 2, … in the order of the calls.
   * Codes: HOST_ERR_BAD_HANDLE, HOST_ERR_BAD_POINTER, HOST_ERR_BAD_TIME, HOST_ERR_BAD_TIME_MODE,
   * HOST_ERR_TOO_MANY_KEYS. */
  HostError (*AddBatchKeyframe)(VOR_AddKeyframesInfo* batch, int32_t timeMode, const T_Time* time,
                                int32_t* index);

  void (*reserved14[1])(void);

  /* Slot 15 (this interface's own choice). Ends the batch. With commit 1 its keys become the stream's,
   * sorted by time, stably; of keys at equal times the later one stays; a key that never got a value is
   * dropped. With 0 they are all dropped.
   * Codes: HOST_ERR_BAD_HANDLE. */
  HostError (*EndKeyframeBatch)(int32_t commit, VOR_AddKeyframesInfo* batch);
} QZGP_KeyframeSuite3;

typedef struct QZGP_KeyframeSuite4 {
  void (*reserved0[14])(void);

  /* Slot 14 (this interface's own choice). Gives a key of the batch its value. The record's stream is any
   * live handle of the stream that the batch was opened on.
   * Codes: HOST_ERR_BAD_HANDLE, HOST_ERR_BAD_POINTER, HOST_ERR_BAD_VALUE, HOST_ERR_BATCH_KEY. */
  HostError (*SetBatchKeyframeValue)(VOR_AddKeyframesInfo* batch, int32_t index,
                                     const StreamValueRecord* value);
} QZGP_KeyframeSuite4;

static_assert(offsetof(QZGP_KeyframeSuite3, GetStreamKeyframeCount) == 0 * sizeof(void (*)(void)), "slot 0");
static_assert(offsetof(QZGP_KeyframeSuite3, BeginKeyframeBatch) == 12 * sizeof(void (*)(void)), "slot 12");
static_assert(offsetof(QZGP_KeyframeSuite3, AddBatchKeyframe) == 13 * sizeof(void (*)(void)), "slot 13");
static_assert(offsetof(QZGP_KeyframeSuite3, EndKeyframeBatch) == 15 * sizeof(void (*)(void)), "slot 15");
static_assert(offsetof(QZGP_KeyframeSuite4, SetBatchKeyframeValue) == 14 * sizeof(void (*)(void)), "slot 14");

#ifdef __cplusplus
}
#endif

#endif
