#include "geometry/CubicSpline.h"

#include <gtest/gtest.h>

#include "TestLines.h"

#include <cmath>
#include <limits>
#include <random>
#include <vector>

#include "geometry/Primitives.h"

namespace {

std::vector<CPoint2D> PointsOf(const CPolyline2D& line) {
    std::vector<CPoint2D> points;
    for (uint32_t i = 0; i < line.GetCount(); ++i) {
        points.push_back(line.GetAt(i));
    }
    return points;
}

void ExpectPoints(const CPolyline2D& line, const std::vector<CPoint2D>& expected) {
    ASSERT_EQ(line.GetCount(), expected.size());
    for (uint32_t i = 0; i < line.GetCount(); ++i) {
        EXPECT_EQ(line.GetAt(i).x, expected[i].x) << "point " << i;
        EXPECT_EQ(line.GetAt(i).y, expected[i].y) << "point " << i;
    }
}

CPoint2D Rounded(double x, double y) {
    return {Round5(x), Round5(y)};
}

// (0,0), (1,1), (2,0): one sweep gives the x tangents 0.75 (an exact solve would give 1) and the y
// tangents 1.5, 0, -1.5, so the segment middles lie at y = 0.6875.
TEST(SplineInterpolate, ThreePointExample) {
    const CPolyline2D line = MakeLine({{0, 0}, {1, 1}, {2, 0}});
    CPolyline2D out;
    line.SplineInterpolate(0.0, out);
    ExpectPoints(out, {Rounded(0, 0), Rounded(0.5, 0.6875), Rounded(1, 1), Rounded(1, 1),
                       Rounded(1.5, 0.6875), Rounded(2, 0)});
    line.SplineInterpolate(0.5, out);  // the repeated inner point is thinned away
    ExpectPoints(out, {Rounded(0, 0), Rounded(0.5, 0.6875), Rounded(1, 1), Rounded(1.5, 0.6875),
                       Rounded(2, 0)});
}

// Two points: tangents of 0.75 times the chord put the quarter sample at 0.90625 of 4 m, not at 1
// m.
TEST(InterpolateSpline, TwoPointsAreSampledOnTheChordUnevenly) {
    const float x[] = {0, 4};
    const float y[] = {0, 0};
    CPolyline2D out;
    ASSERT_TRUE(InterpolateSpline(2, x, y, 0.0, out));
    ASSERT_EQ(out.GetCount(), 9u);  // steps = 2 * 4
    EXPECT_EQ(out.GetAt(2).x, Round5(0.90625));
    EXPECT_EQ(out.GetAt(4).x, Round5(2.0));
    for (uint32_t i = 0; i < out.GetCount(); ++i) {
        EXPECT_EQ(out.GetAt(i).y, 0.0);
    }
}

TEST(InterpolateSpline, StepsFollowTheLongerAxis) {
    static const struct {
        float dx, dy;
        uint32_t samples;
    } cases[] = {
        {3.7f, -1.2f, 7}, {-1.2f, 3.7f, 7}, {0.9f, -0.99f, 2},
        {0.0f, 0.0f, 2},  {1.0f, 0.0f, 3},  {-10.5f, 2.0f, 21},
    };
    for (size_t i = 0; i < std::size(cases); ++i) {
        const float x[] = {100, 100 + cases[i].dx};
        const float y[] = {50, 50 + cases[i].dy};
        CPolyline2D out;
        out.Add({-1, -1});  // appended to, never cleared
        ASSERT_TRUE(InterpolateSpline(2, x, y, 0.0, out)) << "case " << i;
        EXPECT_EQ(out.GetCount(), cases[i].samples + 1) << "case " << i;
        EXPECT_EQ(out.GetAt(0).x, -1) << "case " << i;
    }
}

TEST(InterpolateSpline, FirstAndLastSampleAreAlwaysKept) {
    const float x[] = {0, 1, 1.5f};
    const float y[] = {0, 0, 0};
    CPolyline2D out;
    ASSERT_TRUE(InterpolateSpline(3, x, y, 1.0, out));
    ASSERT_GE(out.GetCount(), 2u);
    EXPECT_EQ(out.GetAt(0).x, 0.0);
    EXPECT_EQ(out.GetAt(out.GetCount() - 1).x, Round5(1.5));
    // The end lies closer than 1 m to the last kept sample and is kept all the same.
    EXPECT_LT(Distance(out.GetAt(out.GetCount() - 2), out.GetAt(out.GetCount() - 1)), 1.0);
}

TEST(SplineInterpolate, ShortAndEmptyListsAreCopied) {
    CPolyline2D out;
    CPolyline2D().SplineInterpolate(1.0, out);
    EXPECT_EQ(out.GetCount(), 0u);
    const CPolyline2D two = MakeLine({{0, 0}, {5, 5}}, true);
    two.SplineInterpolate(1.0, out);
    ExpectPoints(out, PointsOf(two));
    EXPECT_TRUE(out.closed);
}

TEST(SplineInterpolate, ClosedLineEndsOnItsFirstPoint) {
    const CPolyline2D square = MakeLine({{0, 0}, {10, 0}, {10, 10}, {0, 10}}, true);
    CPolyline2D out;
    square.SplineInterpolate(1.0, out);
    ASSERT_GT(out.GetCount(), 8u);
    EXPECT_EQ(out.GetAt(0).x, 0.0);
    EXPECT_EQ(out.GetAt(out.GetCount() - 1).x, 0.0);
    EXPECT_EQ(out.GetAt(out.GetCount() - 1).y, 0.0);
    // The same points open stop at the last corner.
    CPolyline2D open = square;
    open.closed = false;
    open.SplineInterpolate(1.0, out);
    EXPECT_EQ(out.GetAt(out.GetCount() - 1).y, 10.0);
}

TEST(SplineInterpolate, RepeatedPointsDivideByNothing) {
    const CPolyline2D line = MakeLine({{0, 0}, {2, 1}, {2, 1}, {5, -1}, {5, -1}});
    CPolyline2D out;
    line.SplineInterpolate(0.0, out);
    ASSERT_GT(out.GetCount(), 5u);
    for (uint32_t i = 0; i < out.GetCount(); ++i) {
        EXPECT_TRUE(std::isfinite(out.GetAt(i).x) && std::isfinite(out.GetAt(i).y)) << i;
    }
    EXPECT_EQ(out.GetAt(out.GetCount() - 1).x, 5.0);
}

TEST(SplinePreview, ShortListsAndTheCursorOnAPoint) {
    CPolyline2D out;
    out.Add({1, 1});
    CPolyline2D().SplinePreview(0.0, out, 3, 3);
    EXPECT_EQ(out.GetCount(), 0u);
    MakeLine({{2, 2}}).SplinePreview(0.0, out, 3, 3);
    ExpectPoints(out, {{2, 2}});
    const CPolyline2D line = MakeLine({{0, 0}, {4, 2}});
    line.SplinePreview(0.0, out, 4.000004f, 2.0f);  // rounds onto the entered point
    EXPECT_EQ(out.GetCount(), 0u);
    line.SplinePreview(0.0, out, 8.0f, 0.0f);
    EXPECT_EQ(out.GetAt(out.GetCount() - 1).x, 8.0);
}

TEST(SplinePreview, IgnoresTheClosedFlag) {
    CPolyline2D out;
    MakeLine({{0, 0}, {10, 0}, {10, 10}}, true).SplinePreview(1.0, out, 0.0f, 10.0f);
    EXPECT_EQ(out.GetAt(out.GetCount() - 1).x, 0.0);
    EXPECT_EQ(out.GetAt(out.GetCount() - 1).y, 10.0);
}

// A cursor reported far off the plan, or not a number at all, must neither overflow the step count
// nor ask for millions of samples.
TEST(SplinePreview, FarOrInvalidCursorStaysBounded) {
    const CPolyline2D line = MakeLine({{0, 0}, {1, 1}});
    const float inf = std::numeric_limits<float>::infinity();
    const float nan = std::numeric_limits<float>::quiet_NaN();
    static const struct {
        float x, y;
    } cursors[] = {{3e9f, 0}, {-3e38f, 2e38f}, {1e6f, 1e6f}, {inf, 0}, {nan, nan}, {nan, 5e9f}};
    const uint32_t bound = 2 + 2 * (kMaxSplineSteps + 1);
    for (size_t i = 0; i < std::size(cursors); ++i) {
        CPolyline2D out;
        line.SplinePreview(0.0, out, cursors[i].x, cursors[i].y);
        EXPECT_GE(out.GetCount(), 2u) << "case " << i;
        EXPECT_LE(out.GetCount(), bound) << "case " << i;
    }
    // Below the cap the step rule is exact: 20,000 m along x is 40,000 steps.
    CPolyline2D out;
    line.SplinePreview(0.0, out, 20001.0f, 1.0f);
    EXPECT_EQ(out.GetCount(), 3u + 40001u);
}

// The preview is the conversion of the entered points plus the cursor, for any open line.
TEST(SplinePreview, EqualsTheConversionOfThePointsAndTheCursor) {
    std::mt19937 random(20261206);
    std::uniform_real_distribution<double> coordinate(-300.0, 300.0);
    std::uniform_int_distribution<int> count(2, 40);
    const double minDists[] = {0.0, 0.5, 1.0, 3.25};
    for (int round = 0; round < 200; ++round) {
        CPolyline2D line;
        for (int i = count(random); i > 0; --i) {
            line.Add(Rounded(coordinate(random), coordinate(random)));
        }
        const float cursorX = float(coordinate(random));
        const float cursorY = float(coordinate(random));
        if (line.Contains(Rounded(cursorX, cursorY))) {
            continue;
        }
        const double minDist = minDists[round % std::size(minDists)];
        CPolyline2D preview;
        line.SplinePreview(minDist, preview, cursorX, cursorY);
        CPolyline2D withCursor = line;
        withCursor.Add({cursorX, cursorY});
        CPolyline2D converted;
        withCursor.SplineInterpolate(minDist, converted);
        ASSERT_NO_FATAL_FAILURE(ExpectPoints(preview, PointsOf(converted))) << "round " << round;
    }
}

}  // namespace
