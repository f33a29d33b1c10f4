#include "objects/AssignmentTable.h"

#include <algorithm>
#include <cstring>
#include <string>
#include <unordered_set>

#include "import/SurveyPointSet.h"

namespace {

CObjectAssignmentArray::const_iterator FindId(const CObjectAssignmentArray& table,
                                              const CString& strId) {
    return std::find_if(table.begin(), table.end(), [&](const CObjectAssignment& entry) {
        return IsSameObjectId(entry.m_strObjectId, strId);
    });
}

}  // namespace

bool IsSameObjectId(const CString& strA, const CString& strB) {
    return std::strcmp(strA, strB) == 0;
}

void BuildAssignmentTable(const CSurveyPointSet& points, CObjectAssignmentArray& table) {
    // A set of the IDs beside the table gives the same table as a search per point, without the
    // quadratic time that a file whose every point has a code of its own would cost.
    std::unordered_set<std::string> ids;
    for (const CObjectAssignment& entry : table) {
        ids.emplace(static_cast<const char*>(entry.m_strObjectId));
    }
    for (int i = 0; i < points.GetCount(); ++i) {
        const CObjectAssignment& assignment = points.GetAt(i).m_Assignment;
        if (ids.emplace(static_cast<const char*>(assignment.m_strObjectId)).second) {
            table.push_back(assignment);
        }
    }
}

bool HasObjectId(const CObjectAssignmentArray& table, const CString& strId) {
    return FindId(table, strId) != table.end();
}

bool FindAssignment(const CObjectAssignmentArray& table, const CString& strId, CString& strFile) {
    const auto it = FindId(table, strId);
    if (it == table.end()) {
        return false;
    }
    strFile = it->m_strObjectFile;
    return true;
}
