// CKalmoretImpl: the plug-in's one automation object. It connects itself to the host (event sink,
// help file, hooks, toolbar), receives the host's events through its dispatch map and owns all tool
// state: host pointers and element handles, mode and anchor, the imported points, the contour line
// being entered and the contour-tool settings (its CKalmoretSettings share).
#pragma once

#include <span>

#include "core/HostInterfaces.h"
#include "core/Settings.h"
#include "framework/CmdTarget.h"
#include "framework/String.h"
#include "geometry/PlacementAnchor.h"
#include "geometry/Polyline2D.h"
#include "import/SurveyPointSet.h"

// m_nMode values.
inline constexpr int kModeIdle = 0;
inline constexpr int kModePlacementPending = 3;

class CKalmoretImpl : public CCmdTarget, public CKalmoretSettings {
public:
    CKalmoretImpl() = default;
    ~CKalmoretImpl() override;

    // Connects to the host; FALSE for a null host, a host without the macro interface, or a refused
    // event connection (which is also shown to the user).
    BOOL Connect(IDispatch* pHost);
    // Removes the toolbar, the macro interface and the event connection; safe to call again and
    // after a failed Connect.
    void Disconnect();

    // Event handlers.
    void OnProgramExit();
    void OnButtonChange(LONG lHandle, LONG lCode);
    void OnHowMove(LONG lHandle, FLOAT fX, FLOAT fY);
    void OnHowInput(LONG lHandle, FLOAT fX, FLOAT fY, LONG lFlags);

    // Places a copy of the assigned object at every point whose code has an object file, moved in
    // the plan by (fDeltaX, fDeltaY) and standing on the point's height.
    void PlaceObjects(float fDeltaX, float fDeltaY);

    IOsrikApplication* m_pHost = nullptr;
    IOsrikMacro* m_pMacro = nullptr;
    DWORD m_dwCookie = 0;
    LONG m_lToolbar = 0;
    LONG m_lContourButton = 0;
    LONG m_lImportButton = 0;
    LONG m_lPolylineEntry = 0;
    LONG m_lPolygonEntry = 0;
    LONG m_lImportEntry = 0;
    int m_nAnchor = 0;
    int m_nMode = kModeIdle;
    CSurveyPointSet m_PointSet;
    CPolyline2D m_Contour;
    // The settings m_fHeight, m_nInterpol, m_fSegLen and m_strPath come with CKalmoretSettings.

protected:
    std::span<const CDispatchEntry> GetDispatchMap() const override;
    bool IsDispatchInterface(REFIID riid) const override;

private:
    void ReleaseHost();
    void BuildToolbar();
    LONG AddButton(UINT nIDText, UINT nIDBitmap, LONG lNumber);
    LONG AddEntry(LONG lButton, UINT nIDText, UINT nIDBitmap, LONG lNumber);
    void ConvertContourLine(LONG lHandle);
    void DrawContourPreview(IOsrikOverlay* pOverlay, bool bClosed, FLOAT fX, FLOAT fY);
    void DrawPlacementPreview(IOsrikOverlay* pOverlay, FLOAT fX, FLOAT fY);
    void AddContourPoint(FLOAT fX, FLOAT fY);
    void InsertPointSet(FLOAT fX, FLOAT fY);
    void CreateSite(const CAnchorOffset& origin, float fWidth, float fHeight);
    void AskToEndWizard();
};
