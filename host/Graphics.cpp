#include "host/Graphics.h"

bool ReadFloatArray(const VARIANT& v, size_t nMin, std::vector<float>& values) {
    SAFEARRAY* psa = v.parray;
    if (v.vt != (VT_ARRAY | VT_R4) || !psa || SafeArrayGetDim(psa) != 1 ||
        SafeArrayGetElemsize(psa) != sizeof(float) || psa->rgsabound[0].cElements < nMin) {
        return false;
    }
    void* pData = nullptr;
    if (FAILED(SafeArrayAccessData(psa, &pData))) {
        return false;
    }
    const auto* pf = static_cast<const float*>(pData);
    values.assign(pf, pf + psa->rgsabound[0].cElements);
    SafeArrayUnaccessData(psa);
    return true;
}

HRESULT CPolylineObject::SetPoints(LONG lCount, VARIANT vPoints) {
    std::vector<float> values;
    if (lCount < 0 || !ReadFloatArray(vPoints, 2 * size_t(lCount), values)) {
        TraceCall("SetPoints", lCount, std::string("bad array"));
        TraceResult("E_INVALIDARG");
        return E_INVALIDARG;
    }
    std::vector<CPlanPoint> points;
    points.reserve(size_t(lCount));
    std::string trace = "[";
    for (size_t i = 0; i < size_t(lCount); ++i) {
        points.emplace_back(values[2 * i], values[2 * i + 1]);
        if (State().bTrace) {
            trace += i ? ", [" : "[";
            trace +=
                FormatJsonFloat(values[2 * i]) + ", " + FormatJsonFloat(values[2 * i + 1]) + "]";
        }
    }
    TraceCall("SetPoints", lCount, trace + "]");
    m_properties.Set("points", std::move(points));
    return S_OK;
}

std::vector<CPlanPoint> CPolylineObject::Points() const {
    const CPropertyList::CValue* pValue = m_properties.Find("points");
    return pValue ? std::get<std::vector<CPlanPoint>>(*pValue) : std::vector<CPlanPoint>();
}

bool CPolylineObject::IsClosed() const {
    const CPropertyList::CValue* pValue = m_properties.Find("closed");
    return pValue && std::get<bool>(*pValue);
}
