#include <gtest/gtest.h>

#include <cstdlib>
#include <string>

#include "platform/Win32.h"

// Read by the test module through GetProcAddress on the executable: [0] attach, [1] detach calls.
extern "C" {
__attribute__((visibility("default"))) int g_anDllMainCalls[2] = {0, 0};
}

namespace {

const char* ModulePath() {
    return KALMORET_TEST_MODULE;
}

TEST(Module, LoadRunsDllMainAndFreeRunsItAgain) {
    g_anDllMainCalls[0] = g_anDllMainCalls[1] = 0;
    HMODULE hModule = LoadLibraryA(ModulePath());
    ASSERT_NE(hModule, nullptr);
    EXPECT_EQ(g_anDllMainCalls[0], 1);
    HMODULE hAgain = LoadLibraryA(ModulePath());  // a second load only counts
    EXPECT_EQ(hAgain, hModule);
    EXPECT_EQ(g_anDllMainCalls[0], 1);

    auto answer = reinterpret_cast<int (*)()>(
        reinterpret_cast<void*>(GetProcAddress(hModule, "TestModuleAnswer")));
    ASSERT_NE(answer, nullptr);
    EXPECT_EQ(answer(), 42);
    EXPECT_EQ(GetProcAddress(hModule, "NoSuchFunction"), nullptr);

    char path[MAX_PATH] = "";
    EXPECT_EQ(GetModuleFileNameA(hModule, path, MAX_PATH), std::string(ModulePath()).size());
    EXPECT_STREQ(path, ModulePath());

    EXPECT_TRUE(FreeLibrary(hAgain));
    EXPECT_EQ(g_anDllMainCalls[1], 0);
    EXPECT_TRUE(FreeLibrary(hModule));
    EXPECT_EQ(g_anDllMainCalls[1], 1);
    EXPECT_FALSE(FreeLibrary(hModule));
}

TEST(Module, DllMainReturningFalseFailsTheLoad) {
    g_anDllMainCalls[0] = g_anDllMainCalls[1] = 0;
    setenv("KALMORET_TEST_FAIL_ATTACH", "1", 1);
    EXPECT_EQ(LoadLibraryA(ModulePath()), nullptr);
    unsetenv("KALMORET_TEST_FAIL_ATTACH");
    EXPECT_EQ(g_anDllMainCalls[0], 1);
    EXPECT_EQ(g_anDllMainCalls[1], 1);  // the loader detaches what failed to attach
    EXPECT_EQ(LoadLibraryA("/nonexistent/Module.so"), nullptr);
}

TEST(Module, TheExecutableByNameAndItsExports) {
    char path[MAX_PATH] = "";
    const DWORD length = GetModuleFileNameA(nullptr, path, MAX_PATH);
    ASSERT_GT(length, 0u);
    HMODULE hExe = GetModuleHandleA(path);
    EXPECT_EQ(hExe, GetModuleHandleA(nullptr));
    EXPECT_NE(GetProcAddress(hExe, "g_anDllMainCalls"), nullptr);

    char small[5] = "";  // truncated with its zero, returning the buffer size
    EXPECT_EQ(GetModuleFileNameA(nullptr, small, 5), 5u);
    EXPECT_EQ(std::string(small), std::string(path, 4));

    HMODULE hFromAddress = nullptr;
    EXPECT_TRUE(GetModuleHandleExA(
        GET_MODULE_HANDLE_EX_FLAG_FROM_ADDRESS | GET_MODULE_HANDLE_EX_FLAG_UNCHANGED_REFCOUNT,
        reinterpret_cast<LPCSTR>(&g_anDllMainCalls), &hFromAddress));
    EXPECT_EQ(hFromAddress, hExe);
}

}  // namespace
