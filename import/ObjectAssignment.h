// CObjectAssignment: one point code and the host object file assigned to it.
#pragma once

#include "framework/String.h"

// A plain value: the entry of a point's code, of the assignment table and of the object cache.
// A new entry has both strings empty. Copying allocates only for strings too long to be held
// inline; nothing throws except std::bad_alloc.
//
// Deliberately not polymorphic: every survey point embeds one, and nothing derives from it, so a
// vtable pointer would only add to the memory of every point.
class CObjectAssignment {
public:
    // The object ID: the point code read from the surveyor file; empty when the line had none.
    CString m_strObjectId;
    // Full path of the host object file assigned to the ID; empty means no assignment.
    CString m_strObjectFile;
};
