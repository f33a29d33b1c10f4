#include "host/ConnectionPoint.h"

#include <algorithm>

HRESULT CConnectionPoint::GetConnectionInterface(IID* pIID) {
    TraceCall("GetConnectionInterface");
    if (!pIID) {
        return E_POINTER;
    }
    *pIID = IID_IOsrikEvents;
    return S_OK;
}

HRESULT CConnectionPoint::GetConnectionPointContainer(IConnectionPointContainer** ppCPC) {
    TraceCall("GetConnectionPointContainer");
    if (!ppCPC) {
        return E_POINTER;
    }
    State().Find(m_pContainer)->AddRefForCaller();
    *ppCPC = m_pContainer;
    return S_OK;
}

HRESULT CConnectionPoint::Advise(IUnknown* pUnkSink, DWORD* pdwCookie) {
    TraceCall("Advise");
    if (!pUnkSink || !pdwCookie) {
        return E_POINTER;
    }
    *pdwCookie = 0;
    IDispatch* pSink = nullptr;
    if (FAILED(pUnkSink->QueryInterface(IID_IOsrikEvents, reinterpret_cast<void**>(&pSink))) ||
        !pSink) {
        TraceResult("CONNECT_E_CANNOTCONNECT");
        return CONNECT_E_CANNOTCONNECT;
    }
    *pdwCookie = m_dwNextCookie++;
    m_sinks.push_back({*pdwCookie, pSink});
    TraceResult("cookie " + std::to_string(*pdwCookie));
    return S_OK;
}

HRESULT CConnectionPoint::Unadvise(DWORD dwCookie) {
    TraceCall("Unadvise", LONG(dwCookie));
    const auto it = std::find_if(m_sinks.begin(), m_sinks.end(), [dwCookie](const CSink& sink) {
        return sink.dwCookie == dwCookie;
    });
    if (it == m_sinks.end()) {
        TraceResult("CONNECT_E_NOCONNECTION");
        return CONNECT_E_NOCONNECTION;
    }
    IDispatch* pSink = it->pSink;
    m_sinks.erase(it);
    pSink->Release();
    return S_OK;
}

HRESULT CConnectionPoint::EnumConnections(IEnumConnections** ppEnum) {
    TraceCall("EnumConnections");
    if (ppEnum) {
        *ppEnum = nullptr;
    }
    return E_NOTIMPL;
}

std::vector<IDispatch*> CConnectionPoint::TakeSinkReferences() const {
    std::vector<IDispatch*> sinks;
    for (const CSink& sink : m_sinks) {
        sink.pSink->AddRef();
        sinks.push_back(sink.pSink);
    }
    return sinks;
}

void CConnectionPoint::DropSinks() {
    std::vector<CSink> sinks;
    sinks.swap(m_sinks);
    for (const CSink& sink : sinks) {
        State().Trace("host drops the event connection " + std::to_string(sink.dwCookie));
        sink.pSink->Release();
    }
}

void* CConnectionPoint::GetInterface(REFIID riid) {
    if (IsEqualIID(riid, IID_IConnectionPoint)) {
        return static_cast<IConnectionPoint*>(this);
    }
    return CComObject::GetInterface(riid);
}
