#include "screens/present.h"

#include "app/shell.h"
#include "assets/catalogue.h"
#include "platform/gdi.h"

namespace {
constexpr INT FRAME_W = 240;
constexpr INT FRAME_H = 293;
constexpr INT REVEAL_STRIP = 1;  // any height but 293 asks PresentImage for the reveal
}  // namespace

void PresentFrame(BYTE shown) {
    g_hdc = GetDC(g_hWnd);
    PresentImage(g_frameImage, g_hdc, 0, 0, FRAME_W, shown == 1 ? FRAME_H : REVEAL_STRIP);
    ReleaseDC(g_hWnd, g_hdc);
}
