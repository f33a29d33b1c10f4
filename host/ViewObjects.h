// The plan view and its overlay of temporary graphics.
#pragma once

#include <vector>

#include "host/Graphics.h"

class COverlayObject final : public CDispatchObject<IOsrikOverlay> {
public:
    explicit COverlayObject(CHostState& state)
        : CDispatchObject(state, "overlay", IID_IOsrikOverlay) {}
    ~COverlayObject() override;

    // Keeps a reference to the object until the next ClearOverlay.
    HRESULT STDMETHODCALLTYPE AddToOverlay(IOsrikGraphic2D* pObject, LONG* plResult) override;
    HRESULT STDMETHODCALLTYPE ClearOverlay() override;

    COverlaySnapshot Snapshot() const;
    void Detach() override { m_items.clear(); }

private:
    void ReleaseAll();

    std::vector<CHostObject*> m_items;
};

class CViewObject final : public CDispatchObject<IOsrikView> {
public:
    explicit CViewObject(CHostState& state);
    ~CViewObject() override;

    HRESULT STDMETHODCALLTYPE GetOverlay(IOsrikOverlay** ppOverlay) override;
    HRESULT STDMETHODCALLTYPE UpdateView() override;

    COverlayObject& Overlay() { return *m_pOverlay; }
    void Detach() override { m_pOverlay = nullptr; }
    int UpdateCount() const { return m_nUpdates; }

private:
    COverlayObject* m_pOverlay;
    int m_nUpdates = 0;
};
