// Point lists for the geometry tests.
#pragma once

#include <initializer_list>

#include "geometry/Polyline2D.h"

inline CPolyline2D MakeLine(std::initializer_list<CPoint2D> points, bool closed = false) {
    CPolyline2D line;
    for (const CPoint2D& p : points) {
        line.Add(p);
    }
    line.closed = closed;
    return line;
}
