/* "QZGP Memory Suite": blocks of the host's memory, named by handles. */
#ifndef HOSTAPI_MEMORYSUITE_H
#define HOSTAPI_MEMORYSUITE_H

#include <assert.h>
#include <stddef.h>

#include "hostapi/HostTypes.h"

#ifdef __cplusplus
extern "C" {
#endif

#define QZGP_MEMORY_SUITE "QZGP Memory Suite"
#define QZGP_MEMORY_SUITE_1 1

typedef struct QZGP_MemorySuite1 {
  /* Slot 0. Allocates size bytes (0 or more), contents unspecified. The name is for the host's own
   * reports. Flags: 0, the only value defined. On success the caller owns the handle until FreeMemHandle.
   * Codes: HOST_ERR_BAD_POINTER, HOST_ERR_BAD_PLUGIN_ID, HOST_ERR_MEMORY, HOST_ERR_BAD_MEMORY_SIZE,
   * HOST_ERR_TOO_MUCH_MEMORY. */
  HostError (*NewMemHandle)(int32_t pluginId, const char* name, int64_t size, int32_t flags,
                            HostMemHandle** handle);

  /* Slot 1. Frees the block, locked or not, and ends the handle.
   * Codes: HOST_ERR_BAD_HANDLE. */
  HostError (*FreeMemHandle)(HostMemHandle* handle);

  /* Slot 2. Hands out the block's address, which stays the same until the matching unlock. Locks nest.
   * Codes: HOST_ERR_BAD_HANDLE, HOST_ERR_BAD_POINTER. */
  HostError (*LockMemHandle)(HostMemHandle* handle, void** address);

  /* Slot 3. Ends one lock. An unlock after a lock that failed is accepted.
   * Codes: HOST_ERR_BAD_HANDLE, HOST_ERR_MEMORY_STATE. */
  HostError (*UnlockMemHandle)(HostMemHandle* handle);
} QZGP_MemorySuite1;

static_assert(offsetof(QZGP_MemorySuite1, NewMemHandle) == 0 * sizeof(void (*)(void)), "slot 0");
static_assert(offsetof(QZGP_MemorySuite1, FreeMemHandle) == 1 * sizeof(void (*)(void)), "slot 1");
static_assert(offsetof(QZGP_MemorySuite1, LockMemHandle) == 2 * sizeof(void (*)(void)), "slot 2");
static_assert(offsetof(QZGP_MemorySuite1, UnlockMemHandle) == 3 * sizeof(void (*)(void)), "slot 3");

#ifdef __cplusplus
}
#endif

#endif
