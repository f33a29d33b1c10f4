// CObjectCache: the object IDs and object files remembered between runs, mirror of the cache file.
//
// The application object owns the one cache (it derives from CObjectCache, so the methods below are
// its own: pApp->LoadObjectCache()). The cache starts empty, is filled from the file each time the
// assignment dialog opens, and may hold an ID more than once (a file edited by hand); lookups and
// updates use the first entry with an ID. Nothing here is shown to the user.
#pragma once

#include "framework/String.h"
#include "objects/AssignmentTable.h"

class CObjectCache {
public:
    // Empties the cache and reads the cache file below the host's folder into it. A missing or
    // unreadable file, or a host without a cache path, leaves it empty.
    void LoadObjectCache();
    // Writes the cache to the cache file, replacing the file only once the new one is complete.
    // Writes nothing when there is no cache path, or when the last load found the file but could
    // not read it: that file still holds assignments the cache lacks.
    void SaveObjectCache();
    // For each table entry with an object file: sets that file on the first cache entry with the
    // ID, or appends a copy of the entry. Never removes entries or empties their files.
    void MergeObjectCache(const CObjectAssignmentArray& table);
    // Index of the first entry with the ID, or -1.
    int FindCacheIndex(const CString& strId) const;
    // The object file of the first entry with the ID: true and strFile set, else false.
    bool LookupObjectCache(const CString& strId, CString& strFile) const;

    // The load and save above on the given file instead of the one below the host's folder.
    void LoadObjectCacheFile(const CString& strFile);
    void SaveObjectCacheFile(const CString& strFile);

    const CObjectAssignmentArray& GetObjectCache() const { return m_ObjectCache; }

private:
    CObjectAssignmentArray m_ObjectCache;
    bool m_bCacheFileUnread = false;  // the last load found the file but did not read all of it
};
