// The stand-in's profile functions against the behaviour of Windows' own.
#include <gtest/gtest.h>

#include <cstring>
#include <optional>
#include <string>

#include "platform/FileFaults.h"
#include "platform/Win32.h"
#include "tests/support/TempFolder.h"

namespace {

using namespace std::string_literals;

constexpr DWORD kUnset = 0xDEADBEEF;

struct CReadCase {
    const char* pszComment;
    std::string file;
    const char* pszSection;
    const char* pszKey;
    const char* pszDefault;
    DWORD nSize;
    const char* pszExpected;
    DWORD dwError;  // GetLastError afterwards, kUnset for untouched
};

const CReadCase kReadCases[] = {
    // lookup
    {"names ignore case", "[Recent]\r\nHeight=12.5\r\n", "rECENT", "HEIGHT", "d", 64, "12.5",
     kUnset},
    {"blanks trimmed", " \t[ Recent ] \r\n\v Height \t= 12.5 \t\r\n", "Recent", "Height", "d", 64,
     "12.5", kUnset},
    {"argument spaces", "[A]\r\nk=v\r\n", "  A ", " k  ", "d", 64, "v", kUnset},
    {"argument tab fails", "[A]\r\nk=v\r\n", "A", "\tk", "d", 64, "d", kUnset},
    {"first key wins", "[A]\r\nk=1\r\nK=2\r\n", "A", "k", "d", 64, "1", kUnset},
    {"first section only", "[A]\r\nx=1\r\n[a]\r\nk=2\r\n", "A", "k", "d", 64, "d", kUnset},
    {"before any section", "k=1\r\n[A]\r\n", "", "k", "d", 64, "d", kUnset},
    {"empty section name", "[]\r\nk=1\r\n", "", "k", "d", 64, "1", kUnset},
    {"header without ]", "[A \r\nk=3", "A", "k", "d", 64, "3", kUnset},
    {"text after ]", "[A] x=9\r\nk=3\r\n", "A", "k", "d", 64, "3", kUnset},
    {"LF lines", "[A]\nk=4\n", "A", "k", "d", 64, "4", kUnset},
    {"CR lines", "[A]\rk=5\r", "A", "k", "d", 64, "5", kUnset},
    {"Windows-1252 case", "[H\xF6he]\r\nk=6\r\n", "H\xD6HE", "K", "d", 64, "6", kUnset},
    // comments
    {"comment line", "[A]\r\n  ;k=1\r\nk=2\r\n", "A", "k", "d", 64, "2", kUnset},
    {"no inline comment", "[A]\r\nk=v ;x\r\n", "A", "k", "d", 64, "v ;x", kUnset},
    {"comment key", "[A]\r\n;k=1\r\n", "A", ";k", "d", 64, "d", kUnset},
    // quotes
    {"double quotes", "[A]\r\nk=\" a b \"\r\n", "A", "k", "d", 64, " a b ", kUnset},
    {"single quotes", "[A]\r\nk='v'\r\n", "A", "k", "d", 64, "v", kUnset},
    {"crossed quotes", "[A]\r\nk=\"v'\r\n", "A", "k", "d", 64, "\"v'", kUnset},
    {"lone quote", "[A]\r\nk=\"\r\n", "A", "k", "d", 64, "\"", kUnset},
    // values and defaults
    {"empty value", "[A]\r\nk=\r\n", "A", "k", "d", 64, "", kUnset},
    {"line without =", "[A]\r\nk\r\n", "A", "k", "d", 64, "d", kUnset},
    {"empty key argument", "[A]\r\n=v\r\n", "A", "", "d", 64, "d", kUnset},
    {"default trailing spaces", "[A]\r\n", "A", "k", " d\t  ", 64, " d\t", kUnset},
    {"null default", "[A]\r\n", "A", "k", nullptr, 64, "", kUnset},
    // buffer sizes
    {"exact size", "[A]\r\nk=val1\r\n", "A", "k", "d", 5, "val1", kUnset},
    {"one short", "[A]\r\nk=val1\r\n", "A", "k", "d", 4, "val", ERROR_MORE_DATA},
    {"size 1", "[A]\r\nk=val1\r\n", "A", "k", "d", 1, "", ERROR_MORE_DATA},
    {"default cut", "[A]\r\n", "A", "k", "default", 4, "def", ERROR_MORE_DATA},
};

TEST(GetPrivateProfileString, ReadsAsWindowsDoes) {
    for (size_t i = 0; i < std::size(kReadCases); ++i) {
        const CReadCase& c = kReadCases[i];
        CTempFolder folder;
        folder.Write("a.ini", c.file);
        char szBuffer[64];
        std::memset(szBuffer, '#', sizeof szBuffer);
        SetLastError(kUnset);
        const DWORD n = GetPrivateProfileStringA(c.pszSection, c.pszKey, c.pszDefault, szBuffer,
                                                 c.nSize, folder.Path("a.ini").c_str());
        EXPECT_STREQ(szBuffer, c.pszExpected) << "case " << i << ": " << c.pszComment;
        EXPECT_EQ(n, std::strlen(c.pszExpected)) << "case " << i << ": " << c.pszComment;
        EXPECT_EQ(GetLastError(), c.dwError) << "case " << i << ": " << c.pszComment;
    }
}

TEST(GetPrivateProfileString, MissingFileGivesDefaultAndSizeZeroTouchesNothing) {
    CTempFolder folder;
    char szBuffer[16] = "untouched";
    const std::string path = folder.Path("missing.ini");
    EXPECT_EQ(GetPrivateProfileStringA("A", "k", "x", szBuffer, 0, path.c_str()), 0u);
    EXPECT_STREQ(szBuffer, "untouched");
    SetLastError(kUnset);
    EXPECT_EQ(GetPrivateProfileStringA("A", "k", "x", szBuffer, 16, path.c_str()), 1u);
    EXPECT_STREQ(szBuffer, "x");
    EXPECT_EQ(GetLastError(), ERROR_FILE_NOT_FOUND);
}

TEST(GetPrivateProfileString, ListsNamesWithDoubleZero) {
    CTempFolder folder;
    folder.Write("a.ini", "[one]\r\nk1=1\r\n;c=0\r\nbare\r\nk2=\r\n[two]\r\n[one]\r\nk3=3\r\n");
    const std::string path = folder.Path("a.ini");
    char szBuffer[32];
    EXPECT_EQ(GetPrivateProfileStringA(nullptr, "x", "", szBuffer, 32, path.c_str()), 12u);
    EXPECT_EQ(std::string(szBuffer, 13), "one\0two\0one\0\0"s);
    EXPECT_EQ(GetPrivateProfileStringA("ONE", nullptr, "", szBuffer, 32, path.c_str()), 6u);
    EXPECT_EQ(std::string(szBuffer, 7), "k1\0k2\0\0"s);
    // Too small: the last name is cut and the list still ends in two zeros.
    EXPECT_EQ(GetPrivateProfileStringA(nullptr, nullptr, "", szBuffer, 7, path.c_str()), 5u);
    EXPECT_EQ(std::string(szBuffer, 7), "one\0t\0\0"s);
}

TEST(GetPrivateProfileInt, ConvertsAsWindowsDoes) {
    static const struct {
        const char* pszValue;  // null: no such key
        INT nDefault;
        UINT nExpected;
    } kCases[] = {
        {nullptr, -1, 4294967295u},
        {nullptr, 1, 1},
        {"", 5, 5},
        {"-1", 1, 4294967295u},
        {"+1", -1, 1},
        {"7", 0, 7},
        {"4294967296", 1, 0},
        {"4294967297", 0, 1},
        {"-4294967297", 0, 4294967295u},
        {"42A94967297", 0, 42},
        {"B42", 1, 0},
        {"0x1A", 0, 26},
        {"0X1A", 0, 0},
        {"\"12\"", 0, 12},
        {"1,75", 0, 1},
    };
    for (size_t i = 0; i < std::size(kCases); ++i) {
        CTempFolder folder;
        folder.Write("a.ini", kCases[i].pszValue ? "[A]\r\nk=" + std::string(kCases[i].pszValue)
                                                 : "[A]\r\n");
        EXPECT_EQ(GetPrivateProfileIntA("A", "K", kCases[i].nDefault, folder.Path("a.ini").c_str()),
                  kCases[i].nExpected)
            << "case " << i;
    }
}

struct CWriteCase {
    const char* pszComment;
    std::optional<std::string> file;  // nullopt: no file
    const char* pszSection;
    const char* pszKey;
    const char* pszValue;
    std::string expected;
};

const CWriteCase kWriteCases[] = {
    {"new file", std::nullopt, "App", "key", "string", "[App]\r\nkey=string\r\n"},
    {"new section at the end", "[App1]\r\nkey1=string1\r\n[App2]\r\nkey4=string4\r\n", "App3",
     "key5", "string5",
     "[App1]\r\nkey1=string1\r\n[App2]\r\nkey4=string4\r\n[App3]\r\nkey5=string5\r\n"},
    {"open last line", "[A]\r\nk=1", "B", "k", "2", "[A]\r\nk=1\r\n[B]\r\nk=2\r\n"},
    {"replace keeps name, case, place", "[app]\r\n  KEY = old\r\nz=1\r\n", " App ", "key", "new",
     "[app]\r\n  KEY = new\r\nz=1\r\n"},
    {"after last key", "[A]\r\nk1=1\r\n;c\r\n\r\n[B]\r\nk=2\r\n", "a", "k2", "x",
     "[A]\r\nk1=1\r\nk2=x\r\n;c\r\n\r\n[B]\r\nk=2\r\n"},
    {"section without keys", "[A]\r\n\r\n[B]\r\n", "A", "k", "v", "[A]\r\nk=v\r\n\r\n[B]\r\n"},
    {"semicolon key at section end", "[A]\r\nk=1\r\n;c\r\n\r\n", "A", ";x", "2",
     "[A]\r\nk=1\r\n;c\r\n;x=2\r\n\r\n"},
    {"other lines kept byte for byte", "\0junk\n[A]\nk=1\n; c \n"s, "A", "j", "2",
     "\0junk\n[A]\nk=1\nj=2\r\n; c \n"s},
    {"value as given", "[A]\r\n", "A", "k", " v ", "[A]\r\nk= v \r\n"},
    {"empty value", "[A]\r\nk=1\r\n", "A", "k", "", "[A]\r\nk=\r\n"},
    {"null value deletes key", "[A]\r\nk=1\r\nj=2\r\n", "A", "K", nullptr, "[A]\r\nj=2\r\n"},
    {"null key deletes section", "[A]\r\nk=1\r\n;c\r\n[B]\r\nj=2\r\n", "a", nullptr, nullptr,
     ";c\r\n[B]\r\nj=2\r\n"},
    {"delete on a missing file", std::nullopt, "A", "k", nullptr, ""},
};

TEST(WritePrivateProfileString, EditsAsWindowsDoes) {
    for (size_t i = 0; i < std::size(kWriteCases); ++i) {
        const CWriteCase& c = kWriteCases[i];
        CTempFolder folder;
        if (c.file) {
            folder.Write("a.ini", *c.file);
        }
        EXPECT_TRUE(WritePrivateProfileStringA(c.pszSection, c.pszKey, c.pszValue,
                                               folder.Path("a.ini").c_str()))
            << "case " << i << ": " << c.pszComment;
        EXPECT_EQ(folder.Read("a.ini"), c.expected) << "case " << i << ": " << c.pszComment;
    }
}

TEST(WritePrivateProfileString, FailsWithoutWritingWhereWindowsFails) {
    CTempFolder folder;
    folder.Write("a.ini", "[A]\r\nk=1\r\n");
    const std::string file = folder.Path("a.ini");
    static const struct {
        const char* pszSection;
        std::string path;
        DWORD dwError;
    } kCases[] = {
        {nullptr, file, ERROR_FILE_NOT_FOUND},
        {"A", "", ERROR_ACCESS_DENIED},
        {"A", "a.ini", ERROR_FILE_NOT_FOUND},  // a bare name means the Windows folder
        {"A", folder.Path("missing\\a.ini"), ERROR_PATH_NOT_FOUND},
    };
    for (size_t i = 0; i < std::size(kCases); ++i) {
        SetLastError(kUnset);
        EXPECT_FALSE(
            WritePrivateProfileStringA(kCases[i].pszSection, "k", "2", kCases[i].path.c_str()))
            << "case " << i;
        EXPECT_EQ(GetLastError(), kCases[i].dwError) << "case " << i;
    }
    EXPECT_FALSE(folder.Exists("missing"));
    StandInSetFileFault(folder.Path().c_str(), STANDIN_FAULT_CREATE, ERROR_ACCESS_DENIED);
    EXPECT_FALSE(WritePrivateProfileStringA("A", "k", "2", file.c_str()));
    StandInSetFileFault(nullptr, 0, 0);
    EXPECT_EQ(GetLastError(), ERROR_ACCESS_DENIED);
    EXPECT_EQ(folder.Read("a.ini"), "[A]\r\nk=1\r\n");
}

}  // namespace
