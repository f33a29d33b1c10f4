// What the reference host needs from the platform beyond the Windows API: a clock it advances, and
// the hands of the UI driver that answer the plug-in's modal UI. The stand-in implements it over
// its virtual clock and its message-box seam; a Windows build implements it over real timers and
// hooks.
#pragma once

#include "platform/Win32.h"

// Answers one message box: returns IDOK or IDCANCEL. Called inside MessageBoxA.
using DRIVERMESSAGEBOXPROC = int (*)(void* pContext, LPCSTR pszText, LPCSTR pszCaption, UINT uType);
// Records one WinHelpA call.
using DRIVERHELPPROC = void (*)(void* pContext, LPCSTR pszHelpFile, UINT uCommand,
                                ULONG_PTR dwData);

// Installs the answerer of message boxes (null: every box answers IDCANCEL).
void DriverSetMessageBoxProc(DRIVERMESSAGEBOXPROC pfn, void* pContext);
// Installs the recorder of help calls (null: help calls are dropped).
void DriverSetHelpProc(DRIVERHELPPROC pfn, void* pContext);

// The host's main window, created on first use; timers of the plug-in are set on it.
HWND DriverGetMainWindow();

// Moves the host's clock on by `ms` milliseconds; timers that fall due post their WM_TIMER message
// (one pending message per timer, as on Windows). Returns the clock afterwards.
DWORD DriverAdvanceClock(DWORD ms);
