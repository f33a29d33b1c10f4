#include "RecordingHost.h"

#include "platform/HostDriver.h"

namespace {

std::string Num(long long n) {
    return std::to_string(n);
}

std::string Hex(LONG n) {
    char text[16];
    std::snprintf(text, sizeof text, "0x%08X", unsigned(n));
    return text;
}

std::string Flt(float f) {
    char text[32];
    std::snprintf(text, sizeof text, "%.9g", double(f));
    return text;
}

}  // namespace

HRESULT CRecordingHost::QueryInterface(REFIID riid, void** ppv) {
    *ppv = nullptr;
    if (riid == IID_IUnknown || riid == IID_IDispatch || riid == IID_IOsrikApplication) {
        *ppv = static_cast<IOsrikApplication*>(this);
    } else if (riid == IID_IOsrikMacro && m_bHasMacro) {
        *ppv = static_cast<IOsrikMacro*>(this);
    } else if (riid == IID_IConnectionPointContainer) {
        *ppv = static_cast<IConnectionPointContainer*>(this);
    } else {
        return E_NOINTERFACE;
    }
    AddRef();
    return S_OK;
}

HRESULT CRecordingHost::GetProgramPath(BSTR* pPath) {
    Record("GetProgramPath");
    *pPath = SUCCEEDED(m_hrProgramPath) ? SysAllocString(m_strProgramPath.c_str()) : nullptr;
    return m_hrProgramPath;
}

HRESULT CRecordingHost::GetMainWindow(HWND* phWnd) {
    Record("GetMainWindow");
    *phWnd = DriverGetMainWindow();  // a real window: Windows sets no timer on a made-up handle
    return S_OK;
}

HRESULT CRecordingHost::SetModeFlags(LONG lFlags) {
    Record("SetModeFlags " + Hex(lFlags));
    m_lModeFlags = lFlags;
    return S_OK;
}

HRESULT CRecordingHost::GetModeFlags(LONG* plFlags) {
    Record("GetModeFlags");
    *plFlags = m_lModeFlags;
    return S_OK;
}

CRecordingObject* CRecordingHost::NewObject(const std::string& kind) {
    m_objects.push_back(
        std::make_unique<CRecordingObject>(*this, kind + std::to_string(m_objects.size() + 1)));
    m_objects.back()->AddRef();
    return m_objects.back().get();
}

std::string CRecordingHost::NameOf(const IOsrikGraphic2D* pObject) const {
    for (const auto& object : m_objects) {
        CRecordingObject* p = object.get();
        if (pObject == static_cast<IOsrikLine*>(p) || pObject == static_cast<IOsrikPolyline*>(p) ||
            pObject == static_cast<IOsrikRectangle*>(p)) {
            return p->Name();
        }
    }
    return "(unknown)";
}

std::vector<std::string> CRecordingHost::HeldObjects() const {
    std::vector<std::string> held;
    for (const auto& object : m_objects) {
        if (object->m_nRefs != 0) {
            held.push_back(object->Name());
        }
    }
    return held;
}

HRESULT CRecordingHost::GetActiveView(IOsrikView** ppView) {
    Record("GetActiveView");
    *ppView = m_bHasView ? static_cast<IOsrikView*>(NewObject("view")) : nullptr;
    return S_OK;
}

HRESULT CRecordingHost::CreateToolbar(LONG lStyle, LONG* plToolbar) {
    Record("CreateToolbar " + Hex(lStyle));
    *plToolbar = m_lNextHandle++;
    return S_OK;
}

HRESULT CRecordingHost::DeleteToolbar(LONG lToolbar, LONG*) {
    Record("DeleteToolbar " + Num(lToolbar));
    return S_OK;
}

HRESULT CRecordingHost::RefreshToolbars() {
    Record("RefreshToolbars");
    return S_OK;
}

HRESULT CRecordingHost::LoadObjectFile(BSTR bstrFile, LONG lFlag, IOsrikObjectTemplate** pp) {
    const std::string file = Text(bstrFile);
    Record("LoadObjectFile " + file + " " + Num(lFlag));
    const bool loadable = !file.empty() && !m_unloadableFiles.count(file);
    *pp = loadable ? static_cast<IOsrikObjectTemplate*>(NewObject("template")) : nullptr;
    return loadable ? S_OK : E_FAIL;
}

HRESULT CRecordingHost::CreateLineObject(LONG lFlags, IOsrikLine** pp) {
    Record("CreateLineObject " + Hex(lFlags));
    *pp = NewObject("line");
    return S_OK;
}

HRESULT CRecordingHost::CreatePolylineObject(LONG lFlags, IOsrikPolyline** pp) {
    Record("CreatePolylineObject " + Hex(lFlags));
    *pp = NewObject("polyline");
    return S_OK;
}

HRESULT CRecordingHost::CreateRectangleObject(LONG lFlags, IOsrikRectangle** pp) {
    Record("CreateRectangleObject " + Hex(lFlags));
    *pp = NewObject("rectangle");
    return S_OK;
}

HRESULT CRecordingHost::CreateSiteObject(LONG lKind, IOsrikSite** pp) {
    Record("CreateSiteObject " + Num(lKind));
    *pp = NewObject("site");
    return S_OK;
}

HRESULT CRecordingHost::PlaceSiteObject(IOsrikSite* pSite, IOsrikPolyline* pOutline, LONG*) {
    Record("PlaceSiteObject " + static_cast<CRecordingObject*>(pSite)->Name() + " " +
           static_cast<CRecordingObject*>(pOutline)->Name());
    return S_OK;
}

HRESULT CRecordingHost::ShowToolbar(LONG lToolbar, LONG lX, LONG lY, LONG lVisible, LONG lDocked,
                                    LONG*) {
    Record("ShowToolbar " + Num(lToolbar) + " " + Num(lX) + " " + Num(lY) + " " + Num(lVisible) +
           " " + Num(lDocked));
    return S_OK;
}

HRESULT CRecordingHost::SetInputMode(LONG lMode) {
    Record("SetInputMode " + Num(lMode));
    return S_OK;
}

HRESULT CRecordingHost::SetProgressText(BSTR bstrText) {
    Record("SetProgressText " + Text(bstrText));
    return S_OK;
}

HRESULT CRecordingHost::SetProgressPosition(LONG lPercent) {
    Record("SetProgressPosition " + Num(lPercent));
    return S_OK;
}

HRESULT CRecordingHost::CreateHeightPoint(FLOAT fX, FLOAT fY, FLOAT fZ, LONG*) {
    Record("CreateHeightPoint " + Flt(fX) + " " + Flt(fY) + " " + Flt(fZ));
    return S_OK;
}

HRESULT CRecordingHost::SetHelpFile(LONG lKind, BSTR bstrPath, LONG*) {
    Record("SetHelpFile " + Num(lKind) + " " + Text(bstrPath));
    return S_OK;
}

HRESULT CRecordingHost::StartProgress(BSTR bstrTitle, LONG lFlags) {
    Record("StartProgress " + Text(bstrTitle) + " " + Num(lFlags));
    return S_OK;
}

HRESULT CRecordingHost::EndProgress() {
    Record("EndProgress");
    return S_OK;
}

HRESULT CRecordingHost::GetDirectory(LONG, BSTR* pPath) {
    *pPath = nullptr;
    return E_NOTIMPL;
}

HRESULT CRecordingHost::BeginEditGroup(BSTR bstrName, LONG* plGroup) {
    Record("BeginEditGroup " + Text(bstrName));
    *plGroup = m_lGroup;
    return S_OK;
}

HRESULT CRecordingHost::ActivateEditGroup(LONG* plGroup, LONG*) {
    Record("ActivateEditGroup " + Num(*plGroup));
    return S_OK;
}

HRESULT CRecordingHost::EndEditGroup(LONG* plGroup, LONG lKeep, LONG*) {
    Record("EndEditGroup " + Num(*plGroup) + " " + Num(lKeep));
    return S_OK;
}

HRESULT CRecordingHost::SetBatchMode(LONG lOn, LONG*) {
    Record("SetBatchMode " + Num(lOn));
    return S_OK;
}

HRESULT CRecordingHost::SetMessageHooks(MACROIDLEHOOK pfnIdle, MACROMESSAGEHOOK pfnMessage) {
    Record(std::string("SetMessageHooks ") + (pfnIdle && pfnMessage ? "both" : "missing"));
    return S_OK;
}

HRESULT CRecordingHost::AddButtonEntry(LONG lButton, HBITMAP hBitmap, LONG lStyle, BSTR bstrText,
                                       LONG lNumber, LONG* plEntry) {
    Record("AddButtonEntry " + Num(lButton) + (hBitmap ? " bitmap " : " nobitmap ") + Hex(lStyle) +
           " " + Text(bstrText) + " " + Num(lNumber));
    *plEntry = m_lNextHandle++;
    return S_OK;
}

HRESULT CRecordingHost::AddToolbarButton(LONG lToolbar, HBITMAP hBitmap, BSTR bstrText,
                                         LONG lNumber, LONG* plButton) {
    Record("AddToolbarButton " + Num(lToolbar) + (hBitmap ? " bitmap " : " nobitmap ") +
           Text(bstrText) + " " + Num(lNumber));
    *plButton = m_lNextHandle++;
    return S_OK;
}

HRESULT CRecordingHost::FindConnectionPoint(REFIID riid, IConnectionPoint** ppCP) {
    *ppCP = nullptr;
    if (riid != IID_IOsrikEvents) {
        return CONNECT_E_NOCONNECTION;
    }
    *ppCP = this;
    AddRef();
    return S_OK;
}

HRESULT CRecordingHost::Advise(IUnknown* pUnkSink, DWORD* pdwCookie) {
    Record("Advise");
    *pdwCookie = 0;
    if (FAILED(m_hrAdvise)) {
        return m_hrAdvise;
    }
    pUnkSink->QueryInterface(IID_IOsrikEvents, reinterpret_cast<void**>(&m_pSink));
    *pdwCookie = 9;
    return S_OK;
}

HRESULT CRecordingHost::Unadvise(DWORD dwCookie) {
    Record("Unadvise " + Num(dwCookie));
    if (dwCookie != 9 || !m_pSink) {
        return CONNECT_E_NOCONNECTION;
    }
    m_pSink->Release();
    m_pSink = nullptr;
    return S_OK;
}
