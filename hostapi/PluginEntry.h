/* The one function that an importer module exports. */
#ifndef HOSTAPI_PLUGINENTRY_H
#define HOSTAPI_PLUGINENTRY_H

#include "hostapi/HostTypes.h"
#include "hostapi/WNBasicSuite.h"

#ifdef __cplusplus
extern "C" {
#endif

/* The exported symbol's name. */
#define HOST_PLUGIN_ENTRY_SYMBOL "GPMain_MayaImport"

/* Called once after the module is loaded, before any callback. The basic suite lives until the module is
 * unloaded; the plug-in id is the plug-in's name for itself in every operation that wants one. The version
 * numbers are the host's own, and the reserved pointer is null. A code other than 0 means that nothing was
 * registered. */
typedef HostError (*HostPluginEntry)(const WNBasicSuite* basicSuite, int32_t hostMajor, int32_t hostMinor,
                                     int32_t pluginId, void* reserved);

#ifdef __cplusplus
}
#endif

#endif
