#include "host/ModelObjects.h"

HRESULT CObjectTemplate::CreateObjectInstance(LONG lA, LONG lB, IOsrikObject3D** ppObject) {
    TraceCall("CreateObjectInstance", lA, lB);
    if (!ppObject) {
        return E_POINTER;
    }
    auto* pObject = new CObject3D(State(), m_strFile, m_info);
    pObject->AddRefForCaller();
    *ppObject = pObject;
    TraceResult(pObject->Name());
    return S_OK;
}

HRESULT CObject3D::SetObjectMode(LONG lMode) {
    TraceCall("SetObjectMode", lMode);
    m_record.mode = lMode;
    return S_OK;
}

HRESULT CObject3D::SetObjectLevel(LONG lLevel) {
    TraceCall("SetObjectLevel", lLevel);
    m_record.level = lLevel;
    return S_OK;
}

HRESULT CObject3D::InsertObject(LONG lFlags, LONG* plResult) {
    TraceCall("InsertObject", lFlags);
    CProject& project = State().project;
    m_record.group = project.ActiveGroup();
    project.objects.push_back(m_record);
    if (plResult) {
        *plResult = LONG(project.objects.size());
    }
    return S_OK;
}

HRESULT CObject3D::SetTransformMatrix(VARIANT vMatrix, LONG* plResult) {
    const std::optional<std::array<float, 16>> matrix = ReadMatrix(vMatrix);
    if (!matrix) {
        TraceCall("SetTransformMatrix", std::string("bad array"));
        TraceResult("E_INVALIDARG");
        return E_INVALIDARG;
    }
    if (State().bTrace) {
        std::string text = "[";
        for (size_t i = 0; i < matrix->size(); ++i) {
            text += i ? ", " : "";
            text += FormatJsonFloat((*matrix)[i]);
        }
        TraceCall("SetTransformMatrix", text + "]");
    }
    m_record.matrix = matrix;
    if (plResult) {
        *plResult = 1;
    }
    return S_OK;
}

HRESULT CObject3D::GetObjectExtents(LONG lFlags, FLOAT* pfX, FLOAT* pfY, FLOAT* pfZ) {
    TraceCall("GetObjectExtents", lFlags);
    if (!pfX || !pfY || !pfZ) {
        return E_POINTER;
    }
    *pfX = m_info.fSizeX;
    *pfY = m_info.fSizeY;
    *pfZ = m_info.fSizeZ;
    TraceResult(FormatJsonFloat(*pfX) + ", " + FormatJsonFloat(*pfY) + ", " +
                FormatJsonFloat(*pfZ));
    return S_OK;
}

std::optional<std::array<float, 16>> ReadMatrix(const VARIANT& v) {
    SAFEARRAY* psa = v.parray;
    if (v.vt != (VT_ARRAY | VT_R4) || !psa || SafeArrayGetDim(psa) != 2 ||
        SafeArrayGetElemsize(psa) != sizeof(float)) {
        return std::nullopt;
    }
    for (UINT nDim = 1; nDim <= 2; ++nDim) {
        LONG lLower = -1, lUpper = -1;
        if (FAILED(SafeArrayGetLBound(psa, nDim, &lLower)) ||
            FAILED(SafeArrayGetUBound(psa, nDim, &lUpper)) || lLower != 0 || lUpper != 3) {
            return std::nullopt;
        }
    }
    void* pData = nullptr;
    if (FAILED(SafeArrayAccessData(psa, &pData))) {
        return std::nullopt;
    }
    std::array<float, 16> matrix{};
    const auto* pf = static_cast<const float*>(pData);
    std::copy(pf, pf + 16, matrix.begin());
    SafeArrayUnaccessData(psa);
    return matrix;
}
