// The host objects as the plug-in meets them, driven in-process: COM identity, reference counts and
// the leak report, the recorded properties, arrays that arrive malformed, and the project records.
#include <gtest/gtest.h>

#include <cstdio>
#include <fstream>

#include "host/Macro.h"
#include "host/ModelObjects.h"
#include "host/Session.h"

namespace {

class HostObjects : public ::testing::Test {
protected:
    CHostSession m_session{"/opt/Osrik/", false};
    COsrikApplication& m_app = m_session.App();
    CProject& m_project = m_session.State().project;
};

// A VT_ARRAY | VT_R4 VARIANT: one dimension, or nRows rows when nRows > 0.
VARIANT FloatArray(std::vector<float> values, ULONG nRows = 0, LONG lLower = 0) {
    const UINT nDims = nRows ? 2 : 1;
    SAFEARRAYBOUND bounds[2] = {
        {nRows ? ULONG(values.size()) / nRows : ULONG(values.size()), lLower}, {nRows, lLower}};
    VARIANT v;
    VariantInit(&v);
    v.vt = VT_ARRAY | VT_R4;
    v.parray = SafeArrayCreate(VT_R4, nDims, bounds);
    void* pData = nullptr;
    SafeArrayAccessData(v.parray, &pData);
    std::copy(values.begin(), values.end(), static_cast<float*>(pData));
    SafeArrayUnaccessData(v.parray);
    return v;
}

TEST_F(HostObjects, MacroSharesTheApplicationsIdentity) {
    IOsrikMacro* pMacro = nullptr;
    ASSERT_EQ(m_app.QueryInterface(IID_IOsrikMacro, reinterpret_cast<void**>(&pMacro)), S_OK);
    IUnknown* pFromMacro = nullptr;
    IUnknown* pFromApp = nullptr;
    pMacro->QueryInterface(IID_IUnknown, reinterpret_cast<void**>(&pFromMacro));
    m_app.QueryInterface(IID_IUnknown, reinterpret_cast<void**>(&pFromApp));
    EXPECT_EQ(pFromMacro, pFromApp);
    pFromMacro->Release();
    pFromApp->Release();
    pMacro->Release();

    void* pNone = reinterpret_cast<void*>(0xdeadbeef);
    EXPECT_EQ(m_app.QueryInterface(IID_IOsrikLine, &pNone), E_NOINTERFACE);
    EXPECT_EQ(pNone, nullptr);
}

TEST_F(HostObjects, ReportsReferencesThePluginKeepsAndWhenItGivesThemBack) {
    IOsrikView* pView = nullptr;
    m_app.GetActiveView(&pView);
    m_session.BeginStep(3, "HowMove");
    m_session.CheckLeaks();
    m_session.CheckLeaks();  // unchanged: reported once
    pView->Release();
    m_session.BeginStep(4, "HowInput");
    m_session.CheckLeaks();
    ASSERT_EQ(m_project.leaks.size(), 2u);
    EXPECT_EQ(m_project.leaks[0].line, 3);
    EXPECT_EQ(m_project.leaks[0].strEvent, "HowMove");
    EXPECT_EQ(m_project.leaks[0].strObject, "view");
    EXPECT_EQ(m_project.leaks[0].lRefs, 1);
    EXPECT_EQ(m_project.leaks[1].line, 4);
    EXPECT_EQ(m_project.leaks[1].lRefs, 0);
}

TEST_F(HostObjects, IgnoresAReleaseTooManyAndReportsIt) {
    IOsrikView* pView = nullptr;
    m_app.GetActiveView(&pView);
    pView->Release();
    pView->Release();  // the host's own reference must survive this
    ASSERT_EQ(m_project.leaks.size(), 1u);
    EXPECT_EQ(m_project.leaks[0].strObject, "view");
    EXPECT_EQ(m_project.leaks[0].lRefs, -1);
    EXPECT_EQ(&m_app.View(), pView);
    EXPECT_EQ(m_app.View().GetOverlay(nullptr), E_POINTER);  // still alive
}

TEST_F(HostObjects, NoViewWhenTheScenarioTookItAway) {
    m_session.State().bViewAvailable = false;
    IOsrikView* pView = reinterpret_cast<IOsrikView*>(0xdeadbeef);
    EXPECT_EQ(m_app.GetActiveView(&pView), S_FALSE);
    EXPECT_EQ(pView, nullptr);
}

TEST_F(HostObjects, OverlayKeepsItsObjectsUntilCleared) {
    IOsrikLine* pLine = nullptr;
    ASSERT_EQ(m_app.CreateLineObject(0x100, &pLine), S_OK);
    pLine->SetRedraw(0);
    pLine->SetLineColor(0x00FFFFFF);
    pLine->SetX1(1.5f);
    pLine->SetRedraw(1);
    COverlayObject& overlay = m_app.View().Overlay();
    LONG lResult = 0;
    EXPECT_EQ(overlay.AddToOverlay(pLine, &lResult), S_OK);
    pLine->Release();

    const COverlaySnapshot snapshot = overlay.Snapshot();
    ASSERT_EQ(snapshot.size(), 1u);
    EXPECT_EQ(snapshot[0].strType, "line");
    const auto& items = snapshot[0].properties.Items();
    ASSERT_EQ(items.size(), 3u);
    EXPECT_EQ(items[0].first, "redraw");  // first set first, last value kept
    EXPECT_EQ(std::get<LONG>(items[0].second), 1);
    EXPECT_EQ(items[1].first, "lineColor");
    EXPECT_EQ(items[2].first, "x1");
    EXPECT_EQ(std::get<float>(items[2].second), 1.5f);

    EXPECT_NE(m_session.State().Find(pLine), nullptr);
    overlay.ClearOverlay();
    EXPECT_EQ(m_session.State().Find(pLine), nullptr);  // the last reference went with it
    EXPECT_TRUE(overlay.Snapshot().empty());
}

TEST_F(HostObjects, OverlayRefusesForeignObjects) {
    IOsrikLine* pLine = nullptr;
    m_app.CreateLineObject(0x100, &pLine);
    LONG lResult = 0;
    EXPECT_EQ(
        m_app.View().Overlay().AddToOverlay(reinterpret_cast<IOsrikGraphic2D*>(&lResult), &lResult),
        E_INVALIDARG);
    pLine->Release();
}

TEST_F(HostObjects, SetPointsTakesOnlyAFittingFloatArray) {
    IOsrikPolyline* pPolyline = nullptr;
    m_app.CreatePolylineObject(0x100, &pPolyline);
    auto* pObject = dynamic_cast<CPolylineObject*>(m_session.State().Find(pPolyline));
    ASSERT_NE(pObject, nullptr);

    VARIANT good = FloatArray({1, 2, 3, 4, 5, 6});
    VARIANT square = FloatArray({1, 2, 3, 4}, 2);  // 2 x 2
    VARIANT wrongType;
    VariantInit(&wrongType);
    wrongType.vt = VT_I4;
    static const struct {
        LONG lCount;
        VARIANT* pv;
        HRESULT hr;
        size_t nPoints;
    } kCases[] = {
        {3, &good, S_OK, 3},
        {2, &good, S_OK, 2},  // a longer array is fine
        {0, &good, S_OK, 0},
        {4, &good, E_INVALIDARG, 0},  // too short
        {-1, &good, E_INVALIDARG, 0},
        {1, &square, E_INVALIDARG, 0},  // two dimensions
        {1, &wrongType, E_INVALIDARG, 0},
    };
    for (size_t i = 0; i < std::size(kCases); ++i) {
        pPolyline->SetPoints(0, good);  // reset
        const HRESULT hr = pPolyline->SetPoints(kCases[i].lCount, *kCases[i].pv);
        EXPECT_EQ(hr, kCases[i].hr) << "case " << i;
        if (SUCCEEDED(hr)) {
            EXPECT_EQ(pObject->Points().size(), kCases[i].nPoints) << "case " << i;
        }
    }
    EXPECT_EQ(pObject->Points(), (std::vector<CPlanPoint>{}));
    pPolyline->SetPoints(2, good);
    EXPECT_EQ(pObject->Points(), (std::vector<CPlanPoint>{{1.f, 2.f}, {3.f, 4.f}}));
    VariantClear(&good);
    VariantClear(&square);
    pPolyline->Release();
}

TEST(ReadMatrix, TakesOnlyAFourByFourFloatArrayFromZero) {
    std::vector<float> values(16);
    for (size_t i = 0; i < 16; ++i) {
        values[i] = float(i);
    }
    VARIANT good = FloatArray(values, 4);
    VARIANT flat = FloatArray(values);
    VARIANT fromOne = FloatArray(values, 4, 1);
    VARIANT small = FloatArray({1, 2, 3, 4}, 2);
    const auto matrix = ReadMatrix(good);
    ASSERT_TRUE(matrix);
    EXPECT_EQ((*matrix)[12], 12.0f);
    EXPECT_FALSE(ReadMatrix(flat));
    EXPECT_FALSE(ReadMatrix(fromOne));
    EXPECT_FALSE(ReadMatrix(small));
    for (VARIANT* pv : {&good, &flat, &fromOne, &small}) {
        VariantClear(pv);
    }
}

TEST_F(HostObjects, PlacesSitesWithTheirOutlineInTheActiveGroup) {
    LONG lGroup = 0, lResult = 0;
    BSTR bstrName = SysAllocString(OLESTR("Geometerdatei importieren"));
    m_app.BeginEditGroup(bstrName, &lGroup);
    SysFreeString(bstrName);
    m_app.ActivateEditGroup(&lGroup, &lResult);

    IOsrikSite* pSite = nullptr;
    IOsrikPolyline* pOutline = nullptr;
    EXPECT_EQ(m_app.CreateSiteObject(3, &pSite), E_INVALIDARG);
    EXPECT_EQ(pSite, nullptr);
    ASSERT_EQ(m_app.CreateSiteObject(2, &pSite), S_OK);
    m_app.CreatePolylineObject(0x100, &pOutline);
    VARIANT corners = FloatArray({0, 0, 4, 0, 4, 2, 0, 2});
    pOutline->SetPoints(4, corners);
    VariantClear(&corners);
    pOutline->SetClosed(VARIANT_TRUE);
    EXPECT_EQ(m_app.PlaceSiteObject(pSite, pOutline, &lResult), S_OK);
    EXPECT_EQ(m_app.PlaceSiteObject(pSite, nullptr, &lResult), E_INVALIDARG);
    pOutline->Release();
    pSite->Release();
    m_app.EndEditGroup(&lGroup, -1, &lResult);

    ASSERT_EQ(m_project.sites.size(), 1u);
    EXPECT_EQ(m_project.sites[0].lKind, 2);
    EXPECT_EQ(m_project.sites[0].outline.size(), 4u);
    EXPECT_TRUE(m_project.sites[0].bClosed);
    EXPECT_EQ(m_project.sites[0].group, 0u);
    EXPECT_EQ(m_project.editGroups[0].strName, "Geometerdatei importieren");
}

TEST_F(HostObjects, LoadsObjectFilesAndRecordsInsertedObjects) {
    const std::string strPath = ::testing::TempDir() + "/osrik_tree.oqb";
    std::ofstream(strPath) << "osrik-object 1\nname Baum\nextents 3 3 2\n";
    BSTR bstrFile = SysAllocString(Utf8ToUtf16(strPath).c_str());
    BSTR bstrMissing = SysAllocString(OLESTR("/no/such.oqb"));
    IOsrikObjectTemplate* pTemplate = reinterpret_cast<IOsrikObjectTemplate*>(0xdeadbeef);
    EXPECT_EQ(m_app.LoadObjectFile(bstrMissing, 1, &pTemplate), E_FAIL);
    EXPECT_EQ(pTemplate, nullptr);
    ASSERT_EQ(m_app.LoadObjectFile(bstrFile, 1, &pTemplate), S_OK);
    SysFreeString(bstrFile);
    SysFreeString(bstrMissing);

    IOsrikObject3D* pObject = nullptr;
    ASSERT_EQ(pTemplate->CreateObjectInstance(0, 0, &pObject), S_OK);
    float fX = 0, fY = 0, fZ = 0;
    pObject->GetObjectExtents(0, &fX, &fY, &fZ);
    EXPECT_EQ(fZ, 2.0f);
    pObject->SetObjectMode(49);
    pObject->SetObjectLevel(-1);
    std::vector<float> identity(16, 0.0f);
    identity[0] = identity[5] = identity[10] = identity[15] = 1;
    identity[14] = 101;
    VARIANT matrix = FloatArray(identity, 4);
    LONG lResult = 0;
    EXPECT_EQ(pObject->SetTransformMatrix(matrix, &lResult), S_OK);
    VariantClear(&matrix);
    pObject->InsertObject(0, &lResult);
    pObject->Release();
    pTemplate->Release();
    std::remove(strPath.c_str());

    ASSERT_EQ(m_project.objects.size(), 1u);
    const CPlacedObject& placed = m_project.objects[0];
    EXPECT_EQ(placed.strFile, strPath);
    EXPECT_EQ(placed.mode, 49);
    EXPECT_EQ(placed.level, -1);
    EXPECT_EQ((*placed.matrix)[14], 101.0f);
    EXPECT_FALSE(placed.group);
    m_session.CheckLeaks();
    EXPECT_TRUE(m_project.leaks.empty());
}

TEST_F(HostObjects, GivesPathsWithTheirTrailingSeparator) {
    BSTR bstrPath = nullptr;
    ASSERT_EQ(m_app.GetProgramPath(&bstrPath), S_OK);
    EXPECT_EQ(BstrToUtf8(bstrPath), "/opt/Osrik/");
    SysFreeString(bstrPath);
    ASSERT_EQ(m_app.GetDirectory(COsrikApplication::kObjectDirectory, &bstrPath), S_OK);
    EXPECT_EQ(BstrToUtf8(bstrPath), "/opt/Osrik/Objekte/");
    SysFreeString(bstrPath);
    EXPECT_EQ(m_app.GetDirectory(4, &bstrPath), E_INVALIDARG);
    EXPECT_EQ(bstrPath, nullptr);
}

TEST_F(HostObjects, BuildsTheToolbarOnlyUnderFittingParents) {
    LONG lToolbar = 0, lButton = 0, lEntry = 0;
    BSTR bstrText = SysAllocString(OLESTR("H\u00F6henlinie"));
    m_app.CreateToolbar(0x08020204, &lToolbar);
    CMacroObject& macro = m_app.Macro();
    EXPECT_EQ(macro.AddButtonEntry(lToolbar, nullptr, 1, bstrText, 2, &lEntry), E_INVALIDARG);
    EXPECT_EQ(lEntry, 0);  // an entry needs a button
    EXPECT_EQ(macro.AddToolbarButton(lToolbar, nullptr, bstrText, 50040, &lButton), S_OK);
    EXPECT_EQ(macro.AddToolbarButton(lButton, nullptr, bstrText, 50040, &lEntry), E_INVALIDARG);
    EXPECT_EQ(macro.AddButtonEntry(lButton, nullptr, 0x08020203, bstrText, 50041, &lEntry), S_OK);
    SysFreeString(bstrText);

    ASSERT_EQ(m_project.toolbar.size(), 3u);
    EXPECT_EQ(m_project.toolbar[2].lParent, lButton);
    EXPECT_EQ(m_project.toolbar[2].text, "H\xC3\xB6henlinie");
    EXPECT_EQ(m_project.toolbar[2].bitmap, std::nullopt);
    EXPECT_EQ(m_project.toolbar[2].style, 0x08020203);
    EXPECT_EQ(m_session.ResolveElement("toolbar"), lToolbar);
    EXPECT_EQ(m_session.ResolveElement("contour-button"), lButton);
    EXPECT_EQ(m_session.ResolveElement("polyline"), lEntry);
    EXPECT_EQ(m_session.ResolveElement("polygon"), std::nullopt);
    EXPECT_EQ(m_session.ResolveElement("import"), std::nullopt);
}

TEST(DescribeBitmap, TellsWhatGetObjectKnows) {
    EXPECT_EQ(DescribeBitmap(nullptr), std::nullopt);
    int nNotABitmap = 0;
    EXPECT_EQ(DescribeBitmap(reinterpret_cast<HBITMAP>(&nNotABitmap)), "invalid");
}

}  // namespace
