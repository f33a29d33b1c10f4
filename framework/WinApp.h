// CWinApp: the application object of a plug-in module, driven by the module's DllMain.
//
// Exactly one instance exists per module (a global). DllMain runs InitInstance when the module is
// loaded (FALSE makes the load fail) and ExitInstance when it is unloaded. The application title,
// caption of every message box, is the module's file name without its extension.
#pragma once

#include "framework/String.h"
#include "platform/Win32.h"

class CWinApp {
public:
    CWinApp();
    virtual ~CWinApp();
    CWinApp(const CWinApp&) = delete;
    CWinApp& operator=(const CWinApp&) = delete;

    virtual BOOL InitInstance();
    virtual int ExitInstance();
    virtual BOOL OnIdle(LONG lCount);
    virtual BOOL PreTranslateMessage(MSG* pMsg);

    // Shows a message box with the application title as caption; returns IDOK, IDCANCEL, ...
    int DoMessageBox(const char* pszText, UINT nType) const;

    HINSTANCE m_hInstance = nullptr;
    CString m_strAppTitle;

private:
    friend BOOL AfxModuleAttach(HINSTANCE hInstance);
    friend void AfxModuleDetach();
    bool m_bInitialized = false;
};

// The module's application object, or null.
CWinApp* AfxGetApp();
// The module's instance handle, which is also where its resources are taken from.
HINSTANCE AfxGetInstanceHandle();
HINSTANCE AfxGetResourceHandle();

// A message box with the application title as caption (MB_OK when nType is omitted).
int AfxMessageBox(const char* pszText, UINT nType = MB_OK);
int AfxMessageBox(UINT nIDPrompt, UINT nType = MB_OK);

// Called by DllMain. Attach sets up the module and runs InitInstance (ExitInstance when that
// fails); detach runs ExitInstance once for a module that attached successfully.
BOOL AfxModuleAttach(HINSTANCE hInstance);
void AfxModuleDetach();

// Makes this module's state current for the scope of a call from the host (resources, application
// object). With one module per application object the guard only marks the call's extent.
class CModuleStateGuard {
public:
    CModuleStateGuard();
    ~CModuleStateGuard();
    CModuleStateGuard(const CModuleStateGuard&) = delete;
    CModuleStateGuard& operator=(const CModuleStateGuard&) = delete;

private:
    HINSTANCE m_hPrevious;
};
#define AFX_MANAGE_STATE_GUARD() CModuleStateGuard afxModuleStateGuard
