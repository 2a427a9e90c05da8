/* "QZGP Stream Suite": a layer's animatable properties. Versions 7 and 8 are both in use. */
#ifndef HOSTAPI_STREAMSUITE_H
#define HOSTAPI_STREAMSUITE_H

#include <assert.h>
#include <stddef.h>

#include "hostapi/HostTypes.h"

#ifdef __cplusplus
extern "C" {
#endif

#define QZGP_STREAM_SUITE "QZGP Stream Suite"
#define QZGP_STREAM_SUITE_7 7
#define QZGP_STREAM_SUITE_8 8

/* A stream handle with a value for it. A one-dimensional value uses value[0], a three-dimensional one
 * the first three; the rest are 0 or ignored. Points for distances, percent for scale, degrees for
 * rotations, pixels for zoom. */
typedef struct StreamValueRecord {
  VOR_Stream* stream;
  double value[4];
} StreamValueRecord;

typedef struct QZGP_StreamSuite7 {
  void (*reserved0[3])(void);

  /* Slot 3 (this interface's own choice). Acquires a stream of a layer by its number (LayerStreamId).
   * Each success hands out a handle of its own, which the caller owns until ReleaseStream.
   * Codes: HOST_ERR_BAD_HANDLE, HOST_ERR_BAD_POINTER, HOST_ERR_BAD_PLUGIN_ID, HOST_ERR_NO_SUCH_STREAM,
   * HOST_ERR_MEMORY. */
  HostError (*AcquireLayerStream)(int32_t pluginId, VOR_Layer* layer, int32_t streamId, VOR_Stream** stream);

  void (*reserved4[4])(void);

  /* Slot 8 (this interface's own choice). Ends the handle. A batch opened with it goes on.
   * Codes: HOST_ERR_BAD_HANDLE. */
  HostError (*ReleaseStream)(VOR_Stream* stream);
} QZGP_StreamSuite7;

typedef struct QZGP_StreamSuite8 {
  void (*reserved0[5])(void);

  /* Slot 5 (this interface's own choice). Sets the static value; the record's own stream handle is the
   * same stream. Keys, where there are any, stay.
   * Codes: HOST_ERR_BAD_HANDLE, HOST_ERR_BAD_POINTER, HOST_ERR_BAD_PLUGIN_ID, HOST_ERR_BAD_VALUE. */
  HostError (*SetStreamValue)(int32_t pluginId, VOR_Stream* stream, const StreamValueRecord* value);
} QZGP_StreamSuite8;

static_assert(offsetof(QZGP_StreamSuite7, AcquireLayerStream) == 3 * sizeof(void (*)(void)), "slot 3");
static_assert(offsetof(QZGP_StreamSuite7, ReleaseStream) == 8 * sizeof(void (*)(void)), "slot 8");
static_assert(offsetof(QZGP_StreamSuite8, SetStreamValue) == 5 * sizeof(void (*)(void)), "slot 5");

#ifdef __cplusplus
}
#endif

#endif
