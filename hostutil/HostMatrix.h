/* 4x4 matrices.
 *
 * Conventions: m[row][column]; points are column vectors, so a matrix M takes p to M·p and the translation
 * is the last column; axes are right-handed, and a positive angle turns counter-clockwise as seen from the
 * tip of the axis. Each composing operation acts after those that the matrix already holds: M becomes
 * Op·M. Angles are in radians. A null pointer is HOST_ERR_UTILITY_NULL.
 */
#ifndef HOSTUTIL_HOSTMATRIX_H
#define HOSTUTIL_HOSTMATRIX_H

#include "hostapi/HostTypes.h"
#include "hostutil/Export.h"

#ifdef __cplusplus
extern "C" {
#endif

typedef struct TransformMatrix {
  double m[4][4];
} TransformMatrix;

/* A matrix taken apart. Scale first, then rotation about X, then Y, then Z, then translation give the matrix
 * back: T·Rz·Ry·Rx·S. */
typedef struct MatrixComponents {
  double translation[3];
  double scale[3];    /* 1.0 is unscaled; only x can be negative */
  double shear[3];    /* always 0 */
  double rotation[3]; /* about X, Y and Z, in radians; Y lies within a quarter turn of 0 */
} MatrixComponents;

/* Makes it the identity. */
HOSTUTIL_API HostError MatrixSetIdentity(TransformMatrix* matrix);

/* Moves by (tx, ty, tz). */
HOSTUTIL_API HostError MatrixTranslate(TransformMatrix* matrix, double tx, double ty, double tz);

/* Scales about the origin. */
HOSTUTIL_API HostError MatrixScale(TransformMatrix* matrix, double sx, double sy, double sz);

/* Turns about an axis through the origin. The axis need not be of length 1; one of length 0 turns nothing. */
HOSTUTIL_API HostError MatrixRotateAxis(TransformMatrix* matrix, double ax, double ay, double az,
                                        double angle);

/* Takes the matrix apart. The lengths of the axes are the scale; a negative determinant makes x negative.
 * Where the cosine of the Y angle is below 1e-9, Z is 0 and X takes the rest. An axis of length 0 gives scale
 * 0, and its direction is completed from the others: where one is known, the angles that it leaves open are
 * 0. Axes that are not at right angles leave Y and Z to the first and X to the others. A length beyond the
 * largest double is held there. `options` is not read; pass null. HOST_ERR_MATRIX_NOT_FINITE when the matrix
 * holds a value that is not finite. */
HOSTUTIL_API HostError MatrixDecompose(const TransformMatrix* matrix, MatrixComponents* components,
                                       void* options);

/* A transform as scenes hold it: scaled about one pivot, turned about another, then moved. */
typedef struct PivotedTransform {
  double scalePivot[3];
  double scale[3];
  double rotatePivot[3];
  double rotation[3]; /* about X, then Y, then Z, in radians */
  double translation[3];
} PivotedTransform;

/* Composes the transform and takes it apart. Gives what these services give one after the other, to the last
 * bit: MatrixSetIdentity; MatrixTranslate by -scalePivot; MatrixScale; MatrixTranslate by scalePivot and by
 * -rotatePivot; MatrixRotateAxis about X, Y and Z; MatrixTranslate by rotatePivot and by translation;
 * MatrixDecompose. Fails as MatrixDecompose does; a rehearsal takes the whole for one call of that. */
HOSTUTIL_API HostError MatrixDecomposePivoted(const PivotedTransform* from, MatrixComponents* components);

#ifdef __cplusplus
}
#endif

#endif
