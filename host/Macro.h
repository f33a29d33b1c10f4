// The host's macro interface: message hooks and the toolbar's buttons and entries. A separate
// object whose IUnknown is the application's, as COM identity asks.
#pragma once

#include "host/HostObject.h"

class COsrikApplication;

class CMacroObject final : public CDispatchObject<IOsrikMacro> {
public:
    CMacroObject(CHostState& state, COsrikApplication& app)
        : CDispatchObject(state, "macro", IID_IOsrikMacro), m_app(app) {}

    HRESULT STDMETHODCALLTYPE SetMessageHooks(MACROIDLEHOOK pfnIdle,
                                              MACROMESSAGEHOOK pfnMessage) override;
    HRESULT STDMETHODCALLTYPE AddButtonEntry(LONG lButton, HBITMAP hBitmap, LONG lStyle,
                                             BSTR bstrText, LONG lNumber, LONG* plEntry) override;
    HRESULT STDMETHODCALLTYPE AddToolbarButton(LONG lToolbar, HBITMAP hBitmap, BSTR bstrText,
                                               LONG lNumber, LONG* plButton) override;

protected:
    void* GetInterface(REFIID riid) override;

private:
    // Adds an element under a parent of kind pszParentKind; 0 when the parent is not one.
    LONG AddElement(const char* pszKind, LONG lParent, const char* pszParentKind, HBITMAP hBitmap,
                    BSTR bstrText, LONG lNumber, std::optional<LONG> style);

    COsrikApplication& m_app;
};
