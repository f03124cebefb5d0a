// Device contexts, bitmap sections and block copies. The window's device context draws into
// the window's client surface; bitmap sections are plain memory in the handheld's layout.
#include <algorithm>
#include <cstring>

#include "platform/core/backend.h"
#include "platform/core/gdi_objects.h"
#include "platform/core/record.h"
#include "platform/core/window_state.h"

namespace {

HDC__ g_screenDc{HDC__::Kind::kScreen};

// The largest bitmap section the platform makes; no picture of a 240-pixel handheld comes
// near it, and it keeps a hostile header from asking for gigabytes.
constexpr long long kMaxSectionBytes = 64LL * 1024 * 1024;
constexpr int kMaxSide = 16384;

std::uint32_t ToRgb(const RGBQUAD& q) {
    return (std::uint32_t{q.rgbRed} << 16) | (std::uint32_t{q.rgbGreen} << 8) | q.rgbBlue;
}

void PresentIfDrawn(HDC__* dc, platform::PresentReason reason) {
    HWND__* w = platform::GameWindow();
    if (dc->drawn && w != nullptr) {
        if (reason == platform::PresentReason::kFrame) {
            ++platform::CallRecord().presents;
        }
        platform::CurrentBackend().Present(w->surface, reason);
    }
}

}  // namespace

namespace {
HDC__* g_openWindowDc = nullptr;
}

HDC GetDC(HWND window) {
    if (window == nullptr) {
        return &g_screenDc;
    }
    if (!IsWindow(window)) {
        return nullptr;
    }
    auto* dc = new HDC__{HDC__::Kind::kWindow};
    g_openWindowDc = dc;
    return dc;
}

int ReleaseDC(HWND window, HDC dc) {
    (void)window;
    if (dc == nullptr || dc == &g_screenDc) {
        return dc == nullptr ? 0 : 1;
    }
    if (dc->kind != HDC__::Kind::kWindow) {
        return 0;
    }
    PresentIfDrawn(dc, platform::PresentReason::kFrame);
    if (g_openWindowDc == dc) {
        g_openWindowDc = nullptr;
    }
    delete dc;
    return 1;
}

namespace platform {
void PresentPendingDrawing() {
    if (g_openWindowDc != nullptr && g_openWindowDc->drawn) {
        PresentIfDrawn(g_openWindowDc, PresentReason::kSleep);
    }
}
}  // namespace platform

HBITMAP CreateDIBSection(HDC dc, const BITMAPINFO* info, UINT usage, void** bits, HANDLE section,
                         DWORD offset) {
    (void)dc, (void)usage, (void)section, (void)offset;
    if (bits != nullptr) {
        *bits = nullptr;
    }
    if (info == nullptr) {
        return nullptr;
    }
    const BITMAPINFOHEADER& h = info->bmiHeader;
    int bpp = h.biBitCount;
    if (h.biWidth <= 0 || h.biHeight <= 0 || h.biWidth > kMaxSide || h.biHeight > kMaxSide ||
        (bpp != 1 && bpp != 2 && bpp != 4 && bpp != 8 && bpp != 16 && bpp != 24 && bpp != 32)) {
        return nullptr;
    }
    long long stride = ((static_cast<long long>(h.biWidth) * bpp + 31) / 32) * 4;
    // Room for at least one byte per pixel whatever the depth, so that byte-wise drawing of
    // a picture of fewer bits per pixel stays inside its memory.
    long long rowBytes = std::max(stride, (static_cast<long long>(h.biWidth) + 3) & ~3LL);
    if (rowBytes * h.biHeight > kMaxSectionBytes) {
        return nullptr;
    }
    auto* bmp = new HGDIOBJ__;
    bmp->width = h.biWidth;
    bmp->height = h.biHeight;
    bmp->bitsPerPixel = bpp;
    bmp->stride = static_cast<int>(stride);
    int colours = bpp <= 8 ? (1 << bpp) : 0;
    std::memcpy(bmp->palette, info->bmiColors, sizeof(RGBQUAD) * colours);
    bmp->pixels.assign(static_cast<std::size_t>(rowBytes * h.biHeight), 0);
    if (bits != nullptr) {
        *bits = bmp->pixels.data();
    }
    return bmp;
}

HDC CreateCompatibleDC(HDC dc) {
    (void)dc;
    return new HDC__{HDC__::Kind::kMemory};
}

HGDIOBJ SelectObject(HDC dc, HGDIOBJ object) {
    if (dc == nullptr || dc->kind != HDC__::Kind::kMemory) {
        return nullptr;
    }
    HGDIOBJ previous = dc->selected;
    dc->selected = object;
    return previous;
}

BOOL DeleteDC(HDC dc) {
    if (dc == nullptr || dc->kind != HDC__::Kind::kMemory) {
        return FALSE;
    }
    delete dc;
    return TRUE;
}

BOOL DeleteObject(HGDIOBJ object) {
    if (object == nullptr) {
        return FALSE;
    }
    delete object;
    return TRUE;
}

BOOL BitBlt(HDC dest, int x, int y, int width, int height, HDC src, int srcX, int srcY, DWORD rop) {
    (void)rop;
    if (dest == nullptr || src == nullptr || src->selected == nullptr || width <= 0 ||
        height <= 0) {
        return FALSE;
    }
    const HGDIOBJ__& bmp = *src->selected;
    if (dest->kind != HDC__::Kind::kWindow) {
        return FALSE;  // the game only copies pictures to the window
    }
    HWND__* w = platform::GameWindow();
    if (w == nullptr) {
        return FALSE;
    }
    platform::Record& record = platform::CallRecord();
    if (record.enabled) {
        record.windowBlits.push_back({x, y, width, height, srcX, srcY});
    }
    // A strip above the previous one starts the next pass of an interleaved reveal: show the
    // pass that is complete before drawing on.
    if (dest->drawn && y < dest->lastBlitY) {
        PresentIfDrawn(dest, platform::PresentReason::kRevealStep);
    }
    dest->lastBlitY = y;
    dest->drawn = true;

    platform::Surface& surface = w->surface;
    int x0 = std::max({0, x, x - srcX});
    int y0 = std::max({0, y, y - srcY});
    int x1 = std::min({surface.width, x + width, x - srcX + bmp.width});
    int y1 = std::min({surface.height, y + height, y - srcY + bmp.height});
    if (bmp.bitsPerPixel != 8) {
        return TRUE;  // only 8-bit pictures are shown; other depths draw nothing
    }
    for (int dy = y0; dy < y1; ++dy) {
        int sy = dy - y + srcY;
        const BYTE* row =
            bmp.pixels.data() + static_cast<std::size_t>(bmp.height - 1 - sy) * bmp.stride;
        std::uint32_t* out = surface.pixels.data() + static_cast<std::size_t>(dy) * surface.width;
        for (int dx = x0; dx < x1; ++dx) {
            out[dx] = ToRgb(bmp.palette[row[dx - x + srcX]]);
        }
    }
    return TRUE;
}

BOOL IntersectRect(RECT* result, const RECT* a, const RECT* b) {
    if (result == nullptr || a == nullptr || b == nullptr) {
        return FALSE;
    }
    RECT r{std::max(a->left, b->left), std::max(a->top, b->top), std::min(a->right, b->right),
           std::min(a->bottom, b->bottom)};
    if (r.left >= r.right || r.top >= r.bottom) {
        *result = RECT{0, 0, 0, 0};
        return FALSE;
    }
    *result = r;
    return TRUE;
}

int SetBkMode(HDC dc, int mode) {
    if (dc == nullptr) {
        return 0;
    }
    int previous = dc->bkMode;
    dc->bkMode = mode;
    return previous;
}
