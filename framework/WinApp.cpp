#include "framework/WinApp.h"

namespace {

CWinApp* g_pApp = nullptr;
HINSTANCE g_hModule = nullptr;
thread_local HINSTANCE t_hCurrentResources = nullptr;

// "C:\Programme\Kalmoret.dll" or "/opt/osrik/Kalmoret.so" gives "Kalmoret".
CString TitleFromPath(const char* pszPath) {
    const CString path(pszPath);
    int start = 0;
    for (int i = 0; i < path.GetLength(); ++i) {
        if (path.GetAt(i) == '\\' || path.GetAt(i) == '/') {
            start = i + 1;
        }
    }
    CString name = path.Mid(start, path.GetLength() - start);
    for (int i = name.GetLength() - 1; i > 0; --i) {
        if (name.GetAt(i) == '.') {
            return name.Left(i);
        }
    }
    return name;
}

}  // namespace

CWinApp::CWinApp() {
    g_pApp = this;
}

CWinApp::~CWinApp() {
    if (g_pApp == this) {
        g_pApp = nullptr;
    }
}

BOOL CWinApp::InitInstance() {
    return TRUE;
}
int CWinApp::ExitInstance() {
    return 0;
}
BOOL CWinApp::OnIdle(LONG) {
    return FALSE;
}
BOOL CWinApp::PreTranslateMessage(MSG*) {
    return FALSE;
}

int CWinApp::DoMessageBox(const char* pszText, UINT nType) const {
    return MessageBoxA(nullptr, pszText, m_strAppTitle, nType);
}

CWinApp* AfxGetApp() {
    return g_pApp;
}
HINSTANCE AfxGetInstanceHandle() {
    return g_hModule;
}
HINSTANCE AfxGetResourceHandle() {
    return t_hCurrentResources ? t_hCurrentResources : g_hModule;
}

int AfxMessageBox(const char* pszText, UINT nType) {
    CWinApp* pApp = AfxGetApp();
    return pApp ? pApp->DoMessageBox(pszText, nType) : MessageBoxA(nullptr, pszText, "", nType);
}

int AfxMessageBox(UINT nIDPrompt, UINT nType) {
    CString strText;
    strText.LoadString(nIDPrompt);
    return AfxMessageBox(strText, nType);
}

BOOL AfxModuleAttach(HINSTANCE hInstance) {
    g_hModule = hInstance;
    CWinApp* pApp = AfxGetApp();
    if (!pApp) {
        return TRUE;
    }
    char szPath[MAX_PATH] = "";
    GetModuleFileNameA(hInstance, szPath, MAX_PATH);
    pApp->m_hInstance = hInstance;
    pApp->m_strAppTitle = TitleFromPath(szPath);
    CModuleStateGuard guard;
    if (!pApp->InitInstance()) {
        pApp->ExitInstance();
        return FALSE;
    }
    pApp->m_bInitialized = true;
    return TRUE;
}

void AfxModuleDetach() {
    CWinApp* pApp = AfxGetApp();
    if (pApp && pApp->m_bInitialized) {
        CModuleStateGuard guard;
        pApp->m_bInitialized = false;
        pApp->ExitInstance();
    }
}

CModuleStateGuard::CModuleStateGuard() : m_hPrevious(t_hCurrentResources) {
    t_hCurrentResources = g_hModule;
}

CModuleStateGuard::~CModuleStateGuard() {
    t_hCurrentResources = m_hPrevious;
}
