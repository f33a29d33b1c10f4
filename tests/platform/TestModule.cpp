// A module for the loader tests: its DllMain fails the load when asked to through the environment,
// and it counts its attach and detach calls in the executable's exported counters.
#include <cstdlib>

#include "platform/Win32.h"

extern "C" BOOL WINAPI DllMain(HINSTANCE, DWORD dwReason, LPVOID) {
    auto* counters =
        reinterpret_cast<int*>(GetProcAddress(GetModuleHandleA(nullptr), "g_anDllMainCalls"));
    if (counters) {
        ++counters[dwReason == DLL_PROCESS_ATTACH ? 0 : 1];
    }
    return std::getenv("KALMORET_TEST_FAIL_ATTACH") ? FALSE : TRUE;
}

extern "C" int TestModuleAnswer() {
    return 42;
}
