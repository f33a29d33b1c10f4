#include "geometry/Polyline2D.h"

#include <gtest/gtest.h>

#include "TestLines.h"

#include <cstring>

namespace {

std::string ThrownText(const CPolyline2D& line, uint32_t index) {
    try {
        line.GetAt(index);
    } catch (char* text) {
        return text;
    }
    return "nothing thrown";
}

TEST(Polyline2D, GetAtThrowsTheTextForIndexesNotBelowTheCount) {
    const CPolyline2D line = MakeLine({{1, 2}, {3, 4}});
    EXPECT_EQ(line.GetAt(1).x, 3);
    EXPECT_EQ(ThrownText(line, 2), "Index out of Range!");
    EXPECT_EQ(ThrownText(line, uint32_t(-1)), "Index out of Range!");
    EXPECT_EQ(ThrownText(CPolyline2D{}, 0), "Index out of Range!");
    EXPECT_THROW(line.GetAt(5), void*);
}

TEST(Polyline2D, SegmentCountFollowsTheClosedFlag) {
    static const struct {
        size_t points;
        bool closed;
        int32_t expected;
    } cases[] = {
        {0, false, -1}, {0, true, 0}, {1, false, 0}, {3, false, 2}, {3, true, 3},
    };
    for (size_t i = 0; i < std::size(cases); ++i) {
        CPolyline2D line;
        for (size_t k = 0; k < cases[i].points; ++k) {
            line.Add({double(k), 0});
        }
        line.closed = cases[i].closed;
        EXPECT_EQ(line.GetSegmentCount(), cases[i].expected) << "case " << i;
    }
}

TEST(Polyline2D, GetSegmentWrapsTheIndexOnce) {
    const CPolyline2D line = MakeLine({{0, 0}, {1, 0}, {1, 1}}, true);
    static const struct {
        int32_t index;
        CSegment2D expected;
    } cases[] = {
        {0, {0, 0, 1, 0}},  {1, {1, 0, 1, 1}},
        {2, {1, 1, 0, 0}},  // 2: third point back to the first
        {-1, {1, 1, 0, 0}}, {-3, {0, 0, 1, 0}},
        {3, {0, 0, 1, 0}},  // n wraps to edge 0
        {5, {1, 1, 0, 0}},
    };
    for (size_t i = 0; i < std::size(cases); ++i) {
        CSegment2D s{9, 9, 9, 9};
        ASSERT_TRUE(line.GetSegment(cases[i].index, s)) << "case " << i;
        EXPECT_EQ(std::memcmp(&s, &cases[i].expected, sizeof s), 0) << "case " << i;
    }
    CSegment2D s;
    EXPECT_THROW(line.GetSegment(6, s), char*);
    EXPECT_THROW(line.GetSegment(-4, s), char*);
}

TEST(Polyline2D, GetSegmentOnFewerThanTwoPointsIsZeroAndFalse) {
    for (const CPolyline2D& line : {CPolyline2D{}, MakeLine({{5, 5}}, true)}) {
        CSegment2D s{9, 9, 9, 9};
        EXPECT_FALSE(line.GetSegment(0, s));
        EXPECT_EQ(s.x0, 0);
        EXPECT_EQ(s.y0, 0);
        EXPECT_EQ(s.x1, 0);
        EXPECT_EQ(s.y1, 0);
    }
}

TEST(Polyline2D, ContainsUsesTheTolerance) {
    const CPolyline2D line = MakeLine({{0, 0}, {10, 10}});
    EXPECT_TRUE(line.Contains({10.000009, 9.999991}));
    EXPECT_FALSE(line.Contains({10.00002, 10}));
    EXPECT_FALSE(CPolyline2D{}.Contains({0, 0}));
}

TEST(Polyline2D, AssignCopiesPointsAndFlagClearKeepsTheFlag) {
    CPolyline2D target = MakeLine({{7, 7}, {8, 8}, {9, 9}});
    const CPolyline2D source = MakeLine({{1, 1}, {2, 2}}, true);
    target.Assign(source);
    ASSERT_EQ(target.GetCount(), 2u);
    EXPECT_EQ(target.GetAt(1).y, 2);
    EXPECT_TRUE(target.closed);
    target.Assign(target);
    EXPECT_EQ(target.GetCount(), 2u);
    target.Clear();
    EXPECT_EQ(target.GetCount(), 0u);
    EXPECT_TRUE(target.closed);
}

}  // namespace
