// The settings and cache files below the host's folder, end to end: this program is named
// Osrik.exe, so its own folder plays the host's installation folder.
#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>
#include <iterator>

#include "core/Settings.h"
#include "framework/WinApp.h"
#include "objects/ObjectCache.h"

namespace {

class HostFilesTest : public testing::Test {
protected:
    void SetUp() override {
        ASSERT_TRUE(AfxModuleAttach(GetModuleHandleA(nullptr)));
        char szExe[MAX_PATH] = "";
        ASSERT_GT(GetModuleFileNameA(nullptr, szExe, MAX_PATH), 0u);
        m_makros = std::filesystem::path(szExe).parent_path() / "Standard" / "Makros";
        std::filesystem::remove_all(m_makros.parent_path());
    }
    void TearDown() override { std::filesystem::remove_all(m_makros.parent_path()); }

    std::string Read(const char* pszName) const {
        std::ifstream in(m_makros / pszName, std::ios::binary);
        return std::string(std::istreambuf_iterator<char>(in), {});
    }

    std::filesystem::path m_makros;
};

TEST_F(HostFilesTest, SettingsRoundTripThroughTheHostsFolder) {
    std::filesystem::create_directories(m_makros);
    ASSERT_TRUE(SaveSettings({12.5f, 2, 0.5f, "C:\\Vermessung"}));
    EXPECT_EQ(Read("Kalmoret.ini"),
              "[Recent]\r\nHeight=12.500000\r\nSegLen=0.500000\r\n"
              "Interpol=2\r\nPath=C:\\Vermessung\r\n");
    CKalmoretSettings settings;
    ASSERT_TRUE(LoadSettings(settings));
    EXPECT_EQ(settings.m_fHeight, 12.5f);
    EXPECT_EQ(settings.m_fSegLen, 0.5f);
    EXPECT_EQ(settings.m_nInterpol, 2);
    EXPECT_STREQ(settings.m_strPath, "C:\\Vermessung");
}

TEST_F(HostFilesTest, WithoutTheMakrosFolderNothingIsWritten) {
    CKalmoretSettings settings{1.0f, 1, 1.0f, "x"};
    EXPECT_TRUE(SaveSettings(settings));
    CObjectCache cache;
    cache.MergeObjectCache({{"A", "a"}});
    cache.SaveObjectCache();
    EXPECT_FALSE(std::filesystem::exists(m_makros.parent_path()));
    EXPECT_TRUE(LoadSettings(settings));
    EXPECT_EQ(settings.m_fHeight, 0.0f);
    EXPECT_STREQ(settings.m_strPath, "");
}

TEST_F(HostFilesTest, ObjectCacheRoundTripThroughTheHostsFolder) {
    std::filesystem::create_directories(m_makros);
    CObjectCache cache;
    cache.MergeObjectCache({{"Baum", "C:\\Objekte\\Baum.oqb"}, {"Mast", ""}});
    cache.SaveObjectCache();
    EXPECT_EQ(Read("KalmoretObj.Cache"), "Baum=C:\\Objekte\\Baum.oqb\r\n");
    EXPECT_FALSE(std::filesystem::exists(m_makros / "KalmoretObj.Cache.tmp"));
    CObjectCache loaded;
    loaded.LoadObjectCache();
    CString strFile;
    EXPECT_TRUE(loaded.LookupObjectCache("Baum", strFile));
    EXPECT_STREQ(strFile, "C:\\Objekte\\Baum.oqb");
}

}  // namespace
