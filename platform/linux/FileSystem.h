// The stand-in's own file primitives over POSIX, shared by its file, profile and runtime functions:
// Windows paths to Linux paths, errno to Windows error codes, and the injected faults.
#pragma once

#include <string>
#include <string_view>

#include "platform/linux/FileFaults.h"

namespace standin {

// The Linux path of a Windows path: '\' separates folders as '/' does.
std::string ToHostPath(const char* pszPath);
// True when the path names a folder; a bare file name would lie in the Windows folder, which the
// stand-in does not have.
bool HasFolder(std::string_view path);

// The Windows error for errno after an operation on `path` (a missing folder is PATH_NOT_FOUND).
DWORD ErrorFromErrno(int nErrno, const std::string& path);
// The injected error for this operation on `path`, or ERROR_SUCCESS.
DWORD InjectedFault(DWORD dwOperation, const std::string& path);

// The whole file; ERROR_SUCCESS or the Windows error.
DWORD ReadWholeFile(const std::string& path, std::string& bytes);
// Creates or truncates the file and writes `bytes`; ERROR_SUCCESS or the Windows error.
DWORD WriteWholeFile(const std::string& path, std::string_view bytes);

}  // namespace standin
