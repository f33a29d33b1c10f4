// A host for unit tests that records every call the plug-in makes, in order, as one line each, and
// answers with values the test sets. Its objects count their references so that tests can check
// that the plug-in gave every one back.
#pragma once

#include <memory>
#include <set>
#include <string>
#include <vector>

#include "RecordingObject.h"

#include "core/HostInterfaces.h"
#include "framework/String.h"

class CRecordingHost final : public IOsrikApplication,
                             public IOsrikMacro,
                             public IConnectionPointContainer,
                             public IConnectionPoint {
public:
    std::vector<std::string> m_calls;
    ULONG m_nRefs = 1;  // the test's own reference
    virtual ~CRecordingHost() = default;

    // Answers.
    bool m_bHasMacro = true;
    HRESULT m_hrAdvise = S_OK;
    HRESULT m_hrProgramPath = S_OK;
    std::basic_string<OLECHAR> m_strProgramPath = OLESTR("C:\\Osrik\\");
    LONG m_lModeFlags = 0x1234567F;
    LONG m_lGroup = 77;
    LONG m_lNextHandle = 100;
    bool m_bHasView = true;
    IDispatch* m_pSink = nullptr;
    std::set<std::string> m_unloadableFiles;  // LoadObjectFile gives no template for these
    std::vector<std::unique_ptr<CRecordingObject>> m_objects;

    // A new host object, handed out with one reference.
    CRecordingObject* NewObject(const std::string& kind);
    // The name of the object behind a graphic object pointer.
    std::string NameOf(const IOsrikGraphic2D* pObject) const;
    // The objects the plug-in still holds references to.
    std::vector<std::string> HeldObjects() const;

    void Record(const std::string& line) { m_calls.push_back(line); }
    static std::string Text(BSTR bstr) { return std::string(CString::FromBstr(bstr)); }

    // IUnknown, shared by all the host's interfaces here.
    HRESULT STDMETHODCALLTYPE QueryInterface(REFIID riid, void** ppv) override;
    ULONG STDMETHODCALLTYPE AddRef() override { return ++m_nRefs; }
    ULONG STDMETHODCALLTYPE Release() override { return --m_nRefs; }

    // IDispatch: not called by the plug-in.
    HRESULT STDMETHODCALLTYPE GetTypeInfoCount(UINT*) override { return E_NOTIMPL; }
    HRESULT STDMETHODCALLTYPE GetTypeInfo(UINT, LCID, ITypeInfo**) override { return E_NOTIMPL; }
    HRESULT STDMETHODCALLTYPE GetIDsOfNames(REFIID, LPOLESTR*, UINT, LCID, DISPID*) override {
        return E_NOTIMPL;
    }
    HRESULT STDMETHODCALLTYPE Invoke(DISPID, REFIID, LCID, WORD, DISPPARAMS*, VARIANT*, EXCEPINFO*,
                                     UINT*) override {
        return E_NOTIMPL;
    }

    // IOsrikApplication
    HRESULT STDMETHODCALLTYPE GetProgramPath(BSTR* pPath) override;
    HRESULT STDMETHODCALLTYPE GetMainWindow(HWND* phWnd) override;
    HRESULT STDMETHODCALLTYPE SetModeFlags(LONG lFlags) override;
    HRESULT STDMETHODCALLTYPE GetModeFlags(LONG* plFlags) override;
    HRESULT STDMETHODCALLTYPE GetActiveView(IOsrikView** ppView) override;
    HRESULT STDMETHODCALLTYPE CreateToolbar(LONG lStyle, LONG* plToolbar) override;
    HRESULT STDMETHODCALLTYPE DeleteToolbar(LONG lToolbar, LONG* plResult) override;
    HRESULT STDMETHODCALLTYPE RefreshToolbars() override;
    HRESULT STDMETHODCALLTYPE LoadObjectFile(BSTR, LONG, IOsrikObjectTemplate**) override;
    HRESULT STDMETHODCALLTYPE CreateLineObject(LONG, IOsrikLine**) override;
    HRESULT STDMETHODCALLTYPE CreatePolylineObject(LONG, IOsrikPolyline**) override;
    HRESULT STDMETHODCALLTYPE CreateRectangleObject(LONG, IOsrikRectangle**) override;
    HRESULT STDMETHODCALLTYPE CreateSiteObject(LONG, IOsrikSite**) override;
    HRESULT STDMETHODCALLTYPE PlaceSiteObject(IOsrikSite*, IOsrikPolyline*, LONG*) override;
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
    HRESULT STDMETHODCALLTYPE GetDirectory(LONG, BSTR*) override;
    HRESULT STDMETHODCALLTYPE BeginEditGroup(BSTR bstrName, LONG* plGroup) override;
    HRESULT STDMETHODCALLTYPE ActivateEditGroup(LONG* plGroup, LONG* plResult) override;
    HRESULT STDMETHODCALLTYPE EndEditGroup(LONG* plGroup, LONG lKeep, LONG* plResult) override;
    HRESULT STDMETHODCALLTYPE SetBatchMode(LONG lOn, LONG* plResult) override;

    // IOsrikMacro
    HRESULT STDMETHODCALLTYPE SetMessageHooks(MACROIDLEHOOK, MACROMESSAGEHOOK) override;
    HRESULT STDMETHODCALLTYPE AddButtonEntry(LONG lButton, HBITMAP hBitmap, LONG lStyle,
                                             BSTR bstrText, LONG lNumber, LONG* plEntry) override;
    HRESULT STDMETHODCALLTYPE AddToolbarButton(LONG lToolbar, HBITMAP hBitmap, BSTR bstrText,
                                               LONG lNumber, LONG* plButton) override;

    // IConnectionPointContainer
    HRESULT STDMETHODCALLTYPE EnumConnectionPoints(IEnumConnectionPoints**) override {
        return E_NOTIMPL;
    }
    HRESULT STDMETHODCALLTYPE FindConnectionPoint(REFIID riid, IConnectionPoint** ppCP) override;

    // IConnectionPoint
    HRESULT STDMETHODCALLTYPE GetConnectionInterface(IID*) override { return E_NOTIMPL; }
    HRESULT STDMETHODCALLTYPE GetConnectionPointContainer(IConnectionPointContainer**) override {
        return E_NOTIMPL;
    }
    HRESULT STDMETHODCALLTYPE Advise(IUnknown* pUnkSink, DWORD* pdwCookie) override;
    HRESULT STDMETHODCALLTYPE Unadvise(DWORD dwCookie) override;
    HRESULT STDMETHODCALLTYPE EnumConnections(IEnumConnections**) override { return E_NOTIMPL; }
};
