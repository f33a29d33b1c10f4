#include <gtest/gtest.h>

#include <cstring>

#include "platform/Win32.h"

namespace {

TEST(Bstr, KeepsItsLengthAndItsZero) {
    const OLECHAR text[] = OLESTR("H\u00f6he");
    BSTR bstr = SysAllocString(text);
    ASSERT_NE(bstr, nullptr);
    EXPECT_EQ(SysStringLen(bstr), 4u);
    EXPECT_EQ(reinterpret_cast<const uint32_t*>(bstr)[-1], 8u);  // byte count before the text
    EXPECT_EQ(bstr[4], 0);
    SysFreeString(bstr);

    BSTR empty = SysAllocStringLen(nullptr, 3);
    EXPECT_EQ(SysStringLen(empty), 3u);
    EXPECT_EQ(empty[0], 0);
    SysFreeString(empty);
    SysFreeString(nullptr);
    EXPECT_EQ(SysAllocString(nullptr), nullptr);
    EXPECT_EQ(SysStringLen(nullptr), 0u);
}

TEST(SafeArray, TwoDimensionalFloatsInAVariant) {
    SAFEARRAYBOUND bounds[2] = {{4, 0}, {4, 0}};
    SAFEARRAY* psa = SafeArrayCreate(VT_R4, 2, bounds);
    ASSERT_NE(psa, nullptr);
    EXPECT_EQ(SafeArrayGetDim(psa), 2u);
    EXPECT_EQ(SafeArrayGetElemsize(psa), 4u);
    LONG upper = 0;
    EXPECT_EQ(SafeArrayGetUBound(psa, 2, &upper), S_OK);
    EXPECT_EQ(upper, 3);
    void* data = nullptr;
    ASSERT_EQ(SafeArrayAccessData(psa, &data), S_OK);
    static_cast<float*>(data)[15] = 1.0f;
    EXPECT_EQ(SafeArrayDestroy(psa), DISP_E_ARRAYISLOCKED);  // locked arrays stay
    EXPECT_EQ(SafeArrayUnaccessData(psa), S_OK);
    EXPECT_EQ(SafeArrayUnaccessData(psa), E_UNEXPECTED);

    VARIANT v;
    VariantInit(&v);
    v.vt = VT_ARRAY | VT_R4;
    v.parray = psa;
    EXPECT_EQ(VariantClear(&v), S_OK);  // destroys the array; the sanitizers watch for leaks
    EXPECT_EQ(v.vt, VT_EMPTY);
}

TEST(SafeArray, RefusesWhatItCannotHold) {
    SAFEARRAYBOUND huge[2] = {{0x10000, 0}, {0x10000, 0}};
    EXPECT_EQ(SafeArrayCreate(VT_R4, 2, huge), nullptr);
    SAFEARRAYBOUND one = {1, 0};
    EXPECT_EQ(SafeArrayCreate(VT_EMPTY, 1, &one), nullptr);
    EXPECT_EQ(SafeArrayCreate(VT_R4, 0, &one), nullptr);
}

TEST(Variant, ClearFreesStringsButNotReferences) {
    VARIANT v;
    VariantInit(&v);
    v.vt = VT_BSTR;
    v.bstrVal = SysAllocString(OLESTR("x"));
    EXPECT_EQ(VariantClear(&v), S_OK);
    LONG value = 7;
    v.vt = VT_BYREF | VT_I4;
    v.plVal = &value;
    EXPECT_EQ(VariantClear(&v), S_OK);
    EXPECT_EQ(value, 7);
}

TEST(CodePage, Windows1252RoundTripsAndUtf8) {
    static const struct {
        const char* ansi;
        std::basic_string<OLECHAR> wide;
    } cases[] = {
        {"H\xf6he", OLESTR("H\u00f6he")},
        {"\x80 \x9f", OLESTR("\u20ac \u0178")},
        {"\x81", OLESTR("\u0081")},
        {"", OLESTR("")},
    };
    for (size_t i = 0; i < std::size(cases); ++i) {
        OLECHAR wide[16] = {};
        const int n = MultiByteToWideChar(CP_ACP, 0, cases[i].ansi, -1, wide, 16);
        EXPECT_EQ(std::basic_string<OLECHAR>(wide), cases[i].wide) << "case " << i;
        EXPECT_EQ(n, int(cases[i].wide.size()) + 1) << "case " << i;
        char ansi[16] = {};
        WideCharToMultiByte(CP_ACP, 0, wide, -1, ansi, 16, nullptr, nullptr);
        EXPECT_STREQ(ansi, cases[i].ansi) << "case " << i;
    }
    char out[8] = {};
    EXPECT_EQ(WideCharToMultiByte(CP_ACP, 0, OLESTR("\u4e2d"), -1, out, 8, nullptr, nullptr), 2);
    EXPECT_STREQ(out, "?");
    EXPECT_EQ(WideCharToMultiByte(CP_UTF8, 0, OLESTR("\u00fc"), -1, out, 8, nullptr, nullptr), 3);
    EXPECT_STREQ(out, "\xc3\xbc");
    EXPECT_EQ(MultiByteToWideChar(CP_ACP, 0, "abc", -1, nullptr, 0), 4);  // size query
    OLECHAR small[2];
    EXPECT_EQ(MultiByteToWideChar(CP_ACP, 0, "abc", -1, small, 2), 0);  // too small: nothing
}

}  // namespace
