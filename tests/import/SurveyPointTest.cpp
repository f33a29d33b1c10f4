#include "import/SurveyPoint.h"

#include <gtest/gtest.h>

namespace {

TEST(SurveyPoint, ParseLineReadsTheFourFormsAndSkipsTheRest) {
    static const struct {
        const char* line;
        const char* name;  // nullptr: skipped
        float x = 0, y = 0, z = 0;
        const char* code = nullptr;
    } cases[] = {
        // X Y Z: named by the running index (7 here)
        {"100.5 200.25 10", "7", 100.5f, 200.25f, 10, ""},
        {"1.25e3 -0.5 +7", "7", 1250, -0.5f, 7, ""},
        {"1e400 2 3", "7", 0, 2, 3, ""},
        // name X Y Z; four numbers are read this way
        {"P1 100.5 200.25 10", "P1", 100.5f, 200.25f, 10, ""},
        {"1 2 3 4", "1", 2, 3, 4, ""},
        // X Y Z code
        {"1 2 3 B7", "7", 1, 2, 3, "B7"},
        {"1 2 3 inf", "7", 1, 2, 3, "inf"},
        // name X Y Z code, the code running to the end of the trimmed line
        {"P7 1 2 3 Baum alt", "P7", 1, 2, 3, "Baum alt"},
        {"P7 1 2 3 Baum\talt \t ", "P7", 1, 2, 3, "Baum\talt"},
        {"P7 1 2 3  \t x   y", "P7", 1, 2, 3, "x   y"},
        {"1 2 3 4 5", "1", 2, 3, 4, "5"},
        // leading blanks and tabs, tab separators, line ends; other bytes kept as they are
        {" \t P1\t1  \t2 3\r\n", "P1", 1, 2, 3, ""},
        {"\f1 2 3\v", "7", 1, 2, 3, ""},
        {"\xc3\x98YA 1 2 3 \xc3\x98YA", "\xc3\x98YA", 1, 2, 3, "\xc3\x98YA"},
        // skipped
        {"", nullptr},
        {" \t\r\n", nullptr},
        {"1 2", nullptr},
        {"P1 1 2", nullptr},
        {"P1 x 2 3", nullptr},  // numeric token 4 makes it name X Y Z, and token 2 is not
        {"P1 1 2 3e", nullptr},
        {"100,5 200,25 10", nullptr},
        {"12.5m 3 4", nullptr},
        {"Punkt X Y Z", nullptr},
        {"P1 1 2 x Baum", nullptr},
        {"nan 1 2", nullptr},
        {"P1\v1 2 3", nullptr},  // a vertical tab separates nothing: three tokens
    };
    for (size_t i = 0; i < std::size(cases); ++i) {
        CSurveyPoint p;
        p.m_strName = "keep";
        p.m_fX = p.m_fY = p.m_fZ = -99;
        p.m_Assignment.m_strObjectId = "old";
        p.m_Assignment.m_strObjectFile = "tree.oqb";
        const bool bAccepted = cases[i].name != nullptr;
        ASSERT_EQ(p.ParseLine(cases[i].line, 7), bAccepted) << "case " << i;
        EXPECT_STREQ(p.m_strName, bAccepted ? cases[i].name : "keep") << "case " << i;
        EXPECT_EQ(p.m_fX, bAccepted ? cases[i].x : -99) << "case " << i;
        EXPECT_EQ(p.m_fY, bAccepted ? cases[i].y : -99) << "case " << i;
        EXPECT_EQ(p.m_fZ, bAccepted ? cases[i].z : -99) << "case " << i;
        EXPECT_STREQ(p.m_Assignment.m_strObjectId, bAccepted ? cases[i].code : "old")
            << "case " << i;
        EXPECT_STREQ(p.m_Assignment.m_strObjectFile, "tree.oqb") << "case " << i;
    }
}

}  // namespace
