// Where the plug-in keeps its data files: below the folder of the host's executable.
#pragma once

#include "framework/String.h"
#include "platform/Win32.h"

// Replaces the file name of the host executable strExePath by strRelative when that name is
// "Osrik.exe" or "OsrikPlus.exe" in any letter case. For any other name returns false and empties
// strPath: there is then no data file, and callers read and write nothing. Does not throw.
bool MakeHostRelativePath(const CString& strExePath, const CString& strRelative, CString& strPath);

// The full path of string-table entry nID (a path relative to the host's folder) below the running
// executable, by the rule above. False, with strPath empty, when the executable's path is unknown
// or too long for MAX_PATH, its name is neither host name, or the string is missing.
bool GetHostRelativePath(UINT nID, CString& strPath);
