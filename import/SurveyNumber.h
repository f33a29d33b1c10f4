// ParseSurveyNumber: the strict number syntax of surveyor files and its 32-bit float value.
#pragma once

#include <string_view>

// True when the whole token is a decimal number in the "C" locale's form: optional sign, digits
// with an optional '.', at least one digit, optional exponent (e or E, optional sign, digits).
// No blanks, "inf", "nan", hexadecimal, decimal comma or trailing unit. The value is the nearest
// double of the text, then the nearest float; a value whose float would not be finite (beyond
// about +-3.4e38, however far) becomes 0, one too small for a double becomes a signed zero.
// On false fValue is unchanged. Does not allocate or throw.
bool ParseSurveyNumber(std::string_view token, float& fValue);
