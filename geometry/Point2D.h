// Plane points and edges of the contour geometry, in metres of the host's plan coordinates.
#pragma once

// A plane point. Plain value type; every coordinate the plug-in stores has passed Round5.
struct CPoint2D {
    double x = 0.0;
    double y = 0.0;
};

// One edge of a point list, from (x0, y0) to (x1, y1); filled by CPolyline2D::GetSegment.
struct CSegment2D {
    double x0 = 0.0;
    double y0 = 0.0;
    double x1 = 0.0;
    double y1 = 0.0;

    // The point at distance d from the start towards the end; d is not clamped, so it may lie
    // before the start or beyond the end. |d| <= 1e-5 gives the start exactly. Returns false and
    // leaves `out` untouched when the edge is shorter than 1e-5.
    bool PointAt(double d, CPoint2D& out) const;
};
