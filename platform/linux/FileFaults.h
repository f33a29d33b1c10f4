// Test seam of the stand-in's file system: makes chosen file operations fail below a path, with the
// error Windows would report, so tests can show an unwritable folder, a full disk or a failed
// rename (tests run as root, for whom permissions alone fail nothing). Linux only; not part of the
// facade.
#pragma once

#include "platform/linux/WinTypes.h"

inline constexpr DWORD STANDIN_FAULT_OPEN_READ = 0x01;  // opening an existing file to read, _access
inline constexpr DWORD STANDIN_FAULT_CREATE = 0x02;     // opening or creating a file to write
inline constexpr DWORD STANDIN_FAULT_READ = 0x04;       // reading bytes from an open file
inline constexpr DWORD STANDIN_FAULT_WRITE = 0x08;      // writing bytes, flushing
inline constexpr DWORD STANDIN_FAULT_MOVE = 0x10;       // renaming, replacing
inline constexpr DWORD STANDIN_FAULT_DELETE = 0x20;     // deleting

extern "C" {
// Operations in dwOperations on paths that begin with pszPathPrefix (a Windows or Linux path) fail
// with dwError from now on; one fault at a time, a null prefix clears it.
void StandInSetFileFault(LPCSTR pszPathPrefix, DWORD dwOperations, DWORD dwError);
}
