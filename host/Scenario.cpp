#include "host/Scenario.h"

#include <charconv>
#include <climits>
#include <cstdio>

namespace {

constexpr std::string_view kElementNames[] = {"toolbar",  "contour-button", "import-button",
                                              "polyline", "polygon",        "import"};

bool IsBlank(char c) {
    return c == ' ' || c == '\t' || c == '\r';
}

bool ParseInteger(std::string_view word, long long nMin, long long nMax, long long& nValue) {
    int nBase = 10;
    std::string_view digits = word;
    bool bNegative = false;
    if (!digits.empty() && digits[0] == '-') {
        bNegative = true;
        digits.remove_prefix(1);
    }
    if (digits.size() > 2 && digits[0] == '0' && (digits[1] == 'x' || digits[1] == 'X')) {
        nBase = 16;
        digits.remove_prefix(2);
    }
    unsigned long long nMagnitude = 0;
    const auto result =
        std::from_chars(digits.data(), digits.data() + digits.size(), nMagnitude, nBase);
    if (digits.empty() || result.ec != std::errc() || result.ptr != digits.data() + digits.size() ||
        nMagnitude > (unsigned long long)LLONG_MAX) {
        return false;
    }
    nValue = bNegative ? -(long long)nMagnitude : (long long)nMagnitude;
    return nValue >= nMin && nValue <= nMax;
}

bool ParseFloat(std::string_view word, float& fValue) {
    const auto result = std::from_chars(word.data(), word.data() + word.size(), fValue);
    return !word.empty() && result.ec == std::errc() && result.ptr == word.data() + word.size();
}

// Parses the words of one line into cmd; returns the reason of a fault, or "" when sound.
class CLineParser {
public:
    CLineParser(const std::vector<std::string>& words, CScenarioCommand& cmd)
        : m_words(words), m_cmd(cmd) {}

    std::string Parse();

private:
    std::string Expect(size_t nMin, size_t nMax) const;
    std::string Integer(size_t i, long long nMin, long long nMax, long long& nValue) const;
    std::string Coordinate(size_t i, float& fValue) const;
    std::string Element(size_t i) const;
    std::string ParseButton();
    std::string ParsePosition(ECommand eKind);
    std::string ParseNumber(ECommand eKind, long long nMin, long long nMax);
    std::string ParseBare(ECommand eKind);
    std::string ParseUi();
    std::string ParseUiArgs(EUiAction eKind, size_t nWords);

    const std::vector<std::string>& m_words;
    CScenarioCommand& m_cmd;
};

std::string CLineParser::Expect(size_t nMin, size_t nMax) const {
    const size_t n = m_words.size() - 1;
    if (n < nMin || n > nMax) {
        return "'" + m_words[0] + "' takes " + std::to_string(nMin) +
               (nMin == nMax ? "" : " to " + std::to_string(nMax)) + " arguments, not " +
               std::to_string(n);
    }
    return "";
}

std::string CLineParser::Integer(size_t i, long long nMin, long long nMax,
                                 long long& nValue) const {
    if (!ParseInteger(m_words[i], nMin, nMax, nValue)) {
        return "'" + m_words[i] + "' is not an integer from " + std::to_string(nMin) + " to " +
               std::to_string(nMax);
    }
    return "";
}

std::string CLineParser::Coordinate(size_t i, float& fValue) const {
    return ParseFloat(m_words[i], fValue) ? "" : "'" + m_words[i] + "' is not a number";
}

std::string CLineParser::Element(size_t i) const {
    long long nHandle = 0;
    if (!IsToolbarElementName(m_words[i]) &&
        !ParseInteger(m_words[i], INT32_MIN, INT32_MAX, nHandle)) {
        return "'" + m_words[i] + "' is neither a toolbar element nor a handle";
    }
    return "";
}

std::string CLineParser::ParseButton() {
    m_cmd.eKind = ECommand::Button;
    std::string err = Expect(2, 2);
    if (err.empty()) {
        err = Element(1);
    }
    if (err.empty()) {
        err = Integer(2, INT32_MIN, INT32_MAX, m_cmd.nValue);
    }
    return err;
}

std::string CLineParser::ParsePosition(ECommand eKind) {
    m_cmd.eKind = eKind;
    std::string err = Expect(3, eKind == ECommand::Click ? 4 : 3);
    if (err.empty()) {
        err = Element(1);
    }
    if (err.empty()) {
        err = Coordinate(2, m_cmd.fX);
    }
    if (err.empty()) {
        err = Coordinate(3, m_cmd.fY);
    }
    if (err.empty() && m_words.size() == 5) {
        err = Integer(4, INT32_MIN, INT32_MAX, m_cmd.nValue);  // the flags of a click
    }
    return err;
}

std::string CLineParser::ParseNumber(ECommand eKind, long long nMin, long long nMax) {
    m_cmd.eKind = eKind;
    std::string err = Expect(1, 1);
    return err.empty() ? Integer(1, nMin, nMax, m_cmd.nValue) : err;
}

std::string CLineParser::ParseBare(ECommand eKind) {
    m_cmd.eKind = eKind;
    return Expect(0, 0);
}

std::string CLineParser::Parse() {
    const std::string& verb = m_words[0];
    std::string err;
    if (verb == "button") {
        err = ParseButton();
    } else if (verb == "click" || verb == "move") {
        err = ParsePosition(verb == "click" ? ECommand::Click : ECommand::Move);
    } else if (verb == "event") {
        err = ParseNumber(ECommand::Event, 2, 52);
    } else if (verb == "idle") {
        err = ParseNumber(ECommand::Idle, 0, 86400000);
    } else if (verb == "exit" || verb == "noview" || verb == "view") {
        err = ParseBare(verb == "exit"   ? ECommand::Exit
                        : verb == "view" ? ECommand::View
                                         : ECommand::NoView);
    } else if (verb == "ui") {
        m_cmd.eKind = ECommand::Ui;
        err = ParseUi();
    } else {
        err = "unknown command '" + verb + "'";
    }
    if (err.empty() && (m_cmd.eKind == ECommand::Button || m_cmd.eKind == ECommand::Click ||
                        m_cmd.eKind == ECommand::Move)) {
        m_cmd.strElement = m_words[1];
        long long nHandle = 0;
        if (!IsToolbarElementName(m_words[1]) &&
            ParseInteger(m_words[1], INT32_MIN, INT32_MAX, nHandle)) {
            m_cmd.handle = LONG(nHandle);
        }
    }
    return err;
}

struct CUiVerb {
    std::string_view name;
    EUiAction eKind;
    size_t nWords;  // after the verb
};

constexpr CUiVerb kUiVerbs[] = {
    {"ok", EUiAction::Ok, 0},         {"cancel", EUiAction::Cancel, 0},
    {"file", EUiAction::File, 1},     {"file-cancel", EUiAction::FileCancel, 0},
    {"dialog", EUiAction::Dialog, 1}, {"type", EUiAction::Type, 2},
    {"click", EUiAction::Click, 1},   {"select", EUiAction::Select, 2},
    {"mark", EUiAction::Mark, 2},     {"dblclick", EUiAction::DblClick, 2},
    {"key", EUiAction::Key, 2},
};

std::string CLineParser::ParseUi() {
    if (m_words.size() < 2) {
        return "'ui' needs an action";
    }
    for (const CUiVerb& verb : kUiVerbs) {
        if (m_words[1] == verb.name) {
            m_cmd.ui.eKind = verb.eKind;
            return ParseUiArgs(verb.eKind, verb.nWords);
        }
    }
    return "unknown UI action '" + m_words[1] + "'";
}

std::string CLineParser::ParseUiArgs(EUiAction eKind, size_t nWords) {
    if (m_words.size() != nWords + 2) {
        return "'ui " + m_words[1] + "' takes " + std::to_string(nWords) + " arguments, not " +
               std::to_string(m_words.size() - 2);
    }
    CUiAction& ui = m_cmd.ui;
    long long nCtrl = 0;
    long long nValue = 0;
    std::string err;
    switch (eKind) {
        case EUiAction::File:
            ui.strText = m_words[2];
            break;
        case EUiAction::Dialog:
            err = Integer(2, 0, 65535, nValue);
            break;
        case EUiAction::Type:
            err = Integer(2, 0, 65535, nCtrl);
            ui.strText = m_words[3];
            break;
        case EUiAction::Click:
            err = Integer(2, 0, 65535, nCtrl);
            break;
        case EUiAction::Select:
        case EUiAction::Mark:
        case EUiAction::DblClick:
        case EUiAction::Key:
            err = Integer(2, 0, 65535, nCtrl);
            if (err.empty()) {
                err = Integer(3, -1, INT32_MAX, nValue);
            }
            break;
        default:
            break;
    }
    ui.nCtrl = int(nCtrl);
    ui.nValue = int(nValue);
    return err;
}

}  // namespace

bool IsToolbarElementName(std::string_view name) {
    for (const std::string_view known : kElementNames) {
        if (name == known) {
            return true;
        }
    }
    return false;
}

bool SplitScenarioWords(std::string_view line, std::vector<std::string>& words,
                        std::string& strError) {
    words.clear();
    size_t i = 0;
    while (i < line.size()) {
        if (IsBlank(line[i])) {
            ++i;
            continue;
        }
        if (line[i] == '#') {
            break;
        }
        if (line[i] != '"') {
            const size_t nStart = i;
            while (i < line.size() && !IsBlank(line[i]) && line[i] != '"') {
                ++i;
            }
            if (i < line.size() && line[i] == '"') {
                strError = "a quote inside a word";
                return false;
            }
            words.emplace_back(line.substr(nStart, i - nStart));
            continue;
        }
        const size_t nClose = line.find('"', i + 1);
        if (nClose == std::string_view::npos) {
            strError = "unterminated quote";
            return false;
        }
        if (nClose + 1 < line.size() && !IsBlank(line[nClose + 1])) {
            strError = "a quoted word must end at a blank";
            return false;
        }
        words.emplace_back(line.substr(i + 1, nClose - i - 1));
        i = nClose + 1;
    }
    return true;
}

CScenario ParseScenario(std::string_view text) {
    CScenario scenario;
    if (text.substr(0, 3) == "\xEF\xBB\xBF") {
        text.remove_prefix(3);  // a UTF-8 byte order mark some editors write
    }
    std::vector<std::string> words;
    int nLine = 0;
    while (!text.empty()) {
        ++nLine;
        const size_t nEnd = text.find('\n');
        const std::string_view line = text.substr(0, nEnd);
        text.remove_prefix(nEnd == std::string_view::npos ? text.size() : nEnd + 1);
        std::string err;
        if (!SplitScenarioWords(line, words, err)) {
            scenario.strError = "line " + std::to_string(nLine) + ": " + err;
            return scenario;
        }
        if (words.empty()) {
            continue;
        }
        CScenarioCommand cmd;
        cmd.nLine = nLine;
        cmd.ui.nLine = nLine;
        err = CLineParser(words, cmd).Parse();
        if (!err.empty()) {
            scenario.strError = "line " + std::to_string(nLine) + ": " + err;
            return scenario;
        }
        scenario.commands.push_back(std::move(cmd));
    }
    return scenario;
}

std::string DescribeUiAction(const CUiAction& action) {
    std::string text;
    const auto quote = [](const std::string& s) { return "\"" + s + "\""; };
    switch (action.eKind) {
        case EUiAction::Ok:
            text = "ui ok";
            break;
        case EUiAction::Cancel:
            text = "ui cancel";
            break;
        case EUiAction::File:
            text = "ui file " + quote(action.strText);
            break;
        case EUiAction::FileCancel:
            text = "ui file-cancel";
            break;
        case EUiAction::Dialog:
            text = "ui dialog " + std::to_string(action.nValue);
            break;
        case EUiAction::Type:
            text = "ui type " + std::to_string(action.nCtrl) + " " + quote(action.strText);
            break;
        case EUiAction::Click:
            text = "ui click " + std::to_string(action.nCtrl);
            break;
        case EUiAction::Select:
            text = "ui select";
            break;
        case EUiAction::Mark:
            text = "ui mark";
            break;
        case EUiAction::DblClick:
            text = "ui dblclick";
            break;
        case EUiAction::Key:
            text = "ui key";
            break;
    }
    if (action.eKind >= EUiAction::Select) {
        text += ' ';
        text += std::to_string(action.nCtrl);
        text += ' ';
        text += std::to_string(action.nValue);
    }
    return text + " (line " + std::to_string(action.nLine) + ")";
}
