// Module functions of the stand-in over the dynamic loader. A module handle is the loader's handle;
// LoadLibraryA and FreeLibrary run the module's exported DllMain as the Windows loader does.
#pragma once

#include "platform/linux/WinTypes.h"

inline constexpr DWORD DLL_PROCESS_DETACH = 0;
inline constexpr DWORD DLL_PROCESS_ATTACH = 1;
inline constexpr DWORD GET_MODULE_HANDLE_EX_FLAG_UNCHANGED_REFCOUNT = 0x00000002;
inline constexpr DWORD GET_MODULE_HANDLE_EX_FLAG_FROM_ADDRESS = 0x00000004;

using FARPROC = void (*)();

extern "C" {
// The executable for a null name or the executable's own path; otherwise a loaded module by path.
HMODULE GetModuleHandleA(LPCSTR lpModuleName);
// Supports only FROM_ADDRESS with UNCHANGED_REFCOUNT: the module that contains an address.
BOOL GetModuleHandleExA(DWORD dwFlags, LPCSTR lpModuleName, HMODULE* phModule);
FARPROC GetProcAddress(HMODULE hModule, LPCSTR lpProcName);
// Loads the module; on its first load calls DllMain(DLL_PROCESS_ATTACH) and, if that returns FALSE,
// DllMain(DLL_PROCESS_DETACH), unloads it and returns null, like the Windows loader.
HMODULE LoadLibraryA(LPCSTR lpLibFileName);
// On the last reference calls DllMain(DLL_PROCESS_DETACH), then unloads.
BOOL FreeLibrary(HMODULE hLibModule);
// Full path of the module (null: the executable); truncated to nSize - 1 characters plus the zero,
// returning nSize, when the buffer is too small.
DWORD GetModuleFileNameA(HMODULE hModule, LPSTR lpFilename, DWORD nSize);
}
