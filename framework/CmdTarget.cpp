#include "framework/CmdTarget.h"

#include <cstring>

namespace {

VARTYPE ParamType(char letter) {
    const bool byRef = letter >= 'A' && letter <= 'Z';
    VARTYPE vt = VT_EMPTY;
    switch (byRef ? char(letter - 'A' + 'a') : letter) {
        case 'l':
            vt = VT_I4;
            break;
        case 'f':
            vt = VT_R4;
            break;
        case 'b':
            vt = VT_BOOL;
            break;
        case 's':
            vt = VT_BSTR;
            break;
        case 'd':
            vt = VT_DISPATCH;
            break;
        case 'v':
            vt = VT_VARIANT;
            break;
        default:
            break;
    }
    return byRef ? VARTYPE(vt | VT_BYREF) : vt;
}

// Checks the arguments against the parameter letters; on a mismatch names its rgvarg index.
HRESULT CheckArguments(const char* pszParams, const DISPPARAMS& params, UINT* puArgErr) {
    const UINT count = UINT(std::strlen(pszParams));
    if (params.cNamedArgs != 0) {
        return HRESULT(0x80020007);  // DISP_E_NONAMEDARGS
    }
    if (params.cArgs != count || (count > 0 && !params.rgvarg)) {
        return DISP_E_BADPARAMCOUNT;
    }
    for (UINT i = 0; i < count; ++i) {
        const UINT slot = count - 1 - i;
        const VARTYPE expected = ParamType(pszParams[i]);
        const VARTYPE actual = params.rgvarg[slot].vt;
        const bool anyVariant = expected == VT_VARIANT;
        const bool refPresent = !(expected & VT_BYREF) || params.rgvarg[slot].byref != nullptr;
        if ((!anyVariant && actual != expected) || !refPresent) {
            if (puArgErr) {
                *puArgErr = slot;
            }
            return DISP_E_TYPEMISMATCH;
        }
    }
    return S_OK;
}

}  // namespace

IDispatch* CCmdTarget::GetIDispatch(BOOL bAddRef) {
    if (bAddRef) {
        AddRef();
    }
    return this;
}

HRESULT CCmdTarget::QueryInterface(REFIID riid, void** ppvObject) {
    if (!ppvObject) {
        return E_POINTER;
    }
    *ppvObject = nullptr;
    if (!IsEqualIID(riid, IID_IUnknown) && !IsEqualIID(riid, IID_IDispatch) &&
        !IsDispatchInterface(riid)) {
        return E_NOINTERFACE;
    }
    *ppvObject = static_cast<IDispatch*>(this);
    AddRef();
    return S_OK;
}

ULONG CCmdTarget::AddRef() {
    return ++m_dwRef;
}

ULONG CCmdTarget::Release() {
    const ULONG count = --m_dwRef;
    if (count == 0) {
        OnFinalRelease();
    }
    return count;
}

HRESULT CCmdTarget::GetTypeInfoCount(UINT* pctinfo) {
    if (!pctinfo) {
        return E_POINTER;
    }
    *pctinfo = 0;
    return S_OK;
}

HRESULT CCmdTarget::GetTypeInfo(UINT, LCID, ITypeInfo** ppTInfo) {
    if (ppTInfo) {
        *ppTInfo = nullptr;
    }
    return E_NOTIMPL;
}

HRESULT CCmdTarget::GetIDsOfNames(REFIID, LPOLESTR*, UINT, LCID, DISPID*) {
    return DISP_E_UNKNOWNNAME;  // the host calls events by identifier only
}

HRESULT CCmdTarget::Invoke(DISPID dispIdMember, REFIID riid, LCID, WORD, DISPPARAMS* pDispParams,
                           VARIANT* pVarResult, EXCEPINFO*, UINT* puArgErr) {
    if (!IsEqualIID(riid, IID_NULL)) {
        return DISP_E_UNKNOWNINTERFACE;
    }
    if (!pDispParams) {
        return E_INVALIDARG;
    }
    for (const CDispatchEntry& entry : GetDispatchMap()) {
        if (entry.id != dispIdMember) {
            continue;
        }
        const HRESULT hr = CheckArguments(entry.pszParams, *pDispParams, puArgErr);
        if (FAILED(hr)) {
            return hr;
        }
        if (pVarResult) {
            VariantInit(pVarResult);
        }
        try {
            if (entry.pfnHandler) {
                entry.pfnHandler(this, CDispArgs(*pDispParams));
            }
            return S_OK;
        } catch (...) {
            return DISP_E_EXCEPTION;  // no exception crosses into the host
        }
    }
    return DISP_E_MEMBERNOTFOUND;
}

BOOL AfxConnectionAdvise(IUnknown* pUnkSrc, REFIID iid, IUnknown* pUnkSink, BOOL bRefCount,
                         DWORD* pdwCookie) {
    if (!pUnkSrc || !pUnkSink || !pdwCookie) {
        return FALSE;
    }
    BOOL bSuccess = FALSE;
    IConnectionPointContainer* pContainer = nullptr;
    if (SUCCEEDED(pUnkSrc->QueryInterface(IID_IConnectionPointContainer,
                                          reinterpret_cast<void**>(&pContainer)))) {
        IConnectionPoint* pPoint = nullptr;
        if (SUCCEEDED(pContainer->FindConnectionPoint(iid, &pPoint)) && pPoint) {
            if (SUCCEEDED(pPoint->Advise(pUnkSink, pdwCookie))) {
                bSuccess = TRUE;
                if (!bRefCount) {
                    pUnkSink->Release();  // the caller wants no reference held for the sink
                }
            }
            pPoint->Release();
        }
        pContainer->Release();
    }
    return bSuccess;
}

BOOL AfxConnectionUnadvise(IUnknown* pUnkSrc, REFIID iid, IUnknown* pUnkSink, BOOL bRefCount,
                           DWORD dwCookie) {
    if (!pUnkSrc || !pUnkSink) {
        return FALSE;
    }
    if (!bRefCount) {
        pUnkSink->AddRef();  // balances the release Unadvise makes
    }
    BOOL bSuccess = FALSE;
    IConnectionPointContainer* pContainer = nullptr;
    if (SUCCEEDED(pUnkSrc->QueryInterface(IID_IConnectionPointContainer,
                                          reinterpret_cast<void**>(&pContainer)))) {
        IConnectionPoint* pPoint = nullptr;
        if (SUCCEEDED(pContainer->FindConnectionPoint(iid, &pPoint)) && pPoint) {
            bSuccess = SUCCEEDED(pPoint->Unadvise(dwCookie));
            pPoint->Release();
        }
        pContainer->Release();
    }
    if (!bSuccess && !bRefCount) {
        pUnkSink->Release();
    }
    return bSuccess;
}
