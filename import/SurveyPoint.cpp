#include "import/SurveyPoint.h"

#include <array>
#include <charconv>

#include "import/SurveyNumber.h"

namespace {

// The white space that the C library's isspace knows in the "C" locale; only blank and tab
// separate tokens.
bool IsTrimmed(char ch) {
    return ch == ' ' || (ch >= '\t' && ch <= '\r');
}

bool IsSeparator(char ch) {
    return ch == ' ' || ch == '\t';
}

std::string_view Trim(std::string_view s) {
    size_t nBegin = 0;
    size_t nEnd = s.size();
    while (nBegin < nEnd && IsTrimmed(s[nBegin])) {
        ++nBegin;
    }
    while (nEnd > nBegin && IsTrimmed(s[nEnd - 1])) {
        --nEnd;
    }
    return s.substr(nBegin, nEnd - nBegin);
}

struct CTokens {
    std::array<std::string_view, 5> tokens;
    int nCount = 0;
};

// Up to four tokens at runs of blanks and tabs; a fifth takes the rest of the (trimmed) line,
// separators inside it included.
CTokens Tokenise(std::string_view line) {
    CTokens t;
    size_t i = 0;
    while (i < line.size()) {
        while (i < line.size() && IsSeparator(line[i])) {
            ++i;
        }
        if (i == line.size()) {
            break;
        }
        if (t.nCount == 4) {
            t.tokens[4] = line.substr(i);
            t.nCount = 5;
            break;
        }
        const size_t nStart = i;
        while (i < line.size() && !IsSeparator(line[i])) {
            ++i;
        }
        t.tokens[size_t(t.nCount++)] = line.substr(nStart, i - nStart);
    }
    return t;
}

// Numeric values of three consecutive tokens starting at `first`; false if any is not numeric.
bool ParseXyz(const CTokens& t, size_t first, std::array<float, 3>& xyz) {
    return ParseSurveyNumber(t.tokens[first], xyz[0]) &&
           ParseSurveyNumber(t.tokens[first + 1], xyz[1]) &&
           ParseSurveyNumber(t.tokens[first + 2], xyz[2]);
}

void SetRunningName(CString& strName, int nRunningIndex) {
    char buffer[16];
    const std::to_chars_result r = std::to_chars(buffer, buffer + sizeof buffer, nRunningIndex);
    strName = std::string_view(buffer, size_t(r.ptr - buffer));
}

}  // namespace

bool CSurveyPoint::ParseLine(const CString& strLine, int nRunningIndex) {
    return ParseLine(std::string_view(strLine.Str()), nRunningIndex);
}

bool CSurveyPoint::ParseLine(std::string_view line, int nRunningIndex) {
    const CTokens t = Tokenise(Trim(line));
    std::array<float, 3> xyz{};
    std::string_view name;  // empty: the running number
    std::string_view code;
    float fLast = 0.0f;
    if (t.nCount == 3) {
        if (!ParseXyz(t, 0, xyz)) {
            return false;
        }
    } else if (t.nCount == 4 && ParseSurveyNumber(t.tokens[3], fLast)) {
        // Four numbers are name X Y Z; the line is not tried as X Y Z code then.
        if (!ParseSurveyNumber(t.tokens[1], xyz[0]) || !ParseSurveyNumber(t.tokens[2], xyz[1])) {
            return false;
        }
        xyz[2] = fLast;
        name = t.tokens[0];
    } else if (t.nCount == 4) {
        if (!ParseXyz(t, 0, xyz)) {
            return false;
        }
        code = t.tokens[3];
    } else if (t.nCount == 5) {
        if (!ParseXyz(t, 1, xyz)) {
            return false;
        }
        name = t.tokens[0];
        code = t.tokens[4];
    } else {
        return false;
    }
    if (name.empty()) {
        SetRunningName(m_strName, nRunningIndex);
    } else {
        m_strName = name;
    }
    m_fX = xyz[0];
    m_fY = xyz[1];
    m_fZ = xyz[2];
    m_Assignment.m_strObjectId = code;
    return true;
}
