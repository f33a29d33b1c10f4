// An imported point set in process: inserting it at a click, its placement
// preview, and the objects placed at its points, checked in the reference
// host's trace and project.
#include <gtest/gtest.h>

#include "PluginTestBase.h"
#include "tests/support/TempFolder.h"

namespace {

constexpr LONG kInputEnded = 8;

class PointInsertionTest : public AttachedTest {
protected:
    void Add(float fX, float fY, float fZ, const char* pszId = "", const std::string& file = "") {
        CSurveyPoint p;
        p.m_fX = fX;
        p.m_fY = fY;
        p.m_fZ = fZ;
        p.m_Assignment.m_strObjectId = pszId;
        p.m_Assignment.m_strObjectFile = file.c_str();
        Impl()->m_PointSet.Add(p);
    }
    // Minimum corner (10, 20), extent (30, 40); placement pending.
    void FillPointSet(int nCreationMode) {
        Impl()->m_PointSet = CSurveyPointSet();
        Add(10, 20, 1);
        Add(40, 60, 3);
        Add(25, 60, 5);
        Impl()->m_PointSet.SetCreationMode(nCreationMode);
        Impl()->m_PointSet.UpdateRange();
        Impl()->m_nMode = kModePlacementPending;
    }
    void Insert(float fX, float fY) {
        Answers().push_back(IDOK);
        Impl()->OnHowInput(Impl()->m_lImportEntry, fX, fY, 0);
    }
    CTempFolder m_folder;
};

TEST_F(PointInsertionTest, FullSequenceWithPlot) {
    FillPointSet(1);
    Impl()->m_nAnchor = 1;
    Insert(1000, 2000);
    const Calls expected = {"app.GetModeFlags() -> 127",
                            "app.SetModeFlags(96)",
                            "app.SetBatchMode(-1)",
                            "app.BeginEditGroup(\"Geometerdatei importieren\") -> 1",
                            "app.ActivateEditGroup(1)",
                            "app.StartProgress(\"Erweiterter Gel\xc3\xa4nde-Assistent\", 0)",
                            "app.SetProgressText(\"Grundst\xc3\xbc"
                            "ck erzeugen\")",
                            "app.CreateSiteObject(1) -> site#1",
                            "app.CreatePolylineObject(256) -> polyline#1",
                            "polyline#1.SetPoints(4, [[1000, 2000], [1030, 2000], [1030, 2040], "
                            "[1000, 2040]])",
                            "polyline#1.SetClosed(-1)",
                            "app.PlaceSiteObject(site#1, polyline#1)",
                            "app.SetProgressText(\"H\xc3\xb6henpunkte erzeugen\")",
                            "app.SetProgressPosition(0)",
                            "app.CreateHeightPoint(1000, 2000, 1)",
                            "app.SetProgressPosition(33)",
                            "app.CreateHeightPoint(1030, 2040, 3)",
                            "app.SetProgressPosition(66)",
                            "app.CreateHeightPoint(1015, 2040, 5)",
                            "app.SetProgressText(\"Objekte platzieren\")",
                            "app.LoadObjectFile(\"\", 1) -> E_FAIL",
                            "app.EndProgress()",
                            "app.EndEditGroup(1, -1)",
                            "app.SetBatchMode(0)",
                            "app.SetModeFlags(127)"};
    EXPECT_EQ(TakeTrace(), expected);
    EXPECT_EQ(Boxes().at(0).text,
              "Sollen jetzt die ausgew\xe4hlten 3 H\xf6henpunkte eingef\xfcgt werden?");
    EXPECT_EQ(Impl()->m_nMode, kModePlacementPending);  // placement goes on
}

TEST_F(PointInsertionTest, AnchorDecidesWhereThePointsLand) {
    // The last point is the survey point (25, 60); the outline starts at the
    // placed minimum.
    static const struct {
        int anchor;
        float lastX, lastY, minX, minY;
    } cases[] = {
        {1, 1015, 2040, 1000, 2000},
        {0, 1000, 2020, 985, 1980},
        {9, 1000, 2020, 985, 1980},  // out of range: as the centre
        {5, 985, 2000, 970, 1960},
    };
    for (size_t i = 0; i < std::size(cases); ++i) {
        FillPointSet(1);
        Impl()->m_nAnchor = cases[i].anchor;
        Insert(1000, 2000);
        const CHeightPoint& last = Project().heightPoints.back();
        EXPECT_EQ(CPlanPoint(last.fX, last.fY), CPlanPoint(cases[i].lastX, cases[i].lastY))
            << "case " << i;
        ASSERT_EQ(Project().sites.size(), i + 1) << "case " << i;
        const float x = cases[i].minX, y = cases[i].minY;
        EXPECT_EQ(Project().sites.back().outline,
                  (std::vector<CPlanPoint>{{x, y}, {x + 30, y}, {x + 30, y + 40}, {x, y + 40}}))
            << "case " << i;
    }
}

TEST_F(PointInsertionTest, CancelOrModeZeroOrOnePoint) {
    FillPointSet(0);
    Answers().push_back(IDCANCEL);
    Impl()->OnHowInput(Impl()->m_lImportEntry, 5, 5, 0);
    EXPECT_TRUE(TakeTrace().empty());

    Insert(5, 5);  // creation mode 0: no plot
    EXPECT_TRUE(Project().sites.empty());
    EXPECT_EQ(Project().heightPoints.size(), 3u);

    // One point has no extent, so it lands on the click whatever the anchor.
    for (int anchor : {0, 3, 7}) {
        Impl()->m_PointSet = CSurveyPointSet();
        Add(7, 8, 9);
        Impl()->m_PointSet.UpdateRange();
        Impl()->m_nAnchor = anchor;
        Insert(100.5f, -3.25f);
        const CHeightPoint& p = Project().heightPoints.back();
        EXPECT_EQ(std::vector<float>({p.fX, p.fY, p.fZ}), std::vector<float>({100.5f, -3.25f, 9}))
            << "anchor " << anchor;
    }
}

TEST_F(PointInsertionTest, InputEndedFlagComesFirst) {
    FillPointSet(0);
    Impl()->OnHowInput(Impl()->m_lPolylineEntry, 1, 1, kInputEnded | 1);
    EXPECT_EQ(TakeTrace(), Calls{"app.SetInputMode(0)"});
    EXPECT_EQ(Impl()->m_nMode, kModeIdle);
    EXPECT_EQ(Impl()->m_Contour.GetCount(), 0u);  // not taken as a click
}

TEST_F(PointInsertionTest, PreviewRectangleByAnchor) {
    Impl()->OnHowMove(Impl()->m_lImportEntry, 1, 1);  // nothing pending
    Impl()->OnHowMove(Impl()->m_lContourButton, 1, 1);
    Impl()->OnHowMove(4711, 1, 1);
    EXPECT_TRUE(TakeTrace().empty());
    const Calls clear = {"app.GetActiveView() -> view", "view.GetOverlay() -> overlay",
                         "overlay.ClearOverlay()"};
    Impl()->m_nMode = kModePlacementPending;  // an empty set: cleared, nothing drawn
    Impl()->OnHowMove(Impl()->m_lImportEntry, 1, 1);
    EXPECT_EQ(TakeTrace(), clear);

    Add(0, 0, 0);
    Add(4, 2, 0);
    Impl()->m_PointSet.UpdateRange();
    Impl()->m_nAnchor = 3;
    Impl()->OnHowMove(Impl()->m_lImportEntry, 10, 20);
    Calls expected = clear;
    for (const char* pszCall :
         {"app.CreateRectangleObject(256) -> rectangle#1", "rectangle#1.SetRedraw(0)",
          "rectangle#1.SetDrawMode(1)", "rectangle#1.SetFillColor(0)",
          "rectangle#1.SetFillStyle(0)", "rectangle#1.SetLineColor(16777215)",
          "rectangle#1.SetLineStyle(1)", "rectangle#1.SetLineWidth(-1)",
          "rectangle#1.SetAuxColor(0)", "rectangle#1.SetAuxStyle(1)", "rectangle#1.SetAuxValue(0)",
          "rectangle#1.SetWidth(4)", "rectangle#1.SetHeight(2)", "rectangle#1.SetX(6)",
          "rectangle#1.SetY(22)", "rectangle#1.SetRedraw(1)",
          "overlay.AddToOverlay(rectangle#1)"}) {
        expected.push_back(pszCall);
    }
    EXPECT_EQ(TakeTrace(), expected);
}

TEST_F(PointInsertionTest, ObjectsOfOneIdTogetherInPointOrder) {
    for (const char* pszName : {"a.oqb", "b.oqb", "other.oqb", "lower.oqb"}) {
        m_folder.Write(pszName, "osrik-object 1\nname x\nextents 1 1 2\n");
    }
    Add(1, 0, 0, "A", m_folder.Path("a.oqb"));
    Add(2, 0, 0, "B", m_folder.Path("b.oqb"));
    Add(3, 0, 0, "A",
        m_folder.Path("other.oqb"));  // the first point's file counts for the ID
    Add(4, 0, 0);                     // no code and no file: nothing
    Add(5, 0, 0, "C", m_folder.Path("missing.oqb"));
    Add(6, 0, 0, "a", m_folder.Path("lower.oqb"));  // IDs are case-sensitive
    Impl()->PlaceObjects(0, 0);
    std::vector<std::string> files;
    std::vector<float> xs;
    for (const CPlacedObject& object : Project().objects) {
        files.push_back(object.strFile);
        xs.push_back(object.matrix.value_or(std::array<float, 16>{})[12]);
    }
    EXPECT_EQ(files,
              (std::vector<std::string>{m_folder.Path("a.oqb"), m_folder.Path("a.oqb"),
                                        m_folder.Path("b.oqb"), m_folder.Path("lower.oqb")}));
    EXPECT_EQ(xs, (std::vector<float>{1, 3, 2, 6}));  // A1, A2, B1, a
}

TEST_F(PointInsertionTest, OneObjectsCallsAndItsMatrix) {
    Impl()->PlaceObjects(1, 1);  // no point: no call
    EXPECT_TRUE(TakeTrace().empty());
    m_folder.Write("tree.oqb", "osrik-object 1\nname Baum\nextents 3 3 2\n");
    Add(3, 4, 100, "T", m_folder.Path("tree.oqb"));
    Impl()->PlaceObjects(10, -5);
    const Calls expected = {
        "app.LoadObjectFile(\"" + m_folder.Path("tree.oqb") + "\", 1) -> template#1",
        "template#1.CreateObjectInstance(0, 0) -> object#1",
        "object#1.SetObjectMode(49)",
        "object#1.SetObjectLevel(-1)",
        "object#1.GetObjectExtents(0) -> 3, 3, 2",
        "object#1.SetTransformMatrix([1, 0, 0, 0, 0, 1, 0, "
        "0, 0, 0, 1, 0, 13, -1, 101, 1])",
        "object#1.InsertObject(0)"};
    EXPECT_EQ(TakeTrace(), expected);  // 2 m high at z = 100 stands at 101
}

}  // namespace
