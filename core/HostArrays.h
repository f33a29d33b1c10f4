// Float arrays as the host takes them: point lists for polyline objects and placement matrices.
#pragma once

#include "core/HostInterfaces.h"
#include "geometry/Polyline2D.h"

// Wraps 2n floats (x0, y0, x1, y1, ...) into `out` as VT_ARRAY | VT_R4, one dimension, lower bound
// 0. The caller clears `out` (VariantClear destroys the array). When the array cannot be created or
// locked, `out` is left VT_EMPTY.
void MakeFloatArrayVariant(int n, const float* xy, VARIANT* out);

// Wraps 16 floats into `out` as a 4 x 4 two-dimensional VT_ARRAY | VT_R4 with lower bounds 0, in
// the given order. Returns false, with `out` VT_EMPTY, when the array cannot be had.
bool MakeMatrixVariant(const float (&matrix)[16], VARIANT* out);

// Gives the host polyline its vertices (SetPoints) and closed state (SetClosed). Does nothing for a
// null object or an empty list; without memory for the points it leaves the object as it was.
void SetObjectPoints(IOsrikPolyline* pObject, const CPolyline2D& list);

// A double as the host's 32-bit float: values beyond the float range become the largest float of
// their sign instead of an undefined conversion; NaN stays NaN.
float ToHostFloat(double v);
