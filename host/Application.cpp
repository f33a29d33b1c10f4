#include "host/Application.h"

#include "host/Macro.h"
#include "host/ModelObjects.h"
#include "platform/HostDriver.h"

namespace {

BSTR AllocBstr(const std::string& utf8) {
    return SysAllocString(Utf8ToUtf16(utf8).c_str());
}

}  // namespace

std::optional<std::string> DescribeBitmap(HBITMAP hBitmap) {
    if (!hBitmap) {
        return std::nullopt;
    }
    BITMAP bm{};
    if (GetObjectA(hBitmap, int(sizeof bm), &bm) < int(sizeof bm)) {
        return "invalid";
    }
    return std::to_string(bm.bmWidth) + "x" + std::to_string(bm.bmHeight) + "x" +
           std::to_string(bm.bmBitsPixel);
}

COsrikApplication::COsrikApplication(CHostState& state)
    : CDispatchObject(state, "app", IID_IOsrikApplication),
      m_pMacro(new CMacroObject(state, *this)),
      m_pEvents(new CConnectionPoint(state, this)),
      m_pView(new CViewObject(state)) {
    RegisterInterface(static_cast<IConnectionPointContainer*>(this));
    m_pMacro->HostAddRef();
    m_pEvents->HostAddRef();
    m_pView->HostAddRef();
}

COsrikApplication::~COsrikApplication() {
    // The parts go first, then the application, whose registry entries its destructor removes.
    for (CHostObject* pPart :
         {static_cast<CHostObject*>(m_pView), static_cast<CHostObject*>(m_pEvents),
          static_cast<CHostObject*>(m_pMacro)}) {
        if (pPart) {
            pPart->HostRelease();
        }
    }
}

void COsrikApplication::Detach() {
    m_pMacro = nullptr;
    m_pEvents = nullptr;
    m_pView = nullptr;
}

void* COsrikApplication::GetInterface(REFIID riid) {
    if (IsEqualIID(riid, IID_IConnectionPointContainer)) {
        return static_cast<IConnectionPointContainer*>(this);
    }
    if (IsEqualIID(riid, IID_IOsrikMacro)) {
        return static_cast<IOsrikMacro*>(m_pMacro);
    }
    return CDispatchObject::GetInterface(riid);
}

HRESULT COsrikApplication::EnumConnectionPoints(IEnumConnectionPoints** ppEnum) {
    TraceCall("EnumConnectionPoints");
    if (ppEnum) {
        *ppEnum = nullptr;
    }
    return E_NOTIMPL;
}

HRESULT COsrikApplication::FindConnectionPoint(REFIID riid, IConnectionPoint** ppCP) {
    TraceCall("FindConnectionPoint", HostIidName(riid));
    if (!ppCP) {
        return E_POINTER;
    }
    *ppCP = nullptr;
    if (!IsEqualIID(riid, IID_IOsrikEvents)) {
        TraceResult("CONNECT_E_NOCONNECTION");
        return CONNECT_E_NOCONNECTION;
    }
    m_pEvents->AddRefForCaller();
    *ppCP = m_pEvents;
    TraceResult(m_pEvents->Name());
    return S_OK;
}

HRESULT COsrikApplication::GetProgramPath(BSTR* pPath) {
    TraceCall("GetProgramPath");
    if (!pPath) {
        return E_POINTER;
    }
    *pPath = AllocBstr(State().strProgramPath);
    TraceResult(QuoteJson(State().strProgramPath));
    return *pPath ? S_OK : E_OUTOFMEMORY;
}

HRESULT COsrikApplication::GetMainWindow(HWND* phWnd) {
    TraceCall("GetMainWindow");
    if (!phWnd) {
        return E_POINTER;
    }
    *phWnd = DriverGetMainWindow();
    return S_OK;
}

HRESULT COsrikApplication::SetModeFlags(LONG lFlags) {
    TraceCall("SetModeFlags", lFlags);
    State().lModeFlags = lFlags;
    return S_OK;
}

HRESULT COsrikApplication::GetModeFlags(LONG* plFlags) {
    TraceCall("GetModeFlags");
    if (!plFlags) {
        return E_POINTER;
    }
    *plFlags = State().lModeFlags;
    TraceResult(std::to_string(*plFlags));
    return S_OK;
}

HRESULT COsrikApplication::GetActiveView(IOsrikView** ppView) {
    TraceCall("GetActiveView");
    if (!ppView) {
        return E_POINTER;
    }
    *ppView = nullptr;
    if (!State().bViewAvailable) {
        TraceResult("no view");
        return S_FALSE;
    }
    m_pView->AddRefForCaller();
    *ppView = m_pView;
    TraceResult(m_pView->Name());
    return S_OK;
}

HRESULT COsrikApplication::CreateToolbar(LONG lStyle, LONG* plToolbar) {
    TraceCall("CreateToolbar", lStyle);
    if (!plToolbar) {
        return E_POINTER;
    }
    CToolbarElement element;
    element.lHandle = State().lNextHandle++;
    element.strKind = "toolbar";
    element.style = lStyle;
    State().project.toolbar.push_back(element);
    *plToolbar = element.lHandle;
    TraceResult(std::to_string(*plToolbar));
    return S_OK;
}

HRESULT COsrikApplication::DeleteToolbar(LONG lToolbar, LONG* plResult) {
    TraceCall("DeleteToolbar", lToolbar);
    const CToolbarElement* pElement = State().project.FindToolbarElement(lToolbar);
    const bool bFound = pElement && pElement->strKind == "toolbar";
    if (plResult) {
        *plResult = bFound ? 1 : 0;
    }
    return bFound ? S_OK : E_INVALIDARG;
}

HRESULT COsrikApplication::RefreshToolbars() {
    TraceCall("RefreshToolbars");
    return S_OK;
}

HRESULT COsrikApplication::ShowToolbar(LONG lToolbar, LONG lX, LONG lY, LONG lVisible, LONG lDocked,
                                       LONG* plResult) {
    TraceCall("ShowToolbar", lToolbar, lX, lY, lVisible, lDocked);
    const CToolbarElement* pElement = State().project.FindToolbarElement(lToolbar);
    const bool bFound = pElement && pElement->strKind == "toolbar";
    if (plResult) {
        *plResult = bFound ? 1 : 0;
    }
    return bFound ? S_OK : E_INVALIDARG;
}

HRESULT COsrikApplication::LoadObjectFile(BSTR bstrFile, LONG lFlag,
                                          IOsrikObjectTemplate** ppTemplate) {
    TraceCall("LoadObjectFile", bstrFile, lFlag);
    if (!ppTemplate) {
        return E_POINTER;
    }
    *ppTemplate = nullptr;
    const std::string strFile = BstrToUtf8(bstrFile);
    std::optional<CObjectFileInfo> info = ReadObjectFile(strFile);
    if (!info) {
        TraceResult("E_FAIL");
        return E_FAIL;
    }
    auto* pTemplate = new CObjectTemplate(State(), strFile, std::move(*info));
    pTemplate->AddRefForCaller();
    *ppTemplate = pTemplate;
    TraceResult(pTemplate->Name());
    return S_OK;
}

template <typename TObject, typename TInterface>
HRESULT COsrikApplication::CreateGraphic(const char* pszMethod, LONG lFlags,
                                         TInterface** ppObject) {
    TraceCall(pszMethod, lFlags);
    if (!ppObject) {
        return E_POINTER;
    }
    auto* pObject = new TObject(State());
    pObject->AddRefForCaller();
    *ppObject = pObject;
    TraceResult(pObject->Name());
    return S_OK;
}

HRESULT COsrikApplication::CreateLineObject(LONG lFlags, IOsrikLine** ppLine) {
    return CreateGraphic<CLineObject>("CreateLineObject", lFlags, ppLine);
}

HRESULT COsrikApplication::CreatePolylineObject(LONG lFlags, IOsrikPolyline** ppPolyline) {
    return CreateGraphic<CPolylineObject>("CreatePolylineObject", lFlags, ppPolyline);
}

HRESULT COsrikApplication::CreateRectangleObject(LONG lFlags, IOsrikRectangle** ppRectangle) {
    return CreateGraphic<CRectangleObject>("CreateRectangleObject", lFlags, ppRectangle);
}

HRESULT COsrikApplication::CreateSiteObject(LONG lKind, IOsrikSite** ppSite) {
    TraceCall("CreateSiteObject", lKind);
    if (!ppSite) {
        return E_POINTER;
    }
    *ppSite = nullptr;
    if (lKind != 1 && lKind != 2) {
        TraceResult("E_INVALIDARG");
        return E_INVALIDARG;  // 1 plot, 2 terrain area
    }
    auto* pSite = new CSiteObject(State(), lKind);
    pSite->AddRefForCaller();
    *ppSite = pSite;
    TraceResult(pSite->Name());
    return S_OK;
}

HRESULT COsrikApplication::PlaceSiteObject(IOsrikSite* pSite, IOsrikPolyline* pOutline,
                                           LONG* plResult) {
    TraceCall("PlaceSiteObject", TraceObject(pSite), TraceObject(pOutline));
    auto* pSiteObject = dynamic_cast<CSiteObject*>(State().Find(pSite));
    auto* pPolyline = dynamic_cast<CPolylineObject*>(State().Find(pOutline));
    if (!pSiteObject || !pPolyline) {
        TraceResult("E_INVALIDARG");
        return E_INVALIDARG;
    }
    CProject& project = State().project;
    project.sites.push_back(
        {pSiteObject->Kind(), pPolyline->Points(), pPolyline->IsClosed(), project.ActiveGroup()});
    if (plResult) {
        *plResult = LONG(project.sites.size());
    }
    return S_OK;
}

HRESULT COsrikApplication::SetInputMode(LONG lMode) {
    TraceCall("SetInputMode", lMode);
    return S_OK;
}

HRESULT COsrikApplication::StartProgress(BSTR bstrTitle, LONG lFlags) {
    TraceCall("StartProgress", bstrTitle, lFlags);
    State().project.progress.push_back({"StartProgress", BstrToUtf8(bstrTitle), std::nullopt});
    return S_OK;
}

HRESULT COsrikApplication::SetProgressText(BSTR bstrText) {
    TraceCall("SetProgressText", bstrText);
    State().project.progress.push_back({"SetProgressText", BstrToUtf8(bstrText), std::nullopt});
    return S_OK;
}

HRESULT COsrikApplication::SetProgressPosition(LONG lPercent) {
    TraceCall("SetProgressPosition", lPercent);
    State().project.progress.push_back({"SetProgressPosition", std::nullopt, lPercent});
    return S_OK;
}

HRESULT COsrikApplication::EndProgress() {
    TraceCall("EndProgress");
    State().project.progress.push_back({"EndProgress", std::nullopt, std::nullopt});
    return S_OK;
}

HRESULT COsrikApplication::CreateHeightPoint(FLOAT fX, FLOAT fY, FLOAT fZ, LONG* plResult) {
    TraceCall("CreateHeightPoint", fX, fY, fZ);
    CProject& project = State().project;
    project.heightPoints.push_back({fX, fY, fZ, project.ActiveGroup()});
    if (plResult) {
        *plResult = LONG(project.heightPoints.size());
    }
    return S_OK;
}

HRESULT COsrikApplication::SetHelpFile(LONG lKind, BSTR bstrPath, LONG* plResult) {
    TraceCall("SetHelpFile", lKind, bstrPath);
    if (plResult) {
        *plResult = 1;
    }
    return S_OK;
}

HRESULT COsrikApplication::GetDirectory(LONG lKind, BSTR* pPath) {
    TraceCall("GetDirectory", lKind);
    if (!pPath) {
        return E_POINTER;
    }
    *pPath = nullptr;
    if (lKind != kObjectDirectory) {
        TraceResult("E_INVALIDARG");
        return E_INVALIDARG;
    }
    const std::string& strBase = State().strProgramPath;
    const char chSeparator = strBase.empty() ? '/' : strBase.back();
    const std::string strFolder = strBase + "Objekte" + chSeparator;
    *pPath = AllocBstr(strFolder);
    TraceResult(QuoteJson(strFolder));
    return *pPath ? S_OK : E_OUTOFMEMORY;
}

HRESULT COsrikApplication::BeginEditGroup(BSTR bstrName, LONG* plGroup) {
    TraceCall("BeginEditGroup", bstrName);
    if (!plGroup) {
        return E_POINTER;
    }
    *plGroup = State().project.BeginEditGroup(BstrToUtf8(bstrName));
    TraceResult(std::to_string(*plGroup));
    return S_OK;
}

HRESULT COsrikApplication::ActivateEditGroup(LONG* plGroup, LONG* plResult) {
    TraceCall("ActivateEditGroup", plGroup ? *plGroup : 0);
    if (!plGroup) {
        return E_POINTER;
    }
    const bool bDone = State().project.ActivateEditGroup(*plGroup);
    if (plResult) {
        *plResult = bDone ? 1 : 0;
    }
    if (!bDone) {
        TraceResult("E_INVALIDARG");
    }
    return bDone ? S_OK : E_INVALIDARG;
}

HRESULT COsrikApplication::EndEditGroup(LONG* plGroup, LONG lKeep, LONG* plResult) {
    TraceCall("EndEditGroup", plGroup ? *plGroup : 0, lKeep);
    if (!plGroup) {
        return E_POINTER;
    }
    const bool bDone = State().project.EndEditGroup(*plGroup, lKeep != 0);
    if (plResult) {
        *plResult = bDone ? 1 : 0;
    }
    if (!bDone) {
        TraceResult("E_INVALIDARG");
    }
    return bDone ? S_OK : E_INVALIDARG;
}

HRESULT COsrikApplication::SetBatchMode(LONG lOn, LONG* plResult) {
    TraceCall("SetBatchMode", lOn);
    State().lBatchMode = lOn;
    if (plResult) {
        *plResult = 1;
    }
    return S_OK;
}
