// The UI driver: answers the plug-in's modal UI from the queued `ui` actions and records message
// boxes and help calls in the project. The first UI that finds no fitting action marks the
// scenario failed; it is answered with Cancel so the plug-in can return.
#pragma once

#include <optional>
#include <string>

#include "host/HostState.h"
#include "host/UiQueue.h"

class CUiDriver {
public:
    explicit CUiDriver(CHostState& state);
    ~CUiDriver();  // uninstalls the driver procedures
    CUiDriver(const CUiDriver&) = delete;
    CUiDriver& operator=(const CUiDriver&) = delete;

    CUiQueue& Queue() { return m_queue; }
    // The reason of the first failure, "" while none occurred.
    const std::string& Failure() const { return m_strFailure; }
    void Fail(const std::string& strReason);

    int OnMessageBox(LPCSTR pszText, LPCSTR pszCaption, UINT uType);
    void OnHelp(LPCSTR pszHelpFile, UINT uCommand, ULONG_PTR dwData);

    // A file-open dialog: the chosen path in the ANSI code page, or none for `ui file-cancel` and
    // for a failure (no fitting action).
    std::optional<std::string> OnFileDialog(LPCSTR pszInitialFolder);
    // A modal dialog with template nTemplate opens: a queued `ui dialog ID` next must name it.
    void OnDialogOpened(UINT nTemplate);
    // The next action for the open dialog nTemplate, texts in the ANSI code page; none when the
    // queue holds no action for a dialog (a failure: the dialog is then cancelled).
    std::optional<CUiAction> NextDialogAction(UINT nTemplate);

private:
    CHostState& m_state;
    CUiQueue m_queue;
    std::string m_strFailure;
};
