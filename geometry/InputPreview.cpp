// The preview that follows the cursor: the contour line being entered through the cursor, or the
// rectangle the imported points will fill when placed there. Nothing is written to the project.
#include "core/HostArrays.h"
#include "core/KalmoretImpl.h"
#include "geometry/CubicSpline.h"
#include "geometry/PlacementAnchor.h"
#include "geometry/Primitives.h"

namespace {

// The host draws the overlay in XOR mode and takes colours complemented.
LONG InvertedRgb(BYTE r, BYTE g, BYTE b) {
    return LONG((255 - r) + 256 * (255 - g) + 65536 * (255 - b));
}

constexpr LONG kDrawXor = 1;
constexpr LONG kSolidLine = 1;
constexpr FLOAT kHairline = -1.0f;
constexpr LONG kNoFill = 0;

void StyleRubberBand(IOsrikLine* pLine) {
    pLine->SetDrawMode(kDrawXor);
    pLine->SetLineColor(InvertedRgb(0, 0, 0));
    pLine->SetLineStyle(kSolidLine);
    pLine->SetLineWidth(kHairline);
}

// Polylines and rectangles share these eight calls, in this order.
template <typename Shape>
void StylePreviewShape(Shape* pShape) {
    pShape->SetDrawMode(kDrawXor);
    pShape->SetFillColor(InvertedRgb(255, 255, 255));
    pShape->SetFillStyle(kNoFill);
    pShape->SetLineColor(InvertedRgb(0, 0, 0));
    pShape->SetLineStyle(kSolidLine);
    pShape->SetLineWidth(kHairline);
    pShape->SetAuxColor(InvertedRgb(255, 255, 255));
    pShape->SetAuxStyle(kSolidLine);
}

void StylePreviewPolyline(IOsrikPolyline* pPolyline) {
    StylePreviewShape(pPolyline);
}

void StylePreviewRectangle(IOsrikRectangle* pRectangle) {
    StylePreviewShape(pRectangle);
    pRectangle->SetAuxValue(0);
}

void AddAndRelease(IOsrikOverlay* pOverlay, IOsrikGraphic2D* pObject) {
    pObject->SetRedraw(1);
    LONG lResult = 0;
    pOverlay->AddToOverlay(pObject, &lResult);
    pObject->Release();
}

}  // namespace

void CKalmoretImpl::OnHowMove(LONG lHandle, FLOAT fX, FLOAT fY) {
    const bool bContour = lHandle == m_lPolylineEntry || lHandle == m_lPolygonEntry;
    const bool bPlacement = lHandle == m_lImportEntry && m_nMode == kModePlacementPending;
    if (!bContour && !bPlacement) {
        return;  // not ours: no host call at all
    }
    IOsrikView* pView = nullptr;
    m_pHost->GetActiveView(&pView);
    if (!pView) {
        return;
    }
    IOsrikOverlay* pOverlay = nullptr;
    pView->GetOverlay(&pOverlay);
    if (pOverlay) {
        pOverlay->ClearOverlay();
        if (bContour) {
            DrawContourPreview(pOverlay, lHandle == m_lPolygonEntry, fX, fY);
        } else {
            DrawPlacementPreview(pOverlay, fX, fY);
        }
        pOverlay->Release();
    }
    pView->Release();
}

void CKalmoretImpl::DrawContourPreview(IOsrikOverlay* pOverlay, bool bClosed, FLOAT fX, FLOAT fY) {
    const uint32_t n = m_Contour.GetCount();
    if (n == 1) {
        IOsrikLine* pLine = nullptr;
        if (FAILED(m_pHost->CreateLineObject(kNewGraphicFlags, &pLine)) || !pLine) {
            return;
        }
        pLine->SetRedraw(0);
        StyleRubberBand(pLine);
        pLine->SetX1(ToHostFloat(m_Contour.GetAt(0).x));
        pLine->SetY1(ToHostFloat(m_Contour.GetAt(0).y));
        pLine->SetX2(fX);  // the cursor as received, not rounded
        pLine->SetY2(fY);
        AddAndRelease(pOverlay, pLine);
        return;
    }
    if (n < 2) {
        return;
    }
    m_Contour.closed = bClosed;
    CPolyline2D preview;
    preview.closed = bClosed;
    if (m_nInterpol == 2) {
        m_Contour.SplinePreview(Round5(m_fSegLen), preview, fX, fY);
    } else {
        // The linear densification is not previewed: the straight line shows the same course.
        preview.Assign(m_Contour);
        preview.Add({Round5(fX), Round5(fY)});
    }
    IOsrikPolyline* pPolyline = nullptr;
    if (FAILED(m_pHost->CreatePolylineObject(kNewGraphicFlags, &pPolyline)) || !pPolyline) {
        return;
    }
    pPolyline->SetRedraw(0);
    StylePreviewPolyline(pPolyline);
    SetObjectPoints(pPolyline, preview);
    AddAndRelease(pOverlay, pPolyline);
}

void CKalmoretImpl::DrawPlacementPreview(IOsrikOverlay* pOverlay, FLOAT fX, FLOAT fY) {
    if (m_PointSet.GetCount() == 0) {
        return;
    }
    float fWidth = 0, fHeight = 0, fDepth = 0;
    m_PointSet.GetExtent(fWidth, fHeight, fDepth);
    IOsrikRectangle* pRectangle = nullptr;
    m_pHost->CreateRectangleObject(kNewGraphicFlags, &pRectangle);
    if (!pRectangle) {
        return;
    }
    pRectangle->SetRedraw(0);
    StylePreviewRectangle(pRectangle);
    pRectangle->SetWidth(fWidth);
    pRectangle->SetHeight(fHeight);
    const CAnchorOffset corner = PlacementCorner(m_nAnchor, fX, fY, fWidth, fHeight);
    pRectangle->SetX(corner.fX);
    pRectangle->SetY(corner.fY);
    AddAndRelease(pOverlay, pRectangle);
}
