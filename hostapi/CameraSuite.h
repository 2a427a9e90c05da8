/* "QZGP Camera Suite": what only camera layers have. */
#ifndef HOSTAPI_CAMERASUITE_H
#define HOSTAPI_CAMERASUITE_H

#include <assert.h>
#include <stddef.h>

#include "hostapi/HostTypes.h"

#ifdef __cplusplus
extern "C" {
#endif

#define QZGP_CAMERA_SUITE "QZGP Camera Suite"
#define QZGP_CAMERA_SUITE_2 2

/* The side of the film that a film size measures. */
#define HOST_FILM_HORIZONTAL 1
#define HOST_FILM_VERTICAL 2

typedef struct QZGP_CameraSuite2 {
  void (*reserved0[1])(void);

  /* Slot 1 (this interface's own choice). Sets the film size of a camera layer: in points (72 to the
   * inch), positive, measured in the given direction.
   * Codes: HOST_ERR_BAD_HANDLE, HOST_ERR_BAD_POINTER, HOST_ERR_BAD_VALUE, HOST_ERR_BAD_FILM_SIZE,
   * HOST_ERR_BAD_DIRECTION, HOST_ERR_NOT_A_CAMERA. */
  HostError (*SetCameraFilmSize)(VOR_Layer* layer, int32_t direction, const double* filmSize);
} QZGP_CameraSuite2;

static_assert(offsetof(QZGP_CameraSuite2, SetCameraFilmSize) == 1 * sizeof(void (*)(void)), "slot 1");

#ifdef __cplusplus
}
#endif

#endif
