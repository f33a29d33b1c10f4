// The host's one connection point: the plug-in's event sinks for the host's event interface.
#pragma once

#include <vector>

#include "host/HostObject.h"

class CConnectionPoint final : public CComObject<IConnectionPoint> {
public:
    CConnectionPoint(CHostState& state, IConnectionPointContainer* pContainer)
        : CComObject(state, "events"), m_pContainer(pContainer) {}

    HRESULT STDMETHODCALLTYPE GetConnectionInterface(IID* pIID) override;
    HRESULT STDMETHODCALLTYPE
    GetConnectionPointContainer(IConnectionPointContainer** ppCPC) override;
    // Keeps the sink's event interface (asked for by QueryInterface) until Unadvise.
    HRESULT STDMETHODCALLTYPE Advise(IUnknown* pUnkSink, DWORD* pdwCookie) override;
    HRESULT STDMETHODCALLTYPE Unadvise(DWORD dwCookie) override;
    HRESULT STDMETHODCALLTYPE EnumConnections(IEnumConnections** ppEnum) override;

    // The connected sinks, each with a reference added for the caller to release.
    std::vector<IDispatch*> TakeSinkReferences() const;
    bool IsConnected() const { return !m_sinks.empty(); }
    // Releases every sink still connected, as the host does when it closes.
    void DropSinks();
    void Detach() override { m_sinks.clear(); }

protected:
    void* GetInterface(REFIID riid) override;

private:
    struct CSink {
        DWORD dwCookie;
        IDispatch* pSink;
    };

    IConnectionPointContainer* m_pContainer;  // the application, which owns this object
    std::vector<CSink> m_sinks;
    DWORD m_dwNextCookie = 1;
};
