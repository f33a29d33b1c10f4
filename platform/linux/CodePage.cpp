// Windows-1252 and UTF-8 conversion of the stand-in.
#include <string>

#include "platform/Win32.h"

namespace {

// Windows-1252 0x80..0x9F; the five unassigned bytes map to the C1 controls, as Windows does.
constexpr char16_t kHigh1252[32] = {0x20AC, 0x0081, 0x201A, 0x0192, 0x201E, 0x2026, 0x2020, 0x2021,
                                    0x02C6, 0x2030, 0x0160, 0x2039, 0x0152, 0x008D, 0x017D, 0x008F,
                                    0x0090, 0x2018, 0x2019, 0x201C, 0x201D, 0x2022, 0x2013, 0x2014,
                                    0x02DC, 0x2122, 0x0161, 0x203A, 0x0153, 0x009D, 0x017E, 0x0178};

char16_t From1252(unsigned char ch) {
    return (ch >= 0x80 && ch < 0xA0) ? kHigh1252[ch - 0x80] : char16_t(ch);
}

char To1252(char16_t ch) {
    if (ch < 0x80 || (ch >= 0xA0 && ch <= 0xFF)) {
        return char(ch);
    }
    for (int i = 0; i < 32; ++i) {
        if (kHigh1252[i] == ch) {
            return char(0x80 + i);
        }
    }
    return '?';
}

// Decodes one UTF-8 sequence at s[i]; malformed input gives U+FFFD and skips one byte.
char32_t DecodeUtf8(const unsigned char* s, size_t n, size_t& i) {
    const unsigned char lead = s[i++];
    if (lead < 0x80) {
        return lead;
    }
    const int extra = lead >= 0xF0 ? 3 : lead >= 0xE0 ? 2 : lead >= 0xC0 ? 1 : -1;
    if (extra < 0 || lead > 0xF4 || i + size_t(extra) > n) {
        return 0xFFFD;
    }
    char32_t cp = lead & (0x3F >> extra);
    for (int k = 0; k < extra; ++k) {
        if ((s[i + size_t(k)] & 0xC0) != 0x80) {
            return 0xFFFD;
        }
        cp = (cp << 6) | (s[i + size_t(k)] & 0x3F);
    }
    static constexpr char32_t kMin[] = {0, 0x80, 0x800, 0x10000};
    if (cp < kMin[extra] || cp > 0x10FFFF || (cp >= 0xD800 && cp <= 0xDFFF)) {
        return 0xFFFD;
    }
    i += size_t(extra);
    return cp;
}

std::u16string ToUtf16(UINT codePage, const unsigned char* s, size_t n) {
    std::u16string out;
    for (size_t i = 0; i < n;) {
        if (codePage != CP_UTF8) {
            out += From1252(s[i++]);
            continue;
        }
        const char32_t cp = DecodeUtf8(s, n, i);
        if (cp >= 0x10000) {
            out += char16_t(0xD800 + ((cp - 0x10000) >> 10));
            out += char16_t(0xDC00 + ((cp - 0x10000) & 0x3FF));
        } else {
            out += char16_t(cp);
        }
    }
    return out;
}

void AppendUtf8(std::string& out, char32_t cp) {
    if (cp < 0x80) {
        out += char(cp);
    } else if (cp < 0x800) {
        out += char(0xC0 | (cp >> 6));
        out += char(0x80 | (cp & 0x3F));
    } else if (cp < 0x10000) {
        out += char(0xE0 | (cp >> 12));
        out += char(0x80 | ((cp >> 6) & 0x3F));
        out += char(0x80 | (cp & 0x3F));
    } else {
        out += char(0xF0 | (cp >> 18));
        out += char(0x80 | ((cp >> 12) & 0x3F));
        out += char(0x80 | ((cp >> 6) & 0x3F));
        out += char(0x80 | (cp & 0x3F));
    }
}

std::string FromUtf16(UINT codePage, const char16_t* s, size_t n) {
    std::string out;
    for (size_t i = 0; i < n; ++i) {
        if (codePage != CP_UTF8) {
            out += To1252(s[i]);
            continue;
        }
        char32_t cp = s[i];
        if (cp >= 0xD800 && cp <= 0xDBFF && i + 1 < n && s[i + 1] >= 0xDC00 && s[i + 1] <= 0xDFFF) {
            cp = 0x10000 + ((cp - 0xD800) << 10) + (s[++i] - 0xDC00);
        } else if (cp >= 0xD800 && cp <= 0xDFFF) {
            cp = 0xFFFD;
        }
        AppendUtf8(out, cp);
    }
    return out;
}

// Copies a converted string out with the Windows size rules.
template <typename Char, typename String>
int CopyOut(const String& converted, Char* out, int capacity) {
    const int needed = int(converted.size());
    if (capacity == 0) {
        return needed;
    }
    if (!out || capacity < needed) {
        return 0;  // ERROR_INSUFFICIENT_BUFFER
    }
    std::copy(converted.begin(), converted.end(), out);
    return needed;
}

bool Supported(UINT codePage) {
    return codePage == CP_ACP || codePage == 1252 || codePage == CP_UTF8;
}

}  // namespace

extern "C" {

UINT GetACP() {
    return 1252;
}

int MultiByteToWideChar(UINT CodePage, DWORD, LPCSTR lpMultiByteStr, int cbMultiByte,
                        OLECHAR* lpWideCharStr, int cchWideChar) {
    if (!lpMultiByteStr || cbMultiByte == 0 || cbMultiByte < -1 || cchWideChar < 0 ||
        !Supported(CodePage)) {
        return 0;
    }
    const size_t n = cbMultiByte == -1 ? std::char_traits<char>::length(lpMultiByteStr) + 1
                                       : size_t(cbMultiByte);
    const auto* bytes = reinterpret_cast<const unsigned char*>(lpMultiByteStr);
    return CopyOut(ToUtf16(CodePage, bytes, n), lpWideCharStr, cchWideChar);
}

int WideCharToMultiByte(UINT CodePage, DWORD, const OLECHAR* lpWideCharStr, int cchWideChar,
                        LPSTR lpMultiByteStr, int cbMultiByte, LPCSTR, BOOL*) {
    if (!lpWideCharStr || cchWideChar == 0 || cchWideChar < -1 || cbMultiByte < 0 ||
        !Supported(CodePage)) {
        return 0;
    }
    const size_t n = cchWideChar == -1 ? std::char_traits<char16_t>::length(lpWideCharStr) + 1
                                       : size_t(cchWideChar);
    return CopyOut(FromUtf16(CodePage, lpWideCharStr, n), lpMultiByteStr, cbMultiByte);
}

}  // extern "C"
