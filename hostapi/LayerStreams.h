/* The numbers by which the operations name the streams of a layer, its animatable properties. */
#ifndef HOSTAPI_LAYERSTREAMS_H
#define HOSTAPI_LAYERSTREAMS_H

#ifdef __cplusplus
extern "C" {
#endif

/* Every layer has all of them from its creation, but for the zoom. Three numbers a value, or one. */
enum LayerStreamId {
  HOST_STREAM_ANCHOR_POINT = 0, /* three, points; of a camera layer its point of interest */
  HOST_STREAM_POSITION = 1,     /* three, points */
  HOST_STREAM_SCALE = 2,        /* three, percent */
  HOST_STREAM_ROTATION_Z = 3,   /* one, degrees */
  HOST_STREAM_ROTATION_X = 8,   /* one, degrees */
  HOST_STREAM_ROTATION_Y = 9,   /* one, degrees */
  HOST_STREAM_ZOOM = 11         /* one, pixels; of camera layers only */
};

#ifdef __cplusplus
}
#endif

#endif
