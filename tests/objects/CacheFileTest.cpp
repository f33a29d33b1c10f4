// The cache file's line format, and how it is read and replaced.
#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "objects/CacheFile.h"
#include "platform/FileFaults.h"
#include "tests/support/TempFolder.h"

namespace {

using namespace std::string_literals;
using CEntries = std::vector<std::pair<std::string, std::string>>;

CEntries Entries(const CObjectAssignmentArray& entries) {
    CEntries result;
    for (const CObjectAssignment& entry : entries) {
        result.emplace_back(entry.m_strObjectId.Str(), entry.m_strObjectFile.Str());
    }
    return result;
}

CEntries ParseText(const std::string& text, size_t nBlock) {
    CObjectAssignmentArray entries;
    CCacheLineReader reader;
    for (size_t i = 0; i < text.size(); i += nBlock) {
        reader.Feed(std::string_view(text).substr(i, nBlock), entries);
    }
    reader.Finish(entries);
    return Entries(entries);
}

TEST(CacheLineReader, ReadsLinesAsTheFileFormatSays) {
    const std::string longLine = "I=" + std::string(1021, 'f') + "TAIL=g\n";
    static const struct {
        std::string text;
        CEntries expected;
    } kCases[] = {
        // well-formed
        {"A=C:\\o\\a.oqb\r\nB=b.oqb\r\n", {{"A", "C:\\o\\a.oqb"}, {"B", "b.oqb"}}},
        {"A=a\nB=b", {{"A", "a"}, {"B", "b"}}},
        {"A = a \r\n", {{"A ", " a"}}},
        {" \t\vA=a\f\r\n", {{"A", "a"}}},
        {"=a\r\n", {{"", "a"}}},
        {"A=b=c\r\n", {{"A", "b=c"}}},
        {"A=1\r\nA=2\r\n", {{"A", "1"}, {"A", "2"}}},
        // skipped
        {"\r\n   \r\nno equals\r\n=\r\nA=\r\n A = \r\n", {}},
        // a lone CR is no line break; a zero byte ends its line
        {"A\rB=1\r\n", {{"A\rB", "1"}}},
        {"A=1\0junk=2\r\nB=2\r\n"s, {{"A", "1"}, {"B", "2"}}},
        {"A\x1A=1\r\nB=2\r\n", {{"A\x1A", "1"}, {"B", "2"}}},
        // a line longer than 1023 characters is read as pieces
        {longLine, {{"I", std::string(1021, 'f')}, {"TAIL", "g"}}},
    };
    for (size_t i = 0; i < std::size(kCases); ++i) {
        EXPECT_EQ(ParseText(kCases[i].text, kCases[i].text.size() + 1), kCases[i].expected)
            << "case " << i;
        // Blocks of any size give the same, even a CR LF split between two blocks.
        EXPECT_EQ(ParseText(kCases[i].text, 1), kCases[i].expected) << "case " << i;
    }
}

TEST(CacheFile, WritesOneCrLfLinePerEntryAndReadsThemBack) {
    CTempFolder folder;
    const CObjectAssignmentArray entries{{"A", "a.oqb"}, {"", "e.oqb"}, {"A ", " b"}, {"x=y", "z"}};
    const CString strFile = folder.Path("c.Cache").c_str();
    ASSERT_TRUE(WriteObjectCacheFile(strFile, entries));
    EXPECT_EQ(folder.Read("c.Cache"), "A=a.oqb\r\n=e.oqb\r\nA = b\r\nx=y=z\r\n");
    EXPECT_FALSE(folder.Exists("c.Cache.tmp"));
    CObjectAssignmentArray read;
    EXPECT_EQ(ReadObjectCacheFile(strFile, read), ECacheRead::Read);
    // An ID with '=' does not survive: it is read back split at its first '='.
    EXPECT_EQ(Entries(read), (CEntries{{"A", "a.oqb"}, {"", "e.oqb"}, {"A ", " b"}, {"x", "y=z"}}));
}

TEST(CacheFile, AFailedWriteLeavesTheOldFile) {
    static const struct {
        const char* pszFaultPath;  // below the folder
        DWORD dwOperations;
        DWORD dwError;
    } kCases[] = {
        {"c.Cache.tmp", STANDIN_FAULT_CREATE, ERROR_ACCESS_DENIED},
        {"c.Cache.tmp", STANDIN_FAULT_WRITE, ERROR_DISK_FULL},
        {"c.Cache", STANDIN_FAULT_MOVE, ERROR_SHARING_VIOLATION},
    };
    for (size_t i = 0; i < std::size(kCases); ++i) {
        CTempFolder folder;
        folder.Write("c.Cache", "A=old\r\n");
        StandInSetFileFault(folder.Path(kCases[i].pszFaultPath).c_str(), kCases[i].dwOperations,
                            kCases[i].dwError);
        EXPECT_FALSE(WriteObjectCacheFile(folder.Path("c.Cache").c_str(), {{"A", "new"}}))
            << "case " << i;
        StandInSetFileFault(nullptr, 0, 0);
        EXPECT_EQ(folder.Read("c.Cache"), "A=old\r\n") << "case " << i;
        EXPECT_FALSE(folder.Exists("c.Cache.tmp")) << "case " << i;
    }
}

TEST(CacheFile, TellsAMissingFileFromAnUnreadableOne) {
    CTempFolder folder;
    folder.Write("c.Cache", "A=a\r\n");
    CObjectAssignmentArray entries;
    EXPECT_EQ(ReadObjectCacheFile(folder.Path("none.Cache").c_str(), entries), ECacheRead::Missing);
    EXPECT_EQ(ReadObjectCacheFile((folder.Path() + "\\no\\c.Cache").c_str(), entries),
              ECacheRead::Missing);
    for (DWORD dwOperation : {STANDIN_FAULT_OPEN_READ, STANDIN_FAULT_READ}) {
        StandInSetFileFault(folder.Path("c.Cache").c_str(), dwOperation, ERROR_SHARING_VIOLATION);
        EXPECT_EQ(ReadObjectCacheFile(folder.Path("c.Cache").c_str(), entries), ECacheRead::Failed)
            << "operation " << dwOperation;
    }
    StandInSetFileFault(nullptr, 0, 0);
    EXPECT_TRUE(entries.empty());
}

}  // namespace
