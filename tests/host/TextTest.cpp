// Conversions between the plug-in's UTF-16 and code page 1252 texts and the host's UTF-8.
#include <gtest/gtest.h>

#include "host/Text.h"

namespace {

TEST(Utf16ToUtf8, EncodesEveryPlaneAndReplacesLoneSurrogates) {
    static const struct {
        std::u16string in;
        const char* pszOut;
    } kCases[] = {
        {u"", ""},
        {u"Osrik", "Osrik"},
        {u"H\u00F6he", "H\xC3\xB6he"},
        {u"\u20AC", "\xE2\x82\xAC"},
        {u"\U0001F600", "\xF0\x9F\x98\x80"},  // a surrogate pair
        // malformed
        {std::u16string(1, char16_t(0xD800)), "\xEF\xBF\xBD"},
        {std::u16string(1, char16_t(0xDC00)) + u"a",
         "\xEF\xBF\xBD"
         "a"},
        {std::u16string{char16_t(0xD800), char16_t(0xD800), char16_t(0xDC00)},
         "\xEF\xBF\xBD\xF0\x90\x80\x80"},
    };
    for (size_t i = 0; i < std::size(kCases); ++i) {
        EXPECT_EQ(Utf16ToUtf8(kCases[i].in), kCases[i].pszOut) << "case " << i;
    }
}

TEST(Utf8ToUtf16, DecodesAndReplacesMalformedSequences) {
    static const struct {
        const char* pszIn;
        std::u16string out;
    } kCases[] = {
        {"", u""},
        {"H\xC3\xB6he", u"H\u00F6he"},
        {"\xF0\x9F\x98\x80", u"\U0001F600"},
        // malformed
        {"\xC3", u"\uFFFD"},          // cut short
        {"\xC0\xAF", u"\uFFFD"},      // overlong '/'
        {"\xED\xA0\x80", u"\uFFFD"},  // an encoded surrogate
        {"\xFF"
         "a",
         u"\uFFFD"
         "a"},  // no lead byte
        {"\xE2\x82"
         "a",
         u"\uFFFD"
         "a"},  // the byte after a cut sequence is read anew
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
    const char16_t units[] = {u'a', u'\0', u'b'};
    BSTR bstr = SysAllocStringLen(units, 3);
    EXPECT_EQ(BstrToUtf8(bstr), std::string("a\0b", 3));
    SysFreeString(bstr);
}

}  // namespace
