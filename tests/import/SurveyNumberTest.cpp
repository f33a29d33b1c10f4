#include "import/SurveyNumber.h"

#include <gtest/gtest.h>

#include <cfloat>
#include <cstring>
#include <random>
#include <string>

#include "tests/import/SurveyReference.h"

namespace {

constexpr float kUnset = -12345.0f;  // sentinel: shows whether a value was written

bool SameBits(float a, float b) {  // -0 and 0 count as different
    return std::memcmp(&a, &b, sizeof a) == 0;
}

TEST(SurveyNumber, StrictSyntaxAndFloatValue) {
    static const struct {
        const char* token;
        bool numeric;
        float value;
    } cases[] = {
        // accepted forms; the value is the nearest float
        {"12", true, 12},
        {"-3.", true, -3},
        {".5", true, 0.5f},
        {"1.25e3", true, 1250},
        {"+7", true, 7},
        {"1E-2", true, 0.01f},
        {"007", true, 7},
        {"-0", true, -0.0f},
        {"3512345.123", true, 3512345.0f},
        // rejected: no digits, incomplete exponent, stray signs or points
        {"", false, 0},
        {".", false, 0},
        {"-", false, 0},
        {"1e", false, 0},
        {"1e+", false, 0},
        {"e5", false, 0},
        {"--1", false, 0},
        {"1.2.3", false, 0},
        {"1e2.5", false, 0},
        // rejected: decimal comma, unit, special values, hexadecimal, white space
        {"12,5", false, 0},
        {"12.5m", false, 0},
        {"inf", false, 0},
        {"nan", false, 0},
        {"0x10", false, 0},
        {" 1", false, 0},
        {"\v1", false, 0},
        {"1\r", false, 0},
        // too large for a float, either sign, however large: 0
        {"1e400", true, 0},
        {"-1e400", true, 0},
        {"1e99999999999999999999", true, 0},
        {"1e39", true, 0},
        {"-3.5e38", true, 0},
        // just below halfway to 2^128 still rounds to the largest float...
        {"3.4028235e38", true, FLT_MAX},
        {"-3.40282356e38", true, -FLT_MAX},
        // ...unless its nearest double is the halfway point itself
        {"340282356779733661637539395458142568447", true, 0},
        // too small: a zero of the sign written, as strtod gives
        {"1e-400", true, 0.0f},
        {"-1e-400", true, -0.0f},
        {"-1e-99999999999999999999", true, -0.0f},
        {"1.5e-45", true, 1.4e-45f},
        {"0e999999", true, 0},
        {"-0.000e-999", true, -0.0f},
        // more than 19 digits, or beyond 1e22: the general conversion, still exact
        {"0.1000000000000000000000000000001", true, 0.1f},
        {"123456789e25", true, 1.23456789e33f},
    };
    for (size_t i = 0; i < std::size(cases); ++i) {
        float f = kUnset;
        EXPECT_EQ(ParseSurveyNumber(cases[i].token, f), cases[i].numeric) << "case " << i;
        EXPECT_TRUE(SameBits(f, cases[i].numeric ? cases[i].value : kUnset))
            << "case " << i << ": " << f;
    }
}

TEST(SurveyNumber, AgreesWithStrtodOnRandomDecimals) {
    std::mt19937 random(2024);
    for (int round = 0; round < 20000; ++round) {
        std::string token = random() % 4 == 0 ? "-" : "";
        const size_t nDigits = 1 + random() % (round % 3 == 0 ? 30 : 17);
        const size_t nPoint = random() % (nDigits + 1);
        for (size_t k = 0; k < nDigits; ++k) {
            token += k == nPoint ? "." : "";
            token += char('0' + random() % 10);
        }
        if (random() % 3 == 0) {
            token += "e" + std::to_string(int(random() % 90) - 45);
        }
        float fExpected = 0;
        float f = kUnset;
        ASSERT_TRUE(survey_reference::Number(token, fExpected)) << token;
        ASSERT_TRUE(ParseSurveyNumber(token, f)) << token;
        ASSERT_TRUE(SameBits(f, fExpected)) << token << ": " << f << " instead of " << fExpected;
    }
}

}  // namespace
