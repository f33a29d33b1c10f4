// CSurveyPointSet: the points of one surveyor file with their range, selection, scale and shift.
#pragma once

#include <cstdint>
#include <vector>

#include "framework/String.h"
#include "import/SurveyPoint.h"

// The points in file order, the file they came from, the creation mode (0 height points only,
// 1 also an enclosing plot, 2 also an enclosing terrain area) and the range: a minimum and a
// maximum corner, per axis, with empty names and assignments; (0, 0, 0) for an empty set.
// Reading, assignment, CopyRange, Scale and Shift recompute the range themselves; after changing
// points through Add, RemoveAll or GetAt, call UpdateRange. Operations that copy points may throw
// std::bad_alloc; ReadFile does not.
class CSurveyPointSet {
public:
    CSurveyPointSet() = default;
    // Copies file name, creation mode and points, then recomputes the range.
    CSurveyPointSet(const CSurveyPointSet& source);
    CSurveyPointSet& operator=(const CSurveyPointSet& source);
    CSurveyPointSet(CSurveyPointSet&&) noexcept = default;
    CSurveyPointSet& operator=(CSurveyPointSet&&) noexcept = default;
    virtual ~CSurveyPointSet() = default;

    // Replaces the contents with the point lines of the surveyor file at strPath (creation mode
    // 0, file name strPath as given). False, with the set left empty and unnamed, when the file
    // cannot be opened or read, or its points do not fit in memory. True otherwise, also when no
    // line is a point line; a read error midway keeps the points read so far.
    bool ReadFile(const CString& strPath);

    // Makes this set a copy of source limited to the positions nFrom..nTo; a bound past the end
    // ends at the last point, nFrom > nTo keeps none, and a negative bound keeps all points.
    void CopyRange(const CSurveyPointSet& source, int nFrom, int nTo);

    // Scales every point about the minimum corner (factor 1 keeps an axis, 0 flattens it onto
    // its minimum, a negative factor mirrors it). Computed in double, stored as float.
    void Scale(float fScaleX, float fScaleY, float fScaleZ);
    // Adds the offsets (metres) to every point.
    void Shift(float fDeltaX, float fDeltaY, float fDeltaZ);
    // Maximum minus minimum corner per axis (metres), from the stored range.
    void GetExtent(float& fDeltaX, float& fDeltaY, float& fDeltaZ) const;
    // Recomputes both corners from the points.
    void UpdateRange();

    int GetCount() const { return int(m_points.size()); }
    // The point at nIndex, which must be in 0..GetCount()-1.
    const CSurveyPoint& GetAt(int nIndex) const { return m_points[size_t(nIndex)]; }
    CSurveyPoint& GetAt(int nIndex) { return m_points[size_t(nIndex)]; }
    void Add(const CSurveyPoint& point) { m_points.push_back(point); }
    void RemoveAll() { m_points.clear(); }

    const CString& GetFileName() const { return m_strFileName; }
    int GetCreationMode() const { return m_nCreationMode; }
    void SetCreationMode(int nMode) { m_nCreationMode = nMode; }
    const CSurveyPoint& GetMinimum() const { return m_Min; }
    const CSurveyPoint& GetMaximum() const { return m_Max; }

private:
    void Reset();
    bool ReadPoints(const CString& strFile);
    void ReserveByDensity(uint64_t nBytesSeen, uint64_t nFileBytes);

    std::vector<CSurveyPoint> m_points;  // contiguous, by value, in file order
    CString m_strFileName;
    int m_nCreationMode = 0;
    CSurveyPoint m_Min;
    CSurveyPoint m_Max;
};
