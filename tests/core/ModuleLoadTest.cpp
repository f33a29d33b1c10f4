// The plug-in module loaded by a process that offers no registration entry: it loads, stays quiet
// and unloads. (The test executable exports nothing of that name.)
#include <gtest/gtest.h>

#include "platform/HostDriver.h"
#include "platform/Win32.h"

namespace {

TEST(PluginModule, LoadsAndUnloadsInAHostWithoutRegistration) {
    static int s_nBoxes = 0;
    DriverSetMessageBoxProc(
        [](void*, LPCSTR, LPCSTR, UINT) {
            ++s_nBoxes;
            return IDOK;
        },
        nullptr);
    HMODULE hModule = LoadLibraryA(KALMORET_PLUGIN_MODULE);
    ASSERT_NE(hModule, nullptr);
    EXPECT_EQ(s_nBoxes, 0);
    EXPECT_TRUE(FreeLibrary(hModule));
    DriverSetMessageBoxProc(nullptr, nullptr);
}

}  // namespace
