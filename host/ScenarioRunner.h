// Runs a parsed scenario against a loaded plug-in: one command after the other, each event followed
// by the leak check, each cursor move by a snapshot of the overlay.
#pragma once

#include <string>
#include <vector>

#include "host/Scenario.h"
#include "host/Session.h"
#include "host/UiDriver.h"

class CScenarioRunner {
public:
    CScenarioRunner(CHostSession& session, CUiDriver& driver)
        : m_session(session), m_driver(driver) {}

    // Runs the commands to the end, or to the first failure, whose reason it returns ("" when the
    // scenario ran to its end). Records whether the plug-in is still connected afterwards.
    std::string Run(const std::vector<CScenarioCommand>& commands);

private:
    std::string Execute(const CScenarioCommand& cmd);
    std::string FireAt(const CScenarioCommand& cmd, DISPID id);
    void FireEvent(const CScenarioCommand& cmd, CEventArgs& args);

    CHostSession& m_session;
    CUiDriver& m_driver;
};
