#include "geometry/Primitives.h"

#include <gtest/gtest.h>

#include <cmath>
#include <limits>

namespace {

// Results are an integer times 1e-5 in double precision, so the expectations are written that way.
TEST(Round5, RoundsToFiveDecimalsWithHalvesDown) {
    static const struct {
        double value;
        double expected;
    } cases[] = {
        {0.123456, 12346 * 1e-5},
        {-0.0000075, -1 * 1e-5},
        {0.0000025, 0.0},
        {-0.0000025, 0.0},
        {0.000015, 1 * 1e-5},  // an exact half rounds down
        {0.000025, 2 * 1e-5},
        {1.5, 150000 * 1e-5},  // 1.5000000000000002, not 1.5
        {1.000004, 100000 * 1e-5},
        {1.000006, 100001 * 1e-5},
        {-12.345678, -1234568 * 1e-5},
        {double(0.1f), 10000 * 1e-5},  // floats are widened first
        {0.0, 0.0},
    };
    for (size_t i = 0; i < std::size(cases); ++i) {
        EXPECT_EQ(Round5(cases[i].value), cases[i].expected) << "case " << i;
    }
    EXPECT_NE(Round5(1.5), 1.5);
    EXPECT_TRUE(std::isnan(Round5(std::numeric_limits<double>::quiet_NaN())));
}

TEST(PointsEqual, StrictToleranceOnBothAxes) {
    const double nan = std::numeric_limits<double>::quiet_NaN();
    static const struct {
        CPoint2D a, b;
        bool expected;
    } cases[] = {
        {{0, 0}, {0, 0}, true},          {{0, 0}, {0.000009, -0.000009}, true},
        {{0, 0}, {0.00001, 0}, false},  // a difference equal to the tolerance is not below it
        {{0, 0}, {0, 0.00002}, false},   {{0, 0}, {nan, 0}, false},
        {{nan, nan}, {nan, nan}, false},
    };
    for (size_t i = 0; i < std::size(cases); ++i) {
        EXPECT_EQ(PointsEqual(cases[i].a, cases[i].b), cases[i].expected) << "case " << i;
    }
}

TEST(SegmentPointAt, DistanceAlongTheEdgeUnclamped) {
    const CSegment2D edge{1, 2, 4, 6};  // length 5
    static const struct {
        double d;
        CPoint2D expected;
    } cases[] = {
        {0.0, {1, 2}},      {0.000005, {1, 2}},  // within the tolerance: the start exactly
        {-0.00001, {1, 2}}, {2.5, {2.5, 4}},
        {5.0, {4, 6}},      {10.0, {7, 10}},  // one length beyond the end
        {-5.0, {-2, -2}},
    };
    for (size_t i = 0; i < std::size(cases); ++i) {
        CPoint2D p{0xdead, 0xbeef};
        ASSERT_TRUE(edge.PointAt(cases[i].d, p)) << "case " << i;
        EXPECT_DOUBLE_EQ(p.x, cases[i].expected.x) << "case " << i;
        EXPECT_DOUBLE_EQ(p.y, cases[i].expected.y) << "case " << i;
    }
}

TEST(SegmentPointAt, ShortEdgeFailsAndLeavesTheOutput) {
    for (const CSegment2D& edge : {CSegment2D{3, 3, 3, 3}, CSegment2D{0, 0, 0.000009, 0}}) {
        CPoint2D p{0xdead, 0xbeef};
        EXPECT_FALSE(edge.PointAt(0.0, p));
        EXPECT_EQ(p.x, 0xdead);
        EXPECT_EQ(p.y, 0xbeef);
    }
}

}  // namespace
