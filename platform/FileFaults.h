// Test seam for file faults: makes chosen file operations fail below a path, with the error
// Windows would report, so tests can show an unwritable folder, a full disk or a failed rename
// (tests run as root, for whom permissions alone fail nothing). The Linux stand-in injects them;
// on Windows the real file functions cannot be made to fail this way, so the seam is inert there
// and the cases that need it do not run (see the windows test preset).
#pragma once

#ifdef _WIN32
#include "platform/Win32.h"

inline constexpr DWORD STANDIN_FAULT_OPEN_READ = 0x01;
inline constexpr DWORD STANDIN_FAULT_CREATE = 0x02;
inline constexpr DWORD STANDIN_FAULT_READ = 0x04;
inline constexpr DWORD STANDIN_FAULT_WRITE = 0x08;
inline constexpr DWORD STANDIN_FAULT_MOVE = 0x10;
inline constexpr DWORD STANDIN_FAULT_DELETE = 0x20;

// Does nothing on Windows.
inline void StandInSetFileFault(LPCSTR, DWORD, DWORD) {}
#else
#include "platform/linux/FileFaults.h"
#endif
