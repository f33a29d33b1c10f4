// How a module carries its resources under the stand-in: a build step turns the module's resource
// script into one exported table named StandInResources, which LoadStringA and LoadBitmapA look up
// in the module whose handle they are given.
#pragma once

#include "platform/linux/WinTypes.h"

struct CStandInString {
    UINT id;
    const char* text;  // ANSI code page (1252) bytes, zero-terminated
};

struct CStandInBitmap {
    UINT id;
    const BYTE* file;  // the whole .bmp file
    size_t size;
};

struct CStandInResources {
    const CStandInString* strings;
    size_t stringCount;
    const CStandInBitmap* bitmaps;
    size_t bitmapCount;
};

// The exported name of a module's resource table.
#define STANDIN_RESOURCES_SYMBOL "StandInResources"
