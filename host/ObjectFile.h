// Host object files (*.oqb) of the reference host: a small UTF-8 text format.
//
//     osrik-object 1
//     # a comment
//     name Fichte, 6 m
//     extents 2.5 2.5 6
//
// The first line that is neither blank nor a comment must be "osrik-object 1". Then one key a line:
// "name" takes the rest of the line (blanks around it trimmed); "extents" takes three numbers >= 0,
// the object's size in x, y and z in metres. Both keys are required; unknown keys are ignored so
// that later versions can add some. Anything else makes the file unusable.
#pragma once

#include <optional>
#include <string>
#include <string_view>

struct CObjectFileInfo {
    std::string strName;
    float fSizeX = 0;
    float fSizeY = 0;
    float fSizeZ = 0;
};

// The object the text describes, or none when it breaks the format.
std::optional<CObjectFileInfo> ParseObjectFile(std::string_view text);
// Reads and parses the file at that UTF-8 path; none when it cannot be read or parsed.
std::optional<CObjectFileInfo> ReadObjectFile(const std::string& strPath);
