// One run of the host with one plug-in: the host objects, loading and unloading the module, firing
// events at the connected sinks, the message loop with the plug-in's hooks, and the leak check.
#pragma once

#include <map>
#include <optional>
#include <string>

#include "host/Application.h"
#include "host/EventArgs.h"
#include "host/HostState.h"

class CHostSession {
public:
    // strProgramPath: the executable's folder with its trailing separator.
    CHostSession(std::string strProgramPath, bool bTrace);
    ~CHostSession();  // unloads the plug-in if still loaded, then deletes every host object
    CHostSession(const CHostSession&) = delete;
    CHostSession& operator=(const CHostSession&) = delete;

    CHostState& State() { return m_state; }
    COsrikApplication& App() { return *m_pApp; }

    // Loads the module, whose start-up registers through RegisterInProcMacro2. False with the
    // reason when the module does not load.
    bool Load(const std::string& strPath, std::string& strError);
    // Fires ProgramExit if the plug-in is still connected, drops connections it left, unloads it.
    void Shutdown();

    // Sets the event or step that leak reports and failures name.
    void BeginStep(std::optional<int> line, std::string strEvent);
    // Fires one event at every connected sink; records it as undelivered when there is none or
    // when a sink refuses it. Returns whether some sink took it.
    bool Fire(CEventArgs& args);
    // Runs the message loop over nMilliseconds of host time: queued messages through the message
    // hook, the idle hook while the queue is empty, the clock advanced in 10 ms steps. Returns the
    // reason when the plug-in floods the queue, else "".
    std::string RunLoop(DWORD nMilliseconds);
    // Records the host objects the plug-in holds references to, where that changed since the last
    // check: the application and its macro interface count from their second reference while the
    // plug-in is connected.
    void CheckLeaks();

    // The handle of a toolbar element by its scenario name ("polyline", ...), if it exists.
    std::optional<LONG> ResolveElement(const std::string& strElement) const;

    // The session RegisterInProcMacro2 hands to the plug-in's factory; null when none is loading.
    static CHostSession* Current();

private:
    void DeliverMessage(const MSG& msg);

    CHostState m_state;
    COsrikApplication* m_pApp;
    HMODULE m_hModule = nullptr;
    std::map<std::string, LONG> m_lastLeaks;
};
