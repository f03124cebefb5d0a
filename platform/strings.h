// The handheld's UTF-16 string helpers.
#pragma once

#include "platform/types.h"

int lstrlenW(LPCWSTR s);
// Copies src with its terminator into dst and returns dst. No length check: callers size dst.
LPWSTR lstrcpyW(LPWSTR dst, LPCWSTR src);
// Appends src to dst and returns dst. No length check: callers size dst.
LPWSTR lstrcatW(LPWSTR dst, LPCWSTR src);
