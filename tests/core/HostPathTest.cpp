// The rule that places the plug-in's data files below the host's folder.
#include <gtest/gtest.h>

#include "core/HostPath.h"

namespace {

TEST(MakeHostRelativePath, ReplacesOnlyAHostFileName) {
    static const struct {
        const char* pszExe;
        const char* pszExpected;  // null: no path
    } kCases[] = {
        {"C:\\Programme\\Osrik\\OsrikPlus.exe", "C:\\Programme\\Osrik\\Standard\\Makros\\K.ini"},
        {"C:\\Programme\\Osrik\\Osrik.exe", "C:\\Programme\\Osrik\\Standard\\Makros\\K.ini"},
        {"C:\\Osrik\\oSRIK.EXE", "C:\\Osrik\\Standard\\Makros\\K.ini"},
        {"D:OsrikPLUS.exe", "D:Standard\\Makros\\K.ini"},
        {"/opt/osrik/Osrik.exe", "/opt/osrik/Standard\\Makros\\K.ini"},
        {"Osrik.exe", "Standard\\Makros\\K.ini"},
        // Not a host: no data file at all, and never the executable itself.
        {"C:\\Tools\\MyOsrik.exe", nullptr},
        {"C:\\Osrik\\Osrik.exe.bak", nullptr},
        {"C:\\Osrik\\Osrik.ex", nullptr},
        {"C:\\Windows\\notepad.exe", nullptr},
        {"", nullptr},
    };
    for (size_t i = 0; i < std::size(kCases); ++i) {
        CString strPath("sentinel");
        const bool found =
            MakeHostRelativePath(kCases[i].pszExe, "Standard\\Makros\\K.ini", strPath);
        EXPECT_EQ(found, kCases[i].pszExpected != nullptr) << "case " << i;
        EXPECT_STREQ(strPath, kCases[i].pszExpected ? kCases[i].pszExpected : "") << "case " << i;
    }
}

TEST(GetHostRelativePath, GivesNoPathBelowAnExecutableThatIsNoHost) {
    CString strPath("sentinel");
    EXPECT_FALSE(GetHostRelativePath(17, strPath));  // this test program is not called Osrik.exe
    EXPECT_TRUE(strPath.IsEmpty());
}

}  // namespace
