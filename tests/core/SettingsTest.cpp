// The settings file: what is read, what is written, and what is never touched.
#include <gtest/gtest.h>

#include <filesystem>
#include <optional>
#include <set>

#include "core/Settings.h"
#include "framework/WinApp.h"
#include "platform/FileFaults.h"
#include "tests/support/TempFolder.h"

namespace {

class SettingsTest : public testing::Test {
protected:
    // The section and key names come from the module's string table.
    void SetUp() override { ASSERT_TRUE(AfxModuleAttach(GetModuleHandleA(nullptr))); }

    static CKalmoretSettings Sentinels() { return {99.0f, 99, 99.0f, "old"}; }
};

TEST_F(SettingsTest, ReadsEachKeyWithItsRule) {
    static const struct {
        std::optional<std::string> file;
        float fHeight;
        float fSegLen;
        int nInterpol;
        const char* pszPath;
    } kCases[] = {
        {std::nullopt, 0.0f, 0.0f, 0, ""},
        {"[Other]\r\nHeight=5\r\n", 0.0f, 0.0f, 0, ""},
        {"[Recent]\r\nHeight=12.5\r\nSegLen=0.25\r\nInterpol=2\r\nPath=C:\\Daten\r\n", 12.5f, 0.25f,
         2, "C:\\Daten"},
        {"[recent]\r\nheight=1,75\r\nSEGLEN=abc\r\nInterpol=7\r\nPath=\r\n", 1.0f, 0.0f, 7, ""},
        {"[Recent]\r\nHeight=\r\nSegLen=-2e0\r\nInterpol=x\r\n", 0.0f, -2.0f, 0, ""},
        // beyond the float range: 0, as for anything else that is no usable number
        {"[Recent]\r\nHeight=1e39\r\nSegLen=-1e39\r\n", 0.0f, 0.0f, 0, ""},
        {"[Recent]\r\nHeight=3.4e38\r\n", 3.4e38f, 0.0f, 0, ""},
    };
    for (size_t i = 0; i < std::size(kCases); ++i) {
        CTempFolder folder;
        if (kCases[i].file) {
            folder.Write("Kalmoret.ini", *kCases[i].file);
        }
        CKalmoretSettings settings = Sentinels();
        ReadSettingsFile(folder.Path("Kalmoret.ini").c_str(), settings);
        EXPECT_EQ(settings.m_fHeight, kCases[i].fHeight) << "case " << i;
        EXPECT_EQ(settings.m_fSegLen, kCases[i].fSegLen) << "case " << i;
        EXPECT_EQ(settings.m_nInterpol, kCases[i].nInterpol) << "case " << i;
        EXPECT_STREQ(settings.m_strPath, kCases[i].pszPath) << "case " << i;
    }
}

TEST_F(SettingsTest, WritesAllFourKeysAndLeavesTheRestAlone) {
    CTempFolder folder;
    folder.Write("k.ini", "; mine\r\n[Recent]\r\nPath=C:\\Alt\r\nextra=1\r\n[Other]\r\nx=y\r\n");
    const CString strFile = folder.Path("k.ini").c_str();
    WriteSettingsFile(strFile, {12.5f, 1, 0.1f, ""});
    EXPECT_EQ(folder.Read("k.ini"),
              "; mine\r\n[Recent]\r\nPath=\r\nextra=1\r\nHeight=12.500000\r\n"
              "SegLen=0.100000\r\nInterpol=1\r\n[Other]\r\nx=y\r\n");
    CKalmoretSettings settings = Sentinels();
    ReadSettingsFile(strFile, settings);
    EXPECT_EQ(settings.m_fHeight, 12.5f);
    EXPECT_EQ(settings.m_fSegLen, 0.1f);
    EXPECT_EQ(settings.m_nInterpol, 1);
    EXPECT_STREQ(settings.m_strPath, "");
}

TEST_F(SettingsTest, AFileThatCannotBeWrittenIsNotReported) {
    CTempFolder folder;
    folder.Write("k.ini", "[Recent]\r\nHeight=1\r\n");
    StandInSetFileFault(folder.Path().c_str(), STANDIN_FAULT_CREATE, ERROR_ACCESS_DENIED);
    const CKalmoretSettings settings{2.0f, 2, 3.0f, "C:\\x"};
    WriteSettingsFile(folder.Path("k.ini").c_str(), settings);
    StandInSetFileFault(nullptr, 0, 0);
    EXPECT_EQ(folder.Read("k.ini"), "[Recent]\r\nHeight=1\r\n");
    EXPECT_EQ(settings.m_fHeight, 2.0f);
}

// Lists the folder of this test program with each file's size and time.
std::set<std::string> ListExecutableFolder() {
    char szExe[MAX_PATH] = "";
    GetModuleFileNameA(nullptr, szExe, MAX_PATH);
    std::set<std::string> entries;
    for (const auto& entry :
         std::filesystem::directory_iterator(std::filesystem::path(szExe).parent_path())) {
        std::error_code ignored;
        entries.insert(entry.path().string() + " " +
                       std::to_string(entry.is_regular_file() ? entry.file_size() : 0) + " " +
                       std::to_string(entry.last_write_time(ignored).time_since_epoch().count()));
    }
    return entries;
}

TEST_F(SettingsTest, AnExecutableThatIsNoHostHasNoSettingsFile) {
    const std::set<std::string> before = ListExecutableFolder();
    CKalmoretSettings settings = Sentinels();
    EXPECT_FALSE(LoadSettings(settings));
    EXPECT_EQ(settings.m_fHeight, 99.0f);
    EXPECT_STREQ(settings.m_strPath, "old");
    EXPECT_FALSE(SaveSettings(settings));
    EXPECT_EQ(ListExecutableFolder(), before);
}

}  // namespace
