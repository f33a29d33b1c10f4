// The host application object the plug-in receives in its factory callback, with the connection
// point container for the host's events. It owns the macro interface, the event connection point
// and the plan view.
#pragma once

#include "host/ConnectionPoint.h"
#include "host/HostObject.h"
#include "host/ViewObjects.h"

class CMacroObject;

class COsrikApplication final : public CDispatchObject<IOsrikApplication>,
                                public IConnectionPointContainer {
public:
    explicit COsrikApplication(CHostState& state);
    ~COsrikApplication() override;

    // IUnknown for both interfaces.
    HRESULT STDMETHODCALLTYPE QueryInterface(REFIID riid, void** ppvObject) override {
        return CDispatchObject::QueryInterface(riid, ppvObject);
    }
    ULONG STDMETHODCALLTYPE AddRef() override { return CDispatchObject::AddRef(); }
    ULONG STDMETHODCALLTYPE Release() override { return CDispatchObject::Release(); }

    // IConnectionPointContainer
    HRESULT STDMETHODCALLTYPE EnumConnectionPoints(IEnumConnectionPoints** ppEnum) override;
    HRESULT STDMETHODCALLTYPE FindConnectionPoint(REFIID riid, IConnectionPoint** ppCP) override;

    // IOsrikApplication
    HRESULT STDMETHODCALLTYPE GetProgramPath(BSTR* pPath) override;
    HRESULT STDMETHODCALLTYPE GetMainWindow(HWND* phWnd) override;
    HRESULT STDMETHODCALLTYPE SetModeFlags(LONG lFlags) override;
    HRESULT STDMETHODCALLTYPE GetModeFlags(LONG* plFlags) override;
    HRESULT STDMETHODCALLTYPE GetActiveView(IOsrikView** ppView) override;
    HRESULT STDMETHODCALLTYPE CreateToolbar(LONG lStyle, LONG* plToolbar) override;
    HRESULT STDMETHODCALLTYPE DeleteToolbar(LONG lToolbar, LONG* plResult) override;
    HRESULT STDMETHODCALLTYPE RefreshToolbars() override;
    HRESULT STDMETHODCALLTYPE LoadObjectFile(BSTR bstrFile, LONG lFlag,
                                             IOsrikObjectTemplate** ppTemplate) override;
    HRESULT STDMETHODCALLTYPE CreateLineObject(LONG lFlags, IOsrikLine** ppLine) override;
    HRESULT STDMETHODCALLTYPE CreatePolylineObject(LONG lFlags,
                                                   IOsrikPolyline** ppPolyline) override;
    HRESULT STDMETHODCALLTYPE CreateRectangleObject(LONG lFlags,
                                                    IOsrikRectangle** ppRectangle) override;
    HRESULT STDMETHODCALLTYPE CreateSiteObject(LONG lKind, IOsrikSite** ppSite) override;
    HRESULT STDMETHODCALLTYPE PlaceSiteObject(IOsrikSite* pSite, IOsrikPolyline* pOutline,
                                              LONG* plResult) override;
    HRESULT STDMETHODCALLTYPE ShowToolbar(LONG lToolbar, LONG lX, LONG lY, LONG lVisible,
                                          LONG lDocked, LONG* plResult) override;
    HRESULT STDMETHODCALLTYPE SetInputMode(LONG lMode) override;
    HRESULT STDMETHODCALLTYPE SetProgressText(BSTR bstrText) override;
    HRESULT STDMETHODCALLTYPE SetProgressPosition(LONG lPercent) override;
    HRESULT STDMETHODCALLTYPE CreateHeightPoint(FLOAT fX, FLOAT fY, FLOAT fZ,
                                                LONG* plResult) override;
    HRESULT STDMETHODCALLTYPE SetHelpFile(LONG lKind, BSTR bstrPath, LONG* plResult) override;
    HRESULT STDMETHODCALLTYPE StartProgress(BSTR bstrTitle, LONG lFlags) override;
    HRESULT STDMETHODCALLTYPE EndProgress() override;
    HRESULT STDMETHODCALLTYPE GetDirectory(LONG lKind, BSTR* pPath) override;
    HRESULT STDMETHODCALLTYPE BeginEditGroup(BSTR bstrName, LONG* plGroup) override;
    HRESULT STDMETHODCALLTYPE ActivateEditGroup(LONG* plGroup, LONG* plResult) override;
    HRESULT STDMETHODCALLTYPE EndEditGroup(LONG* plGroup, LONG lKeep, LONG* plResult) override;
    HRESULT STDMETHODCALLTYPE SetBatchMode(LONG lOn, LONG* plResult) override;

    CConnectionPoint& Events() { return *m_pEvents; }
    CViewObject& View() { return *m_pView; }
    CMacroObject& Macro() { return *m_pMacro; }
    void Detach() override;

    // The folder GetDirectory gives for object files (kind 5).
    static constexpr LONG kObjectDirectory = 5;

protected:
    void* GetInterface(REFIID riid) override;

private:
    template <typename TObject, typename TInterface>
    HRESULT CreateGraphic(const char* pszMethod, LONG lFlags, TInterface** ppObject);

    CMacroObject* m_pMacro;
    CConnectionPoint* m_pEvents;
    CViewObject* m_pView;
};

// The text that describes a bitmap handle as GetObject reports it: "20x20x32" (width, height, bits
// per pixel), "invalid" for a handle GetObject does not know, none for a null handle.
std::optional<std::string> DescribeBitmap(HBITMAP hBitmap);
