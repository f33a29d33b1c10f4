// BSTR, VARIANT and SAFEARRAY of the stand-in, with the behaviour of the Windows functions.
#include <cstdlib>
#include <cstring>
#include <limits>
#include <new>

#include "platform/Win32.h"

namespace {

// A BSTR points just past a 32-bit byte count and is followed by a zero unit.
uint32_t* Header(BSTR bstr) {
    return reinterpret_cast<uint32_t*>(bstr) - 1;
}

size_t ElementSize(VARTYPE vt) {
    switch (vt) {
        case VT_I1:
        case VT_UI1:
            return 1;
        case VT_I2:
        case VT_UI2:
        case VT_BOOL:
            return 2;
        case VT_I4:
        case VT_UI4:
        case VT_R4:
        case VT_INT:
        case VT_UINT:
        case VT_ERROR:
            return 4;
        case VT_R8:
            return 8;
        case VT_BSTR:
        case VT_DISPATCH:
        case VT_UNKNOWN:
            return sizeof(void*);
        case VT_VARIANT:
            return sizeof(VARIANT);
        default:
            return 0;
    }
}

// Features flag bits of the SAFEARRAY header, used to remember the element type.
constexpr USHORT FADF_HAVEVARTYPE = 0x0080;

// The element type is kept in the four bytes before the header, as Windows does; the header itself
// starts 16 bytes into its block to keep its pointer aligned.
constexpr size_t kHeaderOffset = 16;
VARTYPE* StoredVartype(SAFEARRAY* psa) {
    return reinterpret_cast<VARTYPE*>(reinterpret_cast<char*>(psa) - 4);
}

void ClearElements(SAFEARRAY* psa, VARTYPE vt, size_t count) {
    if (vt == VT_BSTR) {
        for (size_t i = 0; i < count; ++i) {
            SysFreeString(static_cast<BSTR*>(psa->pvData)[i]);
        }
    } else if (vt == VT_DISPATCH || vt == VT_UNKNOWN) {
        for (size_t i = 0; i < count; ++i) {
            if (IUnknown* p = static_cast<IUnknown**>(psa->pvData)[i]) {
                p->Release();
            }
        }
    } else if (vt == VT_VARIANT) {
        for (size_t i = 0; i < count; ++i) {
            VariantClear(&static_cast<VARIANT*>(psa->pvData)[i]);
        }
    }
}

size_t ElementCount(const SAFEARRAY* psa) {
    size_t count = 1;
    for (USHORT d = 0; d < psa->cDims; ++d) {
        count *= psa->rgsabound[d].cElements;
    }
    return count;
}

}  // namespace

extern "C" {

BSTR SysAllocStringLen(const OLECHAR* pch, UINT cch) {
    if (cch > (std::numeric_limits<uint32_t>::max() - 8) / sizeof(OLECHAR)) {
        return nullptr;
    }
    auto* block =
        static_cast<uint32_t*>(std::malloc(sizeof(uint32_t) + (cch + 1) * sizeof(OLECHAR)));
    if (!block) {
        return nullptr;
    }
    block[0] = uint32_t(cch * sizeof(OLECHAR));
    BSTR bstr = reinterpret_cast<BSTR>(block + 1);
    if (pch) {
        std::memcpy(bstr, pch, cch * sizeof(OLECHAR));
    } else {
        std::memset(bstr, 0, cch * sizeof(OLECHAR));
    }
    bstr[cch] = 0;
    return bstr;
}

BSTR SysAllocString(const OLECHAR* psz) {
    if (!psz) {
        return nullptr;
    }
    UINT length = 0;
    while (psz[length] != 0) {
        ++length;
    }
    return SysAllocStringLen(psz, length);
}

void SysFreeString(BSTR bstr) {
    if (bstr) {
        std::free(Header(bstr));
    }
}

UINT SysStringLen(BSTR bstr) {
    return bstr ? UINT(*Header(bstr) / sizeof(OLECHAR)) : 0;
}

void VariantInit(VARIANT* pvarg) {
    pvarg->vt = VT_EMPTY;
    pvarg->wReserved1 = pvarg->wReserved2 = pvarg->wReserved3 = 0;
}

HRESULT VariantClear(VARIANT* pvarg) {
    if (!pvarg) {
        return E_INVALIDARG;
    }
    if (pvarg->vt & VT_BYREF) {
        VariantInit(pvarg);  // references are not owned
        return S_OK;
    }
    if (pvarg->vt & VT_ARRAY) {
        if (pvarg->parray) {
            const HRESULT hr = SafeArrayDestroy(pvarg->parray);
            if (FAILED(hr)) {
                return hr;
            }
        }
    } else if (pvarg->vt == VT_BSTR) {
        SysFreeString(pvarg->bstrVal);
    } else if ((pvarg->vt == VT_DISPATCH || pvarg->vt == VT_UNKNOWN) && pvarg->punkVal) {
        pvarg->punkVal->Release();
    }
    VariantInit(pvarg);
    return S_OK;
}

SAFEARRAY* SafeArrayCreate(VARTYPE vt, UINT cDims, SAFEARRAYBOUND* rgsabound) {
    const size_t elementSize = ElementSize(vt);
    if (cDims == 0 || cDims > 64 || !rgsabound || elementSize == 0) {
        return nullptr;
    }
    size_t count = 1;
    for (UINT d = 0; d < cDims; ++d) {
        const size_t n = rgsabound[d].cElements;
        if (n != 0 && count > std::numeric_limits<uint32_t>::max() / n) {
            return nullptr;
        }
        count *= n;
    }
    const size_t headerSize =
        kHeaderOffset + sizeof(SAFEARRAY) + (cDims - 1) * sizeof(SAFEARRAYBOUND);
    char* block = static_cast<char*>(std::calloc(1, headerSize));
    if (!block) {
        return nullptr;
    }
    auto* psa = reinterpret_cast<SAFEARRAY*>(block + kHeaderOffset);
    psa->cDims = USHORT(cDims);
    psa->fFeatures = FADF_HAVEVARTYPE;
    psa->cbElements = ULONG(elementSize);
    *StoredVartype(psa) = vt;
    // Windows stores the bounds with the last dimension first.
    for (UINT d = 0; d < cDims; ++d) {
        psa->rgsabound[d] = rgsabound[cDims - 1 - d];
    }
    psa->pvData = std::calloc(count ? count : 1, elementSize);
    if (!psa->pvData) {
        std::free(block);
        return nullptr;
    }
    return psa;
}

HRESULT SafeArrayDestroy(SAFEARRAY* psa) {
    if (!psa) {
        return S_OK;
    }
    if (psa->cLocks > 0) {
        return DISP_E_ARRAYISLOCKED;
    }
    ClearElements(psa, *StoredVartype(psa), ElementCount(psa));
    std::free(psa->pvData);
    std::free(reinterpret_cast<char*>(psa) - kHeaderOffset);
    return S_OK;
}

HRESULT SafeArrayAccessData(SAFEARRAY* psa, void** ppvData) {
    if (!psa || !ppvData) {
        return E_INVALIDARG;
    }
    ++psa->cLocks;
    *ppvData = psa->pvData;
    return S_OK;
}

HRESULT SafeArrayUnaccessData(SAFEARRAY* psa) {
    if (!psa) {
        return E_INVALIDARG;
    }
    if (psa->cLocks == 0) {
        return E_UNEXPECTED;
    }
    --psa->cLocks;
    return S_OK;
}

UINT SafeArrayGetDim(SAFEARRAY* psa) {
    return psa ? psa->cDims : 0;
}

UINT SafeArrayGetElemsize(SAFEARRAY* psa) {
    return psa ? psa->cbElements : 0;
}

HRESULT SafeArrayGetLBound(SAFEARRAY* psa, UINT nDim, LONG* plLbound) {
    if (!psa || !plLbound) {
        return E_INVALIDARG;
    }
    if (nDim < 1 || nDim > psa->cDims) {
        return HRESULT(0x8002000B);  // DISP_E_BADINDEX
    }
    *plLbound = psa->rgsabound[psa->cDims - nDim].lLbound;
    return S_OK;
}

HRESULT SafeArrayGetUBound(SAFEARRAY* psa, UINT nDim, LONG* plUbound) {
    LONG lower = 0;
    const HRESULT hr = SafeArrayGetLBound(psa, nDim, &lower);
    if (SUCCEEDED(hr)) {
        *plUbound = LONG(int64_t(lower) + psa->rgsabound[psa->cDims - nDim].cElements - 1);
    }
    return hr;
}

HRESULT SafeArrayGetVartype(SAFEARRAY* psa, VARTYPE* pvt) {
    if (!psa || !pvt) {
        return E_INVALIDARG;
    }
    *pvt = *StoredVartype(psa);
    return S_OK;
}

}  // extern "C"
