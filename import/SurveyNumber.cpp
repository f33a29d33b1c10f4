#include "import/SurveyNumber.h"

#include <algorithm>
#include <charconv>
#include <cmath>
#include <cstdint>
#include <limits>
#include <system_error>

namespace {

bool IsDigit(char ch) {
    return ch >= '0' && ch <= '9';
}

// A token's number as sign, decimal mantissa and power of ten, while its syntax is checked.
struct CDecimal {
    bool bNegative = false;
    uint64_t nMantissa = 0;
    long nExp10 = 0;
    size_t nDigits = 0;  // mantissa digits, leading zeros included; beyond 19 nMantissa is void
};

// Appends a run of digits to the mantissa (fraction digits lower the exponent).
size_t TakeDigits(std::string_view s, size_t i, bool bFraction, CDecimal& dec) {
    for (; i < s.size() && IsDigit(s[i]); ++i) {
        dec.nMantissa = dec.nMantissa * 10 + uint64_t(s[i] - '0');  // wraps harmlessly past 19
        ++dec.nDigits;
        dec.nExp10 -= bFraction ? 1 : 0;
    }
    return i;
}

// Reads an exponent's optional sign and digits from s[i]; false without digits. The value is
// saturated at +-1e8, far beyond any range, so that any number of digits is safe.
bool TakeExponent(std::string_view s, size_t& i, long& nExp) {
    bool bNegative = false;
    if (i < s.size() && (s[i] == '+' || s[i] == '-')) {
        bNegative = s[i++] == '-';
    }
    const size_t nStart = i;
    nExp = 0;
    for (; i < s.size() && IsDigit(s[i]); ++i) {
        nExp = std::min(nExp * 10 + (s[i] - '0'), 100000000L);
    }
    nExp = bNegative ? -nExp : nExp;
    return i > nStart;
}

// True when s has the accepted syntax; fills dec on the way.
bool Scan(std::string_view s, CDecimal& dec) {
    size_t i = 0;
    if (i < s.size() && (s[i] == '+' || s[i] == '-')) {
        dec.bNegative = s[i++] == '-';
    }
    i = TakeDigits(s, i, false, dec);
    if (i < s.size() && s[i] == '.') {
        i = TakeDigits(s, i + 1, true, dec);
    }
    if (dec.nDigits == 0) {
        return false;
    }
    if (i < s.size() && (s[i] == 'e' || s[i] == 'E')) {
        ++i;
        long nExp = 0;
        if (!TakeExponent(s, i, nExp)) {
            return false;
        }
        dec.nExp10 += nExp;
    }
    return i == s.size();
}

// For a number out of the double's range: true when too large. Its decimal order of magnitude
// is then beyond +-300, so the sign of that order decides: digits before the point (after
// leading zeros), or minus the zeros after it, plus the exponent.
bool IsTooLarge(std::string_view s) {
    size_t i = s[0] == '-' ? 1 : 0;
    while (i < s.size() && s[i] == '0') {
        ++i;
    }
    long nOrder = 0;
    for (; i < s.size() && IsDigit(s[i]); ++i) {
        ++nOrder;
    }
    if (nOrder == 0 && i < s.size() && s[i] == '.') {
        for (++i; i < s.size() && s[i] == '0'; ++i) {
            --nOrder;
        }
    }
    size_t nE = s.find_first_of("eE");
    long nExp = 0;
    if (nE != std::string_view::npos && TakeExponent(s, ++nE, nExp)) {
        nOrder += nExp;
    }
    return nOrder > 0;
}

// The nearest double of the decimal: exact operands and one IEEE operation when the mantissa
// and the power of ten are both exact doubles (Clinger's fast path), as for nearly every
// surveyed value; from_chars otherwise. Out of the double range: 0 for too large (the float would
// not be finite anyway), a signed zero for too small.
double ToDouble(std::string_view token, const CDecimal& dec) {
    static constexpr double kPowers[] = {1e0,  1e1,  1e2,  1e3,  1e4,  1e5,  1e6,  1e7,
                                         1e8,  1e9,  1e10, 1e11, 1e12, 1e13, 1e14, 1e15,
                                         1e16, 1e17, 1e18, 1e19, 1e20, 1e21, 1e22};
    constexpr uint64_t kExactMantissa = uint64_t(1) << 53;
    const bool bExact = dec.nDigits <= 19;
    if (bExact && dec.nMantissa == 0) {
        return dec.bNegative ? -0.0 : 0.0;
    }
    if (bExact && dec.nMantissa <= kExactMantissa && dec.nExp10 >= -22 && dec.nExp10 <= 22) {
        const double dMantissa = double(dec.nMantissa);
        const double d =
            dec.nExp10 < 0 ? dMantissa / kPowers[-dec.nExp10] : dMantissa * kPowers[dec.nExp10];
        return dec.bNegative ? -d : d;
    }
    // from_chars takes no '+'; the syntax is checked, so it consumes the rest entirely.
    const std::string_view digits = token[0] == '+' ? token.substr(1) : token;
    double d = 0.0;
    const std::from_chars_result r =
        std::from_chars(digits.data(), digits.data() + digits.size(), d);
    if (r.ec == std::errc::result_out_of_range) {
        return IsTooLarge(digits) ? 0.0 : (dec.bNegative ? -0.0 : 0.0);
    }
    return d;
}

// Nearest float of a finite double; 0 where that float would be infinite. Written out rather than
// left to the cast, whose result beyond the float range is undefined in C++.
float NarrowToFiniteFloat(double d) {
    constexpr double kMax = std::numeric_limits<float>::max();
    // Halfway between FLT_MAX and 2^128: from here on, round-to-nearest gives infinity.
    constexpr double kRoundsToInfinity = 0x1.ffffffp127;
    const double dAbs = std::fabs(d);
    if (dAbs >= kRoundsToInfinity) {
        return 0.0f;
    }
    if (dAbs > kMax) {
        return float(std::copysign(kMax, d));
    }
    return float(d);
}

}  // namespace

bool ParseSurveyNumber(std::string_view token, float& fValue) {
    CDecimal dec;
    if (!Scan(token, dec)) {
        return false;
    }
    fValue = NarrowToFiniteFloat(ToDouble(token, dec));
    return true;
}
