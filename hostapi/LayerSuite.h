/* "QZGP Layer Suite": nesting, flags and parents of layers. */
#ifndef HOSTAPI_LAYERSUITE_H
#define HOSTAPI_LAYERSUITE_H

#include <assert.h>
#include <stddef.h>

#include "hostapi/HostTypes.h"

#ifdef __cplusplus
extern "C" {
#endif

#define QZGP_LAYER_SUITE "QZGP Layer Suite"
#define QZGP_LAYER_SUITE_10 10

/* Layer flags. */
#define HOST_LAYER_FLAG_3D 0x800     /* the layer is three-dimensional */
#define HOST_LAYER_FLAG_AIMED 0x2000 /* 8192: the camera looks at its point of interest */

typedef struct QZGP_LayerSuite10 {
  void (*reserved0[11])(void);

  /* Slot 11. Switches one flag on (1) or off (0).
   * Codes: HOST_ERR_BAD_HANDLE. */
  HostError (*SetLayerFlag)(VOR_Layer* layer, int32_t flag, uint8_t value);

  void (*reserved12[13])(void);

  /* Slot 25. Adds an item (a composition that is not, and does not contain, this one) as a layer.
   * Codes: HOST_ERR_BAD_HANDLE, HOST_ERR_BAD_POINTER, HOST_ERR_NOT_A_COMP, HOST_ERR_TOO_MANY_LAYERS. */
  HostError (*AddLayerFromItem)(VOR_Item* item, VOR_CompItem* comp, VOR_Layer** layer);

  void (*reserved26[16])(void);

  /* Slot 42. Makes parent the parent of layer; both are of one composition, and no circle may arise. No
   * value of either layer changes.
   * Codes: HOST_ERR_BAD_HANDLE, HOST_ERR_WRONG_COMP, HOST_ERR_PARENT_CIRCLE. */
  HostError (*SetLayerParent)(VOR_Layer* layer, VOR_Layer* parent);
} QZGP_LayerSuite10;

static_assert(offsetof(QZGP_LayerSuite10, SetLayerFlag) == 11 * sizeof(void (*)(void)), "slot 11");
static_assert(offsetof(QZGP_LayerSuite10, AddLayerFromItem) == 25 * sizeof(void (*)(void)), "slot 25");
static_assert(offsetof(QZGP_LayerSuite10, SetLayerParent) == 42 * sizeof(void (*)(void)), "slot 42");

#ifdef __cplusplus
}
#endif

#endif
