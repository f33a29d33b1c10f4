// CPolyline2D: an ordered list of plane points, an open polyline or a closed polygon.
#pragma once

#include <cstdint>
#include <vector>

#include "geometry/Point2D.h"

class CPolyline2D {
public:
    // false: open polyline; true: closed polygon whose closing edge (last point back to the first)
    // is implied, never stored as a repeated point.
    bool closed = false;

    // Removes every point; `closed` is unchanged. Keeps the storage, so a list that is filled again
    // and again (the preview on every mouse move) stops allocating once warm.
    void Clear() { m_points.clear(); }
    void Add(const CPoint2D& p) { m_points.push_back(p); }

    // The point `index` steps after the first. Throws the text "Index out of Range!" (as char*) for
    // an index not below the count; callers keep their indexes in range, so this marks a
    // programming error.
    CPoint2D& GetAt(uint32_t index);
    const CPoint2D& GetAt(uint32_t index) const;

    uint32_t GetCount() const { return uint32_t(m_points.size()); }

    // count when closed, count - 1 when open (-1 for an empty open list; below 1 means no
    // segments).
    int32_t GetSegmentCount() const;

    // Edge `index`, with one wrap-around of the index (-1 is the closing edge, n is edge 0; n - 1
    // is the closing edge even on an open list). Returns false with `out` all zero for fewer than
    // two points. An index outside -n .. 2n-1 stays out of range after the wrap and GetAt throws.
    bool GetSegment(int32_t index, CSegment2D& out) const;

    // True at the first point that PointsEqual p; false for an empty list.
    bool Contains(const CPoint2D& p) const;

    // Copies the source's points in order, then its `closed` flag.
    void Assign(const CPolyline2D& source);

    // Clears `out` and fills it with the points of this list densified so that no edge is split
    // into pieces shorter than maxSegLen (see ContourConversion.h for the rule and its bound).
    void LinearInterpolate(double maxSegLen, CPolyline2D& out) const;

    // Clears `out` and fills it with the spline through this list (closed lists return to their
    // first point), sampled, rounded with Round5 and thinned by minDist. Falls back to a copy of
    // this list when memory runs out. See CubicSpline.h.
    void SplineInterpolate(double minDist, CPolyline2D& out) const;

    // Clears `out` and fills it with the spline through this list's points and the cursor, for the
    // mouse-move preview; `out` stays empty while the cursor sits on an entered point. Allocates
    // nothing once warm when `out` is reused.
    void SplinePreview(double minDist, CPolyline2D& out, float cursorX, float cursorY) const;

private:
    // Contiguous storage: callers only append, clear and walk, and the preview wants no allocation
    // per point.
    std::vector<CPoint2D> m_points;
};
