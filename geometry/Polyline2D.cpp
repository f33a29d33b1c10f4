#include "geometry/Polyline2D.h"

#include "geometry/Primitives.h"

namespace {

// Thrown as char* (not const char*) so that a handler for char* or void* catches it too.
char g_szIndexOutOfRange[] = "Index out of Range!";

}  // namespace

CPoint2D& CPolyline2D::GetAt(uint32_t index) {
    if (index >= GetCount()) {
        throw static_cast<char*>(g_szIndexOutOfRange);
    }
    return m_points[index];
}

const CPoint2D& CPolyline2D::GetAt(uint32_t index) const {
    return const_cast<CPolyline2D*>(this)->GetAt(index);
}

int32_t CPolyline2D::GetSegmentCount() const {
    const int64_t count = GetCount();
    return int32_t(closed ? count : count - 1);
}

bool CPolyline2D::GetSegment(int32_t index, CSegment2D& out) const {
    out = CSegment2D{};
    const int64_t n = GetCount();
    if (n < 2) {
        return false;
    }
    int64_t i = index;
    if (i < 0) {
        i += n;
    }
    if (i > n - 1) {
        i -= n;
    }
    const int64_t j = (i + 1 == n) ? 0 : i + 1;
    // Negative indexes convert to huge unsigned ones, which GetAt rejects like any other.
    const CPoint2D& end = GetAt(uint32_t(j));
    const CPoint2D& start = GetAt(uint32_t(i));
    out = {start.x, start.y, end.x, end.y};
    return true;
}

bool CPolyline2D::Contains(const CPoint2D& p) const {
    for (const CPoint2D& q : m_points) {
        if (PointsEqual(p, q)) {
            return true;
        }
    }
    return false;
}

void CPolyline2D::Assign(const CPolyline2D& source) {
    if (this != &source) {
        m_points.assign(source.m_points.begin(), source.m_points.end());
    }
    closed = source.closed;
}
