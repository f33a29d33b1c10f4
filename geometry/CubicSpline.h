// The interpolating cubic spline of contour lines: Hermite form, chord-length parametrisation, zero
// second derivative at both ends, tangents from one sweep of simultaneous displacements over the
// tangent system (deliberately not an exact solve: the curve users know depends on it).
#pragma once

#include <cstdint>
#include <vector>

#include "geometry/Polyline2D.h"

// Sample step counts are capped per segment: 2 steps per metre along the longer axis gives exactly
// this many steps at 32,768 m. Longer segments (in practice only a cursor reported far off the
// plan) are sampled more coarsely, so one call never needs more than this many samples per segment.
inline constexpr int32_t kMaxSplineSteps = 65536;

// The working set of one spline computation; every array holds n floats. All spline arithmetic is
// done on these 32-bit floats, only the final rounding and the thinning distance in double
// precision.
struct CCubicSpline {
    std::vector<float> x, y;            // input points
    std::vector<float> dx, dy;          // differences to the next point (0 .. n-2)
    std::vector<float> tx, ty;          // right-hand sides, then the start tangent at each point
    std::vector<float> ex, ey;          // end tangent of each segment (0 .. n-2)
    std::vector<float> ratio;           // chord-length ratios (0 .. n-2)
    std::vector<float> sub, diag, sup;  // the tridiagonal tangent system
    int32_t n = 0;
};

// One segment between point i and i + 1, sampled at `steps` + 1 parameter values.
struct CHermiteSegment {
    float dx = 0, dy = 0;  // chord
    float tx = 0, ty = 0;  // start tangent
    float ex = 0, ey = 0;  // end tangent
    int32_t steps = 0;
};

// Appends to `out` (not cleared) the samples of the spline through the n points (x[i], y[i]), each
// rounded with Round5 and thinned: a sample closer than minDist to the last kept one is dropped,
// the first and last are always kept, and minDist 0 keeps all. Every inner input point is sampled
// twice (end of one segment, start of the next). Returns false, with `out` untouched, only when
// memory runs out. Reuses a per-thread working set, so it allocates only when n grows.
bool InterpolateSpline(int32_t n, const float* x, const float* y, double minDist, CPolyline2D& out);
