// Text conversions of the host: the plug-in hands over UTF-16 (BSTR) and ANSI code page strings,
// scenario files and the project JSON are UTF-8.
#pragma once

#include <string>
#include <string_view>

#include "platform/Win32.h"

// Text in automation strings' 16-bit units (OLECHAR is wchar_t on Windows, char16_t elsewhere).
using COleString = std::basic_string<OLECHAR>;
using COleStringView = std::basic_string_view<OLECHAR>;

// UTF-16 units to UTF-8; an unpaired surrogate becomes U+FFFD. Does not throw except bad_alloc.
std::string Utf16ToUtf8(COleStringView text);
// A BSTR (null = empty) to UTF-8, using its stored length.
std::string BstrToUtf8(BSTR bstr);
// UTF-8 to UTF-16 units; a malformed byte sequence becomes U+FFFD.
COleString Utf8ToUtf16(std::string_view text);

// ANSI code page (CP_ACP) bytes to UTF-8, through the platform's conversion.
std::string AnsiToUtf8(const char* pszText);
// UTF-8 to the ANSI code page; characters the code page lacks become '?'.
std::string Utf8ToAnsi(std::string_view text);
