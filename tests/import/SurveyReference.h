// A deliberately simple second reading of the surveyor file rules, for tests and fuzzers only:
// whole-file text-mode translation, an fgets-like loop, and strtod for the numbers (a number is
// what strtod consumes entirely, once the characters of "inf", "nan" and hexadecimal are ruled
// out). Slow, but written independently of the reader.
#pragma once

#include <cfloat>
#include <cmath>
#include <cstdlib>
#include <string>
#include <vector>

namespace survey_reference {

struct RefPoint {
    std::string name;
    float x = 0, y = 0, z = 0;
    std::string code;
};

// What fgets(buffer, 255, file) returns piece by piece on a Windows text-mode stream of these
// bytes, each piece as the C string it is (cut at a NUL byte).
inline std::vector<std::string> Pieces(std::string bytes) {
    bytes = bytes.substr(0, bytes.find('\x1a'));  // Ctrl-Z ends a text-mode file
    std::string text;
    for (size_t i = 0; i < bytes.size(); ++i) {
        if (!(bytes[i] == '\r' && i + 1 < bytes.size() && bytes[i + 1] == '\n')) {
            text += bytes[i];
        }
    }
    std::vector<std::string> pieces;
    size_t pos = 0;
    while (pos < text.size()) {
        std::string piece;
        while (pos < text.size() && piece.size() < 254) {
            piece += text[pos++];
            if (piece.back() == '\n') {
                break;
            }
        }
        pieces.push_back(piece.substr(0, piece.find('\0')));
    }
    return pieces;
}

inline bool Number(const std::string& token, float& value) {
    if (token.empty() || token.find_first_not_of("0123456789+-.eE") != std::string::npos) {
        return false;
    }
    char* end = nullptr;
    const double d = std::strtod(token.c_str(), &end);
    if (end != token.c_str() + token.size()) {
        return false;
    }
    const float f = static_cast<float>(d);
    value = std::isfinite(f) ? f : 0.0f;  // not finite as a float: 0
    return true;
}

inline bool ParseLine(const std::string& piece, int running, RefPoint& out) {
    const char* ws = " \t\n\v\f\r";
    const size_t first = piece.find_first_not_of(ws);
    if (first == std::string::npos) {
        return false;
    }
    const std::string line = piece.substr(first, piece.find_last_not_of(ws) - first + 1);
    std::vector<std::string> tokens;
    std::vector<size_t> starts;
    for (size_t i = 0; i < line.size();) {
        const size_t b = line.find_first_not_of(" \t", i);
        if (b == std::string::npos) {
            break;
        }
        const size_t e = std::min(line.find_first_of(" \t", b), line.size());
        tokens.push_back(line.substr(b, e - b));
        starts.push_back(b);
        i = e;
    }
    if (tokens.size() > 5) {
        tokens.resize(5);
        tokens[4] = line.substr(starts[4]);
    }
    float v[5];
    auto num = [&](size_t k) { return Number(tokens[k], v[k]); };
    RefPoint p;
    if (tokens.size() == 3 && num(0) && num(1) && num(2)) {
        p = {std::to_string(running), v[0], v[1], v[2], ""};
    } else if (tokens.size() == 4 && num(3)) {
        if (!num(1) || !num(2)) {
            return false;
        }
        p = {tokens[0], v[1], v[2], v[3], ""};
    } else if (tokens.size() == 4 && num(0) && num(1) && num(2)) {
        p = {std::to_string(running), v[0], v[1], v[2], tokens[3]};
    } else if (tokens.size() == 5 && num(1) && num(2) && num(3)) {
        p = {tokens[0], v[1], v[2], v[3], tokens[4]};
    } else {
        return false;
    }
    out = p;
    return true;
}

inline std::vector<RefPoint> Read(const std::string& bytes) {
    std::vector<RefPoint> points;
    for (const std::string& piece : Pieces(bytes)) {
        RefPoint p;
        if (ParseLine(piece, int(points.size()), p)) {
            points.push_back(p);
        }
    }
    return points;
}

}  // namespace survey_reference
