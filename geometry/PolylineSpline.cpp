// The two entry points of the spline on a point list: conversion and mouse-move preview.
#include <cstddef>
#include <new>
#include <vector>

#include "geometry/CubicSpline.h"
#include "geometry/Primitives.h"

namespace {

// Float copies of the input points, reused between calls (see CubicSpline.cpp).
thread_local std::vector<float> t_inputX;
thread_local std::vector<float> t_inputY;

// Fills the float input arrays with the list's points and `extra` more entries; false without
// memory.
bool PrepareInput(const CPolyline2D& list, uint32_t extra) {
    const size_t count = size_t(list.GetCount()) + extra;
    try {
        t_inputX.resize(count);
        t_inputY.resize(count);
    } catch (const std::bad_alloc&) {
        return false;
    }
    for (uint32_t i = 0; i < list.GetCount(); ++i) {
        t_inputX[i] = float(list.GetAt(i).x);
        t_inputY[i] = float(list.GetAt(i).y);
    }
    return true;
}

// Below the tolerance a minimum distance would thin nothing reliably; 0 keeps every sample.
double EffectiveMinDist(double minDist) {
    return (minDist < kTolerance) ? 0.0 : minDist;
}

}  // namespace

void CPolyline2D::SplineInterpolate(double minDist, CPolyline2D& out) const {
    out.Clear();
    minDist = EffectiveMinDist(minDist);
    if (GetCount() == 0) {
        return;
    }
    if (GetCount() < 3) {
        out.Assign(*this);
        return;
    }
    // A closed line returns to its start, so the curve closes smoothly through the first point.
    CPolyline2D work;
    work.Assign(*this);
    if (work.closed && !PointsEqual(work.GetAt(0), work.GetAt(work.GetCount() - 1))) {
        work.Add(work.GetAt(0));
    }
    if (!PrepareInput(work, 0)) {
        return;
    }
    if (!InterpolateSpline(int32_t(work.GetCount()), t_inputX.data(), t_inputY.data(), minDist,
                           out)) {
        out.Assign(*this);
    }
}

void CPolyline2D::SplinePreview(double minDist, CPolyline2D& out, float cursorX,
                                float cursorY) const {
    out.Clear();
    minDist = EffectiveMinDist(minDist);
    const uint32_t n = GetCount();
    if (n == 0) {
        return;
    }
    if (n < 2) {
        out.Assign(*this);
        return;
    }
    // No curve while the cursor sits on an entered point: the last segment would have no length.
    if (Contains({Round5(cursorX), Round5(cursorY)})) {
        return;
    }
    if (!PrepareInput(*this, 1)) {
        return;
    }
    t_inputX[n] = cursorX;
    t_inputY[n] = cursorY;
    if (!InterpolateSpline(int32_t(n + 1), t_inputX.data(), t_inputY.data(), minDist, out)) {
        out.Assign(*this);
    }
}
