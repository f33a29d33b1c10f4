// A probe plug-in for the reference host's own checks: it registers and connects like a plug-in,
// then misbehaves on request, so that the host's reports of leaks, refused events and message
// floods are tested through Osrik.exe itself. Requests come as events:
//   LoadDialog (2)          keeps a reference to the view (a leak)
//   EndDialog (3)           gives the kept view back, once more than it holds
//   ExecuteMenuItem (4)     refuses the event with DISP_E_TYPEMISMATCH
//   GotOneClick (5)         posts a message that the message hook answers with another, forever
//   SaveDialogDefaults (9)  asks a question in a message box
//   ProgramExit (1)         disconnects
#include <cstring>

#include "core/HostEvents.h"
#include "core/HostInterfaces.h"

namespace {

HINSTANCE g_hModule = nullptr;
IOsrikApplication* g_pHost = nullptr;
IOsrikMacro* g_pMacro = nullptr;
IOsrikView* g_pKeptView = nullptr;
DWORD g_dwCookie = 0;
constexpr UINT kFloodMessage = WM_USER + 7;

BOOL CALLBACK IdleHook(LONG) {
    return FALSE;
}

BOOL CALLBACK MessageHook(MSG* pMsg) {
    if (pMsg->message == kFloodMessage) {
        PostMessageA(pMsg->hwnd, kFloodMessage, 0, 0);
    }
    return FALSE;
}

IConnectionPoint* FindEvents() {
    IConnectionPointContainer* pContainer = nullptr;
    IConnectionPoint* pPoint = nullptr;
    if (SUCCEEDED(g_pHost->QueryInterface(IID_IConnectionPointContainer,
                                          reinterpret_cast<void**>(&pContainer)))) {
        pContainer->FindConnectionPoint(IID_IOsrikEvents, &pPoint);
        pContainer->Release();
    }
    return pPoint;
}

void Disconnect() {
    if (IConnectionPoint* pPoint = g_pHost ? FindEvents() : nullptr) {
        pPoint->Unadvise(g_dwCookie);
        pPoint->Release();
    }
    if (g_pMacro) {
        g_pMacro->Release();
        g_pMacro = nullptr;
    }
    if (g_pHost) {
        g_pHost->Release();
        g_pHost = nullptr;
    }
}

HRESULT OnEvent(DISPID id) {
    switch (id) {
        case 1:
            Disconnect();
            break;
        case 2:
            g_pHost->GetActiveView(&g_pKeptView);
            break;
        case 3:
            if (g_pKeptView) {
                g_pKeptView->Release();
                g_pKeptView->Release();
                g_pKeptView = nullptr;
            }
            break;
        case 4:
            return DISP_E_TYPEMISMATCH;
        case 5: {
            HWND hWnd = nullptr;
            g_pHost->GetMainWindow(&hWnd);
            PostMessageA(hWnd, kFloodMessage, 0, 0);
            break;
        }
        case 9:
            MessageBoxA(nullptr, "Probe?", "Probe", MB_OKCANCEL | MB_ICONQUESTION);
            break;
        default:
            break;
    }
    return S_OK;
}

// The event sink: a static object, so its reference count only has to be right, not to free.
class CProbeSink final : public IDispatch {
public:
    HRESULT STDMETHODCALLTYPE QueryInterface(REFIID riid, void** ppv) override {
        *ppv = nullptr;
        if (!IsEqualIID(riid, IID_IUnknown) && !IsEqualIID(riid, IID_IDispatch) &&
            !IsEqualIID(riid, IID_IOsrikEvents)) {
            return E_NOINTERFACE;
        }
        *ppv = this;
        AddRef();
        return S_OK;
    }
    ULONG STDMETHODCALLTYPE AddRef() override { return ++m_nRefs; }
    ULONG STDMETHODCALLTYPE Release() override { return --m_nRefs; }
    HRESULT STDMETHODCALLTYPE GetTypeInfoCount(UINT*) override { return E_NOTIMPL; }
    HRESULT STDMETHODCALLTYPE GetTypeInfo(UINT, LCID, ITypeInfo**) override { return E_NOTIMPL; }
    HRESULT STDMETHODCALLTYPE GetIDsOfNames(REFIID, LPOLESTR*, UINT, LCID, DISPID*) override {
        return E_NOTIMPL;
    }
    HRESULT STDMETHODCALLTYPE Invoke(DISPID id, REFIID, LCID, WORD, DISPPARAMS* pParams, VARIANT*,
                                     EXCEPINFO*, UINT*) override {
        const COsrikEventInfo* pEvent = FindOsrikEvent(id);
        if (!pEvent || !pParams || pParams->cArgs != std::strlen(pEvent->params)) {
            return DISP_E_BADPARAMCOUNT;
        }
        return OnEvent(id);
    }

private:
    ULONG m_nRefs = 1;
};

CProbeSink g_sink;

BOOL CALLBACK CreateMacroObject(IDispatch* pHost, LONG) {
    if (FAILED(pHost->QueryInterface(IID_IOsrikMacro, reinterpret_cast<void**>(&g_pMacro)))) {
        return FALSE;
    }
    pHost->QueryInterface(IID_IOsrikApplication, reinterpret_cast<void**>(&g_pHost));
    IConnectionPoint* pPoint = FindEvents();
    if (!pPoint || FAILED(pPoint->Advise(&g_sink, &g_dwCookie))) {
        return FALSE;
    }
    pPoint->Release();
    g_pMacro->SetMessageHooks(IdleHook, MessageHook);
    LONG lToolbar = 0, lButton = 0, lEntry = 0, lResult = 0;
    g_pHost->CreateToolbar(1, &lToolbar);
    g_pMacro->AddToolbarButton(lToolbar, nullptr, nullptr, 10, &lButton);
    g_pMacro->AddButtonEntry(lButton, nullptr, 2, nullptr, 11, &lEntry);
    g_pHost->ShowToolbar(lToolbar, 0, 0, 1, 1, &lResult);
    return TRUE;
}

}  // namespace

extern "C" BOOL WINAPI DllMain(HINSTANCE hInstance, DWORD dwReason, LPVOID) {
    if (dwReason == DLL_PROCESS_ATTACH) {
        g_hModule = hInstance;
        auto pfnRegister = reinterpret_cast<REGISTERINPROCMACRO2>(reinterpret_cast<void*>(
            GetProcAddress(GetModuleHandleA(nullptr), "RegisterInProcMacro2")));
        if (pfnRegister) {
            pfnRegister(hInstance, CreateMacroObject, 0);
        }
    }
    return TRUE;
}
