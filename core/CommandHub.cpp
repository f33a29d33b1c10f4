// The command hub: what the plug-in's toolbar, buttons and entries make happen.
#include "core/EditGroup.h"
#include "core/HostArrays.h"
#include "core/KalmoretApp.h"
#include "core/KalmoretImpl.h"
#include "geometry/ContourConversion.h"
#include "res/resource.h"

namespace {

// Change codes of ButtonChange.
constexpr LONG kCodeStart = 2;
constexpr LONG kCodeProperties = 3;  // on an entry: its properties; on the toolbar: end the wizard
constexpr LONG kCodeFinished = 4;
constexpr LONG kCodeAnchorBits = 6;  // both bits set: next placement anchor
constexpr int kLastAnchor = 8;

constexpr UINT kQuestion = MB_OKCANCEL | MB_ICONQUESTION;

}  // namespace

void CKalmoretImpl::OnButtonChange(LONG lHandle, LONG lCode) {
    const bool bContourEntry = lHandle == m_lPolylineEntry || lHandle == m_lPolygonEntry;
    if (lCode == kCodeFinished) {
        if (m_Contour.GetCount() > 0 && AfxMessageBox(IDS_CONVERT_CONTOUR, kQuestion) == IDOK) {
            ConvertContourLine(lHandle);
        }
        m_nMode = kModeIdle;
    }
    if (lCode == kCodeStart && bContourEntry) {
        m_Contour.Clear();
    }
    if (lCode == kCodeProperties && bContourEntry) {
        // The contour-line properties dialog opens here; it is not built yet, so nothing happens.
    }
    if (lCode == kCodeStart && lHandle == m_lImportEntry) {
        // The import dialog opens here; it is not built yet, so nothing happens.
    }
    if ((lCode & kCodeAnchorBits) == kCodeAnchorBits) {
        m_nAnchor = (m_nAnchor < kLastAnchor) ? m_nAnchor + 1 : 0;
    }
    if (lCode == kCodeProperties && lHandle == m_lToolbar) {
        AskToEndWizard();
    }
}

void CKalmoretImpl::ConvertContourLine(LONG lHandle) {
    CEditGroup group(m_pHost, IDS_EDIT_GROUP_CONTOUR);
    m_Contour.closed = lHandle == m_lPolygonEntry;
    CPolyline2D result;
    result.closed = m_Contour.closed;
    ConvertContour(m_Contour, m_nInterpol, m_fSegLen, result);
    for (uint32_t i = 0; i < result.GetCount(); ++i) {
        const CPoint2D& p = result.GetAt(i);
        LONG lResult = 0;
        m_pHost->CreateHeightPoint(ToHostFloat(p.x), ToHostFloat(p.y), m_fHeight, &lResult);
    }
    m_Contour.Clear();
    group.Commit();
}

// The shut-down itself runs later from the message loop (the message hook), outside this event.
void CKalmoretImpl::AskToEndWizard() {
    if (AfxMessageBox(IDS_END_WIZARD, kQuestion) != IDOK) {
        return;
    }
    HWND hWnd = nullptr;
    m_pHost->GetMainWindow(&hWnd);
    SetTimer(hWnd, kShutdownTimerId, kShutdownDelayMs, nullptr);
}
