// CString: the framework's 8-bit text type (ANSI code page bytes, no conversion).
//
// A small value type over std::string with the part of the classic framework's interface that the
// plug-in uses. Indexes and lengths are int as there; out-of-range arguments are clamped rather
// than undefined. Copying allocates; nothing here throws except std::bad_alloc.
#pragma once

#include <cstdarg>
#include <string>
#include <string_view>

#include "platform/Win32.h"

class CString {
public:
    CString() = default;
    CString(const char* psz) : m_str(psz ? psz : "") {}  // NOLINT: implicit like the original
    CString(const char* pch, int nLength) : m_str(pch, nLength > 0 ? size_t(nLength) : 0) {}
    CString(std::string_view sv) : m_str(sv) {}  // NOLINT

    int GetLength() const { return int(m_str.size()); }
    bool IsEmpty() const { return m_str.empty(); }
    void Empty() { m_str.clear(); }
    char GetAt(int nIndex) const { return m_str.at(size_t(nIndex)); }

    operator const char*() const { return m_str.c_str(); }  // NOLINT: LPCTSTR conversion
    const std::string& Str() const { return m_str; }

    CString& operator=(const char* psz) {
        m_str = psz ? psz : "";
        return *this;
    }
    // Replaces the text with these bytes; reuses the storage when it is large enough.
    CString& operator=(std::string_view sv) {
        m_str.assign(sv.data(), sv.size());
        return *this;
    }
    CString& operator+=(const CString& s) {
        m_str += s.m_str;
        return *this;
    }
    CString& operator+=(char ch) {
        m_str += ch;
        return *this;
    }
    friend CString operator+(CString a, const CString& b) { return a += b; }
    friend bool operator==(const CString& a, const CString& b) { return a.m_str == b.m_str; }
    friend bool operator==(const CString& a, const char* b) { return a.m_str == (b ? b : ""); }

    // Byte-wise comparison (<0, 0, >0); CompareNoCase folds ASCII letters only, like the C locale.
    int Compare(const char* psz) const;
    int CompareNoCase(const char* psz) const;

    CString Left(int nCount) const;
    CString Right(int nCount) const;
    CString Mid(int nFirst, int nCount) const;

    // Loads string nID of the module's string table (framework resource handle); FALSE and empty
    // when there is none.
    BOOL LoadString(UINT nID);

    // The text as a new automation string (ANSI code page to UTF-16); the caller frees it with
    // SysFreeString. Null when out of memory.
    BSTR AllocSysString() const;
    // The automation string in the ANSI code page; characters it lacks become '?'.
    static CString FromBstr(const OLECHAR* bstr);

    // printf-style formatting into this string; a formatting error leaves it empty.
    void Format(const char* pszFormat, ...) __attribute__((format(printf, 2, 3)));
    void FormatV(const char* pszFormat, va_list args);

private:
    std::string m_str;
};
