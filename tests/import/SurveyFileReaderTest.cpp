#include <gtest/gtest.h>

#include <cstring>
#include <fstream>
#include <sstream>

#include "import/SurveyPointSet.h"
#include "tests/import/SurveyReference.h"

namespace {

std::string TestFile(const char* name) {
    return std::string(KALMORET_TESTDATA_DIR) + "/survey/" + name;
}

// Writes bytes to a file in the test folder and returns its path.
std::string WriteFile(const std::string& bytes) {
    const std::string path = testing::TempDir() + "survey_" +
                             testing::UnitTest::GetInstance()->current_test_info()->name();
    std::ofstream(path, std::ios::binary) << bytes;
    return path;
}

// A set holding a point and creation mode 2, so that a read shows what it discards.
CSurveyPointSet UsedSet() {
    CSurveyPointSet set;
    set.Add(CSurveyPoint());
    set.SetCreationMode(2);
    return set;
}

// Every point of the set, bit for bit, against the reference reading of the same bytes.
void ExpectAsReference(const CSurveyPointSet& set, const std::string& path) {
    std::ostringstream bytes;
    bytes << std::ifstream(path, std::ios::binary).rdbuf();
    const auto expected = survey_reference::Read(bytes.str());
    ASSERT_EQ(size_t(set.GetCount()), expected.size()) << path;
    for (size_t i = 0; i < expected.size(); ++i) {
        const CSurveyPoint& p = set.GetAt(int(i));
        const float xyz[3] = {p.m_fX, p.m_fY, p.m_fZ};
        const float ref[3] = {expected[i].x, expected[i].y, expected[i].z};
        EXPECT_EQ(p.m_strName.Str(), expected[i].name) << path << ", point " << i;
        EXPECT_EQ(std::memcmp(xyz, ref, sizeof xyz), 0) << path << ", point " << i;
        EXPECT_EQ(p.m_Assignment.m_strObjectId.Str(), expected[i].code) << path << ", point " << i;
    }
}

TEST(SurveyFileReader, FailsOnWhatCannotBeOpenedOrReadAndLeavesTheSetEmpty) {
    for (const std::string& path :
         {TestFile("no_such_file.asc"), testing::TempDir(), std::string()}) {
        CSurveyPointSet set = UsedSet();
        EXPECT_FALSE(set.ReadFile(path.c_str())) << path;
        EXPECT_EQ(set.GetCount(), 0) << path;
        EXPECT_EQ(set.GetCreationMode(), 0) << path;
        EXPECT_TRUE(set.GetFileName().IsEmpty()) << path;
    }
}

TEST(SurveyFileReader, ReadsNamesNumbersLongLinesAndLineEnds) {
    const std::string bytes =
        "Punkt X Y Z\r\n"
        "P1 1 2 3\n"
        "P1 1 x 3\n"  // skipped lines are not counted
        "  P2\t4 5 6 Baum\talt  \r\n"
        "7 8 9\n"
        "A 1 2 3 " +
        std::string(246, 'c') +                  // 300 characters: a point of
        std::string(41, ' ') + "10 11 12\r\n" +  // 254 and one of 46
        "1 2 3 4\n"
        "13 14 15\x1a"
        "16 17 18\n";  // Ctrl-Z ends the text
    const std::string path = WriteFile(bytes);
    const size_t nSeparator =
        path.find_last_of("/\\");  // Windows' temporary folder ends in a backslash
    const std::string odd = path.substr(0, nSeparator) + "/./" + path.substr(nSeparator + 1);
    CSurveyPointSet set = UsedSet();
    ASSERT_TRUE(set.ReadFile(odd.c_str()));
    EXPECT_EQ(set.GetFileName().Str(), odd);  // kept as passed
    EXPECT_EQ(set.GetCreationMode(), 0);
    static const struct {
        const char* name;
        float x;
        const char* code;
    } expected[] = {{"P1", 1, ""}, {"P2", 4, "Baum\talt"}, {"2", 7, ""}, {"A", 1, nullptr},
                    {"4", 10, ""}, {"1", 2, ""},           {"6", 13, ""}};
    ASSERT_EQ(set.GetCount(), int(std::size(expected)));
    for (size_t i = 0; i < std::size(expected); ++i) {
        const CSurveyPoint& p = set.GetAt(int(i));
        EXPECT_STREQ(p.m_strName, expected[i].name) << "point " << i;
        EXPECT_EQ(p.m_fX, expected[i].x) << "point " << i;
        if (expected[i].code != nullptr) {
            EXPECT_STREQ(p.m_Assignment.m_strObjectId, expected[i].code) << "point " << i;
        }
    }
    EXPECT_EQ(set.GetAt(3).m_Assignment.m_strObjectId.GetLength(), 246);
    EXPECT_EQ(set.GetMaximum().m_fZ, 15.0f);
    ExpectAsReference(set, path);
    ASSERT_TRUE(set.ReadFile(set.GetFileName()));  // read again, as the dialog does
    EXPECT_EQ(set.GetCount(), int(std::size(expected)));
    std::remove(path.c_str());
}

TEST(SurveyFileReader, LargeFileWithChangingDensityReadsAsTheReference) {
    // Past the first block and the point where the array is sized by the density so far; dense
    // point lines first, then mostly other lines, so that estimate is far too high.
    std::string bytes;
    for (int i = 0; i < 20000; ++i) {
        bytes += "P" + std::to_string(i) + " 3512345.123 5801234.567 " + std::to_string(i % 977) +
                 ".5 Baum\n" +
                 (i > 6000 ? "Punkt X Y Z\r\n\r\n" + std::string(size_t(i % 600), '-') + "\n" : "");
    }
    const std::string path = WriteFile(bytes);
    CSurveyPointSet set;
    ASSERT_TRUE(set.ReadFile(path.c_str()));
    EXPECT_EQ(set.GetCount(), 20000);
    ExpectAsReference(set, path);
    std::remove(path.c_str());
}

TEST(SurveyFileReader, RealExportsReadAsTheRulesSay) {
    // Counts checked against the files' descriptions and an independent awk reading; one
    // line of each file checked by hand.
    static const struct {
        const char* file;
        int count, index;
        const char* name = nullptr;
        float x = 0, y = 0, z = 0;
        const char* code = nullptr;
    } cases[] = {
        {"tba4236_points_ascii.txt", 4, 3, "G24T0151", 2813756.678f, 516950.798f, 5681546.661f,
         "KRISTIANS"},  // last line, no line end
        {"tba4236_points_utf8.txt", 4, 2, "G24T0477", 2814018.265f, 515471.447f, 5681482.799f,
         "\xc3\x98YA"},
        {"pdal_utm17_2.txt", 10, 9, "9", 289818.5f, 4320980.59f, 170.58f, ""},     // header skipped
        {"pdal_crlf_test2.txt", 10, 0, "289814.15", 4320978.61f, 170.76f, 0, ""},  // 4 numbers
        {"survey2gis_sample_data_min.dat", 221, 0, "68", 3513037.116f, 5279880.877f, 399.59f, ""},
        {"survey2gis_sample_data_none.dat", 0, -1},
        // angle and distance lines of the total station read as name X Y Z code too
        {"tops_leica_tcr_1205.txt", 1432, 0, "OA6", 450398.831f, 205884.254f, 56.973f, "REF"},
        {"tops_leica_tcr_705.txt", 0, -1},  // comma separated
    };
    for (size_t i = 0; i < std::size(cases); ++i) {
        CSurveyPointSet set;
        ASSERT_TRUE(set.ReadFile(TestFile(cases[i].file).c_str())) << "case " << i;
        ASSERT_EQ(set.GetCount(), cases[i].count) << "case " << i;
        ExpectAsReference(set, TestFile(cases[i].file));
        if (cases[i].index >= 0) {
            const CSurveyPoint& p = set.GetAt(cases[i].index);
            EXPECT_STREQ(p.m_strName, cases[i].name) << "case " << i;
            EXPECT_EQ(p.m_fX, cases[i].x) << "case " << i;
            EXPECT_EQ(p.m_fY, cases[i].y) << "case " << i;
            EXPECT_EQ(p.m_fZ, cases[i].z) << "case " << i;
            EXPECT_STREQ(p.m_Assignment.m_strObjectId, cases[i].code) << "case " << i;
        }
    }
}

}  // namespace
