// Clicked positions: the points of the contour line being entered, and the insertion of imported
// points at the click.
#include "core/EditGroup.h"
#include "core/HostArrays.h"
#include "core/KalmoretImpl.h"
#include "framework/WinApp.h"
#include "geometry/PlacementAnchor.h"
#include "geometry/Primitives.h"
#include "res/resource.h"

namespace {

// The host sets this flag when it ends the input of an entry.
constexpr LONG kInputEndedFlag = 8;

void SetProgressText(IOsrikApplication* pHost, UINT nIDText) {
    CString strText;
    strText.LoadString(nIDText);
    BSTR bstrText = strText.AllocSysString();
    pHost->SetProgressText(bstrText);
    SysFreeString(bstrText);
}

}  // namespace

void CKalmoretImpl::OnHowInput(LONG lHandle, FLOAT fX, FLOAT fY, LONG lFlags) {
    if (lFlags & kInputEndedFlag) {
        m_nMode = kModeIdle;
        m_pHost->SetInputMode(0);
    } else if (lHandle == m_lPolylineEntry || lHandle == m_lPolygonEntry) {
        AddContourPoint(fX, fY);
    } else if (lHandle == m_lImportEntry) {
        InsertPointSet(fX, fY);
    }
}

void CKalmoretImpl::AddContourPoint(FLOAT fX, FLOAT fY) {
    IOsrikView* pView = nullptr;
    m_pHost->GetActiveView(&pView);
    if (!pView) {
        return;  // no view, no click
    }
    const CPoint2D p{Round5(fX), Round5(fY)};
    if (!m_Contour.Contains(p)) {
        m_Contour.Add(p);
    }
    pView->UpdateView();
    pView->Release();
}

// Every click asks again and inserts the same points again; the placement stays pending.
void CKalmoretImpl::InsertPointSet(FLOAT fX, FLOAT fY) {
    float fWidth = 0, fHeight = 0, fDepth = 0;
    m_PointSet.GetExtent(fWidth, fHeight, fDepth);
    const CSurveyPoint& minimum = m_PointSet.GetMinimum();
    const CAnchorOffset origin = PlacementOrigin(m_nAnchor, fX, fY, fWidth, fHeight);
    const int n = m_PointSet.GetCount();

    CString strFormat, strQuestion;
    strFormat.LoadString(IDS_INSERT_POINTS);
    strQuestion.Format(strFormat, n);
    if (AfxMessageBox(strQuestion, MB_OKCANCEL | MB_ICONQUESTION) != IDOK) {
        return;
    }
    CEditGroup group(m_pHost, IDS_EDIT_GROUP_IMPORT);
    CString strTitle;
    strTitle.LoadString(IDS_PROGRESS_TITLE);
    BSTR bstrTitle = strTitle.AllocSysString();
    m_pHost->StartProgress(bstrTitle, 0);
    SysFreeString(bstrTitle);
    if (m_PointSet.GetCreationMode() > 0) {
        CreateSite(origin, fWidth, fHeight);
    }
    SetProgressText(m_pHost, IDS_PROGRESS_HEIGHT_POINTS);
    for (int i = 0; i < n; ++i) {
        m_pHost->SetProgressPosition(LONG(double(i) / n * 100.0));
        const CSurveyPoint& p = m_PointSet.GetAt(i);
        LONG lResult = 0;
        m_pHost->CreateHeightPoint(origin.fX + p.m_fX - minimum.m_fX,
                                   origin.fY + p.m_fY - minimum.m_fY, p.m_fZ, &lResult);
    }
    SetProgressText(m_pHost, IDS_PROGRESS_OBJECTS);
    PlaceObjects(origin.fX - minimum.m_fX, origin.fY - minimum.m_fY);
    m_pHost->EndProgress();
    group.Commit();
}

// The enclosing plot (creation mode 1) or terrain area (2): exactly the points' bounding rectangle.
void CKalmoretImpl::CreateSite(const CAnchorOffset& origin, float fWidth, float fHeight) {
    const int nKind = m_PointSet.GetCreationMode();
    SetProgressText(m_pHost, nKind == 1 ? IDS_PROGRESS_PLOT : IDS_PROGRESS_TERRAIN);
    IOsrikSite* pSite = nullptr;
    if (FAILED(m_pHost->CreateSiteObject(nKind, &pSite)) || !pSite) {
        return;
    }
    IOsrikPolyline* pOutline = nullptr;
    if (FAILED(m_pHost->CreatePolylineObject(kNewGraphicFlags, &pOutline)) || !pOutline) {
        pSite->Release();
        return;
    }
    const float x0 = origin.fX, y0 = origin.fY;
    const float x1 = x0 + fWidth, y1 = y0 + fHeight;
    const float corners[8] = {x0, y0, x1, y0, x1, y1, x0, y1};
    VARIANT v;
    MakeFloatArrayVariant(4, corners, &v);
    pOutline->SetPoints(4, v);
    VariantClear(&v);
    pOutline->SetClosed(VARIANT_TRUE);
    LONG lResult = 0;
    m_pHost->PlaceSiteObject(pSite, pOutline, &lResult);
    pOutline->Release();
    pSite->Release();
}
