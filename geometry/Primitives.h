// The tolerance, distance and rounding shared by all contour geometry.
#pragma once

#include "geometry/Point2D.h"

// Coordinates closer than this count as equal; lengths below it count as zero.
inline constexpr double kTolerance = 1e-5;

// Euclidean distance of two points.
double Distance(const CPoint2D& a, const CPoint2D& b);

// True when both coordinate differences are strictly below 1e-5; a NaN difference is not equal.
bool PointsEqual(const CPoint2D& a, const CPoint2D& b);

// Rounds to five decimals, exact halves downwards (0.000015 gives 0.00001); the result is an
// integer times 1e-5 in double precision (1.5 gives 1.5000000000000002). NaN stays NaN.
double Round5(double v);
