/* The root of everything a host offers: the two operations through which a plug-in gets all others. */
#ifndef HOSTAPI_WNBASICSUITE_H
#define HOSTAPI_WNBASICSUITE_H

#include <assert.h>
#include <stddef.h>

#include "hostapi/HostTypes.h"

#ifdef __cplusplus
extern "C" {
#endif

typedef struct WNBasicSuite {
  /* Slot 0. Hands out the table of the suite of that name and version. Each success is one acquisition
   * and is given back by one release; the table lives until the last release. On failure *suite is
   * unspecified.
   * Codes: HOST_ERR_BAD_POINTER, HOST_ERR_SUITE_REFUSED. */
  HostError (*AcquireSuite)(const char* name, int32_t version, const void** suite);

  /* Slot 1. Gives one acquisition back. Must not throw.
   * Codes: HOST_ERR_BAD_POINTER, HOST_ERR_SUITE_NOT_HELD. */
  HostError (*ReleaseSuiteByName)(const char* name, int32_t version);
} WNBasicSuite;

static_assert(offsetof(WNBasicSuite, AcquireSuite) == 0 * sizeof(void (*)(void)), "slot 0");
static_assert(offsetof(WNBasicSuite, ReleaseSuiteByName) == 1 * sizeof(void (*)(void)), "slot 1");

#ifdef __cplusplus
}
#endif

#endif
