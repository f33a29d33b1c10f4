// The assignment table built from a point set, and its lookups.
#include <gtest/gtest.h>

#include <vector>

#include "import/SurveyPointSet.h"
#include "objects/AssignmentTable.h"

namespace {

CSurveyPointSet MakePoints(const std::vector<std::pair<const char*, const char*>>& codes) {
    CSurveyPointSet points;
    for (const auto& [pszId, pszFile] : codes) {
        CSurveyPoint point;
        point.m_Assignment.m_strObjectId = pszId;
        point.m_Assignment.m_strObjectFile = pszFile;
        points.Add(point);
    }
    return points;
}

std::vector<std::pair<std::string, std::string>> Entries(const CObjectAssignmentArray& table) {
    std::vector<std::pair<std::string, std::string>> entries;
    for (const CObjectAssignment& entry : table) {
        entries.emplace_back(entry.m_strObjectId.Str(), entry.m_strObjectFile.Str());
    }
    return entries;
}

TEST(BuildAssignmentTable, OneEntryPerIdInOrderOfFirstOccurrence) {
    using E = std::vector<std::pair<std::string, std::string>>;
    static const struct {
        std::vector<std::pair<const char*, const char*>> points;
        E expected;
    } kCases[] = {
        {{{"A", "a1"}, {"B", ""}, {"A", "a2"}, {"C", "c"}, {"B", "b"}},
         {{"A", "a1"}, {"B", ""}, {"C", "c"}}},
        {{{"X", ""}, {"", ""}, {"Y", ""}, {"", "e"}}, {{"X", ""}, {"", ""}, {"Y", ""}}},
        {{{"B", ""}, {"b", ""}, {"B ", ""}, {"b", ""}}, {{"B", ""}, {"b", ""}, {"B ", ""}}},
        {{}, {}},
    };
    for (size_t i = 0; i < std::size(kCases); ++i) {
        CObjectAssignmentArray table;
        BuildAssignmentTable(MakePoints(kCases[i].points), table);
        EXPECT_EQ(Entries(table), kCases[i].expected) << "case " << i;
    }
}

TEST(FindAssignment, FirstEntryOfTheExactId) {
    const CObjectAssignmentArray table{{"A", "first"}, {"a", "lower"}, {"A", "second"}, {"E", ""}};
    static const struct {
        const char* pszId;
        bool bFound;
        const char* pszFile;
    } kCases[] = {
        {"A", true, "first"},       {"a", true, "lower"},     {"E", true, ""},
        {"A ", false, "untouched"}, {"", false, "untouched"},
    };
    for (size_t i = 0; i < std::size(kCases); ++i) {
        CString strFile("untouched");
        EXPECT_EQ(FindAssignment(table, kCases[i].pszId, strFile), kCases[i].bFound)
            << "case " << i;
        EXPECT_EQ(HasObjectId(table, kCases[i].pszId), kCases[i].bFound) << "case " << i;
        EXPECT_STREQ(strFile, kCases[i].pszFile) << "case " << i;
    }
}

}  // namespace
