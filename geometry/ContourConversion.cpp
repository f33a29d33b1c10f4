#include "geometry/ContourConversion.h"

#include <cmath>

#include "geometry/Primitives.h"

namespace {

// Pieces of an edge of the given length: trunc(length / limit), at least 1. A quotient that is not
// a finite number (a limit of 0 or below the tolerance gives infinity) means the edge stays whole;
// a finite one beyond the cap is capped instead of being converted out of the integer range.
int32_t PieceCount(double length, double limit) {
    const double quotient = length / limit;
    if (!std::isfinite(quotient) || !(quotient >= 1.0)) {
        return 1;
    }
    return (quotient >= kMaxPiecesPerEdge) ? kMaxPiecesPerEdge : int32_t(quotient);
}

}  // namespace

void CPolyline2D::LinearInterpolate(double maxSegLen, CPolyline2D& out) const {
    out.Clear();
    for (int32_t i = 0; i < GetSegmentCount(); ++i) {
        CSegment2D edge;
        if (!GetSegment(i, edge)) {
            continue;
        }
        const double length = Distance({edge.x0, edge.y0}, {edge.x1, edge.y1});
        const int32_t k = PieceCount(length, maxSegLen);
        // The edge contributes its start and the inner division points; its end is the next edge's
        // start (or the final point below). A zero-length edge contributes nothing.
        for (int32_t j = 0; j < k; ++j) {
            CPoint2D p;
            if (edge.PointAt(double(j) / double(k) * length, p)) {
                out.Add(p);
            }
        }
    }
    if (!closed && GetCount() > 0) {
        out.Add(GetAt(GetCount() - 1));
    }
}

void ConvertContour(const CPolyline2D& contour, int32_t interpol, float segLen, CPolyline2D& out) {
    const double limit = Round5(segLen);
    switch (interpol) {
        case kInterpolLinear:
            contour.LinearInterpolate(limit, out);
            break;
        case kInterpolSpline:
            contour.SplineInterpolate(limit, out);
            break;
        default:
            out.Assign(contour);
            break;
    }
}
