// Message boxes: the program's one way of telling the user about a failure.
#pragma once

#include "platform/types.h"

constexpr UINT MB_OK = 0x00000000;
constexpr int IDOK = 1;

// Shows text under caption and waits until the user dismisses it; returns IDOK.
int MessageBoxW(HWND owner, LPCWSTR text, LPCWSTR caption, UINT type);
