// The UI driver's queue: actions from `ui ...` lines, consumed in order by the modal UI the plug-in
// opens. A modal UI that finds no fitting action fails the scenario with a one-line reason.
#pragma once

#include <deque>
#include <optional>
#include <string>
#include <string_view>

#include "host/UiAction.h"
#include "platform/Win32.h"

// Which modal UI asks for an action.
enum class EUiConsumer { MessageBox, FileDialog, Dialog };

class CUiQueue {
public:
    void Push(const CUiAction& action) { m_actions.push_back(action); }
    bool IsEmpty() const { return m_actions.empty(); }
    size_t Size() const { return m_actions.size(); }
    // The next action; the queue must not be empty.
    const CUiAction& Front() const { return m_actions.front(); }

    // Takes the next action for that consumer. When the queue is empty or its next action belongs
    // to another kind of UI, takes nothing and returns no action with the reason in strError;
    // `what` names the asking UI in the reason.
    std::optional<CUiAction> Take(EUiConsumer eConsumer, std::string_view what,
                                  std::string& strError);

    // The reason for actions left unused at the end of a scenario; empty when none are left.
    std::string DescribeLeftovers() const;

private:
    std::deque<CUiAction> m_actions;
};

// The answer a message box of style uType gives for the action (Ok or Cancel): IDOK or IDCANCEL. A
// box without a Cancel button closes with IDOK whichever way it is dismissed, as on Windows.
int MessageBoxAnswer(UINT uType, EUiAction eAction);
