#include <gtest/gtest.h>

#include "PluginTestBase.h"

namespace {

using Calls = std::vector<std::string>;

class InputPreviewTest : public PluginTest {
protected:
    void SetUp() override {
        PluginTest::SetUp();
        Attach();
        ClearCalls();
    }
    void Enter(std::initializer_list<CPoint2D> points) {
        for (const CPoint2D& p : points) {
            Impl()->m_Contour.Add(p);
        }
    }
};

// The eight styling calls of preview polylines and rectangles, on object `name`.
Calls ShapeStyle(const std::string& name) {
    return {name + ".SetDrawMode 1",         name + ".SetFillColor 0", name + ".SetFillStyle 0",
            name + ".SetLineColor 16777215", name + ".SetLineStyle 1", name + ".SetLineWidth -1",
            name + ".SetAuxColor 0",         name + ".SetAuxStyle 1"};
}

Calls Concat(std::initializer_list<Calls> parts) {
    Calls all;
    for (const Calls& part : parts) {
        all.insert(all.end(), part.begin(), part.end());
    }
    return all;
}

const Calls kViewAndClear = {"GetActiveView", "view1.GetOverlay", "overlay2.ClearOverlay"};

TEST_F(InputPreviewTest, NoPointClearsOnePointDrawsTheRubberBand) {
    Impl()->OnHowMove(Impl()->m_lPolylineEntry, 5, 6);
    EXPECT_EQ(Host().m_calls, kViewAndClear);

    Enter({{1.5, 2.25}});
    ClearCalls();
    Impl()->OnHowMove(Impl()->m_lPolylineEntry, 10.123456f, 6);
    const Calls expected = {"GetActiveView",
                            "view3.GetOverlay",
                            "overlay4.ClearOverlay",
                            "CreateLineObject 0x00000100",
                            "line5.SetRedraw 0",
                            "line5.SetDrawMode 1",
                            "line5.SetLineColor 16777215",
                            "line5.SetLineStyle 1",
                            "line5.SetLineWidth -1",
                            "line5.SetX1 1.5",
                            "line5.SetY1 2.25",
                            "line5.SetX2 10.123456",
                            "line5.SetY2 6",
                            "line5.SetRedraw 1",
                            "overlay4.AddToOverlay line5"};
    EXPECT_EQ(Host().m_calls, expected);  // the cursor end as received, not rounded
}

TEST_F(InputPreviewTest, StraightPolylineClosedByThePolygonEntry) {
    Enter({{0, 0}, {10, 0}});
    static const struct {
        LONG CKalmoretImpl::*entry;
        int interpol;
        const char* closed;
    } cases[] = {{&CKalmoretImpl::m_lPolygonEntry, 0, "-1"},
                 {&CKalmoretImpl::m_lPolylineEntry, 1, "0"}};
    for (size_t i = 0; i < std::size(cases); ++i) {
        ClearCalls();
        Host().m_objects.clear();
        Impl()->m_nInterpol = cases[i].interpol;
        Impl()->OnHowMove(Impl()->*cases[i].entry, 10.000004f, 5);
        const Calls expected =
            Concat({kViewAndClear,
                    {"CreatePolylineObject 0x00000100", "polyline3.SetRedraw 0"},
                    ShapeStyle("polyline3"),
                    {"polyline3.SetPoints 3 [0 0 10 0 10 5]",
                     std::string("polyline3.SetClosed ") + cases[i].closed, "polyline3.SetRedraw 1",
                     "overlay2.AddToOverlay polyline3"}});
        EXPECT_EQ(Host().m_calls, expected) << "case " << i;
        EXPECT_EQ(Impl()->m_Contour.closed, i == 0) << "case " << i;
    }
}

TEST_F(InputPreviewTest, SplineWithTheCursorOnAPointDrawsAnEmptyPolyline) {
    Enter({{0, 0}, {3, 1}});
    Impl()->m_nInterpol = 2;
    Impl()->OnHowMove(Impl()->m_lPolylineEntry, 3.000004f, 1);
    const Calls expected = Concat({kViewAndClear,
                                   {"CreatePolylineObject 0x00000100", "polyline3.SetRedraw 0"},
                                   ShapeStyle("polyline3"),
                                   {"polyline3.SetRedraw 1", "overlay2.AddToOverlay polyline3"}});
    EXPECT_EQ(Host().m_calls, expected);
}

TEST_F(InputPreviewTest, PlacementRectangleByAnchor) {
    CSurveyPoint p;
    Impl()->m_PointSet.Add(p);
    p.m_fX = 4;
    p.m_fY = 2;
    Impl()->m_PointSet.Add(p);
    Impl()->m_PointSet.UpdateRange();
    Impl()->m_nMode = kModePlacementPending;
    Impl()->m_nAnchor = 3;
    Impl()->OnHowMove(Impl()->m_lImportEntry, 10, 20);
    const Calls expected =
        Concat({kViewAndClear,
                {"CreateRectangleObject 0x00000100", "rectangle3.SetRedraw 0"},
                ShapeStyle("rectangle3"),
                {"rectangle3.SetAuxValue 0", "rectangle3.SetWidth 4", "rectangle3.SetHeight 2",
                 "rectangle3.SetX 6", "rectangle3.SetY 22", "rectangle3.SetRedraw 1",
                 "overlay2.AddToOverlay rectangle3"}});
    EXPECT_EQ(Host().m_calls, expected);
}

TEST_F(InputPreviewTest, NothingForOtherHandlesOrWithoutPendingPlacement) {
    Impl()->OnHowMove(Impl()->m_lImportEntry, 1, 1);  // mode 0
    Impl()->OnHowMove(Impl()->m_lContourButton, 1, 1);
    Impl()->OnHowMove(4711, 1, 1);
    EXPECT_TRUE(Host().m_calls.empty());
    Impl()->m_nMode = kModePlacementPending;  // an empty set: cleared, nothing drawn
    Impl()->OnHowMove(Impl()->m_lImportEntry, 1, 1);
    EXPECT_EQ(Host().m_calls, kViewAndClear);
    Host().m_bHasView = false;
    ClearCalls();
    Impl()->OnHowMove(Impl()->m_lPolygonEntry, 1, 1);
    EXPECT_EQ(Host().m_calls, Calls{"GetActiveView"});
}

}  // namespace
