#include "host/ObjectFile.h"

#include <charconv>
#include <fstream>
#include <sstream>

namespace {

std::string_view Trim(std::string_view text) {
    const size_t nStart = text.find_first_not_of(" \t\r");
    if (nStart == std::string_view::npos) {
        return {};
    }
    return text.substr(nStart, text.find_last_not_of(" \t\r") - nStart + 1);
}

bool ParseSize(std::string_view& text, float& fValue) {
    text = Trim(text);
    const auto result = std::from_chars(text.data(), text.data() + text.size(), fValue);
    if (result.ec != std::errc() || !(fValue >= 0) || fValue > 1e30f) {
        return false;
    }
    text.remove_prefix(size_t(result.ptr - text.data()));
    return text.empty() || text[0] == ' ' || text[0] == '\t';
}

bool ParseExtents(std::string_view text, CObjectFileInfo& info) {
    return ParseSize(text, info.fSizeX) && ParseSize(text, info.fSizeY) &&
           ParseSize(text, info.fSizeZ) && Trim(text).empty();
}

}  // namespace

std::optional<CObjectFileInfo> ParseObjectFile(std::string_view text) {
    CObjectFileInfo info;
    bool bHeader = false, bName = false, bExtents = false;
    while (!text.empty()) {
        const size_t nEnd = text.find('\n');
        const std::string_view line = Trim(text.substr(0, nEnd));
        text.remove_prefix(nEnd == std::string_view::npos ? text.size() : nEnd + 1);
        if (line.empty() || line[0] == '#') {
            continue;
        }
        const size_t nBlank = line.find_first_of(" \t");
        const std::string_view key = line.substr(0, nBlank);
        const std::string_view value =
            nBlank == std::string_view::npos ? std::string_view() : Trim(line.substr(nBlank));
        if (!bHeader) {
            if (key != "osrik-object" || value != "1") {
                return std::nullopt;
            }
            bHeader = true;
        } else if (key == "name") {
            info.strName = value;
            bName = true;
        } else if (key == "extents") {
            if (!ParseExtents(value, info)) {
                return std::nullopt;
            }
            bExtents = true;
        }
    }
    if (!bName || !bExtents) {
        return std::nullopt;
    }
    return info;
}

std::optional<CObjectFileInfo> ReadObjectFile(const std::string& strPath) {
    std::ifstream file(strPath, std::ios::binary);
    if (strPath.empty() || !file) {
        return std::nullopt;
    }
    std::ostringstream text;
    text << file.rdbuf();
    return ParseObjectFile(text.str());
}
