/* "QZGP Persistent Data Suite": the user's preferences. */
#ifndef HOSTAPI_PERSISTENTDATASUITE_H
#define HOSTAPI_PERSISTENTDATASUITE_H

#include <assert.h>
#include <stddef.h>

#include "hostapi/HostTypes.h"

#ifdef __cplusplus
extern "C" {
#endif

#define QZGP_PERSISTENT_DATA_SUITE "QZGP Persistent Data Suite"
#define QZGP_PERSISTENT_DATA_SUITE_3 3

/* The section and the key of the importer's one preference. 0 takes distances as they stand in the scene, any
 * other value converts them from the scene's linear unit. */
#define HOST_PREF_SECTION "Maya Camera"
#define HOST_PREF_LINEAR_UNITS "Use Linear Units"

typedef struct QZGP_PersistentDataSuite3 {
  /* Slot 0. Hands out the application's preference store, which the host keeps.
   * Codes: HOST_ERR_BAD_POINTER. */
  HostError (*GetAppPrefsBlob)(HostPrefsStore** store);

  void (*reserved1[8])(void);

  /* Slot 9. Reads a 32-bit integer into *value. An entry that is missing is made with the default. A null
   * store has no entries: *value is the default, and none is made. On failure *value is unchanged.
   * Codes: HOST_ERR_BAD_HANDLE, HOST_ERR_BAD_POINTER. */
  HostError (*GetPrefLong)(HostPrefsStore* store, const char* section, const char* key, int32_t defaultValue,
                           int32_t* value);
} QZGP_PersistentDataSuite3;

static_assert(offsetof(QZGP_PersistentDataSuite3, GetAppPrefsBlob) == 0 * sizeof(void (*)(void)), "slot 0");
static_assert(offsetof(QZGP_PersistentDataSuite3, GetPrefLong) == 9 * sizeof(void (*)(void)), "slot 9");

#ifdef __cplusplus
}
#endif

#endif
