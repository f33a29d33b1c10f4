#include <gtest/gtest.h>

#include <algorithm>

#include "PluginTestBase.h"

namespace {

using Calls = std::vector<std::string>;

constexpr LONG kInputEnded = 8;

class PointInsertionTest : public PluginTest {
protected:
    void SetUp() override {
        PluginTest::SetUp();
        Attach();
        ClearCalls();
    }

    // Minimum corner (10, 20), extent (30, 40).
    void FillPointSet(int nCreationMode = 0) {
        static const float points[][3] = {{10, 20, 1}, {40, 60, 3}, {25, 60, 5}};
        for (const auto& xyz : points) {
            CSurveyPoint p;
            p.m_fX = xyz[0];
            p.m_fY = xyz[1];
            p.m_fZ = xyz[2];
            Impl()->m_PointSet.Add(p);
        }
        Impl()->m_PointSet.SetCreationMode(nCreationMode);
        Impl()->m_PointSet.UpdateRange();
        Impl()->m_nMode = kModePlacementPending;
    }

    Calls CallsStartingWith(const std::string& prefix) const {
        Calls matching;
        std::copy_if(Host().m_calls.begin(), Host().m_calls.end(), std::back_inserter(matching),
                     [&](const std::string& call) { return call.rfind(prefix, 0) == 0; });
        return matching;
    }
};

TEST_F(PointInsertionTest, AnchorDecidesWhereThePointsLand) {
    static const struct {
        int anchor;
        std::string lastPoint;  // the survey point (25, 60, 5)
        std::string outline;
    } cases[] = {
        {1, "CreateHeightPoint 1015 2040 5", "[1000 2000 1030 2000 1030 2040 1000 2040]"},
        {0, "CreateHeightPoint 1000 2020 5", "[985 1980 1015 1980 1015 2020 985 2020]"},
        {9, "CreateHeightPoint 1000 2020 5", "[985 1980 1015 1980 1015 2020 985 2020]"},
        {5, "CreateHeightPoint 985 2000 5", "[970 1960 1000 1960 1000 2000 970 2000]"},
    };
    for (size_t i = 0; i < std::size(cases); ++i) {
        Impl()->m_PointSet = CSurveyPointSet();
        FillPointSet(1);
        Impl()->m_nAnchor = cases[i].anchor;
        ClearCalls();
        Answers().push_back(IDOK);
        Impl()->OnHowInput(Impl()->m_lImportEntry, 1000, 2000, 0);
        EXPECT_EQ(CallsStartingWith("CreateHeightPoint").back(), cases[i].lastPoint)
            << "case " << i;
        const Calls outline = CallsStartingWith("polyline");
        ASSERT_EQ(outline.size(), 2u) << "case " << i;
        EXPECT_NE(outline[0].find("SetPoints 4 " + cases[i].outline), std::string::npos)
            << "case " << i << ": " << outline[0];
        EXPECT_EQ(Impl()->m_nMode, kModePlacementPending) << "case " << i;  // placement goes on
    }
    EXPECT_EQ(Boxes().back().text,
              "Sollen jetzt die ausgew\xe4hlten 3 H\xf6henpunkte eingef\xfcgt werden?");
}

TEST_F(PointInsertionTest, FullSequenceWithPlot) {
    FillPointSet(1);
    Impl()->m_nAnchor = 1;
    Answers().push_back(IDOK);
    Impl()->OnHowInput(Impl()->m_lImportEntry, 1000, 2000, 0);
    const Calls expected = {
        "GetModeFlags",
        "SetModeFlags 0x12345660",
        "SetBatchMode -1",
        "BeginEditGroup Geometerdatei importieren",
        "ActivateEditGroup 77",
        "StartProgress Erweiterter Gel\xe4nde-Assistent 0",
        "SetProgressText Grundst\xfc"
        "ck erzeugen",
        "CreateSiteObject 1",
        "CreatePolylineObject 0x00000100",
        "polyline2.SetPoints 4 [1000 2000 1030 2000 1030 2040 1000 2040]",
        "polyline2.SetClosed -1",
        "PlaceSiteObject site1 polyline2",
        "SetProgressText H\xf6henpunkte erzeugen",
        "SetProgressPosition 0",
        "CreateHeightPoint 1000 2000 1",
        "SetProgressPosition 33",
        "CreateHeightPoint 1030 2040 3",
        "SetProgressPosition 66",
        "CreateHeightPoint 1015 2040 5",
        "SetProgressText Objekte platzieren",
        "LoadObjectFile  1",
        "EndProgress",
        "EndEditGroup 77 -1",
        "SetBatchMode 0",
        "SetModeFlags 0x1234567F",
    };
    EXPECT_EQ(Host().m_calls, expected);
}

TEST_F(PointInsertionTest, CancelAndModeZeroAndSinglePoint) {
    FillPointSet(0);
    Answers().push_back(IDCANCEL);
    Impl()->OnHowInput(Impl()->m_lImportEntry, 5, 5, 0);
    EXPECT_TRUE(Host().m_calls.empty());

    Answers().push_back(IDOK);
    Impl()->OnHowInput(Impl()->m_lImportEntry, 5, 5, 0);
    EXPECT_TRUE(CallsStartingWith("CreateSite").empty());
    EXPECT_EQ(CallsStartingWith("SetProgressText").size(), 2u);

    // One point: no extent, so it lands on the click whatever the anchor.
    for (int anchor : {0, 3, 7}) {
        Impl()->m_PointSet = CSurveyPointSet();
        CSurveyPoint p;
        p.m_fX = 7;
        p.m_fY = 8;
        p.m_fZ = 9;
        Impl()->m_PointSet.Add(p);
        Impl()->m_PointSet.UpdateRange();
        Impl()->m_nAnchor = anchor;
        ClearCalls();
        Answers().push_back(IDOK);
        Impl()->OnHowInput(Impl()->m_lImportEntry, 100.5f, -3.25f, 0);
        EXPECT_EQ(CallsStartingWith("CreateHeightPoint"), Calls{"CreateHeightPoint 100.5 -3.25 9"})
            << "anchor " << anchor;
    }
}

TEST_F(PointInsertionTest, InputEndedFlagComesFirst) {
    FillPointSet();
    Impl()->OnHowInput(Impl()->m_lPolylineEntry, 1, 1, kInputEnded | 1);
    EXPECT_EQ(Host().m_calls, Calls{"SetInputMode 0"});
    EXPECT_EQ(Impl()->m_nMode, kModeIdle);
    EXPECT_EQ(Impl()->m_Contour.GetCount(), 0u);
}

TEST_F(PointInsertionTest, ContourClicksAreRoundedAndAddedOnce) {
    static const struct {
        float x, y;
    } clicks[] = {{1.000004f, 2}, {1.000006f, 2}, {1.000006f, 2}, {1.0000001f, 2.0000001f}};
    for (const auto& click : clicks) {
        Impl()->OnHowInput(Impl()->m_lPolygonEntry, click.x, click.y, 0);
    }
    ASSERT_EQ(Impl()->m_Contour.GetCount(), 2u);
    EXPECT_EQ(Impl()->m_Contour.GetAt(0).x, 100000 * 1e-5);
    EXPECT_EQ(Impl()->m_Contour.GetAt(1).x, 100001 * 1e-5);
    EXPECT_EQ(CallsStartingWith("view").size(), 4u);  // UpdateView on every click

    Host().m_bHasView = false;
    Impl()->OnHowInput(Impl()->m_lPolygonEntry, 50, 50, 0);
    EXPECT_EQ(Impl()->m_Contour.GetCount(), 2u);  // no view: the click is dropped
    Impl()->OnHowInput(12345, 60, 60, 0);         // somebody else's entry
    EXPECT_EQ(Impl()->m_Contour.GetCount(), 2u);
}

}  // namespace
