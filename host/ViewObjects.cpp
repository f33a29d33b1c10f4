#include "host/ViewObjects.h"

COverlayObject::~COverlayObject() {
    ReleaseAll();
}

HRESULT COverlayObject::AddToOverlay(IOsrikGraphic2D* pObject, LONG* plResult) {
    TraceCall("AddToOverlay", TraceObject(pObject));
    CHostObject* pHostObject = State().Find(pObject);
    if (!pHostObject || !dynamic_cast<CGraphicRecord*>(pHostObject)) {
        TraceResult("E_INVALIDARG");
        return E_INVALIDARG;  // only the host's own graphic objects can be drawn
    }
    pHostObject->HostAddRef();
    m_items.push_back(pHostObject);
    if (plResult) {
        *plResult = LONG(m_items.size());
    }
    return S_OK;
}

HRESULT COverlayObject::ClearOverlay() {
    TraceCall("ClearOverlay");
    ReleaseAll();
    return S_OK;
}

void COverlayObject::ReleaseAll() {
    std::vector<CHostObject*> items;
    items.swap(m_items);
    for (CHostObject* pItem : items) {
        pItem->HostRelease();
    }
}

COverlaySnapshot COverlayObject::Snapshot() const {
    COverlaySnapshot snapshot;
    for (const CHostObject* pItem : m_items) {
        snapshot.push_back(dynamic_cast<const CGraphicRecord*>(pItem)->Snapshot());
    }
    return snapshot;
}

CViewObject::CViewObject(CHostState& state)
    : CDispatchObject(state, "view", IID_IOsrikView), m_pOverlay(new COverlayObject(state)) {
    m_pOverlay->HostAddRef();
}

CViewObject::~CViewObject() {
    if (m_pOverlay) {
        m_pOverlay->HostRelease();
    }
}

HRESULT CViewObject::GetOverlay(IOsrikOverlay** ppOverlay) {
    TraceCall("GetOverlay");
    if (!ppOverlay) {
        return E_POINTER;
    }
    m_pOverlay->AddRefForCaller();
    *ppOverlay = m_pOverlay;
    TraceResult(m_pOverlay->Name());
    return S_OK;
}

HRESULT CViewObject::UpdateView() {
    TraceCall("UpdateView");
    ++m_nUpdates;
    return S_OK;
}
