// The window procedure: messages only start the clock, feed the input latch and tick the game
// clock; they never draw.
#include "app/input.h"
#include "app/shell.h"
#include "assets/catalogue.h"
#include "game/game_tick.h"
#include "platform/window.h"

LRESULT WndProc(HWND window, UINT message, WPARAM wParam, LPARAM lParam) {
    switch (message) {
        case WM_CREATE:
            SetTimer(window, TICK_TIMER_ID, TICK_INTERVAL_MS, nullptr);
            return 0;
        case WM_DESTROY:
            ReleaseAssets();
            PostQuitMessage(0);
            return 0;
        case WM_KEYDOWN:
            OnKeyDown(wParam);
            return 0;
        case WM_KEYUP:
            OnKeyUp(wParam);
            return 0;
        case WM_TIMER:
            if (wParam == TICK_TIMER_ID) {
                GameTick();
            }
            return 0;
        case WM_LBUTTONDOWN:
            OnPenDown(lParam);
            return 0;
        case WM_LBUTTONUP:
            OnPenUp(lParam);
            return 0;
        default:
            return DefWindowProcW(window, message, wParam, lParam);
    }
}
