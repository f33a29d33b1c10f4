// The stand-in's user32: message queue, timers on the host's clock, message boxes and help handed
// to the host's UI driver, resources from the module's generated table.
#include <dlfcn.h>

#include <algorithm>
#include <cstring>
#include <deque>
#include <list>
#include <vector>

#include "platform/HostDriver.h"
#include "platform/Win32.h"
#include "platform/linux/Resources.h"

struct HWND__ {
    int nUnused;
};

struct HBITMAP__ {
    BITMAP info;
    std::vector<BYTE> bits;
};

namespace {

struct CTimer {
    HWND hwnd;
    UINT_PTR id;
    DWORD elapse;
    DWORD nextDue;
    bool due;
};

// All state of the one user-interface thread; the host and the plug-in share it through this
// library.
struct CUserState {
    DWORD now = 0;
    std::deque<MSG> queue;
    std::vector<CTimer> timers;
    UINT_PTR nextTimerId = 1;
    DRIVERMESSAGEBOXPROC pfnMessageBox = nullptr;
    void* pMessageBoxContext = nullptr;
    DRIVERHELPPROC pfnHelp = nullptr;
    void* pHelpContext = nullptr;
    HWND__ mainWindow{};
    std::list<HBITMAP__> bitmaps;  // owned here, as GDI owns its objects
};

CUserState& State() {
    static CUserState state;
    return state;
}

bool Matches(const MSG& msg, HWND hWnd, UINT min, UINT max) {
    const bool window = !hWnd || msg.hwnd == hWnd;
    const bool range = (min == 0 && max == 0) || (msg.message >= min && msg.message <= max);
    return window && range;
}

// A due timer's WM_TIMER is made when the queue holds nothing else, as on Windows.
bool TakeTimerMessage(MSG* pMsg, HWND hWnd, UINT min, UINT max, bool remove) {
    for (CTimer& timer : State().timers) {
        MSG msg{timer.hwnd, WM_TIMER, timer.id, 0, State().now, {0, 0}};
        if (timer.due && Matches(msg, hWnd, min, max)) {
            *pMsg = msg;
            timer.due = timer.due && !remove;
            return true;
        }
    }
    return false;
}

const CStandInResources* ResourcesOf(HINSTANCE hInstance) {
    if (!hInstance) {
        return nullptr;
    }
    return static_cast<const CStandInResources*>(dlsym(hInstance, STANDIN_RESOURCES_SYMBOL));
}

template <typename T>
uint32_t ReadLe(const BYTE* p) {
    uint32_t value = 0;
    for (size_t i = 0; i < sizeof(T); ++i) {
        value |= uint32_t(p[i]) << (8 * i);
    }
    return value;
}

constexpr WORD kDisplayBitsPixel = 32;

// Reads the header of a .bmp file with a BITMAPINFOHEADER; null for anything else.
HBITMAP MakeBitmap(const CStandInBitmap& resource) {
    const BYTE* f = resource.file;
    if (resource.size < 54 || f[0] != 'B' || f[1] != 'M' || ReadLe<uint32_t>(f + 14) < 40) {
        return nullptr;
    }
    const auto width = LONG(ReadLe<uint32_t>(f + 18));
    const auto height = LONG(ReadLe<uint32_t>(f + 22));
    const auto bitsPixel = WORD(ReadLe<uint16_t>(f + 28));
    const uint32_t offset = ReadLe<uint32_t>(f + 10);
    if (width <= 0 || height == 0 || bitsPixel == 0 || offset > resource.size) {
        return nullptr;
    }
    // LoadBitmap makes a device-dependent bitmap in the display's format, whatever the file's
    // depth: GetObject reports 32 bits a pixel on a true-colour desktop.
    HBITMAP__& bitmap = State().bitmaps.emplace_back();
    bitmap.info = {0,      width, height < 0 ? -height : height, width * 4, 1, kDisplayBitsPixel,
                   nullptr};
    bitmap.bits.assign(f + offset, f + resource.size);
    return &bitmap;
}

}  // namespace

extern "C" {

BOOL PostMessageA(HWND hWnd, UINT Msg, WPARAM wParam, LPARAM lParam) {
    State().queue.push_back({hWnd, Msg, wParam, lParam, State().now, {0, 0}});
    return TRUE;
}

BOOL PeekMessageA(LPMSG lpMsg, HWND hWnd, UINT wMsgFilterMin, UINT wMsgFilterMax, UINT wRemoveMsg) {
    if (!lpMsg) {
        return FALSE;
    }
    auto& queue = State().queue;
    auto it = std::find_if(queue.begin(), queue.end(), [&](const MSG& msg) {
        return Matches(msg, hWnd, wMsgFilterMin, wMsgFilterMax);
    });
    if (it != queue.end()) {
        *lpMsg = *it;
        if (wRemoveMsg & PM_REMOVE) {
            queue.erase(it);
        }
        return TRUE;
    }
    return TakeTimerMessage(lpMsg, hWnd, wMsgFilterMin, wMsgFilterMax, wRemoveMsg & PM_REMOVE);
}

UINT_PTR SetTimer(HWND hWnd, UINT_PTR nIDEvent, UINT uElapse, TIMERPROC) {
    auto& timers = State().timers;
    const DWORD due = State().now + uElapse;
    if (hWnd) {
        // The same window and identifier replace the timer: it starts again from now.
        for (CTimer& timer : timers) {
            if (timer.hwnd == hWnd && timer.id == nIDEvent) {
                timer = {hWnd, nIDEvent, uElapse, due, false};
                return nIDEvent;
            }
        }
        timers.push_back({hWnd, nIDEvent, uElapse, due, false});
        return nIDEvent;
    }
    const UINT_PTR id = State().nextTimerId++;
    timers.push_back({nullptr, id, uElapse, due, false});
    return id;
}

BOOL KillTimer(HWND hWnd, UINT_PTR uIDEvent) {
    auto& timers = State().timers;
    const auto it = std::find_if(timers.begin(), timers.end(), [&](const CTimer& timer) {
        return timer.hwnd == hWnd && timer.id == uIDEvent;
    });
    if (it == timers.end()) {
        return FALSE;
    }
    timers.erase(it);
    return TRUE;
}

DWORD GetTickCount() {
    return State().now;
}

int MessageBoxA(HWND, LPCSTR lpText, LPCSTR lpCaption, UINT uType) {
    const CUserState& state = State();
    if (!state.pfnMessageBox) {
        return IDCANCEL;
    }
    return state.pfnMessageBox(state.pMessageBoxContext, lpText ? lpText : "",
                               lpCaption ? lpCaption : "Error", uType);
}

BOOL WinHelpA(HWND, LPCSTR lpszHelp, UINT uCommand, ULONG_PTR dwData) {
    const CUserState& state = State();
    if (state.pfnHelp) {
        state.pfnHelp(state.pHelpContext, lpszHelp ? lpszHelp : "", uCommand, dwData);
    }
    return TRUE;
}

int LoadStringA(HINSTANCE hInstance, UINT uID, LPSTR lpBuffer, int cchBufferMax) {
    const CStandInResources* resources = ResourcesOf(hInstance);
    if (!resources || !lpBuffer || cchBufferMax <= 0) {
        return 0;
    }
    for (size_t i = 0; i < resources->stringCount; ++i) {
        if (resources->strings[i].id == uID) {
            const char* text = resources->strings[i].text;
            const size_t n = std::min(std::strlen(text), size_t(cchBufferMax - 1));
            std::memcpy(lpBuffer, text, n);
            lpBuffer[n] = '\0';
            return int(n);
        }
    }
    lpBuffer[0] = '\0';
    return 0;
}

HBITMAP LoadBitmapA(HINSTANCE hInstance, LPCSTR lpBitmapName) {
    const CStandInResources* resources = ResourcesOf(hInstance);
    const auto id = UINT(reinterpret_cast<uintptr_t>(lpBitmapName));
    if (!resources || id > 0xFFFF) {
        return nullptr;  // only numbered bitmaps
    }
    for (size_t i = 0; i < resources->bitmapCount; ++i) {
        if (resources->bitmaps[i].id == id) {
            return MakeBitmap(resources->bitmaps[i]);
        }
    }
    return nullptr;
}

int GetObjectA(void* h, int c, void* pv) {
    for (HBITMAP__& bitmap : State().bitmaps) {
        if (&bitmap == h) {
            if (pv && c >= int(sizeof(BITMAP))) {
                std::memcpy(pv, &bitmap.info, sizeof(BITMAP));
            }
            return int(sizeof(BITMAP));
        }
    }
    return 0;
}

BOOL DeleteObject(void* ho) {
    auto& bitmaps = State().bitmaps;
    const auto it = std::find_if(bitmaps.begin(), bitmaps.end(),
                                 [ho](const HBITMAP__& bitmap) { return &bitmap == ho; });
    if (it == bitmaps.end()) {
        return FALSE;
    }
    bitmaps.erase(it);
    return TRUE;
}

}  // extern "C"

void DriverSetMessageBoxProc(DRIVERMESSAGEBOXPROC pfn, void* pContext) {
    State().pfnMessageBox = pfn;
    State().pMessageBoxContext = pContext;
}

void DriverSetHelpProc(DRIVERHELPPROC pfn, void* pContext) {
    State().pfnHelp = pfn;
    State().pHelpContext = pContext;
}

HWND DriverGetMainWindow() {
    return &State().mainWindow;
}

DWORD DriverAdvanceClock(DWORD ms) {
    CUserState& state = State();
    state.now += ms;
    for (CTimer& timer : state.timers) {
        if (int32_t(state.now - timer.nextDue) >= 0) {
            timer.due = true;
            timer.nextDue = state.now + timer.elapse;
        }
    }
    return state.now;
}
