// The one window and its message queue, shared by the message, GDI and backend code.
#pragma once

#include <deque>
#include <string>

#include "platform/core/surface.h"
#include "platform/window.h"

struct HWND__ {
    WNDPROC procedure = nullptr;
    std::string title;
    bool alive = false;
    platform::Surface surface;  // the client area
};

namespace platform {

constexpr int kClientWidth = 240;
constexpr int kClientHeight = 293;

// The game's window, or null before CreateWindowExW and after DestroyWindow.
HWND__* GameWindow();
std::deque<MSG>& MessageQueue();
// Posts WM_TIMER for every timer whose period has passed, keeping at most one queued per timer.
void PostDueTimers(DWORD now);
// Whether a timer was started with SetTimer (backends driving ticks by script turn the
// automatic ticks off with SetAutomaticTimers).
void SetAutomaticTimers(bool on);
// A stand-in handle for another running copy's window, as FindWindowW reports it.
HWND RunningCopyWindow();

}  // namespace platform
