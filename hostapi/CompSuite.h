/* "QZGP Comp Suite": compositions and the layers made in them. Versions 21 and 9 are both in use. */
#ifndef HOSTAPI_COMPSUITE_H
#define HOSTAPI_COMPSUITE_H

#include <assert.h>
#include <stddef.h>

#include "hostapi/HostTypes.h"

#ifdef __cplusplus
extern "C" {
#endif

#define QZGP_COMP_SUITE "QZGP Comp Suite"
#define QZGP_COMP_SUITE_21 21
#define QZGP_COMP_SUITE_9 9

/* As both components of a new camera's centre: "where the host likes". */
#define HOST_CAMERA_CENTER_ANYWHERE (-2147483648.0)

typedef struct QZGP_CompSuite21 {
  void (*reserved0[25])(void);

  /* Slot 25. Makes a composition in a folder. Width and height in pixels; pixel aspect is width to
   * height; the frame rate is in frames per second. The host copies the name.
   * Codes: HOST_ERR_BAD_HANDLE, HOST_ERR_BAD_POINTER, HOST_ERR_BAD_SIZE, HOST_ERR_BAD_RATIO,
   * HOST_ERR_BAD_TIME, HOST_ERR_NOT_A_FOLDER. */
  HostError (*CreateComp)(VOR_Item* folder, const HostUTF16Unit* name, int32_t width, int32_t height,
                          const HostRatio* pixelAspect, const T_Time* duration, const HostRatio* frameRate,
                          VOR_CompItem** comp);
} QZGP_CompSuite21;

typedef struct QZGP_CompSuite9 {
  void (*reserved0[1])(void);

  /* Slot 1. Hands out what the composition is in the project.
   * Codes: HOST_ERR_BAD_HANDLE, HOST_ERR_BAD_POINTER. */
  HostError (*GetItemFromComp)(VOR_CompItem* comp, VOR_Item** item);

  void (*reserved2[12])(void);

  /* Slot 14. Makes a camera layer. The centre is in pixels of the composition. Names are bytes, UTF-8 as
   * a rule; any are accepted, the empty name included.
   * Codes: HOST_ERR_BAD_HANDLE, HOST_ERR_BAD_POINTER, HOST_ERR_BAD_VALUE, HOST_ERR_TOO_MANY_LAYERS,
   * HOST_ERR_TOO_MANY_KEYS. */
  HostError (*NewCameraLayer)(const char* name, VOR_CompItem* comp, double centerX, double centerY,
                              VOR_Layer** layer);

  void (*reserved15[7])(void);

  /* Slot 22. Makes a null layer, an invisible parent. The time is its length; 0 over 0 is the
   * composition's own.
   * Codes: HOST_ERR_BAD_HANDLE, HOST_ERR_BAD_POINTER, HOST_ERR_BAD_TIME, HOST_ERR_TOO_MANY_LAYERS. */
  HostError (*NewNullLayer)(const char* name, VOR_CompItem* comp, const T_Time* time, VOR_Layer** layer);
} QZGP_CompSuite9;

static_assert(offsetof(QZGP_CompSuite21, CreateComp) == 25 * sizeof(void (*)(void)), "slot 25");
static_assert(offsetof(QZGP_CompSuite9, GetItemFromComp) == 1 * sizeof(void (*)(void)), "slot 1");
static_assert(offsetof(QZGP_CompSuite9, NewCameraLayer) == 14 * sizeof(void (*)(void)), "slot 14");
static_assert(offsetof(QZGP_CompSuite9, NewNullLayer) == 22 * sizeof(void (*)(void)), "slot 22");

#ifdef __cplusplus
}
#endif

#endif
