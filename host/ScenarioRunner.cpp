#include "host/ScenarioRunner.h"

std::string CScenarioRunner::Run(const std::vector<CScenarioCommand>& commands) {
    std::string strFailure;
    for (const CScenarioCommand& cmd : commands) {
        strFailure = Execute(cmd);
        if (strFailure.empty()) {
            strFailure = m_driver.Failure();
        }
        if (!strFailure.empty()) {
            break;
        }
    }
    if (strFailure.empty() && !m_driver.Queue().IsEmpty()) {
        strFailure = m_driver.Queue().DescribeLeftovers();
    }
    m_session.State().project.bConnected = m_session.App().Events().IsConnected();
    return strFailure;
}

std::string CScenarioRunner::Execute(const CScenarioCommand& cmd) {
    CHostState& state = m_session.State();
    switch (cmd.eKind) {
        case ECommand::Button:
            return FireAt(cmd, kEventButtonChange);
        case ECommand::Click:
            return FireAt(cmd, kEventHowInput);
        case ECommand::Move: {
            const std::string strFailure = FireAt(cmd, kEventHowMove);
            if (strFailure.empty()) {
                state.project.overlays.push_back(m_session.App().View().Overlay().Snapshot());
            }
            return strFailure;
        }
        case ECommand::Event: {
            CEventArgs args(*FindOsrikEvent(DISPID(cmd.nValue)));
            FireEvent(cmd, args);
            return "";
        }
        case ECommand::Exit: {
            CEventArgs args(*FindOsrikEvent(kEventProgramExit));
            FireEvent(cmd, args);
            return "";
        }
        case ECommand::Idle: {
            m_session.BeginStep(cmd.nLine, "idle");
            const std::string strFailure = m_session.RunLoop(DWORD(cmd.nValue));
            m_session.CheckLeaks();
            return strFailure.empty() ? ""
                                      : "line " + std::to_string(cmd.nLine) + ": " + strFailure;
        }
        case ECommand::NoView:
        case ECommand::View:
            state.bViewAvailable = cmd.eKind == ECommand::View;
            state.Trace(state.bViewAvailable ? "view" : "noview");
            return "";
        case ECommand::Ui:
            m_driver.Queue().Push(cmd.ui);
            return "";
    }
    return "";
}

std::string CScenarioRunner::FireAt(const CScenarioCommand& cmd, DISPID id) {
    std::optional<LONG> handle = cmd.handle;
    if (!handle) {
        handle = m_session.ResolveElement(cmd.strElement);
    }
    if (!handle) {
        return "line " + std::to_string(cmd.nLine) + ": the plug-in has no toolbar element '" +
               cmd.strElement + "'";
    }
    CEventArgs args(*FindOsrikEvent(id));
    args.SetLong(0, *handle);
    if (id == kEventButtonChange) {
        args.SetLong(1, LONG(cmd.nValue));  // ButtonChange(handle, code, 0, FALSE, FALSE, FALSE)
    } else {
        args.SetFloat(
            1, cmd.fX);  // HowMove(handle, x, y, 0), HowInput(handle, x, y, 0, 0, flags, null)
        args.SetFloat(2, cmd.fY);
        args.SetLong(5, LONG(cmd.nValue));
    }
    FireEvent(cmd, args);
    return "";
}

void CScenarioRunner::FireEvent(const CScenarioCommand& cmd, CEventArgs& args) {
    m_session.BeginStep(cmd.nLine, args.Event().name);
    m_session.Fire(args);
    m_session.CheckLeaks();
}
