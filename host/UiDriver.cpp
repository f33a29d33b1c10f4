#include "host/UiDriver.h"

#include "host/Json.h"
#include "host/Text.h"
#include "platform/HostDriver.h"

namespace {

int MessageBoxProc(void* pContext, LPCSTR pszText, LPCSTR pszCaption, UINT uType) {
    return static_cast<CUiDriver*>(pContext)->OnMessageBox(pszText, pszCaption, uType);
}

void HelpProc(void* pContext, LPCSTR pszHelpFile, UINT uCommand, ULONG_PTR dwData) {
    static_cast<CUiDriver*>(pContext)->OnHelp(pszHelpFile, uCommand, dwData);
}

}  // namespace

CUiDriver::CUiDriver(CHostState& state) : m_state(state) {
    DriverSetMessageBoxProc(MessageBoxProc, this);
    DriverSetHelpProc(HelpProc, this);
}

CUiDriver::~CUiDriver() {
    DriverSetMessageBoxProc(nullptr, nullptr);
    DriverSetHelpProc(nullptr, nullptr);
}

void CUiDriver::Fail(const std::string& strReason) {
    if (m_strFailure.empty()) {
        const std::string strWhere =
            m_state.currentLine ? "line " + std::to_string(*m_state.currentLine) + ": " : "";
        m_strFailure = strWhere + strReason;
    }
}

int CUiDriver::OnMessageBox(LPCSTR pszText, LPCSTR pszCaption, UINT uType) {
    CMessageRecord record{AnsiToUtf8(pszText), AnsiToUtf8(pszCaption), uType, ""};
    std::string strError;
    const std::optional<CUiAction> action =
        m_queue.Take(EUiConsumer::MessageBox, "message box " + QuoteJson(record.strText), strError);
    int nAnswer = IDCANCEL;
    if (action) {
        nAnswer = MessageBoxAnswer(uType, action->eKind);
    } else {
        Fail(strError);
    }
    record.strAnswer = nAnswer == IDOK ? "ok" : "cancel";
    m_state.Trace("MessageBox(" + QuoteJson(record.strText) + ", " + QuoteJson(record.strCaption) +
                  ", " + std::to_string(uType) + ") -> " + record.strAnswer);
    m_state.project.messages.push_back(std::move(record));
    return nAnswer;
}

void CUiDriver::OnHelp(LPCSTR pszHelpFile, UINT uCommand, ULONG_PTR dwData) {
    CHelpRecord record{AnsiToUtf8(pszHelpFile), dwData};
    m_state.Trace("WinHelp(" + QuoteJson(record.strPath) + ", " + std::to_string(uCommand) + ", " +
                  std::to_string(dwData) + ")");
    m_state.project.help.push_back(std::move(record));
}

std::optional<std::string> CUiDriver::OnFileDialog(LPCSTR pszInitialFolder) {
    std::string strError;
    const std::optional<CUiAction> action =
        m_queue.Take(EUiConsumer::FileDialog, "a file dialog", strError);
    if (!action) {
        Fail(strError);
    }
    const bool bChosen = action && action->eKind == EUiAction::File;
    m_state.Trace("FileDialog(" + QuoteJson(AnsiToUtf8(pszInitialFolder)) + ") -> " +
                  (bChosen ? QuoteJson(action->strText) : std::string("cancel")));
    return bChosen ? std::optional<std::string>(Utf8ToAnsi(action->strText)) : std::nullopt;
}

void CUiDriver::OnDialogOpened(UINT nTemplate) {
    m_state.Trace("Dialog(" + std::to_string(nTemplate) + ")");
    if (m_queue.IsEmpty() || m_queue.Front().eKind != EUiAction::Dialog) {
        return;  // the scenario does not say which dialog it expects
    }
    std::string strError;
    const CUiAction expected = *m_queue.Take(EUiConsumer::Dialog, "", strError);
    if (UINT(expected.nValue) != nTemplate) {
        Fail("dialog " + std::to_string(nTemplate) + " opened, but the scenario expects " +
             DescribeUiAction(expected));
    }
}

std::optional<CUiAction> CUiDriver::NextDialogAction(UINT nTemplate) {
    const std::string strWhat = "dialog " + std::to_string(nTemplate);
    std::string strError;
    std::optional<CUiAction> action;
    if (!m_queue.IsEmpty() && m_queue.Front().eKind == EUiAction::Dialog) {
        strError = strWhat + " is still open, but the next UI action is " +
                   DescribeUiAction(m_queue.Front());
    } else {
        action = m_queue.Take(EUiConsumer::Dialog, strWhat, strError);
    }
    if (!action) {
        Fail(strError);
        return std::nullopt;
    }
    m_state.Trace(DescribeUiAction(*action));
    action->strText = Utf8ToAnsi(action->strText);
    return action;
}
