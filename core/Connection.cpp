// Connecting the automation object to the host and taking it down again.
#include "core/KalmoretApp.h"
#include "core/KalmoretImpl.h"
#include "framework/WinApp.h"
#include "res/resource.h"

namespace {

// Styles and numbers the host gives the toolbar, its buttons and their entries; the numbers are
// also the help contexts of the dialogs the elements lead to.
constexpr LONG kToolbarStyle = 0x08020204;
constexpr LONG kEntryStyle = 0x08020203;
constexpr LONG kContourNumber = 50040;
constexpr LONG kPolygonNumber = 50041;
constexpr LONG kImportNumber = 50043;

HBITMAP LoadResourceBitmap(UINT nID) {
    return LoadBitmapA(AfxGetResourceHandle(), MAKEINTRESOURCEA(nID));
}

}  // namespace

CKalmoretImpl::~CKalmoretImpl() {
    // Deleted while still connected (the module unloaded without ProgramExit): the host must not
    // keep a sink that no longer exists, nor our references.
    ReleaseHost();
}

BOOL CKalmoretImpl::Connect(IDispatch* pHost) {
    AFX_MANAGE_STATE_GUARD();
    if (!pHost) {
        return FALSE;
    }
    if (FAILED(pHost->QueryInterface(IID_IOsrikMacro, reinterpret_cast<void**>(&m_pMacro)))) {
        m_pMacro = nullptr;
        return FALSE;
    }
    if (!AfxConnectionAdvise(pHost, IID_IOsrikEvents, GetIDispatch(FALSE), TRUE, &m_dwCookie)) {
        AfxMessageBox(IDS_NO_EVENT_CONNECTION, MB_OK);
        return FALSE;
    }
    // The factory's argument is the application interface itself.
    m_pHost = static_cast<IOsrikApplication*>(pHost);
    m_pHost->AddRef();

    CKalmoretApp* pApp = GetKalmoretApp();
    BSTR bstrPath = nullptr;
    if (SUCCEEDED(m_pHost->GetProgramPath(&bstrPath)) && pApp) {
        CString strHelpFile;
        strHelpFile.LoadString(IDS_HELP_FILE);
        pApp->m_strHelpPath = CString::FromBstr(bstrPath) + strHelpFile;
    }
    SysFreeString(bstrPath);
    BSTR bstrHelp = (pApp ? pApp->m_strHelpPath : CString()).AllocSysString();
    LONG lResult = 0;
    m_pHost->SetHelpFile(0, bstrHelp, &lResult);
    SysFreeString(bstrHelp);

    m_pMacro->SetMessageHooks(MacroIdleHook, MacroMessageHook);
    BuildToolbar();
    return TRUE;
}

void CKalmoretImpl::BuildToolbar() {
    m_pHost->CreateToolbar(kToolbarStyle, &m_lToolbar);
    m_lContourButton = AddButton(IDS_CONTOUR_BUTTON, IDB_CONTOUR, kContourNumber);
    m_lImportButton = AddButton(IDS_IMPORT_BUTTON, IDB_IMPORT, kImportNumber);
    if (m_lContourButton != 0) {
        m_lPolylineEntry =
            AddEntry(m_lContourButton, IDS_POLYLINE_ENTRY, IDB_CONTOUR, kContourNumber);
        m_lPolygonEntry =
            AddEntry(m_lContourButton, IDS_POLYGON_ENTRY, IDB_POLYGON, kPolygonNumber);
    }
    if (m_lImportButton != 0) {
        m_lImportEntry = AddEntry(m_lImportButton, IDS_IMPORT_BUTTON, IDB_IMPORT, kImportNumber);
    }
    LONG lResult = 0;
    m_pHost->ShowToolbar(m_lToolbar, 0, 0, 1, 1, &lResult);
}

// A button whose bitmap or text is missing is not created (handle 0), and so gets no entries.
LONG CKalmoretImpl::AddButton(UINT nIDText, UINT nIDBitmap, LONG lNumber) {
    CString strText;
    strText.LoadString(nIDText);
    HBITMAP hBitmap = LoadResourceBitmap(nIDBitmap);
    LONG lButton = 0;
    if (hBitmap && !strText.IsEmpty()) {
        BSTR bstrText = strText.AllocSysString();
        m_pMacro->AddToolbarButton(m_lToolbar, hBitmap, bstrText, lNumber, &lButton);
        SysFreeString(bstrText);
    }
    return lButton;
}

LONG CKalmoretImpl::AddEntry(LONG lButton, UINT nIDText, UINT nIDBitmap, LONG lNumber) {
    CString strText;
    strText.LoadString(nIDText);
    BSTR bstrText = strText.AllocSysString();
    LONG lEntry = 0;
    m_pMacro->AddButtonEntry(lButton, LoadResourceBitmap(nIDBitmap), kEntryStyle, bstrText, lNumber,
                             &lEntry);
    SysFreeString(bstrText);
    return lEntry;
}

void CKalmoretImpl::Disconnect() {
    ExternalAddRef();  // survive our own disconnection
    ReleaseHost();
    ExternalRelease();
}

// After a failed Connect only the macro interface may be held, and there is no host to call; after
// a completed disconnection nothing is held and nothing is released twice.
void CKalmoretImpl::ReleaseHost() {
    if (m_pHost) {
        LONG lResult = 0;
        m_pHost->DeleteToolbar(m_lToolbar, &lResult);
        m_pHost->RefreshToolbars();
    }
    if (m_pMacro) {
        m_pMacro->Release();
        m_pMacro = nullptr;
    }
    if (m_pHost) {
        AfxConnectionUnadvise(m_pHost, IID_IOsrikEvents, GetIDispatch(FALSE), TRUE, m_dwCookie);
        m_pHost->Release();
        m_pHost = nullptr;
    }
}

void CKalmoretImpl::OnProgramExit() {
    Disconnect();
}
