#include "core/EditGroup.h"

#include "framework/String.h"

namespace {

// The host keeps its interactive modes in the five lowest flag bits; a batch of changes runs
// without them.
constexpr LONG kInteractiveModeMask = ~LONG(0x1F);

}  // namespace

CEditGroup::CEditGroup(IOsrikApplication* pHost, UINT nIDName) : m_pHost(pHost) {
    if (!m_pHost) {
        return;
    }
    m_pHost->AddRef();
    m_pHost->GetModeFlags(&m_lSavedFlags);
    m_pHost->SetModeFlags(m_lSavedFlags & kInteractiveModeMask);
    LONG lResult = 0;
    m_pHost->SetBatchMode(-1, &lResult);
    CString strName;
    strName.LoadString(nIDName);
    BSTR bstrName = strName.AllocSysString();
    m_pHost->BeginEditGroup(bstrName, &m_lGroup);
    SysFreeString(bstrName);
    if (m_lGroup != 0) {
        lResult = 0;
        m_pHost->ActivateEditGroup(&m_lGroup, &lResult);
    }
}

CEditGroup::~CEditGroup() {
    if (!m_pHost) {
        return;
    }
    if (m_lGroup != 0) {
        Cancel();
    }
    m_pHost->SetModeFlags(m_lSavedFlags);
    m_pHost->Release();
}

void CEditGroup::End(LONG lKeep) {
    if (!m_pHost || m_lGroup == 0) {
        return;
    }
    LONG lResult = 0;
    m_pHost->EndEditGroup(&m_lGroup, lKeep, &lResult);
    lResult = 0;
    m_pHost->SetBatchMode(0, &lResult);
    m_lGroup = 0;
}
