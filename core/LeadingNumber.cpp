#include "core/LeadingNumber.h"

#include <charconv>
#include <cstring>
#include <system_error>

namespace {

bool IsDigit(char ch) {
    return ch >= '0' && ch <= '9';
}

const char* SkipDigits(const char* p) {
    while (IsDigit(*p)) {
        ++p;
    }
    return p;
}

}  // namespace

double ParseLeadingNumber(const char* pszText) {
    if (!pszText) {
        return 0.0;
    }
    const char* p = pszText;
    while (*p && std::strchr(" \t\n\v\f\r", *p)) {
        ++p;
    }
    const bool negative = *p == '-';
    p += (*p == '-' || *p == '+') ? 1 : 0;
    const char* const first = p;
    p = SkipDigits(p);
    bool digits = p != first;
    if (*p == '.') {
        const char* const fraction = p + 1;
        p = SkipDigits(fraction);
        digits = digits || p != fraction;
    }
    if (!digits) {
        return 0.0;
    }
    if (*p == 'e' || *p == 'E') {
        const char* exponent = p + 1;
        exponent += (*exponent == '-' || *exponent == '+') ? 1 : 0;
        if (IsDigit(*exponent)) {
            p = SkipDigits(exponent);
        }
    }
    double value = 0.0;
    const auto result = std::from_chars(first, p, value, std::chars_format::general);
    if (result.ec != std::errc()) {
        return 0.0;  // beyond the double range either way
    }
    return negative ? -value : value;
}
