#include "core/HostPath.h"

#include <cstring>

namespace {

// True when the path's file name is `name`: the match must start the name, so that a host called
// "MyOsrik.exe" does not count as "Osrik.exe" (its data would land in "MyStandard\...").
bool HasFileName(const CString& strPath, const char* pszName) {
    const int nName = int(std::strlen(pszName));
    const int nStart = strPath.GetLength() - nName;
    if (nStart < 0 || strPath.Right(nName).CompareNoCase(pszName) != 0) {
        return false;
    }
    const char chBefore = nStart > 0 ? strPath.GetAt(nStart - 1) : '\\';
    return chBefore == '\\' || chBefore == '/' || chBefore == ':';
}

}  // namespace

bool MakeHostRelativePath(const CString& strExePath, const CString& strRelative, CString& strPath) {
    for (const char* pszHost : {"Osrik.exe", "OsrikPlus.exe"}) {
        if (HasFileName(strExePath, pszHost)) {
            strPath = strExePath.Left(strExePath.GetLength() - int(std::strlen(pszHost)));
            strPath += strRelative;
            return true;
        }
    }
    strPath.Empty();
    return false;
}

bool GetHostRelativePath(UINT nID, CString& strPath) {
    strPath.Empty();
    char szExePath[MAX_PATH] = "";
    const DWORD nLength = GetModuleFileNameA(nullptr, szExePath, MAX_PATH);
    // A path cut to the buffer names some other file; it must not be used.
    if (nLength == 0 || nLength >= MAX_PATH) {
        return false;
    }
    CString strRelative;
    return strRelative.LoadString(nID) && MakeHostRelativePath(szExePath, strRelative, strPath);
}
