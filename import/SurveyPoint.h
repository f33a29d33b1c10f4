// CSurveyPoint: one surveyed point, and the parsing of one piece of a surveyor file.
#pragma once

#include <string_view>

#include "framework/String.h"
#include "import/ObjectAssignment.h"

// A plain value; a new point has an empty name, x = y = z = 0 and an empty assignment.
// Not polymorphic: points are held by the hundred thousand in one array, and nothing derives
// from them. 112 bytes here, with no further allocation for names and codes of up to 15 bytes.
class CSurveyPoint {
public:
    // Parses one piece of a surveyor file (at most 254 characters as the reader cuts them; any
    // length works). On success sets name, x, y, z and the code (m_Assignment.m_strObjectId; the
    // object file is not touched) and returns true. A line without a name column is named with
    // nRunningIndex in decimal. On false nothing is changed. Allocates only for long texts.
    bool ParseLine(const CString& strLine, int nRunningIndex);
    bool ParseLine(std::string_view line, int nRunningIndex);
    bool ParseLine(const char* pszLine, int nRunningIndex) {
        return ParseLine(std::string_view(pszLine ? pszLine : ""), nRunningIndex);
    }

    CString m_strName;
    float m_fX = 0.0f;               // plan coordinate X, metres
    float m_fY = 0.0f;               // plan coordinate Y, metres
    float m_fZ = 0.0f;               // height, metres
    CObjectAssignment m_Assignment;  // the point code and its object file
};
