// A profile (INI) file's bytes as the Windows profile functions see them, and the edits they make.
//
// Lines end in CR LF, LF or CR. A line whose first non-blank character is '[' opens a section whose
// name runs to the first ']' (or the line end); ';' starts a comment line; any other line with '='
// is a key line. Blanks (space, tab, vertical tab) around names and values do not count. Names
// compare without regard to case (Windows-1252 letters). Lines before the first section belong to
// none. Edits change only the lines they concern and keep every other byte. Nothing here touches a
// file.
#pragma once

#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace standin {

class CProfileText {
public:
    explicit CProfileText(std::string bytes = {});

    const std::string& Bytes() const { return m_bytes; }

    // The value of the first key `key` in the first section `section`, trimmed, with one pair of
    // matching outer quotes removed; nullopt when there is no such key.
    std::optional<std::string_view> FindValue(std::string_view section, std::string_view key) const;
    // Every section name in file order (a repeated section twice).
    std::vector<std::string_view> SectionNames() const;
    // The key names of the first section `section` in file order.
    std::vector<std::string_view> KeyNames(std::string_view section) const;

    // Gives the first key `key` of the first section `section` the value, adding the key after the
    // section's last key line, or the section at the end. Returns false when nothing changed.
    bool SetValue(std::string_view section, std::string_view key, std::string_view value);
    // Removes the first key line `key` of the first section `section`.
    bool DeleteKey(std::string_view section, std::string_view key);
    // Removes the first section `section`: its header and its lines, except comment and blank
    // lines.
    bool DeleteSection(std::string_view section);

private:
    enum class ELine { Blank, Comment, Section, Key, Other };
    struct CLine {
        size_t nStart;  // first byte of the line
        size_t nEnd;    // end of its text, before the line break
        size_t nNext;   // first byte of the next line
        ELine eKind;
        size_t nNameStart, nNameEnd;    // section name or key, trimmed
        size_t nValueStart, nValueEnd;  // key value, trimmed
    };

    void Parse();
    CLine ParseLine(size_t nStart) const;
    std::string_view Name(const CLine& line) const;
    // Index of the first section header `section`, or npos; then the end of its lines.
    size_t FindSection(std::string_view section) const;
    size_t SectionEnd(size_t nHeader) const;
    size_t FindKey(size_t nHeader, std::string_view key) const;
    void Splice(size_t nStart, size_t nEnd, std::string_view text);

    std::string m_bytes;
    std::vector<CLine> m_lines;
};

// Names equal without regard to the case of Windows-1252 letters.
bool ProfileNamesEqual(std::string_view a, std::string_view b);

}  // namespace standin
