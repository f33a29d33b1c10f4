// The assignment table: one entry per distinct object ID (point code) of a point set, in the order
// in which the IDs first occur, each with the object file of the first point that has it.
#pragma once

#include <vector>

#include "framework/String.h"
#include "import/ObjectAssignment.h"

class CSurveyPointSet;

// An ordered, growable array of assignments: the assignment table, and the object cache.
using CObjectAssignmentArray = std::vector<CObjectAssignment>;

// Whether two object IDs are the same: byte for byte, letter case and blanks included, up to the
// first zero (the runtime's multibyte comparison in a single-byte code page). "" is an ID too.
bool IsSameObjectId(const CString& strA, const CString& strB);

// Appends a copy of the embedded assignment of each point whose ID the table does not hold yet, in
// the set's order. The table is not cleared first. Linear in the number of points.
void BuildAssignmentTable(const CSurveyPointSet& points, CObjectAssignmentArray& table);

// True when some entry has the ID.
bool HasObjectId(const CObjectAssignmentArray& table, const CString& strId);

// The object file (possibly empty) of the first entry with the ID: true and strFile set, or false
// with strFile untouched.
bool FindAssignment(const CObjectAssignmentArray& table, const CString& strId, CString& strFile);
