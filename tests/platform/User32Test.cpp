#include <gtest/gtest.h>

#include "platform/HostDriver.h"
#include "platform/Win32.h"

namespace {

void DrainQueue() {
    MSG msg;
    while (PeekMessageA(&msg, nullptr, 0, 0, PM_REMOVE)) {
    }
}

TEST(Timers, FireOnTheHostClockAndRestartWhenSetAgain) {
    DrainQueue();
    HWND hWnd = DriverGetMainWindow();
    ASSERT_EQ(SetTimer(hWnd, 0xE000, 500, nullptr), 0xE000u);
    MSG msg;
    DriverAdvanceClock(490);
    EXPECT_FALSE(PeekMessageA(&msg, nullptr, 0, 0, PM_REMOVE));
    // Set again within the interval: the same timer starts over, so it fires once, later.
    SetTimer(hWnd, 0xE000, 500, nullptr);
    DriverAdvanceClock(490);
    EXPECT_FALSE(PeekMessageA(&msg, nullptr, 0, 0, PM_REMOVE));
    DriverAdvanceClock(20);
    ASSERT_TRUE(PeekMessageA(&msg, nullptr, 0, 0, PM_REMOVE));
    EXPECT_EQ(msg.message, WM_TIMER);
    EXPECT_EQ(msg.wParam, 0xE000u);
    EXPECT_EQ(msg.hwnd, hWnd);
    EXPECT_FALSE(PeekMessageA(&msg, nullptr, 0, 0, PM_REMOVE));
    EXPECT_TRUE(KillTimer(hWnd, 0xE000));
    EXPECT_FALSE(KillTimer(hWnd, 0xE000));
    DriverAdvanceClock(1000);
    EXPECT_FALSE(PeekMessageA(&msg, nullptr, 0, 0, PM_REMOVE));
}

TEST(Messages, PostedBeforeTimersInOrder) {
    DrainQueue();
    HWND hWnd = DriverGetMainWindow();
    SetTimer(hWnd, 7, 10, nullptr);
    DriverAdvanceClock(10);
    PostMessageA(hWnd, WM_USER, 1, 0);
    PostMessageA(hWnd, WM_USER + 1, 2, 0);
    MSG msg;
    ASSERT_TRUE(PeekMessageA(&msg, nullptr, 0, 0, PM_NOREMOVE));
    EXPECT_EQ(msg.message, WM_USER);
    const UINT expected[] = {WM_USER, WM_USER + 1, WM_TIMER};
    for (UINT message : expected) {
        ASSERT_TRUE(PeekMessageA(&msg, nullptr, 0, 0, PM_REMOVE));
        EXPECT_EQ(msg.message, message);
    }
    KillTimer(hWnd, 7);
}

TEST(MessageBox, AnsweredByTheDriver) {
    EXPECT_EQ(MessageBoxA(nullptr, "text", "caption", MB_OK), IDCANCEL);  // no driver
    struct CSeen {
        std::string text, caption;
        UINT type = 0;
    } seen;
    DriverSetMessageBoxProc(
        [](void* context, LPCSTR text, LPCSTR caption, UINT type) {
            auto* s = static_cast<CSeen*>(context);
            *s = {text, caption, type};
            return IDOK;
        },
        &seen);
    EXPECT_EQ(MessageBoxA(nullptr, "Frage?", "Kalmoret", MB_OKCANCEL | MB_ICONQUESTION), IDOK);
    EXPECT_EQ(seen.text, "Frage?");
    EXPECT_EQ(seen.caption, "Kalmoret");
    EXPECT_EQ(seen.type, MB_OKCANCEL | MB_ICONQUESTION);
    DriverSetMessageBoxProc(nullptr, nullptr);
}

}  // namespace
