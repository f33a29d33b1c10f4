// CKalmoretApp: the plug-in module's application object. On load it registers the plug-in with the
// host executable and loads the settings; it owns the automation object, the help file path and the
// object cache (its CObjectCache share: LoadObjectCache, SaveObjectCache, ...).
#pragma once

#include "core/HostInterfaces.h"
#include "framework/WinApp.h"
#include "objects/ObjectCache.h"

class CKalmoretImpl;

class CKalmoretApp : public CWinApp, public CObjectCache {
public:
    CKalmoretApp() = default;
    ~CKalmoretApp() override;

    BOOL InitInstance() override;
    int ExitInstance() override;

    // Settings of the contour tool and the import folder, in the automation object.
    void LoadSettings();
    void SaveSettings();

    CKalmoretImpl* m_pImpl = nullptr;
    CString m_strHelpPath;
};

// The module's application object, or null outside the plug-in module.
CKalmoretApp* GetKalmoretApp();

// The factory callback handed to RegisterInProcMacro2.
BOOL CALLBACK CreateMacroObject(IDispatch* pHost, LONG lReserved);
// The hooks handed to the host by Connect.
BOOL CALLBACK MacroIdleHook(LONG lCount);
BOOL CALLBACK MacroMessageHook(MSG* pMsg);

// Identifier of the shut-down timer set on the host's main window.
inline constexpr UINT_PTR kShutdownTimerId = 0xE000;
inline constexpr UINT kShutdownDelayMs = 500;
