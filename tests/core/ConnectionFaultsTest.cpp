// Connecting and disconnecting in process, with the faults the reference host
// never shows.
#include <gtest/gtest.h>

#include <memory>

#include "PluginTestBase.h"
#include "core/EditGroup.h"
#include "res/resource.h"

namespace {

#define KALMORET_PASS(Method, Params, Args)            \
    HRESULT STDMETHODCALLTYPE Method Params override { \
        return m_real.Method Args;                     \
    }

// The four IDispatch methods, passed on unchanged.
#define KALMORET_PASS_IDISPATCH()                                                                  \
    KALMORET_PASS(GetTypeInfoCount, (UINT * p), (p))                                               \
    KALMORET_PASS(GetTypeInfo, (UINT a, LCID b, ITypeInfo * *c), (a, b, c))                        \
    KALMORET_PASS(GetIDsOfNames, (REFIID a, LPOLESTR * b, UINT c, LCID d, DISPID * e),             \
                  (a, b, c, d, e))                                                                 \
    KALMORET_PASS(Invoke,                                                                          \
                  (DISPID a, REFIID b, LCID c, WORD d, DISPPARAMS * e, VARIANT * f, EXCEPINFO * g, \
                   UINT * h),                                                                      \
                  (a, b, c, d, e, f, g, h))

// The reference host's macro interface, except that it creates no toolbar
// buttons (handle 0).
class CNoButtonsMacro final : public IOsrikMacro {
public:
    explicit CNoButtonsMacro(IOsrikMacro& real) : m_real(real) {}
    HRESULT STDMETHODCALLTYPE QueryInterface(REFIID riid, void** ppv) override {
        return m_real.QueryInterface(riid, ppv);
    }
    ULONG STDMETHODCALLTYPE AddRef() override { return m_real.AddRef(); }
    ULONG STDMETHODCALLTYPE Release() override { return m_real.Release(); }
    HRESULT STDMETHODCALLTYPE AddToolbarButton(LONG, HBITMAP, BSTR, LONG, LONG* plButton) override {
        *plButton = 0;
        return S_OK;
    }
    KALMORET_PASS_IDISPATCH()
    KALMORET_PASS(SetMessageHooks, (MACROIDLEHOOK a, MACROMESSAGEHOOK b), (a, b))
    KALMORET_PASS(AddButtonEntry, (LONG a, HBITMAP b, LONG c, BSTR d, LONG e, LONG* f),
                  (a, b, c, d, e, f))

private:
    IOsrikMacro& m_real;
};

// The reference host's application with faults switched on: no macro interface,
// no event connection, a failing GetProgramPath, no edit group, no toolbar
// buttons. Every other call goes to the real one.
class CFaultyHost final : public IOsrikApplication {
public:
    explicit CFaultyHost(COsrikApplication& real) : m_real(real) {}
    bool m_bNoMacro = false, m_bNoEvents = false, m_bNoProgramPath = false, m_bNoGroup = false,
         m_bNoButtons = false;

    HRESULT STDMETHODCALLTYPE QueryInterface(REFIID riid, void** ppv) override {
        *ppv = nullptr;
        const bool bRefused = (riid == IID_IOsrikMacro && m_bNoMacro) ||
                              (riid == IID_IConnectionPointContainer && m_bNoEvents);
        if (bRefused) {
            return E_NOINTERFACE;
        }
        const HRESULT hr = m_real.QueryInterface(riid, ppv);
        if (SUCCEEDED(hr) && riid == IID_IOsrikMacro && m_bNoButtons) {
            m_pNoButtons = std::make_unique<CNoButtonsMacro>(*static_cast<IOsrikMacro*>(*ppv));
            *ppv = static_cast<IOsrikMacro*>(m_pNoButtons.get());
        }
        return hr;
    }
    ULONG STDMETHODCALLTYPE AddRef() override { return m_real.AddRef(); }
    ULONG STDMETHODCALLTYPE Release() override { return m_real.Release(); }
    HRESULT STDMETHODCALLTYPE GetProgramPath(BSTR* pPath) override {
        *pPath = nullptr;
        return m_bNoProgramPath ? E_FAIL : m_real.GetProgramPath(pPath);
    }
    HRESULT STDMETHODCALLTYPE BeginEditGroup(BSTR bstrName, LONG* plGroup) override {
        const HRESULT hr = m_real.BeginEditGroup(bstrName, plGroup);
        *plGroup = m_bNoGroup ? 0 : *plGroup;
        return hr;
    }
    KALMORET_PASS_IDISPATCH()
    KALMORET_PASS(GetMainWindow, (HWND * p), (p))
    KALMORET_PASS(SetModeFlags, (LONG l), (l))
    KALMORET_PASS(GetModeFlags, (LONG * p), (p))
    KALMORET_PASS(GetActiveView, (IOsrikView * *p), (p))
    KALMORET_PASS(CreateToolbar, (LONG l, LONG* p), (l, p))
    KALMORET_PASS(DeleteToolbar, (LONG l, LONG* p), (l, p))
    KALMORET_PASS(RefreshToolbars, (), ())
    KALMORET_PASS(LoadObjectFile, (BSTR b, LONG l, IOsrikObjectTemplate** p), (b, l, p))
    KALMORET_PASS(CreateLineObject, (LONG l, IOsrikLine** p), (l, p))
    KALMORET_PASS(CreatePolylineObject, (LONG l, IOsrikPolyline** p), (l, p))
    KALMORET_PASS(CreateRectangleObject, (LONG l, IOsrikRectangle** p), (l, p))
    KALMORET_PASS(CreateSiteObject, (LONG l, IOsrikSite** p), (l, p))
    KALMORET_PASS(PlaceSiteObject, (IOsrikSite * s, IOsrikPolyline* o, LONG* p), (s, o, p))
    KALMORET_PASS(ShowToolbar, (LONG a, LONG b, LONG c, LONG d, LONG e, LONG* p),
                  (a, b, c, d, e, p))
    KALMORET_PASS(SetInputMode, (LONG l), (l))
    KALMORET_PASS(SetProgressText, (BSTR b), (b))
    KALMORET_PASS(SetProgressPosition, (LONG l), (l))
    KALMORET_PASS(CreateHeightPoint, (FLOAT x, FLOAT y, FLOAT z, LONG* p), (x, y, z, p))
    KALMORET_PASS(SetHelpFile, (LONG l, BSTR b, LONG* p), (l, b, p))
    KALMORET_PASS(StartProgress, (BSTR b, LONG l), (b, l))
    KALMORET_PASS(EndProgress, (), ())
    KALMORET_PASS(GetDirectory, (LONG l, BSTR* p), (l, p))
    KALMORET_PASS(ActivateEditGroup, (LONG * g, LONG* p), (g, p))
    KALMORET_PASS(EndEditGroup, (LONG * g, LONG l, LONG* p), (g, l, p))
    KALMORET_PASS(SetBatchMode, (LONG l, LONG* p), (l, p))

private:
    COsrikApplication& m_real;
    std::unique_ptr<CNoButtonsMacro> m_pNoButtons;
};

// A second automation object connected to the faulty host, beside the one the
// module made.
class ConnectionTest : public AttachedTest {
protected:
    void SetUp() override {
        AttachedTest::SetUp();
        m_pImpl = new CKalmoretImpl;
    }
    void TearDown() override {
        m_pImpl->Release();
        AttachedTest::TearDown();
    }
    CFaultyHost m_host{Session().App()};
    CKalmoretImpl* m_pImpl = nullptr;
};

TEST_F(PluginTest, HelpPathIsJoinedWithoutASeparatorAndADisconnectionHappensOnce) {
    Session().State().strProgramPath = "C:\\Osrik";
    Attach();
    EXPECT_EQ(GetKalmoretApp()->m_strHelpPath, CString("C:\\OsrikOsrik.hlp"));
    Impl()->OnProgramExit();
    TakeTrace();
    Impl()->Disconnect();
    EXPECT_TRUE(TakeTrace().empty());
}

TEST_F(ConnectionTest, NullHostOrNoMacroInterfaceFailsSilently) {
    EXPECT_FALSE(m_pImpl->Connect(nullptr));
    m_pImpl->Disconnect();
    m_host.m_bNoMacro = true;
    EXPECT_FALSE(m_pImpl->Connect(&m_host));
    m_pImpl->Disconnect();
    EXPECT_TRUE(TakeTrace().empty());
    EXPECT_TRUE(Boxes().empty());
}

TEST_F(ConnectionTest, RefusedEventConnectionIsShownAndFails) {
    m_host.m_bNoEvents = true;
    Answers().push_back(IDOK);
    EXPECT_FALSE(m_pImpl->Connect(&m_host));
    ASSERT_EQ(Boxes().size(), 1u);
    EXPECT_EQ(Boxes()[0].text, "Es konnte keine Event-Verbindung zu Osrik hergestellt werden!");
    EXPECT_EQ(Boxes()[0].caption, "core_test");
    EXPECT_EQ(Boxes()[0].type, MB_OK);
    // Disconnecting the half-connected object calls no host method but gives back
    // the macro.
    m_pImpl->Disconnect();
    EXPECT_EQ(TakeTrace(), Calls{"app.QueryInterface(IOsrikMacro) -> macro"});
}

TEST_F(ConnectionTest, FailingProgramPathKeepsTheHelpPathAndStillBuildsTheToolbar) {
    m_host.m_bNoProgramPath = true;
    GetKalmoretApp()->m_strHelpPath = "kept";
    EXPECT_TRUE(m_pImpl->Connect(&m_host));
    const Calls calls = TakeTrace();
    EXPECT_EQ(calls.at(4), "app.SetHelpFile(0, \"kept\")");
    EXPECT_EQ(calls.back(), "app.ShowToolbar(7, 0, 0, 1, 1)");
    m_pImpl->Disconnect();
}

TEST_F(ConnectionTest, ButtonsTheHostDidNotCreateGetNoEntries) {
    m_host.m_bNoButtons = true;
    EXPECT_TRUE(m_pImpl->Connect(&m_host));
    EXPECT_EQ(m_pImpl->m_lContourButton, 0);
    EXPECT_EQ(m_pImpl->m_lPolylineEntry, 0);
    EXPECT_EQ(m_pImpl->m_lImportEntry, 0);
    for (const std::string& call : TakeTrace()) {
        EXPECT_EQ(call.find("AddButtonEntry"), std::string::npos) << call;
    }
    m_pImpl->Disconnect();
}

TEST_F(ConnectionTest, EditGroupWithoutAGroupStillRestoresTheFlags) {
    m_host.m_bNoGroup = true;
    {
        CEditGroup group(&m_host, IDS_EDIT_GROUP_CONTOUR);
        group.Commit();
        group.Cancel();
    }
    EXPECT_EQ(TakeTrace(),
              (Calls{"app.GetModeFlags() -> 127", "app.SetModeFlags(96)", "app.SetBatchMode(-1)",
                     "app.BeginEditGroup(\"H\xc3\xb6henlinienpunkte "
                     "einf\xc3\xbcgen\") -> 1",
                     "app.SetModeFlags(127)"}));
}

}  // namespace
