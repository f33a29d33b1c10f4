// The module entry point: runs the application object's start-up and shut-down. Only the plug-in
// module links this file; unit tests drive AfxModuleAttach/AfxModuleDetach directly.
#include "framework/WinApp.h"

extern "C" BOOL WINAPI DllMain(HINSTANCE hInstance, DWORD dwReason, LPVOID) {
    try {
        if (dwReason == DLL_PROCESS_ATTACH) {
            return AfxModuleAttach(hInstance);
        }
        if (dwReason == DLL_PROCESS_DETACH) {
            AfxModuleDetach();
        }
        return TRUE;
    } catch (...) {
        return FALSE;  // nothing may escape into the loader
    }
}
