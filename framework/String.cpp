#include "framework/String.h"

#include "framework/WinApp.h"

#include <algorithm>
#include <cstdio>
#include <cstring>

namespace {

char FoldAscii(char ch) {
    return (ch >= 'A' && ch <= 'Z') ? char(ch - 'A' + 'a') : ch;
}

int Sign(int n) {
    return (n > 0) - (n < 0);
}

}  // namespace

int CString::Compare(const char* psz) const {
    return Sign(std::strcmp(m_str.c_str(), psz));
}

int CString::CompareNoCase(const char* psz) const {
    const unsigned char* a = reinterpret_cast<const unsigned char*>(m_str.c_str());
    const unsigned char* b = reinterpret_cast<const unsigned char*>(psz);
    for (;; ++a, ++b) {
        const unsigned char ca = static_cast<unsigned char>(FoldAscii(char(*a)));
        const unsigned char cb = static_cast<unsigned char>(FoldAscii(char(*b)));
        if (ca != cb || ca == 0) {
            return Sign(int(ca) - int(cb));
        }
    }
}

CString CString::Left(int nCount) const {
    const size_t n = size_t(std::clamp(nCount, 0, GetLength()));
    return CString(std::string_view(m_str).substr(0, n));
}

CString CString::Right(int nCount) const {
    const size_t n = size_t(std::clamp(nCount, 0, GetLength()));
    return CString(std::string_view(m_str).substr(m_str.size() - n));
}

CString CString::Mid(int nFirst, int nCount) const {
    const int first = std::clamp(nFirst, 0, GetLength());
    const int count = std::clamp(nCount, 0, GetLength() - first);
    return CString(std::string_view(m_str).substr(size_t(first), size_t(count)));
}

void CString::Format(const char* pszFormat, ...) {
    va_list args;
    va_start(args, pszFormat);
    FormatV(pszFormat, args);
    va_end(args);
}

void CString::FormatV(const char* pszFormat, va_list args) {
    va_list copy;
    va_copy(copy, args);
    const int n = std::vsnprintf(nullptr, 0, pszFormat, copy);
    va_end(copy);
    if (n < 0) {
        m_str.clear();
        return;
    }
    m_str.assign(size_t(n) + 1, '\0');
    std::vsnprintf(m_str.data(), m_str.size(), pszFormat, args);
    m_str.resize(size_t(n));
}

BSTR CString::AllocSysString() const {
    if (m_str.empty()) {
        return SysAllocStringLen(nullptr, 0);
    }
    const int units = MultiByteToWideChar(CP_ACP, 0, m_str.data(), GetLength(), nullptr, 0);
    BSTR bstr = SysAllocStringLen(nullptr, UINT(units));
    if (bstr) {
        MultiByteToWideChar(CP_ACP, 0, m_str.data(), GetLength(), bstr, units);
    }
    return bstr;
}

CString CString::FromBstr(const OLECHAR* bstr) {
    if (!bstr || !bstr[0]) {
        return CString();
    }
    const int bytes =
        WideCharToMultiByte(CP_ACP, WC_NO_BEST_FIT_CHARS, bstr, -1, nullptr, 0, nullptr, nullptr);
    if (bytes <= 1) {
        return CString();
    }
    std::string text(size_t(bytes), '\0');
    WideCharToMultiByte(CP_ACP, WC_NO_BEST_FIT_CHARS, bstr, -1, text.data(), bytes, nullptr,
                        nullptr);
    text.resize(size_t(bytes - 1));
    return CString(std::string_view(text));
}

BOOL CString::LoadString(UINT nID) {
    char szText[1024] = "";
    const int n = ::LoadStringA(AfxGetResourceHandle(), nID, szText, int(sizeof szText));
    m_str.assign(szText, size_t(n > 0 ? n : 0));
    return n > 0;
}
