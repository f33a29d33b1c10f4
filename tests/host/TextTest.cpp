// Conversions between the plug-in's UTF-16 and code page 1252 texts and the host's UTF-8.
#include <gtest/gtest.h>

#include "host/Text.h"

namespace {

TEST(Utf16ToUtf8, EncodesEveryPlaneAndReplacesLoneSurrogates) {
    static const struct {
        COleString in;
        const char* pszOut;
    } kCases[] = {
        {OLESTR(""), ""},
        {OLESTR("Osrik"), "Osrik"},
        {OLESTR("H\u00F6he"), "H\xC3\xB6he"},
        {OLESTR("\u20AC"), "\xE2\x82\xAC"},
        {OLESTR("\U0001F600"), "\xF0\x9F\x98\x80"},  // a surrogate pair
        // malformed
        {COleString(1, OLECHAR(0xD800)), "\xEF\xBF\xBD"},
        {COleString(1, OLECHAR(0xDC00)) + OLESTR("a"),
         "\xEF\xBF\xBD"
         "a"},
        {COleString{OLECHAR(0xD800), OLECHAR(0xD800), OLECHAR(0xDC00)},
         "\xEF\xBF\xBD\xF0\x90\x80\x80"},
    };
    for (size_t i = 0; i < std::size(kCases); ++i) {
        EXPECT_EQ(Utf16ToUtf8(kCases[i].in), kCases[i].pszOut) << "case " << i;
    }
}

TEST(Utf8ToUtf16, DecodesAndReplacesMalformedSequences) {
    static const struct {
        const char* pszIn;
        COleString out;
    } kCases[] = {
        {"", OLESTR("")},
        {"H\xC3\xB6he", OLESTR("H\u00F6he")},
        {"\xF0\x9F\x98\x80", OLESTR("\U0001F600")},
        // malformed
        {"\xC3", OLESTR("\uFFFD")},          // cut short
        {"\xC0\xAF", OLESTR("\uFFFD")},      // overlong '/'
        {"\xED\xA0\x80", OLESTR("\uFFFD")},  // an encoded surrogate
        {"\xFF"
         "a",
         OLESTR("\uFFFD") "a"},  // no lead byte
        {"\xE2\x82"
         "a",
         OLESTR("\uFFFD") "a"},  // the byte after a cut sequence is read anew
    };
    for (size_t i = 0; i < std::size(kCases); ++i) {
        EXPECT_EQ(Utf8ToUtf16(kCases[i].pszIn), kCases[i].out) << "case " << i;
    }
}

TEST(AnsiText, ConvertsCodePage1252BothWays) {
    static const struct {
        const char* pszAnsi;
        const char* pszUtf8;
    } kCases[] = {
        {"", ""},
        {"Gel\xE4nde", "Gel\xC3\xA4nde"},
        {"\x80 \xDF", "\xE2\x82\xAC \xC3\x9F"},  // euro sign, sharp s
    };
    for (size_t i = 0; i < std::size(kCases); ++i) {
        EXPECT_EQ(AnsiToUtf8(kCases[i].pszAnsi), kCases[i].pszUtf8) << "case " << i;
        EXPECT_EQ(Utf8ToAnsi(kCases[i].pszUtf8), kCases[i].pszAnsi) << "case " << i;
    }
    EXPECT_EQ(AnsiToUtf8(nullptr), "");
    EXPECT_EQ(Utf8ToAnsi("\xE2\x88\x9E"), "?");  // infinity is not in the code page
}

TEST(BstrToUtf8, UsesTheStoredLengthAndTakesNull) {
    EXPECT_EQ(BstrToUtf8(nullptr), "");
    const OLECHAR units[] = {OLECHAR('a'), OLECHAR('\0'), OLECHAR('b')};
    BSTR bstr = SysAllocStringLen(units, 3);
    EXPECT_EQ(BstrToUtf8(bstr), std::string("a\0b", 3));
    SysFreeString(bstr);
}

}  // namespace
