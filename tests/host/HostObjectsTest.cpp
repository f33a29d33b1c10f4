// The host objects as the plug-in meets them, driven in-process: COM identity, arrays that arrive
// malformed, and what the scenarios cannot show (refusals, paths, toolbar parents). Leak reports,
// overlay snapshots and placed objects are checked by the scenarios and the core tests.
#include <gtest/gtest.h>

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
