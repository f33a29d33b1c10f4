#include <gtest/gtest.h>

#include "PluginTestBase.h"

namespace {

using Calls = std::vector<std::string>;

const Calls kConnectCalls = {
    "Advise",
    "GetProgramPath",
    "SetHelpFile 0 C:\\Osrik\\Osrik.hlp",
    "SetMessageHooks both",
    "CreateToolbar 0x08020204",
    "AddToolbarButton 100 bitmap Definition von H\xf6henpunkten per H\xf6henlinie|H\xf6henlinie "
    "eingeben 50040",
    "AddToolbarButton 100 bitmap Einlesen von Geometer-Dateien|Geometer-Datei einlesen 50043",
    "AddButtonEntry 101 bitmap 0x08020203 H\xf6henlinie als Polylinie eingeben 50040",
    "AddButtonEntry 101 bitmap 0x08020203 H\xf6henlinie als Polygon eingeben 50041",
    "AddButtonEntry 102 bitmap 0x08020203 Einlesen von Geometer-Dateien|Geometer-Datei einlesen "
    "50043",
    "ShowToolbar 100 0 0 1 1",
};

TEST_F(PluginTest, RegistrationConnectsAndProgramExitDisconnects) {
    Attach();
    ASSERT_NE(Impl(), nullptr);
    EXPECT_EQ(Host().m_calls, kConnectCalls);
    EXPECT_EQ(Impl()->m_lToolbar, 100);
    EXPECT_EQ(Impl()->m_lImportEntry, 105);
    EXPECT_EQ(Host().m_nRefs, 3u);  // the application and the macro interface
    ASSERT_NE(Host().m_pSink, nullptr);

    ClearCalls();
    Impl()->OnProgramExit();
    EXPECT_EQ(Host().m_calls, (Calls{"DeleteToolbar 100", "RefreshToolbars", "Unadvise 9"}));
    EXPECT_EQ(Host().m_nRefs, 1u);
    ClearCalls();
    Impl()->Disconnect();  // a second disconnection does nothing
    EXPECT_TRUE(Host().m_calls.empty());
}

TEST_F(PluginTest, HelpPathIsJoinedWithoutASeparator) {
    Host().m_strProgramPath = OLESTR("C:\\Osrik");
    Attach();
    EXPECT_EQ(Host().m_calls[2], "SetHelpFile 0 C:\\OsrikOsrik.hlp");
    EXPECT_EQ(GetKalmoretApp()->m_strHelpPath, CString("C:\\OsrikOsrik.hlp"));
}

TEST_F(PluginTest, FailingProgramPathStillBuildsTheToolbar) {
    Host().m_hrProgramPath = E_FAIL;
    GetKalmoretApp()->m_strHelpPath = "kept";
    Attach();
    EXPECT_EQ(Host().m_calls[2], "SetHelpFile 0 kept");
    EXPECT_EQ(Host().m_calls.back(), "ShowToolbar 100 0 0 1 1");
    GetKalmoretApp()->m_strHelpPath.Empty();
}

TEST_F(PluginTest, RefusedEventConnectionIsShownAndFails) {
    Host().m_hrAdvise = CONNECT_E_CANNOTCONNECT;
    Answers().push_back(IDOK);
    Attach();  // the module still loads
    ASSERT_NE(Impl(), nullptr);
    EXPECT_EQ(Host().m_calls, Calls{"Advise"});
    ASSERT_EQ(Boxes().size(), 1u);
    EXPECT_EQ(Boxes()[0].text, "Es konnte keine Event-Verbindung zu Osrik hergestellt werden!");
    EXPECT_EQ(Boxes()[0].caption, "core_test");
    EXPECT_EQ(Boxes()[0].type, MB_OK);
    // Disconnecting the half-connected object calls no host method but gives back the macro.
    Impl()->Disconnect();
    EXPECT_EQ(Host().m_calls, Calls{"Advise"});
    EXPECT_EQ(Host().m_nRefs, 1u);
}

TEST_F(PluginTest, NullHostOrNoMacroInterfaceFailsSilently) {
    Host().m_bHasMacro = false;
    Attach();
    EXPECT_TRUE(Host().m_calls.empty());
    EXPECT_TRUE(Boxes().empty());
    auto impl = new CKalmoretImpl;
    EXPECT_FALSE(impl->Connect(nullptr));
    impl->Disconnect();
    impl->Release();
}

}  // namespace
