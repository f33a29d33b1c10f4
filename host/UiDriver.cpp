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
