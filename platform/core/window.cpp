// The window, the message queue and the window timers, shared by every backend.
#include <map>

#include "platform/core/backend.h"
#include "platform/core/record.h"
#include "platform/core/utf.h"
#include "platform/core/window_state.h"

namespace platform {

namespace {

Backend* g_backend = nullptr;
Record g_record;
HWND__ g_window;
HWND__ g_runningCopy;  // never alive: only compared against
std::deque<MSG> g_queue;
std::map<std::u16string, WNDPROC> g_classes;
bool g_automaticTimers = true;

struct Timer {
    DWORD period;
    DWORD started;
    DWORD periodsPosted;
};
std::map<UINT_PTR, Timer> g_timers;

bool TimerQueued(UINT_PTR id) {
    for (const MSG& m : g_queue) {
        if (m.message == WM_TIMER && m.wParam == id) {
            return true;
        }
    }
    return false;
}

}  // namespace

void InstallBackend(Backend* backend) {
    g_backend = backend;
}

Backend& CurrentBackend() {
    return *g_backend;
}

Record& CallRecord() {
    return g_record;
}

HWND__* GameWindow() {
    return g_window.alive ? &g_window : nullptr;
}

std::deque<MSG>& MessageQueue() {
    return g_queue;
}

HWND RunningCopyWindow() {
    return &g_runningCopy;
}

void SetAutomaticTimers(bool on) {
    g_automaticTimers = on;
}

void PostDueTimers(DWORD now) {
    if (!g_automaticTimers || GameWindow() == nullptr) {
        return;
    }
    for (auto& [id, timer] : g_timers) {
        DWORD periods = (now - timer.started) / timer.period;
        if (periods > timer.periodsPosted) {
            // Ticks missed while one was still waiting are dropped, as the handheld does.
            timer.periodsPosted = periods;
            if (!TimerQueued(id)) {
                g_queue.push_back(MSG{&g_window, WM_TIMER, id, 0, now, {0, 0}});
            }
        }
    }
}

}  // namespace platform

using platform::CurrentBackend;

WORD RegisterClassW(const WNDCLASSW* windowClass) {
    if (windowClass == nullptr || windowClass->lpszClassName == nullptr) {
        return 0;
    }
    platform::g_classes[windowClass->lpszClassName] = windowClass->lpfnWndProc;
    return static_cast<WORD>(platform::g_classes.size());
}

HWND FindWindowW(LPCWSTR className, LPCWSTR windowName) {
    (void)className;
    std::string title = platform::ToUtf8(windowName);
    if (platform::g_window.alive && platform::g_window.title == title) {
        return &platform::g_window;
    }
    if (CurrentBackend().FindRunningCopy(title)) {
        return &platform::g_runningCopy;
    }
    return nullptr;
}

BOOL SetForegroundWindow(HWND window) {
    // The handheld's convention of setting the lowest bit (bring owned windows too) means
    // nothing here; strip it before comparing handles.
    auto* plain =
        reinterpret_cast<HWND>(reinterpret_cast<std::uintptr_t>(window) & ~std::uintptr_t{1});
    if (plain == &platform::g_runningCopy) {
        CurrentBackend().RaiseRunningCopy();
        return TRUE;
    }
    if (plain == &platform::g_window && platform::g_window.alive) {
        CurrentBackend().RaiseWindow();
        return TRUE;
    }
    return FALSE;
}

HWND CreateWindowExW(DWORD exStyle, LPCWSTR className, LPCWSTR windowName, DWORD style, int x,
                     int y, int width, int height, HWND parent, HMENU menu, HINSTANCE instance,
                     LPVOID param) {
    (void)exStyle, (void)style, (void)x, (void)y, (void)width, (void)height, (void)parent;
    (void)menu, (void)instance, (void)param;
    auto cls = platform::g_classes.find(className == nullptr ? u"" : className);
    if (cls == platform::g_classes.end() || platform::g_window.alive) {
        return nullptr;
    }
    HWND__& w = platform::g_window;
    w.procedure = cls->second;
    w.title = platform::ToUtf8(windowName);
    w.surface.Resize(platform::kClientWidth, platform::kClientHeight);
    if (!CurrentBackend().OpenWindow(w.title, platform::kClientWidth, platform::kClientHeight)) {
        return nullptr;
    }
    w.alive = true;
    w.procedure(&w, WM_CREATE, 0, 0);
    return &w;
}

BOOL ShowWindow(HWND window, int showCommand) {
    (void)showCommand;
    return window == &platform::g_window ? TRUE : FALSE;
}

BOOL UpdateWindow(HWND window) {
    if (window != &platform::g_window) {
        return FALSE;
    }
    CurrentBackend().LoopStarting();
    return TRUE;
}

BOOL IsWindow(HWND window) {
    return window == &platform::g_window && platform::g_window.alive;
}

BOOL DestroyWindow(HWND window) {
    if (!IsWindow(window)) {
        return FALSE;
    }
    HWND__& w = platform::g_window;
    w.procedure(&w, WM_DESTROY, 0, 0);
    w.alive = false;
    platform::g_timers.clear();
    // Messages for a window that no longer exists are dropped; the quit message stays.
    std::deque<MSG> kept;
    for (const MSG& m : platform::g_queue) {
        if (m.hwnd == nullptr) {
            kept.push_back(m);
        }
    }
    platform::g_queue.swap(kept);
    CurrentBackend().CloseWindow();
    return TRUE;
}

LRESULT DefWindowProcW(HWND window, UINT message, WPARAM wParam, LPARAM lParam) {
    (void)wParam;
    (void)lParam;
    if (message == WM_CLOSE) {
        DestroyWindow(window);
    }
    return 0;
}

HICON LoadIconW(HINSTANCE instance, LPCWSTR name) {
    (void)instance;
    (void)name;
    return nullptr;  // the host shows its own icon
}

HGDIOBJ GetStockObject(int object) {
    (void)object;
    return nullptr;  // the client area is always covered by the game's frames
}

BOOL PeekMessageW(MSG* msg, HWND window, UINT filterMin, UINT filterMax, UINT removeFlags) {
    (void)window, (void)filterMin, (void)filterMax;
    CurrentBackend().Poll();
    platform::PostDueTimers(CurrentBackend().Now());
    auto& queue = platform::g_queue;
    if (queue.empty()) {
        CurrentBackend().PassEnded();
        return FALSE;
    }
    if (msg != nullptr) {
        *msg = queue.front();
    }
    if (removeFlags & PM_REMOVE) {
        queue.pop_front();
    }
    return TRUE;
}

BOOL GetMessageW(MSG* msg, HWND window, UINT filterMin, UINT filterMax) {
    (void)window, (void)filterMin, (void)filterMax;
    auto& queue = platform::g_queue;
    while (queue.empty()) {
        CurrentBackend().WaitForMessage();
        platform::PostDueTimers(CurrentBackend().Now());
    }
    MSG m = queue.front();
    queue.pop_front();
    if (msg != nullptr) {
        *msg = m;
    }
    return m.message == WM_QUIT ? FALSE : TRUE;
}

BOOL TranslateMessage(const MSG* msg) {
    (void)msg;
    return FALSE;  // no character messages: the game reads keys only
}

LRESULT DispatchMessageW(const MSG* msg) {
    LRESULT result = 0;
    platform::Record& record = platform::CallRecord();
    if (record.enabled && msg != nullptr) {
        record.dispatched.push_back(
            {msg->message, msg->wParam, static_cast<long long>(msg->lParam)});
    }
    if (msg != nullptr && msg->hwnd != nullptr && IsWindow(msg->hwnd)) {
        result = msg->hwnd->procedure(msg->hwnd, msg->message, msg->wParam, msg->lParam);
    }
    CurrentBackend().PassEnded();
    return result;
}

BOOL PostMessageW(HWND window, UINT message, WPARAM wParam, LPARAM lParam) {
    if (window != nullptr && !IsWindow(window)) {
        return FALSE;
    }
    platform::g_queue.push_back(
        MSG{window, message, wParam, lParam, CurrentBackend().Now(), {0, 0}});
    return TRUE;
}

void PostQuitMessage(int exitCode) {
    platform::g_queue.push_back(
        MSG{nullptr, WM_QUIT, static_cast<WPARAM>(exitCode), 0, CurrentBackend().Now(), {0, 0}});
}

UINT_PTR SetTimer(HWND window, UINT_PTR id, UINT periodMs, void* callback) {
    (void)callback;
    if (!IsWindow(window) || periodMs == 0) {
        return 0;
    }
    platform::g_timers[id] = platform::Timer{periodMs, CurrentBackend().Now(), 0};
    return id;
}
