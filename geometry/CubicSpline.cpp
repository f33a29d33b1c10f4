#include "geometry/CubicSpline.h"

#include <algorithm>
#include <cmath>
#include <new>

#include "geometry/Primitives.h"

namespace {

// The host calls the plug-in on its one user-interface thread; thread_local keeps the working sets
// safe anyway and lets the preview run on every mouse move without allocating.
thread_local CCubicSpline t_spline;
thread_local std::vector<float> t_sweepStart;
thread_local std::vector<float> t_sweepResult;

void ResizeWorkingSet(CCubicSpline& s, int32_t n) {
    const size_t size = size_t(n);
    for (std::vector<float>* a : {&s.x, &s.y, &s.dx, &s.dy, &s.tx, &s.ty, &s.ex, &s.ey, &s.ratio,
                                  &s.sub, &s.diag, &s.sup}) {
        a->assign(size, 0.0f);
    }
    t_sweepStart.resize(size);
    t_sweepResult.resize(size);
    s.n = n;
}

void ComputeDifferences(CCubicSpline& s) {
    for (int32_t i = 0; i + 1 < s.n; ++i) {
        s.dx[i] = s.x[i + 1] - s.x[i];
        s.dy[i] = s.y[i + 1] - s.y[i];
    }
}

// Ratio of each chord to the next. A zero-length next chord (two equal points) would divide by
// zero; the chord itself stands in for the quotient there.
void ComputeRatios(CCubicSpline& s) {
    const int32_t last = s.n - 2;
    auto chord = [&s](int32_t i) { return std::sqrt(s.dx[i] * s.dx[i] + s.dy[i] * s.dy[i]); };
    for (int32_t i = 0; i < last; ++i) {
        const float next = chord(i + 1);
        s.ratio[i] = (next != 0.0f) ? chord(i) / next : chord(i);
    }
    s.ratio[last] = 1.0f;
}

// Rows of the tangent system for the continuity of the second derivative, with natural ends.
void BuildTangentSystem(CCubicSpline& s) {
    const int32_t last = s.n - 1;
    s.diag[0] = 2.0f;
    s.sup[0] = s.ratio[0];
    s.tx[0] = 3.0f * s.dx[0];
    s.ty[0] = 3.0f * s.dy[0];
    for (int32_t i = 1; i < last; ++i) {
        const float r = s.ratio[i - 1];
        s.sub[i] = 1.0f;
        s.diag[i] = 2.0f * r * (r + 1.0f);
        s.sup[i] = r * r * s.ratio[i];
        s.tx[i] = 3.0f * (r * r * s.dx[i] + s.dx[i - 1]);
        s.ty[i] = 3.0f * (r * r * s.dy[i] + s.dy[i - 1]);
    }
    s.sub[last] = 1.0f;
    s.diag[last] = 2.0f * s.ratio[last - 1];
    s.tx[last] = 3.0f * s.dx[last - 1];
    s.ty[last] = 3.0f * s.dy[last - 1];
}

float DivideUnlessZero(float value, float divisor) {
    return (divisor != 0.0f) ? value / divisor : value;
}

// Exactly one sweep of simultaneous displacements (every new value from the start vector only). The
// result is not the exact solution (two points get 0.75 times the chord as tangents), and the curve
// users have drawn their terrain with depends on precisely this.
void SweepTangents(const CCubicSpline& s, std::vector<float>& rhs) {
    const int32_t last = s.n - 1;
    std::vector<float>& start = t_sweepStart;
    std::vector<float>& result = t_sweepResult;
    for (int32_t i = 0; i <= last; ++i) {
        start[i] = DivideUnlessZero(rhs[i], s.diag[i]);
    }
    result[0] = DivideUnlessZero(rhs[0] - s.sup[0] * start[1], s.diag[0]);
    for (int32_t i = 1; i < last; ++i) {
        const float value = rhs[i] - s.sub[i] * start[i - 1] - s.sup[i] * start[i + 1];
        result[i] = DivideUnlessZero(value, s.diag[i]);
    }
    result[last] = DivideUnlessZero(rhs[last] - s.sub[last] * start[last - 1], s.diag[last]);
    std::copy(result.begin(), result.begin() + s.n, rhs.begin());
}

void ComputeEndTangents(CCubicSpline& s) {
    for (int32_t i = 0; i + 1 < s.n; ++i) {
        s.ex[i] = s.ratio[i] * s.tx[i + 1];
        s.ey[i] = s.ratio[i] * s.ty[i + 1];
    }
}

// |trunc(d)| as an integer, saturated at the cap so that no float outside the integer range is ever
// converted. NaN counts as 0, as an indefinite conversion result would lose the max below.
int64_t AxisSteps(float d) {
    const float a = std::fabs(d);
    if (std::isnan(a)) {
        return 0;
    }
    return (a >= float(kMaxSplineSteps)) ? kMaxSplineSteps : int64_t(a);
}

// About two samples per metre along the segment's longer axis; at least one step, at most the cap.
int32_t StepCount(float dx, float dy) {
    const int64_t steps =
        std::min<int64_t>(2 * std::max(AxisSteps(dx), AxisSteps(dy)), kMaxSplineSteps);
    return std::max<int32_t>(int32_t(steps), 1);
}

CHermiteSegment MakeSegment(const CCubicSpline& s, int32_t i) {
    return {s.dx[i], s.dy[i], s.tx[i], s.ty[i], s.ex[i], s.ey[i], StepCount(s.dx[i], s.dy[i])};
}

// Rounds the samples and keeps those at least minDist from the last kept one, and always the first
// and the last, without ever storing the samples themselves.
class CSampleThinner {
public:
    CSampleThinner(CPolyline2D& out, double minDist, int64_t total)
        : m_out(out), m_minDist(minDist), m_total(total) {}

    void Emit(float x, float y) {
        const CPoint2D p{Round5(x), Round5(y)};
        const bool firstOrLast = m_index == 0 || m_index == m_total - 1;
        ++m_index;
        if (m_minDist == 0.0 || firstOrLast || Distance(m_lastKept, p) >= m_minDist) {
            m_out.Add(p);
            m_lastKept = p;
        }
    }

private:
    CPolyline2D& m_out;
    double m_minDist;
    int64_t m_total;
    int64_t m_index = 0;
    CPoint2D m_lastKept;
};

void SampleSegment(float x0, float y0, const CHermiteSegment& seg, CSampleThinner& thinner) {
    thinner.Emit(x0, y0);
    const float steps = float(seg.steps);
    for (int32_t j = 1; j <= seg.steps; ++j) {
        const float t = float(j) / steps;
        const float h01 = (3.0f - 2.0f * t) * (t * t);
        const float h10 = t * ((t - 1.0f) * (t - 1.0f));
        const float h11 = (t * t) * (t - 1.0f);
        thinner.Emit(x0 + h01 * seg.dx + h10 * seg.tx + h11 * seg.ex,
                     y0 + h01 * seg.dy + h10 * seg.ty + h11 * seg.ey);
    }
}

void SampleSpline(const CCubicSpline& s, double minDist, CPolyline2D& out) {
    int64_t total = 0;
    for (int32_t i = 0; i + 1 < s.n; ++i) {
        total += StepCount(s.dx[i], s.dy[i]) + 1;
    }
    CSampleThinner thinner(out, minDist, total);
    for (int32_t i = 0; i + 1 < s.n; ++i) {
        SampleSegment(s.x[i], s.y[i], MakeSegment(s, i), thinner);
    }
}

}  // namespace

bool InterpolateSpline(int32_t n, const float* x, const float* y, double minDist,
                       CPolyline2D& out) {
    if (n < 2) {
        return true;  // no segment, no sample
    }
    CCubicSpline& s = t_spline;
    try {
        ResizeWorkingSet(s, n);
    } catch (const std::bad_alloc&) {
        return false;
    }
    std::copy(x, x + n, s.x.begin());
    std::copy(y, y + n, s.y.begin());
    ComputeDifferences(s);
    ComputeRatios(s);
    BuildTangentSystem(s);
    SweepTangents(s, s.tx);
    SweepTangents(s, s.ty);
    ComputeEndTangents(s);
    SampleSpline(s, minDist, out);
    return true;
}
