#include "host/UiQueue.h"

namespace {

bool Accepts(EUiConsumer eConsumer, EUiAction eAction) {
    switch (eConsumer) {
        case EUiConsumer::MessageBox:
            return eAction == EUiAction::Ok || eAction == EUiAction::Cancel;
        case EUiConsumer::FileDialog:
            return eAction == EUiAction::File || eAction == EUiAction::FileCancel;
        case EUiConsumer::Dialog:
            return eAction >= EUiAction::Dialog;
    }
    return false;
}

}  // namespace

std::optional<CUiAction> CUiQueue::Take(EUiConsumer eConsumer, std::string_view what,
                                        std::string& strError) {
    if (m_actions.empty()) {
        strError = std::string(what) + " with no queued UI action";
        return std::nullopt;
    }
    if (!Accepts(eConsumer, m_actions.front().eKind)) {
        strError =
            std::string(what) + " but the next UI action is " + DescribeUiAction(m_actions.front());
        return std::nullopt;
    }
    CUiAction action = m_actions.front();
    m_actions.pop_front();
    return action;
}

std::string CUiQueue::DescribeLeftovers() const {
    if (m_actions.empty()) {
        return std::string();
    }
    std::string text = std::to_string(m_actions.size()) + " UI action";
    text += m_actions.size() == 1 ? " left unused: " : "s left unused, the first: ";
    return text + DescribeUiAction(m_actions.front());
}

int MessageBoxAnswer(UINT uType, EUiAction eAction) {
    const bool bHasCancel = (uType & MB_TYPEMASK) != MB_OK;
    return eAction == EUiAction::Cancel && bHasCancel ? IDCANCEL : IDOK;
}
