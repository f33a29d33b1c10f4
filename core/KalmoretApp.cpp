#include "core/KalmoretApp.h"

#include "core/KalmoretImpl.h"
#include "core/Settings.h"

CKalmoretApp::~CKalmoretApp() {
    delete m_pImpl;
}

BOOL CKalmoretApp::InitInstance() {
    const BOOL bResult = CWinApp::InitInstance();
    char szPath[MAX_PATH] = "";
    GetModuleFileNameA(nullptr, szPath, MAX_PATH);
    HMODULE hHost = GetModuleHandleA(szPath);
    if (!hHost) {
        return FALSE;
    }
    auto pfnRegister = reinterpret_cast<REGISTERINPROCMACRO2>(
        reinterpret_cast<void*>(GetProcAddress(hHost, "RegisterInProcMacro2")));
    if (pfnRegister) {
        pfnRegister(m_hInstance, CreateMacroObject,
                    0);  // the host calls the factory before returning
    }
    if (bResult) {
        LoadSettings();
    }
    return bResult;
}

int CKalmoretApp::ExitInstance() {
    delete m_pImpl;
    m_pImpl = nullptr;
    return CWinApp::ExitInstance();
}

CKalmoretApp* GetKalmoretApp() {
    return dynamic_cast<CKalmoretApp*>(AfxGetApp());
}

BOOL CALLBACK CreateMacroObject(IDispatch* pHost, LONG) {
    AFX_MANAGE_STATE_GUARD();
    CKalmoretApp* pApp = GetKalmoretApp();
    if (!pApp) {
        return FALSE;
    }
    try {
        delete pApp->m_pImpl;  // a host that calls the factory twice gets one object
        pApp->m_pImpl = new CKalmoretImpl;
        return pApp->m_pImpl->Connect(pHost);
    } catch (...) {
        return FALSE;  // nothing may escape into the host
    }
}

BOOL CALLBACK MacroIdleHook(LONG lCount) {
    AFX_MANAGE_STATE_GUARD();
    CWinApp* pApp = AfxGetApp();
    return pApp ? pApp->OnIdle(lCount) : FALSE;
}

// Runs the deferred shut-down when its timer fires, then lets the application see the message.
BOOL CALLBACK MacroMessageHook(MSG* pMsg) {
    AFX_MANAGE_STATE_GUARD();
    CKalmoretApp* pApp = GetKalmoretApp();
    if (!pApp || !pMsg) {
        return FALSE;
    }
    try {
        if (pMsg->message == WM_TIMER && pMsg->wParam == kShutdownTimerId) {
            KillTimer(pMsg->hwnd, kShutdownTimerId);
            if (pApp->m_pImpl) {
                pApp->m_pImpl->Disconnect();
            }
            pApp->ExitInstance();
        }
        return pApp->PreTranslateMessage(pMsg);
    } catch (...) {
        return FALSE;
    }
}

void CKalmoretApp::LoadSettings() {
    if (m_pImpl) {
        ::LoadSettings(*m_pImpl);
    }
}

void CKalmoretApp::SaveSettings() {
    if (m_pImpl) {
        ::SaveSettings(*m_pImpl);
    }
}
