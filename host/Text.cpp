#include "host/Text.h"

namespace {

constexpr char32_t kReplacement = 0xFFFD;

void AppendUtf8(std::string& out, char32_t c) {
    if (c < 0x80) {
        out += char(c);
    } else if (c < 0x800) {
        out += char(0xC0 | (c >> 6));
        out += char(0x80 | (c & 0x3F));
    } else if (c < 0x10000) {
        out += char(0xE0 | (c >> 12));
        out += char(0x80 | ((c >> 6) & 0x3F));
        out += char(0x80 | (c & 0x3F));
    } else {
        out += char(0xF0 | (c >> 18));
        out += char(0x80 | ((c >> 12) & 0x3F));
        out += char(0x80 | ((c >> 6) & 0x3F));
        out += char(0x80 | (c & 0x3F));
    }
}

void AppendUtf16(COleString& out, char32_t c) {
    if (c < 0x10000) {
        out += OLECHAR(c);
        return;
    }
    c -= 0x10000;
    out += OLECHAR(0xD800 | (c >> 10));
    out += OLECHAR(0xDC00 | (c & 0x3FF));
}

bool IsHighSurrogate(char32_t c) {
    return c >= 0xD800 && c <= 0xDBFF;
}
bool IsLowSurrogate(char32_t c) {
    return c >= 0xDC00 && c <= 0xDFFF;
}

// Decodes one UTF-8 sequence at text[i], advancing i; rejects overlong forms and surrogates.
char32_t DecodeUtf8(std::string_view text, size_t& i) {
    const auto lead = static_cast<unsigned char>(text[i++]);
    if (lead < 0x80) {
        return lead;
    }
    int nMore = 0;
    char32_t c = 0;
    char32_t cMin = 0;
    if ((lead & 0xE0) == 0xC0) {
        nMore = 1, c = lead & 0x1F, cMin = 0x80;
    } else if ((lead & 0xF0) == 0xE0) {
        nMore = 2, c = lead & 0x0F, cMin = 0x800;
    } else if ((lead & 0xF8) == 0xF0) {
        nMore = 3, c = lead & 0x07, cMin = 0x10000;
    } else {
        return kReplacement;
    }
    for (int k = 0; k < nMore; ++k) {
        if (i >= text.size() || (static_cast<unsigned char>(text[i]) & 0xC0) != 0x80) {
            return kReplacement;  // the unfinished sequence is dropped, the next byte read anew
        }
        c = (c << 6) | (static_cast<unsigned char>(text[i++]) & 0x3F);
    }
    const bool bValid = c >= cMin && c <= 0x10FFFF && !IsHighSurrogate(c) && !IsLowSurrogate(c);
    return bValid ? c : kReplacement;
}

}  // namespace

std::string Utf16ToUtf8(COleStringView text) {
    std::string out;
    out.reserve(text.size());
    for (size_t i = 0; i < text.size(); ++i) {
        char32_t c = text[i];
        if (IsHighSurrogate(c) && i + 1 < text.size() && IsLowSurrogate(text[i + 1])) {
            c = 0x10000 + ((c - 0xD800) << 10) + (char32_t(text[i + 1]) - 0xDC00);
            ++i;
        } else if (IsHighSurrogate(c) || IsLowSurrogate(c)) {
            c = kReplacement;
        }
        AppendUtf8(out, c);
    }
    return out;
}

std::string BstrToUtf8(BSTR bstr) {
    if (!bstr) {
        return std::string();
    }
    return Utf16ToUtf8(COleStringView(bstr, SysStringLen(bstr)));
}

COleString Utf8ToUtf16(std::string_view text) {
    COleString out;
    out.reserve(text.size());
    for (size_t i = 0; i < text.size();) {
        AppendUtf16(out, DecodeUtf8(text, i));
    }
    return out;
}

std::string AnsiToUtf8(const char* pszText) {
    if (!pszText || !*pszText) {
        return std::string();
    }
    const int nUnits = MultiByteToWideChar(CP_ACP, 0, pszText, -1, nullptr, 0);
    if (nUnits <= 0) {
        return std::string();
    }
    COleString wide(size_t(nUnits), OLECHAR(0));
    MultiByteToWideChar(CP_ACP, 0, pszText, -1, wide.data(), nUnits);
    wide.resize(size_t(nUnits - 1));  // without the terminating zero
    return Utf16ToUtf8(wide);
}

std::string Utf8ToAnsi(std::string_view text) {
    const COleString wide = Utf8ToUtf16(text);
    if (wide.empty()) {
        return std::string();
    }
    const int nUnits = int(wide.size());
    const int nBytes = WideCharToMultiByte(CP_ACP, WC_NO_BEST_FIT_CHARS, wide.data(), nUnits,
                                           nullptr, 0, nullptr, nullptr);
    if (nBytes <= 0) {
        return std::string();
    }
    std::string out(size_t(nBytes), '\0');
    WideCharToMultiByte(CP_ACP, WC_NO_BEST_FIT_CHARS, wide.data(), nUnits, out.data(), nBytes,
                        nullptr, nullptr);
    return out;
}
