// The few shell services the program touches at start and at its end.
#pragma once

#include "platform/types.h"

constexpr DWORD SHFS_SHOWTASKBAR = 0x0001;
constexpr DWORD SHFS_HIDETASKBAR = 0x0002;
constexpr DWORD SHFS_HIDESIPBUTTON = 0x0008;

// WinMain, after showing its window and when raising a running copy: the handheld's shell call
// that makes a window cover the screen. The host may do nothing with it.
BOOL SHFullScreen(HWND window, DWORD state);
// Ends the process at once with the exit code, after the host has let go of its devices.
[[noreturn]] void ExitProcess(UINT exitCode);
