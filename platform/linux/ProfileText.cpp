#include "platform/linux/ProfileText.h"

#include <algorithm>

namespace standin {

namespace {

constexpr size_t npos = std::string::npos;

bool IsBlank(char ch) {
    return ch == ' ' || ch == '\t' || ch == '\v';
}

// Lower case of a Windows-1252 letter: ASCII, the Latin-1 letters, and the four pairs in
// 0x80..0x9F.
unsigned char FoldCase(unsigned char ch) {
    if ((ch >= 'A' && ch <= 'Z') || (ch >= 0xC0 && ch <= 0xDE && ch != 0xD7)) {
        return static_cast<unsigned char>(ch + 0x20);
    }
    switch (ch) {
        case 0x8A:
        case 0x8C:
        case 0x8E:
            return static_cast<unsigned char>(ch + 0x10);
        case 0x9F:
            return 0xFF;
        default:
            return ch;
    }
}

}  // namespace

bool ProfileNamesEqual(std::string_view a, std::string_view b) {
    return a.size() == b.size() && std::equal(a.begin(), a.end(), b.begin(), [](char x, char y) {
               return FoldCase(static_cast<unsigned char>(x)) ==
                      FoldCase(static_cast<unsigned char>(y));
           });
}

CProfileText::CProfileText(std::string bytes) : m_bytes(std::move(bytes)) {
    Parse();
}

void CProfileText::Parse() {
    m_lines.clear();
    for (size_t nStart = 0; nStart < m_bytes.size();) {
        m_lines.push_back(ParseLine(nStart));
        nStart = m_lines.back().nNext;
    }
}

CProfileText::CLine CProfileText::ParseLine(size_t nStart) const {
    const size_t nBreak = m_bytes.find_first_of("\r\n", nStart);
    CLine line{nStart, nBreak == npos ? m_bytes.size() : nBreak, 0, ELine::Other, 0, 0, 0, 0};
    line.nNext = line.nEnd;
    if (line.nNext < m_bytes.size()) {
        const bool crlf = m_bytes[line.nNext] == '\r' && line.nNext + 1 < m_bytes.size() &&
                          m_bytes[line.nNext + 1] == '\n';
        line.nNext += crlf ? 2 : 1;
    }
    auto trimmed = [&](size_t nFrom, size_t nTo, size_t& nOutStart, size_t& nOutEnd) {
        while (nFrom < nTo && IsBlank(m_bytes[nFrom])) {
            ++nFrom;
        }
        while (nTo > nFrom && IsBlank(m_bytes[nTo - 1])) {
            --nTo;
        }
        nOutStart = nFrom;
        nOutEnd = nTo;
    };
    size_t nFirst = 0;
    size_t nLast = 0;
    trimmed(line.nStart, line.nEnd, nFirst, nLast);
    if (nFirst == nLast) {
        line.eKind = ELine::Blank;
    } else if (m_bytes[nFirst] == '[') {
        const size_t nClose = m_bytes.find(']', nFirst + 1);
        line.eKind = ELine::Section;
        trimmed(nFirst + 1, std::min(nClose, line.nEnd), line.nNameStart, line.nNameEnd);
    } else if (m_bytes[nFirst] == ';') {
        line.eKind = ELine::Comment;
    } else {
        const size_t nEquals = m_bytes.find('=', nFirst);
        if (nEquals < line.nEnd) {
            line.eKind = ELine::Key;
            trimmed(nFirst, nEquals, line.nNameStart, line.nNameEnd);
            trimmed(nEquals + 1, line.nEnd, line.nValueStart, line.nValueEnd);
        }
    }
    return line;
}

std::string_view CProfileText::Name(const CLine& line) const {
    return std::string_view(m_bytes).substr(line.nNameStart, line.nNameEnd - line.nNameStart);
}

size_t CProfileText::FindSection(std::string_view section) const {
    for (size_t i = 0; i < m_lines.size(); ++i) {
        if (m_lines[i].eKind == ELine::Section && ProfileNamesEqual(Name(m_lines[i]), section)) {
            return i;
        }
    }
    return npos;
}

size_t CProfileText::SectionEnd(size_t nHeader) const {
    size_t i = nHeader + 1;
    while (i < m_lines.size() && m_lines[i].eKind != ELine::Section) {
        ++i;
    }
    return i;
}

size_t CProfileText::FindKey(size_t nHeader, std::string_view key) const {
    const size_t nEnd = SectionEnd(nHeader);
    for (size_t i = nHeader + 1; i < nEnd; ++i) {
        if (m_lines[i].eKind == ELine::Key && ProfileNamesEqual(Name(m_lines[i]), key)) {
            return i;
        }
    }
    return npos;
}

std::optional<std::string_view> CProfileText::FindValue(std::string_view section,
                                                        std::string_view key) const {
    const size_t nHeader = FindSection(section);
    const size_t nKey = nHeader == npos ? npos : FindKey(nHeader, key);
    if (nKey == npos) {
        return std::nullopt;
    }
    const CLine& line = m_lines[nKey];
    std::string_view value =
        std::string_view(m_bytes).substr(line.nValueStart, line.nValueEnd - line.nValueStart);
    if (value.size() >= 2 && value.front() == value.back() &&
        (value.front() == '"' || value.front() == '\'')) {
        value = value.substr(1, value.size() - 2);
    }
    return value;
}

std::vector<std::string_view> CProfileText::SectionNames() const {
    std::vector<std::string_view> names;
    for (const CLine& line : m_lines) {
        if (line.eKind == ELine::Section) {
            names.push_back(Name(line));
        }
    }
    return names;
}

std::vector<std::string_view> CProfileText::KeyNames(std::string_view section) const {
    std::vector<std::string_view> names;
    const size_t nHeader = FindSection(section);
    if (nHeader != npos) {
        for (size_t i = nHeader + 1, nEnd = SectionEnd(nHeader); i < nEnd; ++i) {
            if (m_lines[i].eKind == ELine::Key) {
                names.push_back(Name(m_lines[i]));
            }
        }
    }
    return names;
}

bool CProfileText::SetValue(std::string_view section, std::string_view key,
                            std::string_view value) {
    const std::string entry = std::string(key) + "=" + std::string(value) + "\r\n";
    const size_t nHeader = FindSection(section);
    if (nHeader == npos) {
        const bool open = !m_bytes.empty() && m_bytes.back() != '\n' && m_bytes.back() != '\r';
        Splice(m_bytes.size(), m_bytes.size(),
               (open ? "\r\n[" : "[") + std::string(section) + "]\r\n" + entry);
        return true;
    }
    if (const size_t nKey = FindKey(nHeader, key); nKey != npos) {
        const CLine& line = m_lines[nKey];
        if (line.nValueEnd == line.nEnd &&
            std::string_view(m_bytes).substr(line.nValueStart, line.nEnd - line.nValueStart) ==
                value) {
            return false;
        }
        Splice(line.nValueStart, line.nEnd, value);
        return true;
    }
    // A new key follows the section's last key; one that starts with ';' (a comment once written)
    // goes after the section's last line that is not blank.
    const bool comment = !key.empty() && key.front() == ';';
    size_t nAfter = nHeader;
    for (size_t i = nHeader + 1, nEnd = SectionEnd(nHeader); i < nEnd; ++i) {
        if (m_lines[i].eKind == ELine::Key || (comment && m_lines[i].eKind != ELine::Blank)) {
            nAfter = i;
        }
    }
    const CLine& after = m_lines[nAfter];
    Splice(after.nNext, after.nNext, (after.nNext == after.nEnd ? "\r\n" : "") + entry);
    return true;
}

bool CProfileText::DeleteKey(std::string_view section, std::string_view key) {
    const size_t nHeader = FindSection(section);
    const size_t nKey = nHeader == npos ? npos : FindKey(nHeader, key);
    if (nKey == npos) {
        return false;
    }
    Splice(m_lines[nKey].nStart, m_lines[nKey].nNext, {});
    return true;
}

bool CProfileText::DeleteSection(std::string_view section) {
    const size_t nHeader = FindSection(section);
    if (nHeader == npos) {
        return false;
    }
    const size_t nEnd = SectionEnd(nHeader);
    std::string kept;
    kept.reserve(m_bytes.size());
    for (size_t i = 0; i < m_lines.size(); ++i) {
        const CLine& line = m_lines[i];
        const bool keep =
            i < nHeader || i >= nEnd || line.eKind == ELine::Comment || line.eKind == ELine::Blank;
        if (keep) {
            kept.append(m_bytes, line.nStart, line.nNext - line.nStart);
        }
    }
    m_bytes = std::move(kept);
    Parse();
    return true;
}

void CProfileText::Splice(size_t nStart, size_t nEnd, std::string_view text) {
    m_bytes.replace(nStart, nEnd - nStart, text);
    Parse();
}

}  // namespace standin
