#include "geometry/ContourConversion.h"

#include <gtest/gtest.h>

#include "TestLines.h"

#include <vector>

namespace {

void ExpectNear(const CPolyline2D& line, const std::vector<CPoint2D>& expected, size_t caseIndex) {
    ASSERT_EQ(line.GetCount(), expected.size()) << "case " << caseIndex;
    for (uint32_t i = 0; i < line.GetCount(); ++i) {
        EXPECT_NEAR(line.GetAt(i).x, expected[i].x, 1e-12)
            << "case " << caseIndex << " point " << i;
        EXPECT_NEAR(line.GetAt(i).y, expected[i].y, 1e-12)
            << "case " << caseIndex << " point " << i;
    }
}

TEST(LinearInterpolate, SplitsEdgesIntoPiecesNoShorterThanTheLimit) {
    const CPolyline2D square = MakeLine({{0, 0}, {10, 0}, {10, 10}, {0, 10}}, true);
    const CPolyline2D triangle = MakeLine({{0, 0}, {4, 0}, {0, 3}}, true);
    static const struct {
        const CPolyline2D* line;
        double limit;
        std::vector<CPoint2D> expected;
    } cases[] = {
        {nullptr, 3.0, {{0, 0}, {10.0 / 3, 0}, {20.0 / 3, 0}, {10, 0}}},
        {nullptr, 0.0, {{0, 0}, {10, 0}}},
        {nullptr, -2.0, {{0, 0}, {10, 0}}},
        {&square, 5.0, {{0, 0}, {5, 0}, {10, 0}, {10, 5}, {10, 10}, {5, 10}, {0, 10}, {0, 5}}},
        {&triangle, 3.0, {{0, 0}, {4, 0}, {0, 3}}},  // the first corner is not repeated
        {&square, 0.0, {{0, 0}, {10, 0}, {10, 10}, {0, 10}}},
    };
    const CPolyline2D tenMetres = MakeLine({{0, 0}, {10, 0}});
    for (size_t i = 0; i < std::size(cases); ++i) {
        CPolyline2D out;
        out.Add({99, 99});
        (cases[i].line ? *cases[i].line : tenMetres).LinearInterpolate(cases[i].limit, out);
        ExpectNear(out, cases[i].expected, i);
    }
}

TEST(LinearInterpolate, ShortEdgesAndShortLists) {
    static const struct {
        CPolyline2D line;
        std::vector<CPoint2D> expected;
    } cases[] = {
        {MakeLine({{0, 0}, {5.9, 0}}), {{0, 0}, {5.9, 0}}},  // 5.9 m is not split at 3 m
        {MakeLine({{2, 3}}), {{2, 3}}},
        {MakeLine({}), {}},
        {MakeLine({}, true), {}},
        // Of two points closer than the tolerance only the later one remains.
        {MakeLine({{0, 0}, {1, 0}, {1.000001, 0}, {2, 0}}), {{0, 0}, {1.000001, 0}, {2, 0}}},
    };
    for (size_t i = 0; i < std::size(cases); ++i) {
        CPolyline2D out;
        cases[i].line.LinearInterpolate(3.0, out);
        ExpectNear(out, cases[i].expected, i);
    }
}

// A tiny positive limit on a long edge would otherwise make a million height points.
TEST(LinearInterpolate, PiecesPerEdgeAreCapped) {
    const CPolyline2D line = MakeLine({{0, 0}, {100, 0}, {100, 0.5}});
    CPolyline2D out;
    line.LinearInterpolate(0.0001, out);
    EXPECT_EQ(out.GetCount(), uint32_t(kMaxPiecesPerEdge + 5000 + 1));
    line.LinearInterpolate(0.01, out);  // exactly at the cap: still exact
    EXPECT_EQ(out.GetCount(), uint32_t(10000 + 50 + 1));
    EXPECT_DOUBLE_EQ(out.GetAt(1).x, 0.01);
}

TEST(ConvertContour, ChoosesTheRuleByInterpol) {
    const CPolyline2D line = MakeLine({{0, 0}, {1, 1}, {2, 0}});
    static const struct {
        int32_t interpol;
        float segLen;
        uint32_t count;
    } cases[] = {
        {0, 0.5f, 3},      {5, 0.5f, 3}, {-1, 0.5f, 3},  // as entered
        {1, 0.5f, 5},                                    // linear: 1.41 m edges in two pieces
        {1, 0.000004f, 3},                               // rounds to a limit of 0
        {2, 0.0f, 6},                                    // spline, every sample
        {2, 0.5f, 5},
    };
    for (size_t i = 0; i < std::size(cases); ++i) {
        CPolyline2D out;
        ConvertContour(line, cases[i].interpol, cases[i].segLen, out);
        EXPECT_EQ(out.GetCount(), cases[i].count) << "case " << i;
    }
}

}  // namespace
