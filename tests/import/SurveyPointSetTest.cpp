#include "import/SurveyPointSet.h"

#include <gtest/gtest.h>

#include <array>
#include <cfloat>
#include <cmath>
#include <vector>

namespace {

using Xyz = std::array<float, 3>;

CSurveyPointSet MakeSet(const std::vector<Xyz>& points, int nMode = 0) {
    CSurveyPointSet set;
    for (size_t i = 0; i < points.size(); ++i) {
        CSurveyPoint p;
        p.m_strName = std::string_view(std::to_string(i));
        p.m_fX = points[i][0];
        p.m_fY = points[i][1];
        p.m_fZ = points[i][2];
        p.m_Assignment.m_strObjectId = "code";
        set.Add(p);
    }
    set.SetCreationMode(nMode);
    set.UpdateRange();
    return set;
}

// Ten points i at (100 + i, 50 - i, i * i), creation mode 2.
CSurveyPointSet TenPoints() {
    std::vector<Xyz> points;
    for (int i = 0; i < 10; ++i) {
        points.push_back({100.0f + float(i), 50.0f - float(i), float(i * i)});
    }
    return MakeSet(points, 2);
}

Xyz Corner(const CSurveyPoint& p) {
    EXPECT_TRUE(p.m_strName.IsEmpty() && p.m_Assignment.m_strObjectId.IsEmpty());
    return {p.m_fX, p.m_fY, p.m_fZ};
}

std::string Names(const CSurveyPointSet& set) {
    std::string names;
    for (int i = 0; i < set.GetCount(); ++i) {
        names += set.GetAt(i).m_strName.Str();
    }
    return names;
}

TEST(SurveyPointSet, RangeIsPerAxisOverTheWholeFloatRange) {
    static const struct {
        std::vector<Xyz> points;
        Xyz min, max;
    } cases[] = {
        {{}, {0, 0, 0}, {0, 0, 0}},
        {{{5, 6, 7}}, {5, 6, 7}, {5, 6, 7}},
        {{{1, 9, 5}, {3, 2, 8}, {2, 4, -1}}, {1, 2, -1}, {3, 9, 8}},
        {{{2e30f, -3e38f, 0}}, {2e30f, -3e38f, 0}, {2e30f, -3e38f, 0}},  // beyond +-1e30
        {{{FLT_MAX, 0, 0}, {-FLT_MAX, 0, 0}}, {-FLT_MAX, 0, 0}, {FLT_MAX, 0, 0}},
        {{{NAN, 1, 2}, {NAN, 3, NAN}}, {0, 1, 2}, {0, 3, 2}},  // NaN passed over
    };
    for (size_t i = 0; i < std::size(cases); ++i) {
        const CSurveyPointSet set = MakeSet(cases[i].points);
        EXPECT_EQ(Corner(set.GetMinimum()), cases[i].min) << "case " << i;
        EXPECT_EQ(Corner(set.GetMaximum()), cases[i].max) << "case " << i;
        Xyz extent;
        set.GetExtent(extent[0], extent[1], extent[2]);
        EXPECT_EQ(extent[0], cases[i].max[0] - cases[i].min[0]) << "case " << i;
    }
}

TEST(SurveyPointSet, CopyRangeKeepsPositionsInOrder) {
    static const struct {
        int from, to;
        const char* names;
    } cases[] = {
        {2, 4, "234"}, {-1, 5, "0123456789"}, {3, -1, "0123456789"}, {4, 2, ""},
        {8, 20, "89"}, {9, 9, "9"},           {10, 12, ""},          {0, INT_MAX, "0123456789"},
    };
    const CSurveyPointSet source = TenPoints();
    for (size_t i = 0; i < std::size(cases); ++i) {
        CSurveyPointSet set = MakeSet({{1, 1, 1}});
        set.CopyRange(source, cases[i].from, cases[i].to);
        EXPECT_EQ(Names(set), cases[i].names) << "case " << i;
        EXPECT_EQ(set.GetCreationMode(), 2) << "case " << i;
    }
    CSurveyPointSet set = TenPoints();
    set.CopyRange(set, 7, 8);  // from itself: as from a copy
    EXPECT_EQ(Names(set), "78");
}

TEST(SurveyPointSet, ScalesAboutTheMinimumOfTheKeptPoints) {
    CSurveyPointSet set;
    set.CopyRange(TenPoints(), 2, 4);  // x 102..104, y 46..48, z 4..16
    EXPECT_EQ(Corner(set.GetMinimum()), (Xyz{102, 46, 4}));
    set.Scale(2, 1, 0.5f);
    EXPECT_EQ(Corner(set.GetMinimum()), (Xyz{102, 46, 4}));
    EXPECT_EQ(Corner(set.GetMaximum()), (Xyz{106, 48, 10}));
    EXPECT_EQ(set.GetAt(1).m_fZ, 6.5f);  // 4 + (9 - 4) * 0.5

    static const struct {
        float factor;
        Xyz x;  // the points at x = 100, 105, 110 afterwards
    } cases[] = {{2, {100, 110, 120}},
                 {0.5f, {100, 102.5f, 105}},
                 {1, {100, 105, 110}},
                 {0, {100, 100, 100}},
                 {-1, {100, 95, 90}}};
    for (size_t i = 0; i < std::size(cases); ++i) {
        CSurveyPointSet line = MakeSet({{100, 7, 3}, {105, 7, 3}, {110, 7, 3}});
        line.Scale(cases[i].factor, 1, 1);
        EXPECT_EQ((Xyz{line.GetAt(0).m_fX, line.GetAt(1).m_fX, line.GetAt(2).m_fX}), cases[i].x)
            << "case " << i;
        EXPECT_EQ(line.GetMinimum().m_fX, std::min(cases[i].x[0], cases[i].x[2])) << "case " << i;
        EXPECT_EQ(line.GetAt(1).m_fY, 7.0f) << "case " << i;
    }
}

TEST(SurveyPointSet, ScaleWorksInDoubleAndOverflowsToInfinity) {
    CSurveyPointSet set = MakeSet({{3512345, 0, 0}, {3512346, 0, 0}});
    set.Scale(1.5f, 1, 1);
    EXPECT_EQ(set.GetAt(1).m_fX, 3512346.5f);  // in float, (x - min) * 1.5 + min would round
    set.Scale(3e38f, 1, 1);
    EXPECT_EQ(set.GetAt(1).m_fX, INFINITY);
    EXPECT_EQ(set.GetAt(0).m_fX, 3512345.0f);
}

TEST(SurveyPointSet, ShiftMovesPointsAndRange) {
    CSurveyPointSet set = TenPoints();
    set.Shift(0, 0, 2.5f);
    EXPECT_EQ(Corner(set.GetMinimum()), (Xyz{100, 41, 2.5f}));
    EXPECT_EQ(Corner(set.GetMaximum()), (Xyz{109, 50, 83.5f}));
    EXPECT_EQ(set.GetAt(3).m_fZ, 11.5f);
}

TEST(SurveyPointSet, AssignmentCopiesAllAndRecomputesTheRange) {
    CSurveyPointSet source = TenPoints();
    source.Add(MakeSet({{500, 500, 500}}).GetAt(0));  // range of the source not updated
    CSurveyPointSet copy;
    copy = source;
    EXPECT_EQ(copy.GetCount(), 11);
    EXPECT_EQ(copy.GetCreationMode(), 2);
    EXPECT_EQ(Corner(copy.GetMaximum()), (Xyz{500, 500, 500}));
    EXPECT_EQ(Corner(CSurveyPointSet(source).GetMaximum()), (Xyz{500, 500, 500}));
}

}  // namespace
