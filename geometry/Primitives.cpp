#include "geometry/Primitives.h"

#include <cmath>
#include <cstdint>

namespace {

// The largest double below 100000, not 100000 itself: an exact half in the fifth decimal lands just
// below .5 after the multiplication and so rounds down. Doubles near 1e5 are 2^-36 apart.
constexpr double kRoundMultiplier = 99999.99999999999;
static_assert(kRoundMultiplier < 100000.0 && kRoundMultiplier + 0x1p-36 == 100000.0);

// std::floor, inlined: baseline x86-64 has no rounding instruction, and the library call dominated
// the spline preview, which rounds every sample on every mouse move. Exact for every double: from
// 2^52 on every double is an integer, and below it the truncation to int64 is exact.
double Floor(double v) {
    if (!(std::fabs(v) < 0x1p52)) {
        return v;  // already integral, infinite or NaN
    }
    const double truncated = double(int64_t(v));
    return (truncated > v) ? truncated - 1.0 : truncated;
}

}  // namespace

double Distance(const CPoint2D& a, const CPoint2D& b) {
    const double dx = b.x - a.x;
    const double dy = b.y - a.y;
    return std::sqrt(dx * dx + dy * dy);
}

bool PointsEqual(const CPoint2D& a, const CPoint2D& b) {
    return std::fabs(a.x - b.x) < kTolerance && std::fabs(a.y - b.y) < kTolerance;
}

double Round5(double v) {
    return Floor(v * kRoundMultiplier + 0.5) * 1e-5;
}
