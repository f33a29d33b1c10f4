// The host driver on Windows: a real hidden main window, real time for the host's clock, message
// boxes answered from a CBT hook and help calls taken by a help window.
//
// Message boxes: the hook sees each box as it is activated, reads its caption and text, recovers
// the style word from what the box shows (buttons, icon, default button, help button; the
// modality and placement flags cannot be seen and are not reported), asks the driver's answerer
// and ends the box with its answer before it waits for input.
//
// Help: WinHelpA hands its request to the top-level window of class "MS_WINHELP" (starting the
// help viewer only when there is none) with WM_COPYDATA; the driver's hidden window of that class
// records the request instead, so neither a viewer nor a patch of the plug-in's imports is needed.
#include "platform/HostDriver.h"

#include <mmsystem.h>

#include <algorithm>
#include <cstdlib>
#include <cstring>
#include <string>
#include <vector>

namespace {

constexpr char kMainWindowClass[] = "OsrikMainWindow";
constexpr char kHelpWindowClass[] = "MS_WINHELP";
// WM_COPYDATA's tag for a help request, and the request's header (file name and data follow it).
constexpr ULONG_PTR kHelpRequestTag = 0xA1DE505;
struct CHelpRequest {
    WORD wSize;
    WORD wCommand;
    LONG lData;
    LONG lReserved;
    WORD wFileOffset;
    WORD wDataOffset;
};

// A clock step may start this late after the previous one returned without counting the delay as
// host time: the host's own work between steps (peeking, the idle hook) takes far less.
constexpr LONGLONG kStepSlackMicroseconds = 3000;
// Each step ends this much after its deadline, without moving the next one: a timer due exactly at
// the step's end has then fallen due in the system's own timekeeping too.
constexpr LONGLONG kStepMarginMicroseconds = 2000;

struct CDriverState {
    DRIVERMESSAGEBOXPROC pfnMessageBox = nullptr;
    void* pMessageBoxContext = nullptr;
    DRIVERHELPPROC pfnHelp = nullptr;
    void* pHelpContext = nullptr;
    HWND hMainWindow = nullptr;
    HWND hHelpWindow = nullptr;
    HHOOK hCbtHook = nullptr;
    HWND hAnsweredBox = nullptr;  // a box is activated again when it regains the focus
    int nPendingAnswer = IDCANCEL;
    DWORD dwClock = 0;
    LONGLONG llDeadline = 0;  // when the last clock step ends, in microseconds
    LONGLONG llReturned = 0;  // when the last clock step returned to the host
};

LRESULT CALLBACK CbtProc(int nCode, WPARAM wParam, LPARAM lParam);
LRESULT CALLBACK HelpWindowProc(HWND hWnd, UINT uMsg, WPARAM wParam, LPARAM lParam);

HWND CreateHiddenWindow(const char* pszClass, WNDPROC pfnProc) {
    const HINSTANCE hInstance = GetModuleHandleA(nullptr);
    WNDCLASSEXA wc{};
    wc.cbSize = sizeof wc;
    wc.lpfnWndProc = pfnProc;
    wc.hInstance = hInstance;
    wc.lpszClassName = pszClass;
    RegisterClassExA(&wc);  // fails harmlessly when registered before
    return CreateWindowExA(0, pszClass, pszClass, WS_OVERLAPPEDWINDOW, CW_USEDEFAULT, CW_USEDEFAULT,
                           CW_USEDEFAULT, CW_USEDEFAULT, nullptr, nullptr, hInstance, nullptr);
}

// Set up on first use, on the host's user-interface thread: every message box of that thread is
// answered from then on, also before the host installs an answerer.
CDriverState& Driver() {
    static CDriverState* pState = [] {
        auto* p = new CDriverState;  // lives as long as the process; its windows and hook with it
        p->hCbtHook = SetWindowsHookExA(WH_CBT, CbtProc, nullptr, GetCurrentThreadId());
        p->hHelpWindow = CreateHiddenWindow(kHelpWindowClass, HelpWindowProc);
        timeBeginPeriod(1);  // Sleep to the millisecond, so clock steps end on time
        return p;
    }();
    return *pState;
}

// Installed before main runs, so that no message box of the host's thread ever waits for a user.
const bool g_bDriverReady = (Driver(), true);

std::string WindowText(HWND hWnd) {
    std::vector<char> text(size_t(GetWindowTextLengthA(hWnd)) + 1);
    const int n = GetWindowTextA(hWnd, text.data(), int(text.size()));
    return std::string(text.data(), size_t(n > 0 ? n : 0));
}

std::string ClassName(HWND hWnd) {
    char szName[64] = "";
    GetClassNameA(hWnd, szName, int(sizeof szName));
    return szName;
}

bool IsVisibleChild(HWND hWnd) {
    return (GetWindowLongA(hWnd, GWL_STYLE) & WS_VISIBLE) != 0;
}

// What a message box shows: its button identifiers in order, its icon, its text.
struct CBoxContent {
    std::vector<int> buttons;
    HICON hIcon = nullptr;
    std::string strText;
    bool bOnlyBoxControls = true;  // statics and buttons with a message box's identifiers
};

BOOL CALLBACK CollectControl(HWND hChild, LPARAM lParam) {
    auto& content = *reinterpret_cast<CBoxContent*>(lParam);
    const std::string strClass = ClassName(hChild);
    const int nId = GetDlgCtrlID(hChild);
    if (lstrcmpiA(strClass.c_str(), "Button") == 0) {
        if (nId < IDOK || nId > IDCONTINUE) {
            content.bOnlyBoxControls = false;
        } else if (IsVisibleChild(hChild)) {
            content.buttons.push_back(nId);
        }
    } else if (lstrcmpiA(strClass.c_str(), "Static") == 0) {
        if ((GetWindowLongA(hChild, GWL_STYLE) & SS_TYPEMASK) == SS_ICON) {
            content.hIcon = reinterpret_cast<HICON>(SendMessageA(hChild, STM_GETICON, 0, 0));
        } else if (content.strText.empty()) {
            content.strText = WindowText(hChild);
        }
    } else {
        content.bOnlyBoxControls = false;
    }
    return TRUE;
}

// The button part of the style word from the buttons a box shows (a Help button aside).
struct CButtonSet {
    UINT uType;
    std::vector<int> buttons;
};
const CButtonSet kButtonSets[] = {
    {MB_OK, {IDOK}},
    {MB_OKCANCEL, {IDOK, IDCANCEL}},
    {MB_ABORTRETRYIGNORE, {IDABORT, IDRETRY, IDIGNORE}},
    {MB_YESNOCANCEL, {IDYES, IDNO, IDCANCEL}},
    {MB_YESNO, {IDYES, IDNO}},
    {MB_RETRYCANCEL, {IDRETRY, IDCANCEL}},
    {MB_CANCELTRYCONTINUE, {IDCANCEL, IDTRYAGAIN, IDCONTINUE}},
};

struct CIconKind {
    UINT uType;
    LPCSTR pszIcon;
};
const CIconKind kIcons[] = {
    {MB_ICONHAND, IDI_HAND},
    {MB_ICONQUESTION, IDI_QUESTION},
    {MB_ICONEXCLAMATION, IDI_EXCLAMATION},
    {MB_ICONASTERISK, IDI_ASTERISK},
};

// The style word a box was most likely shown with; false when the window is no message box.
bool RecoverStyle(HWND hBox, const CBoxContent& content, UINT& uType) {
    std::vector<int> buttons = content.buttons;
    uType = 0;
    for (auto it = buttons.begin(); it != buttons.end(); ++it) {
        if (*it == IDHELP) {
            uType |= MB_HELP;
            buttons.erase(it);
            break;
        }
    }
    const CButtonSet* pSet = nullptr;
    for (const CButtonSet& set : kButtonSets) {
        if (std::is_permutation(set.buttons.begin(), set.buttons.end(), buttons.begin(),
                                buttons.end())) {
            pSet = &set;
        }
    }
    if (!pSet || !content.bOnlyBoxControls) {
        return false;
    }
    uType |= pSet->uType;
    for (const CIconKind& icon : kIcons) {
        if (content.hIcon && content.hIcon == LoadIconA(nullptr, icon.pszIcon)) {
            uType |= icon.uType;
        }
    }
    const LRESULT lDefault = SendMessageA(hBox, DM_GETDEFID, 0, 0);
    if (HIWORD(lDefault) == DC_HASDEFID) {
        for (size_t i = 0; i < pSet->buttons.size() && i < 4; ++i) {
            if (pSet->buttons[i] == LOWORD(lDefault)) {
                uType |= UINT(i) * MB_DEFBUTTON2;
            }
        }
    }
    return true;
}

// For screenshots: OSRIK_MESSAGE_BOX_PAUSE_MS keeps each box on the screen that long.
UINT MessageBoxPause() {
    char szValue[16] = "";
    if (!GetEnvironmentVariableA("OSRIK_MESSAGE_BOX_PAUSE_MS", szValue, sizeof szValue)) {
        return 0;
    }
    return UINT(std::strtoul(szValue, nullptr, 10));
}

void CALLBACK EndPausedBox(HWND hBox, UINT, UINT_PTR uId, DWORD) {
    KillTimer(hBox, uId);
    EndDialog(hBox, Driver().nPendingAnswer);
}

void AnswerMessageBox(HWND hBox) {
    CDriverState& state = Driver();
    if (hBox == state.hAnsweredBox) {
        return;  // answered when it first came up
    }
    CBoxContent content;
    EnumChildWindows(hBox, CollectControl, reinterpret_cast<LPARAM>(&content));
    UINT uType = 0;
    if (!RecoverStyle(hBox, content, uType)) {
        return;  // a dialog of the plug-in's own, not a message box
    }
    const std::string strCaption = WindowText(hBox);
    const int nAnswer = state.pfnMessageBox
                            ? state.pfnMessageBox(state.pMessageBoxContext, content.strText.c_str(),
                                                  strCaption.c_str(), uType)
                            : IDCANCEL;
    state.hAnsweredBox = hBox;
    const UINT uPause = MessageBoxPause();
    if (uPause > 0 && SetTimer(hBox, 1, uPause, EndPausedBox)) {
        state.nPendingAnswer = nAnswer;  // the box's own loop ends it when the timer fires
        return;
    }
    // Ending it now makes the box return before its modal loop waits for any input.
    EndDialog(hBox, nAnswer);
}

LRESULT CALLBACK CbtProc(int nCode, WPARAM wParam, LPARAM lParam) {
    const auto hWnd = reinterpret_cast<HWND>(wParam);
    if (nCode == HCBT_ACTIVATE && ClassName(hWnd) == "#32770") {  // the class of message boxes
        AnswerMessageBox(hWnd);
    } else if (nCode == HCBT_DESTROYWND && hWnd == Driver().hAnsweredBox) {
        Driver().hAnsweredBox = nullptr;  // its handle may come back for the next box
    }
    return CallNextHookEx(nullptr, nCode, wParam, lParam);
}

LRESULT CALLBACK HelpWindowProc(HWND hWnd, UINT uMsg, WPARAM wParam, LPARAM lParam) {
    if (uMsg != WM_COPYDATA) {
        return DefWindowProcA(hWnd, uMsg, wParam, lParam);
    }
    const auto* pData = reinterpret_cast<const COPYDATASTRUCT*>(lParam);
    if (!pData || pData->dwData != kHelpRequestTag || pData->cbData < sizeof(CHelpRequest)) {
        return FALSE;
    }
    CHelpRequest request;
    std::memcpy(&request, pData->lpData, sizeof request);
    std::string strFile;
    if (request.wFileOffset != 0 && request.wFileOffset < pData->cbData) {
        const char* pszFile = static_cast<const char*>(pData->lpData) + request.wFileOffset;
        strFile.assign(pszFile, strnlen(pszFile, pData->cbData - request.wFileOffset));
    }
    const CDriverState& state = Driver();
    if (state.pfnHelp) {
        state.pfnHelp(state.pHelpContext, strFile.c_str(), request.wCommand,
                      ULONG_PTR(ULONG(request.lData)));
    }
    return TRUE;
}

LONGLONG NowMicroseconds() {
    static const LONGLONG llFrequency = [] {
        LARGE_INTEGER frequency;
        QueryPerformanceFrequency(&frequency);
        return frequency.QuadPart;
    }();
    LARGE_INTEGER now;
    QueryPerformanceCounter(&now);
    return now.QuadPart / llFrequency * 1000000 +
           now.QuadPart % llFrequency * 1000000 / llFrequency;
}

}  // namespace

void DriverSetMessageBoxProc(DRIVERMESSAGEBOXPROC pfn, void* pContext) {
    CDriverState& state = Driver();
    state.pfnMessageBox = pfn;
    state.pMessageBoxContext = pContext;
}

void DriverSetHelpProc(DRIVERHELPPROC pfn, void* pContext) {
    CDriverState& state = Driver();
    state.pfnHelp = pfn;
    state.pHelpContext = pContext;
}

HWND DriverGetMainWindow() {
    CDriverState& state = Driver();
    if (!state.hMainWindow) {
        state.hMainWindow = CreateHiddenWindow(kMainWindowClass, DefWindowProcA);
    }
    return state.hMainWindow;
}

// Real time passes: the system makes WM_TIMER messages of timers that fall due, and the host's
// next PeekMessageA finds them. Consecutive steps are measured from where the previous one ended,
// so that a run of them lasts their sum and not their sum plus every wake-up's delay.
DWORD DriverAdvanceClock(DWORD ms) {
    CDriverState& state = Driver();
    LONGLONG llNow = NowMicroseconds();
    if (state.llDeadline == 0 || llNow - state.llReturned > kStepSlackMicroseconds) {
        state.llDeadline = llNow;  // the host did other work since: this step starts now
    }
    state.llDeadline += LONGLONG(ms) * 1000;
    const LONGLONG llEnd = state.llDeadline + kStepMarginMicroseconds;
    while ((llNow = NowMicroseconds()) < llEnd) {
        Sleep(DWORD((llEnd - llNow + 999) / 1000));
    }
    state.llReturned = llNow;
    state.dwClock += ms;
    return state.dwClock;
}
