// The JSON writer: exact float text and string escaping. The layout is the one of every expected
// project file, which the scenario tests compare as text.
#include <gtest/gtest.h>

#include <cmath>
#include <cstdlib>
#include <limits>

#include "host/Json.h"

namespace {

TEST(FormatJsonFloat, WritesTheShortestTextThatReadsBackExactly) {
    static const struct {
        float fValue;
        const char* pszText;
    } kCases[] = {
        // normal
        {0.0f, "0"},
        {1.0f, "1"},
        {-1.0f, "-1"},
        {0.1f, "0.1"},
        {4.5f, "4.5"},
        {1000.00006f, "1000.00006"},
        {0.3f + 0.6f, "0.90000004"},
        {16777215.0f, "16777215"},
        // boundary
        {-0.0f, "-0"},
        {1e-5f, "1e-05"},
        {3.4028235e38f, "3.4028235e+38"},
        {1.4e-45f, "1e-45"},
        // not representable in JSON
        {std::numeric_limits<float>::infinity(), "null"},
        {-std::numeric_limits<float>::infinity(), "null"},
        {std::numeric_limits<float>::quiet_NaN(), "null"},
    };
    for (size_t i = 0; i < std::size(kCases); ++i) {
        const std::string text = FormatJsonFloat(kCases[i].fValue);
        EXPECT_EQ(text, kCases[i].pszText) << "case " << i;
        if (std::isfinite(kCases[i].fValue)) {
            EXPECT_EQ(std::strtof(text.c_str(), nullptr), kCases[i].fValue) << "case " << i;
        }
    }
}

TEST(QuoteJson, EscapesWhatJsonForbidsAndKeepsUtf8) {
    static const struct {
        const char* pszIn;
        const char* pszOut;
    } kCases[] = {
        {"", R"("")"},
        {"plain", R"("plain")"},
        {"a\"b", R"("a\"b")"},
        {"C:\\Osrik\\", R"("C:\\Osrik\\")"},
        {"line\nbreak\r\t", R"("line\nbreak\r\t")"},
        {"\x01\x1f", R"("\u0001\u001f")"},
        {"H\xC3\xB6he \xE2\x82\xAC", "\"H\xC3\xB6he \xE2\x82\xAC\""},
    };
    for (size_t i = 0; i < std::size(kCases); ++i) {
        EXPECT_EQ(QuoteJson(kCases[i].pszIn), kCases[i].pszOut) << "case " << i;
    }
}

TEST(CJsonValue, FindsMembersByKey) {
    CJsonValue object = CJsonValue::Object();
    object.Set("a", CJsonValue::Int(1));
    ASSERT_NE(object.Find("a"), nullptr);
    EXPECT_EQ(object.Find("a")->Type(), CJsonValue::EType::Int);
    EXPECT_EQ(object.Find("b"), nullptr);
}

}  // namespace
