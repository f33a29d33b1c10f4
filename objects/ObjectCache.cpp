#include "objects/ObjectCache.h"

#include "core/HostPath.h"
#include "objects/CacheFile.h"
#include "res/resource.h"

void CObjectCache::LoadObjectCache() {
    CString strFile;
    if (GetHostRelativePath(IDS_CACHE_FILE, strFile)) {
        LoadObjectCacheFile(strFile);
    } else {
        m_ObjectCache.clear();
        m_bCacheFileUnread = false;
    }
}

void CObjectCache::SaveObjectCache() {
    CString strFile;
    if (GetHostRelativePath(IDS_CACHE_FILE, strFile)) {
        SaveObjectCacheFile(strFile);
    }
}

void CObjectCache::LoadObjectCacheFile(const CString& strFile) {
    m_ObjectCache.clear();
    m_bCacheFileUnread = ReadObjectCacheFile(strFile, m_ObjectCache) == ECacheRead::Failed;
}

void CObjectCache::SaveObjectCacheFile(const CString& strFile) {
    // Rewriting the file from a cache that missed part of it would lose those assignments.
    if (!m_bCacheFileUnread) {
        WriteObjectCacheFile(strFile, m_ObjectCache);
    }
}

void CObjectCache::MergeObjectCache(const CObjectAssignmentArray& table) {
    for (const CObjectAssignment& entry : table) {
        if (entry.m_strObjectFile.IsEmpty()) {
            continue;
        }
        const int nIndex = FindCacheIndex(entry.m_strObjectId);
        if (nIndex >= 0) {
            m_ObjectCache[size_t(nIndex)].m_strObjectFile = entry.m_strObjectFile;
        } else {
            m_ObjectCache.push_back(entry);
        }
    }
}

int CObjectCache::FindCacheIndex(const CString& strId) const {
    for (size_t i = 0; i < m_ObjectCache.size(); ++i) {
        if (IsSameObjectId(m_ObjectCache[i].m_strObjectId, strId)) {
            return int(i);
        }
    }
    return -1;
}

bool CObjectCache::LookupObjectCache(const CString& strId, CString& strFile) const {
    const int nIndex = FindCacheIndex(strId);
    if (nIndex < 0) {
        return false;
    }
    strFile = m_ObjectCache[size_t(nIndex)].m_strObjectFile;
    return true;
}
