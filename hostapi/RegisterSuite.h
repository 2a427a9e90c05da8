/* "QZGP Register Suite": hooks into the life of a plug-in. */
#ifndef HOSTAPI_REGISTERSUITE_H
#define HOSTAPI_REGISTERSUITE_H

#include <assert.h>
#include <stddef.h>

#include "hostapi/HostTypes.h"

#ifdef __cplusplus
extern "C" {
#endif

#define QZGP_REGISTER_SUITE "QZGP Register Suite"
#define QZGP_REGISTER_SUITE_6 6

/* Called once before the plug-in is unloaded, with the reference value of its registration. */
typedef HostError (*HostDeathHook)(intptr_t refcon);

typedef struct QZGP_RegisterSuite6 {
  void (*reserved0[2])(void);

  /* Slot 2. Registers the hook. The host passes the reference value to it unchanged.
   * Codes: HOST_ERR_BAD_POINTER, HOST_ERR_BAD_PLUGIN_ID. */
  HostError (*RegisterDeathHook)(int32_t pluginId, HostDeathHook hook, intptr_t refcon);
} QZGP_RegisterSuite6;

static_assert(offsetof(QZGP_RegisterSuite6, RegisterDeathHook) == 2 * sizeof(void (*)(void)), "slot 2");

#ifdef __cplusplus
}
#endif

#endif
