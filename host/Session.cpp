#include "host/Session.h"

#include <cstdio>

#include "host/Macro.h"
#include "platform/HostDriver.h"

namespace {

CHostSession* g_pCurrent = nullptr;

constexpr DWORD kLoopStep = 10;
// More messages than this in one step means the plug-in keeps posting to itself.
constexpr int kMaxMessagesPerStep = 100000;

std::string Hex(HRESULT hr) {
    char buffer[16];
    std::snprintf(buffer, sizeof buffer, "0x%08X", unsigned(hr));
    return buffer;
}

}  // namespace

CHostSession* CHostSession::Current() {
    return g_pCurrent;
}

CHostSession::CHostSession(std::string strProgramPath, bool bTrace)
    : m_pApp(new COsrikApplication(m_state)) {
    m_state.strProgramPath = std::move(strProgramPath);
    m_state.bTrace = bTrace;
    m_pApp->HostAddRef();
    g_pCurrent = this;
}

CHostSession::~CHostSession() {
    Shutdown();
    m_state.DestroyAll();
    if (g_pCurrent == this) {
        g_pCurrent = nullptr;
    }
}

bool CHostSession::Load(const std::string& strPath, std::string& strError) {
    BeginStep(std::nullopt, "load");
    m_state.Trace("LoadLibrary(" + QuoteJson(strPath) + ")");
    m_hModule = LoadLibraryA(strPath.c_str());
    if (!m_hModule) {
        strError = "the plug-in " + strPath + " could not be loaded";
        return false;
    }
    CheckLeaks();
    return true;
}

void CHostSession::Shutdown() {
    if (!m_hModule) {
        return;
    }
    if (m_pApp->Events().IsConnected()) {
        BeginStep(std::nullopt, "shutdown");
        m_state.Trace("the host closes");
        CEventArgs args(*FindOsrikEvent(kEventProgramExit));
        Fire(args);
        CheckLeaks();
    }
    m_pApp->Events().DropSinks();
    BeginStep(std::nullopt, "unload");
    m_state.Trace("FreeLibrary");
    FreeLibrary(m_hModule);
    m_hModule = nullptr;
    m_state.pfnIdleHook = nullptr;  // they pointed into the module
    m_state.pfnMessageHook = nullptr;
    CheckLeaks();
}

void CHostSession::BeginStep(std::optional<int> line, std::string strEvent) {
    m_state.currentLine = line;
    m_state.strCurrentEvent = std::move(strEvent);
}

bool CHostSession::Fire(CEventArgs& args) {
    m_state.Trace("event " + args.Describe());
    std::vector<IDispatch*> sinks = m_pApp->Events().TakeSinkReferences();
    const int nLine = m_state.currentLine.value_or(0);
    if (sinks.empty()) {
        m_state.project.undelivered.push_back({nLine, args.Event().name, "no sink"});
        m_state.Trace("event " + std::string(args.Event().name) + " not delivered: no sink");
        return false;
    }
    bool bTaken = false;
    for (IDispatch* pSink : sinks) {
        DISPPARAMS params = args.Params();
        VARIANT result;
        VariantInit(&result);
        EXCEPINFO excep{};
        UINT uArgErr = 0;
        const HRESULT hr = pSink->Invoke(args.Event().id, IID_NULL, 0, DISPATCH_METHOD, &params,
                                         &result, &excep, &uArgErr);
        VariantClear(&result);
        SysFreeString(excep.bstrSource);
        SysFreeString(excep.bstrDescription);
        SysFreeString(excep.bstrHelpFile);
        pSink->Release();
        if (FAILED(hr)) {
            m_state.project.undelivered.push_back({nLine, args.Event().name, "refused " + Hex(hr)});
            m_state.Trace("event " + std::string(args.Event().name) + " refused " + Hex(hr));
        }
        bTaken = bTaken || SUCCEEDED(hr);
    }
    return bTaken;
}

std::string CHostSession::RunLoop(DWORD nMilliseconds) {
    DWORD nElapsed = 0;
    LONG lIdleCount = 0;
    bool bIdleDone = false;
    int nIdleCalls = 0;
    for (;;) {
        MSG msg{};
        int nMessages = 0;
        while (PeekMessageA(&msg, nullptr, 0, 0, PM_REMOVE)) {
            if (++nMessages > kMaxMessagesPerStep) {
                return "the plug-in keeps posting messages";
            }
            DeliverMessage(msg);
            lIdleCount = 0;  // new work: the idle hook starts counting again
            bIdleDone = false;
        }
        if (!bIdleDone && m_state.pfnIdleHook) {
            ++nIdleCalls;
            if (m_state.pfnIdleHook(lIdleCount)) {
                ++lIdleCount;
            } else {
                bIdleDone = true;  // no more idle work until the next message
            }
        }
        if (nElapsed >= nMilliseconds) {
            break;
        }
        const DWORD nStep = std::min(kLoopStep, nMilliseconds - nElapsed);
        DriverAdvanceClock(nStep);
        nElapsed += nStep;
    }
    m_state.Trace("idle " + std::to_string(nMilliseconds) + " ms: " + std::to_string(nIdleCalls) +
                  (nIdleCalls == 1 ? " idle hook call" : " idle hook calls"));
    return "";
}

void CHostSession::DeliverMessage(const MSG& msg) {
    if (!m_state.pfnMessageHook) {
        m_state.Trace("message " + std::to_string(msg.message) + " dropped: no message hook");
        return;
    }
    m_state.Trace("message hook(" + std::to_string(msg.message) + ", " +
                  std::to_string(msg.wParam) + ")");
    MSG copy = msg;
    const BOOL bHandled = m_state.pfnMessageHook(&copy);
    m_state.Trace("message hook returned " + std::to_string(bHandled));
}

void CHostSession::CheckLeaks() {
    const bool bConnected = m_pApp->Events().IsConnected();
    std::map<std::string, LONG> leaks;
    m_state.ForEachObject([&](CHostObject& object) {
        const bool bKeptWhileConnected =
            bConnected && (&object == static_cast<CHostObject*>(m_pApp) ||
                           &object == static_cast<CHostObject*>(&m_pApp->Macro()));
        const LONG lRefs = object.PluginRefs() - (bKeptWhileConnected ? 1 : 0);
        if (lRefs > 0) {
            leaks[object.Name()] = lRefs;
        }
    });
    for (const auto& [name, lRefs] : leaks) {
        const auto it = m_lastLeaks.find(name);
        if (it == m_lastLeaks.end() || it->second != lRefs) {
            m_state.project.leaks.push_back(
                {m_state.currentLine, m_state.strCurrentEvent, name, lRefs});
        }
    }
    for (const auto& [name, lRefs] : m_lastLeaks) {
        if (!leaks.count(name)) {
            m_state.project.leaks.push_back(
                {m_state.currentLine, m_state.strCurrentEvent, name, 0});
        }
    }
    m_lastLeaks = std::move(leaks);
}

std::optional<LONG> CHostSession::ResolveElement(const std::string& strElement) const {
    const std::vector<CToolbarElement>& toolbar = m_state.project.toolbar;
    // The n-th element of a kind under a parent (0: any parent).
    const auto nth = [&](const char* pszKind, LONG lParent, int n) -> std::optional<LONG> {
        for (const CToolbarElement& e : toolbar) {
            if (e.strKind == pszKind && (lParent == 0 || e.lParent == lParent) && n-- == 0) {
                return e.lHandle;
            }
        }
        return std::nullopt;
    };
    const auto entry = [&](int nButton, int nEntry) -> std::optional<LONG> {
        const std::optional<LONG> button = nth("button", 0, nButton);
        return button ? nth("entry", *button, nEntry) : std::nullopt;
    };
    if (strElement == "toolbar") {
        return nth("toolbar", 0, 0);
    }
    if (strElement == "contour-button" || strElement == "import-button") {
        return nth("button", 0, strElement == "contour-button" ? 0 : 1);
    }
    if (strElement == "polyline" || strElement == "polygon") {
        return entry(0, strElement == "polyline" ? 0 : 1);
    }
    if (strElement == "import") {
        return entry(1, 0);
    }
    return std::nullopt;
}

// The host's registration entry: the plug-in's start-up finds it in the executable by name.
extern "C" LONG CALLBACK RegisterInProcMacro2(HINSTANCE hInstance, CREATEMACROOBJECT pfnFactory,
                                              LONG lReserved) {
    CHostSession* pSession = CHostSession::Current();
    if (!pSession || !pfnFactory) {
        return 0;
    }
    CHostState& state = pSession->State();
    state.Trace("RegisterInProcMacro2(module, factory, " + std::to_string(lReserved) + ")");
    (void)hInstance;
    IDispatch* pHost = static_cast<IOsrikApplication*>(&pSession->App());
    const BOOL bResult = pfnFactory(pHost, 0);
    state.Trace("factory(app, 0) -> " + std::to_string(bResult));
    return bResult;
}
