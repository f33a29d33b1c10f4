// The atof-style reading of numbers in the settings file.
#include <gtest/gtest.h>

#include "core/LeadingNumber.h"

namespace {

TEST(ParseLeadingNumber, ReadsTheLeadingDecimalNumber) {
    static const struct {
        const char* pszText;
        double fExpected;
    } kCases[] = {
        // numbers
        {"12.5", 12.5},
        {"  -3e2x", -300.0},
        {"\t\n+.5", 0.5},
        {"5.", 5.0},
        {"0.000001", 1e-6},
        {"3.4028234e38", 3.4028234e38},
        // a prefix only
        {"1,75", 1.0},
        {"12 m", 12.0},
        {"1e", 1.0},
        {"1e+", 1.0},
        {"2E-1", 0.2},
        {"0x1A", 0.0},
        // no number
        {"", 0.0},
        {"abc", 0.0},
        {".", 0.0},
        {"-", 0.0},
        {"inf", 0.0},
        {"nan", 0.0},
        {"e5", 0.0},
        // beyond the double range
        {"1e400", 0.0},
        {"-1e400", 0.0},
        {"1e-400", 0.0},
    };
    for (size_t i = 0; i < std::size(kCases); ++i) {
        EXPECT_DOUBLE_EQ(ParseLeadingNumber(kCases[i].pszText), kCases[i].fExpected)
            << "case " << i << ": " << kCases[i].pszText;
    }
    EXPECT_EQ(ParseLeadingNumber(nullptr), 0.0);
}

}  // namespace
