#include "import/SurveyPointSet.h"

#include <algorithm>
#include <cmath>
#include <limits>

namespace {

// Scaled coordinates go back to float by IEEE rounding, infinity beyond the float range. Written
// out because C++ leaves the cast of an out-of-range double undefined.
float StoreFloat(double d) {
    constexpr double kMax = std::numeric_limits<float>::max();
    constexpr double kRoundsToInfinity = 0x1.ffffffp127;  // halfway between FLT_MAX and 2^128
    if (std::fabs(d) >= kRoundsToInfinity) {
        return std::copysign(std::numeric_limits<float>::infinity(), float(d > 0 ? 1 : -1));
    }
    if (std::fabs(d) > kMax) {
        return float(std::copysign(kMax, d));
    }
    return float(d);
}

}  // namespace

CSurveyPointSet::CSurveyPointSet(const CSurveyPointSet& source)
    : m_points(source.m_points),
      m_strFileName(source.m_strFileName),
      m_nCreationMode(source.m_nCreationMode) {
    UpdateRange();
}

CSurveyPointSet& CSurveyPointSet::operator=(const CSurveyPointSet& source) {
    if (this != &source) {
        m_points = source.m_points;
        m_strFileName = source.m_strFileName;
        m_nCreationMode = source.m_nCreationMode;
    }
    UpdateRange();
    return *this;
}

void CSurveyPointSet::CopyRange(const CSurveyPointSet& source, int nFrom, int nTo) {
    if (nFrom < 0 || nTo < 0) {
        *this = source;
        return;
    }
    if (&source == this) {
        const CSurveyPointSet copy(source);
        CopyRange(copy, nFrom, nTo);
        return;
    }
    m_strFileName = source.m_strFileName;
    m_nCreationMode = source.m_nCreationMode;
    m_points.clear();
    const int nLast = std::min(nTo, source.GetCount() - 1);
    if (nFrom <= nLast) {
        m_points.assign(source.m_points.begin() + nFrom, source.m_points.begin() + nLast + 1);
    }
    UpdateRange();
}

void CSurveyPointSet::Scale(float fScaleX, float fScaleY, float fScaleZ) {
    const double dMinX = m_Min.m_fX;
    const double dMinY = m_Min.m_fY;
    const double dMinZ = m_Min.m_fZ;
    for (CSurveyPoint& p : m_points) {
        p.m_fX = StoreFloat((p.m_fX - dMinX) * fScaleX + dMinX);
        p.m_fY = StoreFloat((p.m_fY - dMinY) * fScaleY + dMinY);
        p.m_fZ = StoreFloat((p.m_fZ - dMinZ) * fScaleZ + dMinZ);
    }
    UpdateRange();
}

void CSurveyPointSet::Shift(float fDeltaX, float fDeltaY, float fDeltaZ) {
    for (CSurveyPoint& p : m_points) {
        p.m_fX += fDeltaX;
        p.m_fY += fDeltaY;
        p.m_fZ += fDeltaZ;
    }
    UpdateRange();
}

void CSurveyPointSet::GetExtent(float& fDeltaX, float& fDeltaY, float& fDeltaZ) const {
    fDeltaX = m_Max.m_fX - m_Min.m_fX;
    fDeltaY = m_Max.m_fY - m_Min.m_fY;
    fDeltaZ = m_Max.m_fZ - m_Min.m_fZ;
}

void CSurveyPointSet::UpdateRange() {
    m_Min = CSurveyPoint();
    m_Max = CSurveyPoint();
    if (m_points.empty()) {
        return;
    }
    // Start beyond every float, not at +-1e30, so that coordinates up to the float limit count.
    constexpr float kInf = std::numeric_limits<float>::infinity();
    float fMin[3] = {kInf, kInf, kInf};
    float fMax[3] = {-kInf, -kInf, -kInf};
    for (const CSurveyPoint& p : m_points) {
        const float v[3] = {p.m_fX, p.m_fY, p.m_fZ};
        for (int a = 0; a < 3; ++a) {
            // <= and >= so that of equal values (0 and -0) the last one counts.
            if (v[a] <= fMin[a]) {
                fMin[a] = v[a];
            }
            if (v[a] >= fMax[a]) {
                fMax[a] = v[a];
            }
        }
    }
    for (int a = 0; a < 3; ++a) {
        if (fMin[a] > fMax[a]) {  // only NaN on this axis: no range, as for an empty set
            fMin[a] = fMax[a] = 0.0f;
        }
    }
    m_Min.m_fX = fMin[0];
    m_Min.m_fY = fMin[1];
    m_Min.m_fZ = fMin[2];
    m_Max.m_fX = fMax[0];
    m_Max.m_fY = fMax[1];
    m_Max.m_fZ = fMax[2];
}
