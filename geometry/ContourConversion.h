// Turning an entered contour line into the positions of its height points.
#pragma once

#include <cstdint>

#include "geometry/Polyline2D.h"

// Interpolation rules of the contour line (the settings value "Interpol").
enum EInterpol : int32_t {
    kInterpolAsEntered = 0,
    kInterpolLinear = 1,
    kInterpolSpline = 2,
};

// An edge is split into at most this many pieces by the linear rule. Each piece becomes a height
// point and a host call, so a tiny limit on a long edge (100 m at 0.0001 m would be a million
// points) must not run away; at a 1 m limit an edge is split exactly up to 10 km.
inline constexpr int32_t kMaxPiecesPerEdge = 10000;

// Fills `out` by the rule `interpol` selects, with Round5(segLen) as the limit: 1 linear, 2 spline,
// anything else the points as entered. `out`'s closed flag has no meaning for the caller.
void ConvertContour(const CPolyline2D& contour, int32_t interpol, float segLen, CPolyline2D& out);
