// Placing host objects at the imported points whose codes have object files.
#include <string>
#include <unordered_map>
#include <vector>

#include "core/HostArrays.h"
#include "core/KalmoretImpl.h"

namespace {

// Mode and level the host gives objects placed on the terrain.
constexpr LONG kPlacedObjectMode = 49;
constexpr LONG kCurrentLevel = -1;
constexpr LONG kLoadAsTemplate = 1;

// The points of one object ID, in point order; IDs in the order of their first point, with the
// object file of that first point.
struct CIdGroup {
    const CObjectAssignment* pAssignment;
    std::vector<int> points;
};

// One pass over the points instead of one pass per ID: the same groups, in the same order.
std::vector<CIdGroup> GroupByObjectId(const CSurveyPointSet& points) {
    std::vector<CIdGroup> groups;
    std::unordered_map<std::string, size_t> index;
    for (int i = 0; i < points.GetCount(); ++i) {
        const CObjectAssignment& assignment = points.GetAt(i).m_Assignment;
        const auto [it, added] = index.try_emplace(assignment.m_strObjectId.Str(), groups.size());
        if (added) {
            groups.push_back({&assignment, {}});
        }
        groups[it->second].points.push_back(i);
    }
    return groups;
}

// Identity with the translation (x, y, z) in the fourth row.
void PlaceOne(IOsrikObjectTemplate* pTemplate, float fX, float fY, float fZ) {
    IOsrikObject3D* pObject = nullptr;
    pTemplate->CreateObjectInstance(0, 0, &pObject);
    if (!pObject) {
        return;
    }
    pObject->SetObjectMode(kPlacedObjectMode);
    pObject->SetObjectLevel(kCurrentLevel);
    float fExtentX = 0, fExtentY = 0, fObjectHeight = 0;
    pObject->GetObjectExtents(0, &fExtentX, &fExtentY, &fObjectHeight);
    const float matrix[16] = {1, 0, 0, 0, 0, 1, 0, 0, 0, 0, 1, 0, fX, fY, fZ + 0.5f * fObjectHeight,
                              1};
    VARIANT v;
    if (MakeMatrixVariant(matrix, &v)) {  // without the array the object is skipped
        LONG lResult = 0;
        pObject->SetTransformMatrix(v, &lResult);
        VariantClear(&v);
        lResult = 0;
        pObject->InsertObject(0, &lResult);
    }
    pObject->Release();
}

}  // namespace

void CKalmoretImpl::PlaceObjects(float fDeltaX, float fDeltaY) {
    for (const CIdGroup& group : GroupByObjectId(m_PointSet)) {
        BSTR bstrFile = group.pAssignment->m_strObjectFile.AllocSysString();
        IOsrikObjectTemplate* pTemplate = nullptr;
        m_pHost->LoadObjectFile(bstrFile, kLoadAsTemplate, &pTemplate);
        SysFreeString(bstrFile);
        if (!pTemplate) {
            continue;
        }
        for (int i : group.points) {
            const CSurveyPoint& p = m_PointSet.GetAt(i);
            PlaceOne(pTemplate, p.m_fX + fDeltaX, p.m_fY + fDeltaY, p.m_fZ);
        }
        pTemplate->Release();
    }
}
