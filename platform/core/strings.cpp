#include "platform/strings.h"

int lstrlenW(LPCWSTR s) {
    int n = 0;
    while (s != nullptr && s[n] != 0) {
        ++n;
    }
    return n;
}

LPWSTR lstrcpyW(LPWSTR dst, LPCWSTR src) {
    LPWSTR d = dst;
    while ((*d++ = *src++) != 0) {
    }
    return dst;
}

LPWSTR lstrcatW(LPWSTR dst, LPCWSTR src) {
    lstrcpyW(dst + lstrlenW(dst), src);
    return dst;
}
