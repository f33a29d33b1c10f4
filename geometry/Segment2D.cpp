#include "geometry/Point2D.h"
#include "geometry/Primitives.h"

#include <cmath>

bool CSegment2D::PointAt(double d, CPoint2D& out) const {
    const double length = Distance({x0, y0}, {x1, y1});
    if (length < kTolerance) {
        return false;
    }
    if (std::fabs(d) <= kTolerance) {
        out = {x0, y0};
        return true;
    }
    // Scaling by the reciprocal rather than dividing keeps the results of earlier versions.
    const double inverse = 1.0 / length;
    out.x = (x1 - x0) * inverse * d + x0;
    out.y = (y1 - y0) * inverse * d + y0;
    return true;
}
