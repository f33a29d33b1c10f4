// The one facade through which plug-in and host code reach the Windows API.
//
// On Windows it includes the real SDK headers. Elsewhere it declares our stand-in, which implements
// only what the plug-in and the reference host use, with Windows semantics; each area of the
// stand-in has its own header in platform/linux/. Every #ifdef _WIN32 of the project lives in
// platform/.
#pragma once

#ifdef _WIN32
// windows.h first: the others build on it.
// clang-format off
#include <windows.h>
#include <io.h>
#include <ocidl.h>
#include <oleauto.h>
#include <olectl.h>
// clang-format on
#else
#include "platform/linux/CodePage.h"
#include "platform/linux/Com.h"
#include "platform/linux/Crt.h"
#include "platform/linux/Kernel32.h"
#include "platform/linux/Module.h"
#include "platform/linux/OleAuto.h"
#include "platform/linux/User32.h"
#include "platform/linux/WinTypes.h"
#endif
