#include "core/HostArrays.h"

#include <cmath>
#include <cstring>
#include <limits>
#include <new>
#include <vector>

namespace {

// Creates a VT_R4 array with the given bounds and copies `count` floats into it.
SAFEARRAY* MakeFloatArray(SAFEARRAYBOUND* bounds, UINT dims, const float* data, size_t count) {
    SAFEARRAY* psa = SafeArrayCreate(VT_R4, dims, bounds);
    if (!psa) {
        return nullptr;
    }
    void* pData = nullptr;
    if (FAILED(SafeArrayAccessData(psa, &pData))) {
        SafeArrayDestroy(psa);
        return nullptr;
    }
    if (count > 0) {
        std::memcpy(pData, data, count * sizeof(float));
    }
    SafeArrayUnaccessData(psa);
    return psa;
}

void PutArray(SAFEARRAY* psa, VARIANT* out) {
    VariantInit(out);
    if (psa) {
        out->vt = VT_ARRAY | VT_R4;
        out->parray = psa;
    }
}

}  // namespace

void MakeFloatArrayVariant(int n, const float* xy, VARIANT* out) {
    const ULONG count = n > 0 ? ULONG(2 * int64_t(n)) : 0;
    SAFEARRAYBOUND bound = {count, 0};
    PutArray(MakeFloatArray(&bound, 1, xy, count), out);
}

bool MakeMatrixVariant(const float (&matrix)[16], VARIANT* out) {
    SAFEARRAYBOUND bounds[2] = {{4, 0}, {4, 0}};
    PutArray(MakeFloatArray(bounds, 2, matrix, 16), out);
    return out->vt != VT_EMPTY;
}

void SetObjectPoints(IOsrikPolyline* pObject, const CPolyline2D& list) {
    const uint32_t n = list.GetCount();
    if (!pObject || n == 0) {
        return;
    }
    std::vector<float> buffer;
    try {
        buffer.resize(size_t(n) * 2);
    } catch (const std::bad_alloc&) {
        return;
    }
    for (uint32_t i = 0; i < n; ++i) {
        buffer[2 * i] = ToHostFloat(list.GetAt(i).x);
        buffer[2 * i + 1] = ToHostFloat(list.GetAt(i).y);
    }
    VARIANT v;
    MakeFloatArrayVariant(int(n), buffer.data(), &v);
    if (v.vt == VT_EMPTY) {
        return;  // no array, no host calls
    }
    pObject->SetPoints(LONG(n), v);
    VariantClear(&v);
    pObject->SetClosed(list.closed ? VARIANT_TRUE : VARIANT_FALSE);
}

float ToHostFloat(double v) {
    constexpr double kMax = std::numeric_limits<float>::max();
    if (v > kMax) {
        return std::numeric_limits<float>::max();
    }
    if (v < -kMax) {
        return -std::numeric_limits<float>::max();
    }
    return float(v);
}
