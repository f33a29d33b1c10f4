#include "RecordingObject.h"

#include <gtest/gtest.h>

#include <cstdio>

#include "RecordingHost.h"

namespace {

std::string Number(double value) {
    char text[32];
    std::snprintf(text, sizeof text, "%.9g", value);
    return text;
}

}  // namespace

HRESULT CRecordingObject::QueryInterface(REFIID, void** ppv) {
    *ppv = nullptr;
    return E_NOINTERFACE;  // the plug-in never asks its host objects for other interfaces
}

ULONG CRecordingObject::Release() {
    if (m_nRefs == 0) {
        ADD_FAILURE_AT(__FILE__, __LINE__) << m_name << " released once too often";
        return 0;
    }
    return --m_nRefs;
}

HRESULT CRecordingObject::Record(const std::string& method) {
    m_host.Record(m_name + "." + method);
    return S_OK;
}

HRESULT CRecordingObject::Record(const std::string& method, double value) {
    return Record(method + " " + Number(value));
}

std::string CRecordingObject::Floats(const VARIANT& v) {
    if (v.vt != (VT_ARRAY | VT_R4) || !v.parray) {
        return "(no array)";
    }
    size_t count = 1;
    for (USHORT d = 0; d < v.parray->cDims; ++d) {
        count *= v.parray->rgsabound[d].cElements;
    }
    std::string text;
    const auto* values = static_cast<const float*>(v.parray->pvData);
    for (size_t i = 0; i < count; ++i) {
        text += (i ? " " : "") + Number(values[i]);
    }
    return text;
}

HRESULT CRecordingObject::GetOverlay(IOsrikOverlay** ppOverlay) {
    Record("GetOverlay");
    *ppOverlay = m_host.NewObject("overlay");
    return S_OK;
}

HRESULT CRecordingObject::AddToOverlay(IOsrikGraphic2D* pObject, LONG*) {
    return Record("AddToOverlay " + m_host.NameOf(pObject));
}

HRESULT CRecordingObject::SetPoints(LONG lCount, VARIANT vPoints) {
    return Record("SetPoints " + std::to_string(lCount) + " [" + Floats(vPoints) + "]");
}

HRESULT CRecordingObject::CreateObjectInstance(LONG, LONG, IOsrikObject3D** pp) {
    Record("CreateObjectInstance");
    CRecordingObject* pObject = m_host.NewObject("object");
    pObject->m_fHeight = m_fHeight;
    *pp = pObject;
    return S_OK;
}

HRESULT CRecordingObject::SetTransformMatrix(VARIANT vMatrix, LONG*) {
    const bool square = vMatrix.parray && vMatrix.parray->cDims == 2;
    return Record(std::string("SetTransformMatrix ") + (square ? "4x4 " : "") + "[" +
                  Floats(vMatrix) + "]");
}

HRESULT CRecordingObject::GetObjectExtents(LONG, FLOAT* pfX, FLOAT* pfY, FLOAT* pfZ) {
    Record("GetObjectExtents");
    *pfX = 1.0f;
    *pfY = 1.0f;
    *pfZ = m_fHeight;
    return S_OK;
}
