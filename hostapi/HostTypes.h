/* The value types and handles that cross the border between the host and its plug-ins.
 *
 * Everything here is plain C: no exceptions, no references, no classes. Every handle is an opaque
 * pointer that the host owns; a plug-in stores and passes handles and never frees one except through
 * the operation that says so. A null handle is never valid where an operation takes one, unless the
 * operation says otherwise.
 *
 * Threads. Everything happens on one thread, that of the entry, one call at a time. The host calls the entry,
 * the callbacks and the death hook one after the other. A plug-in calls operations only while one of these
 * runs, and no operation calls back into a plug-in.
 *
 * Failures. An operation that returns a code other than 0 did nothing. The caller still holds all that it
 * held before, also what the call should have ended: it can end that again, or still hold it when the
 * callback returns. What the call should have handed out is unchanged, or null or 0, unless the operation
 * says otherwise; the caller owns nothing of it. Any operation may be called next, the same one too. A handle
 * that is null although the code is 0 is no object.
 *
 * "Codes" at an operation are those that the embedded host returns by itself. A permissive one returns none
 * for sizes, ratios, times and values. A rehearsal can make it return any other code, and so can another
 * host.
 *
 * Exceptions. Operations are plain function pointers: an exception may come in through one, but none leaves
 * the entry, a callback or the death hook. What a call that threw has done is unknown; its caller treats it
 * as failed.
 */
#ifndef HOSTAPI_HOSTTYPES_H
#define HOSTAPI_HOSTTYPES_H

#include <stdint.h>

#ifdef __cplusplus
extern "C" {
#endif

/* The result of every host operation and of every callback: 0 for success, else a code of
 * ErrorCodes.h or one that a host adds to them. */
typedef int32_t HostError;

/* One unit of UTF-16 text. Texts are NUL-terminated unless a length goes with them. */
typedef uint16_t HostUTF16Unit;

/* A time in seconds: value / scale. The scale of a key time or a duration is positive. */
typedef struct T_Time {
  int32_t value;
  uint32_t scale;
} T_Time;

/* A ratio: numerator / denominator. Used for pixel aspects (width to height) and frame rates
 * (frames per second). */
typedef struct HostRatio {
  int32_t numerator;
  uint32_t denominator;
} HostRatio;

/* A project item: a folder, or what a composition is in the project. Lives as long as the project. */
typedef struct VOR_Item VOR_Item;

/* A composition. Lives as long as the project. */
typedef struct VOR_CompItem VOR_CompItem;

/* A layer of a composition. Lives as long as its composition. */
typedef struct VOR_Layer VOR_Layer;

/* One acquisition of a layer's stream (one animatable property). Lives until it is released. */
typedef struct VOR_Stream VOR_Stream;

/* An open batch of keyframe insertions on one stream. Lives until it is ended. */
typedef struct VOR_AddKeyframesInfo VOR_AddKeyframesInfo;

/* A block of the host's memory. Lives until it is freed. */
typedef struct HostMemHandle HostMemHandle;

/* The host's preference store. Lives as long as the host. */
typedef struct HostPrefsStore HostPrefsStore;

/* An importer that a plug-in has registered, from 1. 0 is no importer. */
typedef int32_t HostImporterId;

#ifdef __cplusplus
}
#endif

#endif
