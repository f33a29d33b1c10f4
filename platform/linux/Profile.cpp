// The stand-in's profile functions: the file is read afresh on every call (reads see changes made
// by others) and rewritten whole by every write that changes it.
#include <cstdint>
#include <cstring>
#include <string>
#include <vector>

#include "platform/Win32.h"
#include "platform/linux/FileSystem.h"
#include "platform/linux/ProfileText.h"

namespace {

using standin::CProfileText;

// Windows ignores spaces, and only spaces, around the section and key arguments.
std::string_view TrimSpaces(const char* psz) {
    std::string_view text(psz);
    while (!text.empty() && text.front() == ' ') {
        text.remove_prefix(1);
    }
    while (!text.empty() && text.back() == ' ') {
        text.remove_suffix(1);
    }
    return text;
}

DWORD CopyText(std::string_view text, LPSTR pBuffer, DWORD nSize) {
    if (!pBuffer || nSize == 0) {
        return 0;
    }
    const size_t n = text.size() < nSize ? text.size() : nSize - 1;
    std::memcpy(pBuffer, text.data(), n);
    pBuffer[n] = '\0';
    if (n < text.size()) {
        SetLastError(ERROR_MORE_DATA);
    }
    return DWORD(n);
}

// Names, each followed by a zero, and one more zero; a list that does not fit ends in two zeros.
DWORD CopyList(const std::vector<std::string_view>& names, LPSTR pBuffer, DWORD nSize) {
    if (!pBuffer || nSize == 0) {
        return 0;
    }
    std::string list;
    for (std::string_view name : names) {
        list.append(name).push_back('\0');
    }
    list.push_back('\0');
    if (list.size() == 1 && nSize >= 2) {
        list.push_back('\0');  // an empty list still reads as a double-zero-terminated one
    }
    if (list.size() <= nSize) {
        std::memcpy(pBuffer, list.data(), list.size());
        return DWORD(names.empty() ? 0 : list.size() - 1);
    }
    SetLastError(ERROR_MORE_DATA);
    if (nSize < 2) {
        pBuffer[0] = '\0';
        return 0;
    }
    std::memcpy(pBuffer, list.data(), nSize - 2);
    pBuffer[nSize - 2] = '\0';
    pBuffer[nSize - 1] = '\0';
    return nSize - 2;
}

// Reads the profile; ERROR_SUCCESS, or the error (a bare file name has no Windows folder here).
DWORD LoadProfile(LPCSTR lpFileName, std::string& path, std::string& bytes) {
    path = standin::ToHostPath(lpFileName);
    if (!standin::HasFolder(path)) {
        return ERROR_FILE_NOT_FOUND;
    }
    return standin::ReadWholeFile(path, bytes);
}

// A leading sign, then decimal digits or digits after 0x, 0o or 0b; wraps modulo 2^32.
UINT ParseProfileInt(const char* p) {
    while (*p && static_cast<unsigned char>(*p) <= ' ') {
        ++p;
    }
    const bool negative = *p == '-';
    p += (*p == '-' || *p == '+') ? 1 : 0;
    uint32_t base = 10;
    if (p[0] == '0' && (p[1] == 'x' || p[1] == 'o' || p[1] == 'b')) {
        base = p[1] == 'x' ? 16 : p[1] == 'o' ? 8 : 2;
        p += 2;
    }
    uint32_t value = 0;
    for (;; ++p) {
        const char ch = *p;
        const uint32_t digit = (ch >= '0' && ch <= '9')   ? uint32_t(ch - '0')
                               : (ch >= 'a' && ch <= 'f') ? uint32_t(ch - 'a' + 10)
                               : (ch >= 'A' && ch <= 'F') ? uint32_t(ch - 'A' + 10)
                                                          : 99;
        if (digit >= base) {
            break;
        }
        value = value * base + digit;
    }
    return negative ? 0u - value : value;
}

}  // namespace

extern "C" {

DWORD GetPrivateProfileStringA(LPCSTR lpAppName, LPCSTR lpKeyName, LPCSTR lpDefault,
                               LPSTR lpReturnedString, DWORD nSize, LPCSTR lpFileName) {
    std::string_view fallback(lpDefault ? lpDefault : "");
    while (!fallback.empty() && fallback.back() == ' ') {
        fallback.remove_suffix(1);
    }
    const bool listing = !lpAppName || !lpKeyName;
    std::string path;
    std::string bytes;
    if (const DWORD dwError = LoadProfile(lpFileName, path, bytes)) {
        SetLastError(dwError);
        return listing ? CopyList({}, lpReturnedString, nSize)
                       : CopyText(fallback, lpReturnedString, nSize);
    }
    const CProfileText text(std::move(bytes));
    if (!lpAppName) {
        return CopyList(text.SectionNames(), lpReturnedString, nSize);
    }
    if (!lpKeyName) {
        return CopyList(text.KeyNames(TrimSpaces(lpAppName)), lpReturnedString, nSize);
    }
    const std::string_view key = TrimSpaces(lpKeyName);
    const auto value = key.empty() ? std::nullopt : text.FindValue(TrimSpaces(lpAppName), key);
    return CopyText(value ? *value : fallback, lpReturnedString, nSize);
}

UINT GetPrivateProfileIntA(LPCSTR lpAppName, LPCSTR lpKeyName, INT nDefault, LPCSTR lpFileName) {
    if (!lpAppName || !lpKeyName) {
        return UINT(nDefault);
    }
    // Only the first 29 characters of the value count, as in the Windows implementation.
    char szValue[30] = "";
    if (GetPrivateProfileStringA(lpAppName, lpKeyName, "", szValue, sizeof szValue, lpFileName) ==
        0) {
        return UINT(nDefault);
    }
    return ParseProfileInt(szValue);
}

BOOL WritePrivateProfileStringA(LPCSTR lpAppName, LPCSTR lpKeyName, LPCSTR lpString,
                                LPCSTR lpFileName) {
    if (!lpAppName) {
        if (lpKeyName || lpString) {
            SetLastError(ERROR_FILE_NOT_FOUND);
        }
        return FALSE;  // all three null only flushes a cache, which the stand-in does not keep
    }
    if (!lpFileName || !*lpFileName) {
        SetLastError(lpFileName ? ERROR_ACCESS_DENIED : ERROR_FILE_NOT_FOUND);
        return FALSE;
    }
    std::string path;
    std::string bytes;
    const DWORD dwRead = LoadProfile(lpFileName, path, bytes);
    const bool missing = dwRead == ERROR_FILE_NOT_FOUND;
    if (dwRead != ERROR_SUCCESS && (!missing || !standin::HasFolder(path))) {
        SetLastError(dwRead);
        return FALSE;
    }
    CProfileText text(std::move(bytes));
    const std::string_view section = TrimSpaces(lpAppName);
    const bool changed = !lpKeyName  ? text.DeleteSection(section)
                         : !lpString ? text.DeleteKey(section, TrimSpaces(lpKeyName))
                                     : text.SetValue(section, TrimSpaces(lpKeyName), lpString);
    if (!changed && !missing) {
        return TRUE;
    }
    // A delete on a missing file leaves an empty file behind, as Windows does.
    if (const DWORD dwWrite = standin::WriteWholeFile(path, text.Bytes())) {
        SetLastError(dwWrite);
        return FALSE;
    }
    return TRUE;
}

}  // extern "C"
