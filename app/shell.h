// The application shell's globals: the window, the device context a frame holds while it
// presents, and the screen state the main loop dispatches on.
#pragma once

#include "platform/types.h"

enum : BYTE {
    SCREEN_TITLE = 0,
    SCREEN_OPTIONS = 1,
    SCREEN_FISHING = 2,
    SCREEN_RANKING = 3,
    SCREEN_INTRO = 4,
};

constexpr UINT_PTR TICK_TIMER_ID = 10;
constexpr UINT TICK_INTERVAL_MS = 100;

extern HWND g_hWnd;
extern HDC g_hdc;
extern BYTE g_screen;

LRESULT WndProc(HWND window, UINT message, WPARAM wParam, LPARAM lParam);
