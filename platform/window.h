// Window class, the one window, its message queue and the window timer.
// WinMain and the main loop call these; WndProc receives what they deliver.
#pragma once

#include "platform/types.h"

using WNDPROC = LRESULT (*)(HWND, UINT, WPARAM, LPARAM);

struct WNDCLASSW {
    UINT style;
    WNDPROC lpfnWndProc;
    int cbClsExtra;
    int cbWndExtra;
    HINSTANCE hInstance;
    HICON hIcon;
    HCURSOR hCursor;
    HBRUSH hbrBackground;
    LPCWSTR lpszMenuName;
    LPCWSTR lpszClassName;
};

struct POINT {
    LONG x;
    LONG y;
};

struct MSG {
    HWND hwnd;
    UINT message;
    WPARAM wParam;
    LPARAM lParam;
    DWORD time;
    POINT pt;
};

constexpr UINT WM_CREATE = 0x0001;
constexpr UINT WM_DESTROY = 0x0002;
constexpr UINT WM_CLOSE = 0x0010;
constexpr UINT WM_QUIT = 0x0012;
constexpr UINT WM_KEYDOWN = 0x0100;
constexpr UINT WM_KEYUP = 0x0101;
constexpr UINT WM_TIMER = 0x0113;
constexpr UINT WM_LBUTTONDOWN = 0x0201;
constexpr UINT WM_LBUTTONUP = 0x0202;

constexpr UINT VK_RETURN = 13;
constexpr UINT VK_LEFT = 37;
constexpr UINT VK_UP = 38;
constexpr UINT VK_RIGHT = 39;
constexpr UINT VK_DOWN = 40;

constexpr UINT CS_VREDRAW = 0x0001;
constexpr UINT CS_HREDRAW = 0x0002;
constexpr DWORD WS_VISIBLE = 0x10000000;
constexpr int CW_USEDEFAULT = static_cast<int>(0x80000000u);
constexpr UINT PM_NOREMOVE = 0x0000;
constexpr UINT PM_REMOVE = 0x0001;
constexpr int SW_SHOW = 5;
constexpr int WHITE_BRUSH = 0;

// WinMain, once: registers the window procedure under a class name. Returns 0 on failure.
WORD RegisterClassW(const WNDCLASSW* windowClass);
// WinMain's single-instance check: the running copy's window with this title, or null.
HWND FindWindowW(LPCWSTR className, LPCWSTR windowName);
// WinMain, after FindWindowW found a running copy: raises that copy's window.
BOOL SetForegroundWindow(HWND window);
// WinMain, once: creates the game's window; WM_CREATE reaches the window procedure before
// this returns. Null when no window can be opened.
HWND CreateWindowExW(DWORD exStyle, LPCWSTR className, LPCWSTR windowName, DWORD style, int x,
                     int y, int width, int height, HWND parent, HMENU menu, HINSTANCE instance,
                     LPVOID param);
BOOL ShowWindow(HWND window, int showCommand);
BOOL UpdateWindow(HWND window);
// Destroys the window: WM_DESTROY is sent to its procedure before this returns.
BOOL DestroyWindow(HWND window);
// The window procedure's answer to every message it does not handle itself.
LRESULT DefWindowProcW(HWND window, UINT message, WPARAM wParam, LPARAM lParam);
HICON LoadIconW(HINSTANCE instance, LPCWSTR name);
HGDIOBJ GetStockObject(int object);

// The main loop, once per pass: TRUE when a message is waiting (PM_NOREMOVE leaves it queued).
BOOL PeekMessageW(MSG* msg, HWND window, UINT filterMin, UINT filterMax, UINT removeFlags);
// Takes the next message, waiting for one; returns 0 for WM_QUIT.
BOOL GetMessageW(MSG* msg, HWND window, UINT filterMin, UINT filterMax);
BOOL TranslateMessage(const MSG* msg);
// Hands the message to the window procedure of its window and returns its result.
LRESULT DispatchMessageW(const MSG* msg);
BOOL PostMessageW(HWND window, UINT message, WPARAM wParam, LPARAM lParam);
// Queues WM_QUIT with the exit code; GetMessageW returns 0 when it reaches it.
void PostQuitMessage(int exitCode);
// WM_CREATE: starts a periodic WM_TIMER. At most one WM_TIMER per timer waits in the queue,
// as on the handheld: a late loop sees one tick, not a burst.
UINT_PTR SetTimer(HWND window, UINT_PTR id, UINT periodMs, void* callback);
// TRUE while the window exists; the main loop asks after a message to learn whether that
// message destroyed it.
BOOL IsWindow(HWND window);
