// Module functions of the stand-in over dlopen/dlsym.
#include <dlfcn.h>
#include <link.h>
#include <unistd.h>

#include <climits>
#include <cstring>
#include <map>
#include <string>

#include "platform/Win32.h"

namespace {

using DLLMAIN = BOOL (*)(HINSTANCE, DWORD, LPVOID);

// Load counts of the modules LoadLibraryA loaded, to run DllMain on the first and last only.
std::map<void*, int>& LoadCounts() {
    static std::map<void*, int> counts;
    return counts;
}

void* ExecutableHandle() {
    static void* handle = dlopen(nullptr, RTLD_NOW);
    return handle;
}

std::string ExecutablePath() {
    char buffer[PATH_MAX];
    const ssize_t n = readlink("/proc/self/exe", buffer, sizeof buffer);
    return n > 0 ? std::string(buffer, size_t(n)) : std::string();
}

std::string ModulePath(void* handle) {
    if (!handle || handle == ExecutableHandle()) {
        return ExecutablePath();
    }
    link_map* map = nullptr;
    if (dlinfo(handle, RTLD_DI_LINKMAP, &map) != 0 || !map || !map->l_name) {
        return std::string();
    }
    return map->l_name[0] ? map->l_name : ExecutablePath();
}

BOOL CallDllMain(void* handle, DWORD reason) {
    auto entry = reinterpret_cast<DLLMAIN>(dlsym(handle, "DllMain"));
    return entry ? entry(static_cast<HINSTANCE>(handle), reason, nullptr) : TRUE;
}

}  // namespace

extern "C" {

HMODULE GetModuleHandleA(LPCSTR lpModuleName) {
    if (!lpModuleName || ExecutablePath() == lpModuleName) {
        return static_cast<HMODULE>(ExecutableHandle());
    }
    void* handle = dlopen(lpModuleName, RTLD_NOW | RTLD_NOLOAD);
    if (handle) {
        dlclose(handle);  // NOLOAD still counts a reference; the module stays loaded
    }
    return static_cast<HMODULE>(handle);
}

BOOL GetModuleHandleExA(DWORD dwFlags, LPCSTR lpModuleName, HMODULE* phModule) {
    if (!phModule) {
        return FALSE;
    }
    *phModule = nullptr;
    Dl_info info{};
    if (!(dwFlags & GET_MODULE_HANDLE_EX_FLAG_FROM_ADDRESS) || !dladdr(lpModuleName, &info)) {
        return FALSE;
    }
    // The loader names the executable as it was started (argv[0]); its load address identifies it.
    link_map* exe = nullptr;
    const bool inExecutable = dlinfo(ExecutableHandle(), RTLD_DI_LINKMAP, &exe) == 0 && exe &&
                              reinterpret_cast<void*>(exe->l_addr) == info.dli_fbase;
    if (inExecutable || !info.dli_fname) {
        *phModule = static_cast<HMODULE>(ExecutableHandle());
        return TRUE;
    }
    *phModule = GetModuleHandleA(info.dli_fname);
    return *phModule != nullptr;
}

FARPROC GetProcAddress(HMODULE hModule, LPCSTR lpProcName) {
    if (!hModule || !lpProcName) {
        return nullptr;
    }
    return reinterpret_cast<FARPROC>(dlsym(hModule, lpProcName));
}

HMODULE LoadLibraryA(LPCSTR lpLibFileName) {
    if (!lpLibFileName) {
        return nullptr;
    }
    void* handle = dlopen(lpLibFileName, RTLD_NOW | RTLD_LOCAL);
    if (!handle) {
        return nullptr;
    }
    if (++LoadCounts()[handle] == 1 && !CallDllMain(handle, DLL_PROCESS_ATTACH)) {
        CallDllMain(handle, DLL_PROCESS_DETACH);
        LoadCounts().erase(handle);
        dlclose(handle);
        return nullptr;
    }
    return static_cast<HMODULE>(handle);
}

BOOL FreeLibrary(HMODULE hLibModule) {
    auto it = LoadCounts().find(hLibModule);
    if (it == LoadCounts().end()) {
        return FALSE;
    }
    if (--it->second == 0) {
        CallDllMain(hLibModule, DLL_PROCESS_DETACH);
        LoadCounts().erase(it);
    }
    return dlclose(hLibModule) == 0;
}

DWORD GetModuleFileNameA(HMODULE hModule, LPSTR lpFilename, DWORD nSize) {
    const std::string path = ModulePath(hModule);
    if (path.empty() || !lpFilename || nSize == 0) {
        return 0;
    }
    if (path.size() >= nSize) {
        std::memcpy(lpFilename, path.data(), nSize - 1);
        lpFilename[nSize - 1] = '\0';
        SetLastError(ERROR_INSUFFICIENT_BUFFER);
        return nSize;
    }
    std::memcpy(lpFilename, path.c_str(), path.size() + 1);
    return DWORD(path.size());
}

}  // extern "C"
