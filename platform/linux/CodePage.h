// Code page conversion of the stand-in: the ANSI code page is Windows-1252, as on a German or
// Western European Windows; UTF-8 (CP_UTF8) is there for the host's files.
#pragma once

#include "platform/linux/Com.h"

inline constexpr UINT CP_ACP = 0;
inline constexpr UINT CP_UTF8 = 65001;
// Windows would otherwise write a look-alike ("8" for the infinity sign); the stand-in never does.
inline constexpr DWORD WC_NO_BEST_FIT_CHARS = 0x00000400;

extern "C" {
UINT GetACP();
// As on Windows: cbMultiByte -1 converts up to and including the terminating zero; a zero output
// size asks for the size needed; returns the units written (0 on failure, e.g. a buffer too small).
int MultiByteToWideChar(UINT CodePage, DWORD dwFlags, LPCSTR lpMultiByteStr, int cbMultiByte,
                        OLECHAR* lpWideCharStr, int cchWideChar);
// Characters the code page lacks become '?'; the last two parameters must be null.
int WideCharToMultiByte(UINT CodePage, DWORD dwFlags, const OLECHAR* lpWideCharStr, int cchWideChar,
                        LPSTR lpMultiByteStr, int cbMultiByte, LPCSTR lpDefaultChar,
                        BOOL* lpUsedDefaultChar);
}
