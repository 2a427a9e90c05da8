/* "QZGP Utility Suite": messages to the user, and their suppression. */
#ifndef HOSTAPI_UTILITYSUITE_H
#define HOSTAPI_UTILITYSUITE_H

#include <assert.h>
#include <stddef.h>

#include "hostapi/HostTypes.h"

#ifdef __cplusplus
extern "C" {
#endif

#define QZGP_UTILITY_SUITE "QZGP Utility Suite"
#define QZGP_UTILITY_SUITE_7 7

/* What the host remembers of one span of silent errors. The caller provides the storage and passes the
 * same address to both ends; the contents are the host's. */
typedef struct HostSilentErrorState {
  int64_t reserved[4];
} HostSilentErrorState;

typedef struct QZGP_UtilitySuite7 {
  /* Slot 0. Shows a NUL-terminated UTF-8 text to the user. The host copies it.
   * Codes: HOST_ERR_BAD_POINTER, HOST_ERR_BAD_PLUGIN_ID. */
  HostError (*ShowMessage)(int32_t pluginId, const char* text);

  void (*reserved1[2])(void);

  /* Slot 3. From here on the host shows no error, until the matching EndSilentErrors. Spans nest.
   * Codes: HOST_ERR_BAD_POINTER. */
  HostError (*BeginSilentErrors)(HostSilentErrorState* state);

  /* Slot 4. Ends the span that began with this state record. With report 0 the errors of the span are
   * dropped, with any other value they are shown now.
   * Codes: HOST_ERR_BAD_POINTER, HOST_ERR_SILENT_ERRORS. */
  HostError (*EndSilentErrors)(int32_t report, HostSilentErrorState* state);
} QZGP_UtilitySuite7;

static_assert(offsetof(QZGP_UtilitySuite7, ShowMessage) == 0 * sizeof(void (*)(void)), "slot 0");
static_assert(offsetof(QZGP_UtilitySuite7, BeginSilentErrors) == 3 * sizeof(void (*)(void)), "slot 3");
static_assert(offsetof(QZGP_UtilitySuite7, EndSilentErrors) == 4 * sizeof(void (*)(void)), "slot 4");

#ifdef __cplusplus
}
#endif

#endif
