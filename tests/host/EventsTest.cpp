// Events as the plug-in receives them: arguments reversed with their types, by-reference targets,
// the event connection, and the message loop with the hooks.
#include <gtest/gtest.h>

#include <cstring>
#include <vector>

#include "host/Macro.h"
#include "host/Session.h"
#include "platform/HostDriver.h"

namespace {

// A plug-in's event sink: answers the event interface, counts the calls, refuses on request.
// What the arguments look like on arrival is checked end to end by the scenarios.
class CFakeSink final : public IDispatch {
public:
    HRESULT STDMETHODCALLTYPE QueryInterface(REFIID riid, void** ppv) override {
        *ppv = nullptr;
        if (!IsEqualIID(riid, IID_IOsrikEvents) && !IsEqualIID(riid, IID_IUnknown)) {
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
    HRESULT STDMETHODCALLTYPE Invoke(DISPID, REFIID, LCID, WORD, DISPPARAMS*, VARIANT*, EXCEPINFO*,
                                     UINT*) override {
        ++m_nCalls;
        return m_hrAnswer;
    }

    ULONG m_nRefs = 1;
    int m_nCalls = 0;
    HRESULT m_hrAnswer = S_OK;
};

class Events : public ::testing::Test {
protected:
    CHostSession m_session{"/opt/Osrik/", false};
    CProject& m_project = m_session.State().project;
    CFakeSink m_sink;
};

TEST(CEventArgs, ReversesArgumentsAndPointsReferencesAtHostValues) {
    CEventArgs args(*FindOsrikEvent(14));  // SaveStart(string, long, BOOL, long ref)
    args.SetLong(1, 7);
    DISPPARAMS params = args.Params();
    ASSERT_EQ(params.cArgs, 4u);
    EXPECT_EQ(params.cNamedArgs, 0u);
    EXPECT_EQ(params.rgvarg[3].vt, VT_BSTR);
    EXPECT_EQ(SysStringLen(params.rgvarg[3].bstrVal), 0u);
    EXPECT_EQ(params.rgvarg[2].vt, VT_I4);
    EXPECT_EQ(params.rgvarg[2].lVal, 7);
    EXPECT_EQ(params.rgvarg[1].vt, VT_BOOL);
    EXPECT_EQ(params.rgvarg[0].vt, VT_BYREF | VT_I4);
    ASSERT_NE(params.rgvarg[0].plVal, nullptr);
    *params.rgvarg[0].plVal = 5;
    EXPECT_EQ(args.Describe(), "SaveStart(\"\", 7, false, &5)");
}

TEST(CEventArgs, GivesEveryEventItsDeclaredTypes) {
    for (DISPID id = 1; id <= 52; ++id) {
        const COsrikEventInfo& event = *FindOsrikEvent(id);
        CEventArgs args(event);
        DISPPARAMS params = args.Params();
        const size_t nCount = std::strlen(event.params);
        ASSERT_EQ(params.cArgs, nCount) << event.name;
        for (size_t i = 0; i < nCount; ++i) {
            const VARTYPE expected = OsrikParamType(event.params[i]);
            const VARIANT& v = params.rgvarg[nCount - 1 - i];
            EXPECT_EQ(v.vt, expected == VT_VARIANT ? VARTYPE(VT_EMPTY) : expected)
                << event.name << " argument " << i;
            if (v.vt & VT_BYREF) {
                EXPECT_NE(v.byref, nullptr) << event.name << " argument " << i;
            }
        }
    }
}

// Undelivered and refused events are recorded as the probe scenarios show; here the references.
TEST_F(Events, ReachConnectedSinksAndGiveBackTheirReferences) {
    CEventArgs button(*FindOsrikEvent(kEventButtonChange));
    CConnectionPoint& events = m_session.App().Events();
    DWORD dwCookie = 0;
    ASSERT_EQ(events.Advise(&m_sink, &dwCookie), S_OK);
    EXPECT_NE(dwCookie, 0u);
    EXPECT_EQ(m_sink.m_nRefs, 2u);
    EXPECT_TRUE(m_session.Fire(button));
    EXPECT_EQ(m_sink.m_nCalls, 1);
    EXPECT_EQ(m_sink.m_nRefs, 2u);  // the host's reference for the call is given back
    EXPECT_EQ(events.Unadvise(dwCookie + 1), CONNECT_E_NOCONNECTION);
    EXPECT_EQ(events.Unadvise(dwCookie), S_OK);
    EXPECT_EQ(m_sink.m_nRefs, 1u);
    EXPECT_FALSE(events.IsConnected());
}

TEST_F(Events, ConnectionPointRefusesSinksWithoutTheEventInterface) {
    struct CPlainUnknown final : IUnknown {
        HRESULT STDMETHODCALLTYPE QueryInterface(REFIID, void** ppv) override {
            *ppv = nullptr;
            return E_NOINTERFACE;
        }
        ULONG STDMETHODCALLTYPE AddRef() override { return 1; }
        ULONG STDMETHODCALLTYPE Release() override { return 1; }
    } plain;
    DWORD dwCookie = 0xdeadbeef;
    EXPECT_EQ(m_session.App().Events().Advise(&plain, &dwCookie), CONNECT_E_CANNOTCONNECT);
    EXPECT_EQ(dwCookie, 0u);
    IConnectionPoint* pPoint = reinterpret_cast<IConnectionPoint*>(0xdeadbeef);
    EXPECT_EQ(m_session.App().FindConnectionPoint(IID_IDispatch, &pPoint), CONNECT_E_NOCONNECTION);
    EXPECT_EQ(pPoint, nullptr);
}

TEST_F(Events, AllowTheApplicationAndMacroOnlyWhileConnected) {
    DWORD dwCookie = 0;
    m_session.App().Events().Advise(&m_sink, &dwCookie);
    IOsrikMacro* pMacro = nullptr;
    m_session.App().QueryInterface(IID_IOsrikMacro, reinterpret_cast<void**>(&pMacro));
    m_session.App().AddRef();
    m_session.CheckLeaks();
    EXPECT_TRUE(m_project.leaks.empty());

    m_session.App().Events().Unadvise(dwCookie);
    m_session.BeginStep(9, "ProgramExit");
    m_session.CheckLeaks();
    ASSERT_EQ(m_project.leaks.size(), 2u);
    EXPECT_EQ(m_project.leaks[0].strObject, "app");
    EXPECT_EQ(m_project.leaks[1].strObject, "macro");
    pMacro->Release();
    m_session.App().Release();
}

// Hooks of a pretend plug-in.
std::vector<UINT> g_messages;
std::vector<LONG> g_idleCounts;

BOOL CALLBACK RecordMessage(MSG* pMsg) {
    g_messages.push_back(pMsg->message);
    return FALSE;
}

BOOL CALLBACK IdleTwice(LONG lCount) {
    g_idleCounts.push_back(lCount);
    return lCount < 1;
}

TEST_F(Events, LoopRunsHooksAndTimersOnTheHostClock) {
    g_messages.clear();
    g_idleCounts.clear();
    m_session.App().Macro().SetMessageHooks(IdleTwice, RecordMessage);
    HWND hWnd = DriverGetMainWindow();
    PostMessageA(hWnd, WM_USER, 0, 0);
    SetTimer(hWnd, 0xE000, 500, nullptr);

    EXPECT_EQ(m_session.RunLoop(490), "");
    EXPECT_EQ(g_messages, std::vector<UINT>{WM_USER});
    EXPECT_EQ(g_idleCounts, (std::vector<LONG>{0, 1}));  // FALSE ends idle work until a message
    EXPECT_EQ(m_session.RunLoop(10), "");  // the timer falls due at the end of the span
    EXPECT_EQ(g_messages, (std::vector<UINT>{WM_USER, WM_TIMER}));
    // Each span starts with new idle work; the timer message starts it once more.
    EXPECT_EQ(g_idleCounts, (std::vector<LONG>{0, 1, 0, 0}));
    KillTimer(hWnd, 0xE000);
}

}  // namespace
