// The host objects that end up in the project: plots and terrain areas, object templates loaded
// from object files, and the 3D objects made from them.
#pragma once

#include <array>
#include <optional>

#include "host/HostObject.h"
#include "host/ObjectFile.h"

class CSiteObject final : public CDispatchObject<IOsrikSite> {
public:
    CSiteObject(CHostState& state, LONG lKind)
        : CDispatchObject(state, "site", IID_IOsrikSite), m_lKind(lKind) {}

    LONG Kind() const { return m_lKind; }

private:
    LONG m_lKind;
};

class CObjectTemplate final : public CDispatchObject<IOsrikObjectTemplate> {
public:
    CObjectTemplate(CHostState& state, std::string strFile, CObjectFileInfo info)
        : CDispatchObject(state, "template", IID_IOsrikObjectTemplate),
          m_strFile(std::move(strFile)),
          m_info(std::move(info)) {}

    HRESULT STDMETHODCALLTYPE CreateObjectInstance(LONG lA, LONG lB,
                                                   IOsrikObject3D** ppObject) override;

private:
    std::string m_strFile;
    CObjectFileInfo m_info;
};

class CObject3D final : public CDispatchObject<IOsrikObject3D> {
public:
    CObject3D(CHostState& state, std::string strFile, const CObjectFileInfo& info)
        : CDispatchObject(state, "object", IID_IOsrikObject3D), m_info(info) {
        m_record.strFile = std::move(strFile);
    }

    HRESULT STDMETHODCALLTYPE SetObjectMode(LONG lMode) override;
    HRESULT STDMETHODCALLTYPE SetObjectLevel(LONG lLevel) override;
    HRESULT STDMETHODCALLTYPE InsertObject(LONG lFlags, LONG* plResult) override;
    HRESULT STDMETHODCALLTYPE SetTransformMatrix(VARIANT vMatrix, LONG* plResult) override;
    HRESULT STDMETHODCALLTYPE GetObjectExtents(LONG lFlags, FLOAT* pfX, FLOAT* pfY,
                                               FLOAT* pfZ) override;

private:
    CObjectFileInfo m_info;
    CPlacedObject m_record;  // what InsertObject puts into the project
};

// The 16 floats of a VT_ARRAY | VT_R4 VARIANT holding a two-dimensional 4 x 4 array with lower
// bounds 0, in memory order; none for any other VARIANT.
std::optional<std::array<float, 16>> ReadMatrix(const VARIANT& v);
