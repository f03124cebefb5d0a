// Text on the window's device context.
#include "platform/core/gdi_objects.h"

BOOL GetTextExtentExPointW(HDC dc, LPCWSTR text, int count, int maxExtent, int* fit, int* dx,
                           SIZE* size) {
    (void)dc, (void)text, (void)maxExtent, (void)fit, (void)dx;
    if (size != nullptr) {
        *size = SIZE{count * 6, 13};
    }
    return TRUE;
}

int DrawTextW(HDC dc, LPCWSTR text, int count, RECT* rect, UINT format) {
    (void)dc, (void)text, (void)count, (void)rect, (void)format;
    return 13;
}
