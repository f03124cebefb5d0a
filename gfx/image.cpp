#include "gfx/image.h"

#include <algorithm>
#include <cstring>

#include "gfx/keyed_row.h"
#include "platform/memory.h"

Image::~Image() {
    if (bitmap != nullptr) {
        DeleteObject(bitmap);
    }
    if (info != nullptr) {
        VirtualFree(info, 0, MEM_RELEASE);
    }
}

BYTE* Image::PixelAddress(INT px, INT py) {
    if (px >= Width() || py >= Height()) {
        return nullptr;
    }
    return bits + static_cast<long long>(Height() - 1 - py) * Stride() + px;
}

void Image::GetRect(RECT* rect) {
    *rect = RECT{0, 0, Width(), Height()};
}

namespace {

// Narrows one axis of a copy so that it lies inside both images. Returns false when nothing
// of it is left.
bool ClipAxis(long long& dst, long long& src, long long& len, long long dstSize,
              long long srcSize) {
    long long skip = std::max({0LL, -dst, -src});
    dst += skip;
    src += skip;
    len -= skip;
    len = std::min({len, dstSize - dst, srcSize - src});
    return len > 0;
}

}  // namespace

void Image::Draw(Image* dest, INT dx, INT dy, UINT width, UINT height, INT sx, INT sy, DWORD key) {
    if (width == 0 || height == 0 || dest == nullptr || bits == nullptr || dest->bits == nullptr) {
        return;
    }
    long long x = dx, y = dy, srcX = sx, srcY = sy, w = width, h = height;
    if (!ClipAxis(x, srcX, w, dest->Width(), Width()) ||
        !ClipAxis(y, srcY, h, dest->Height(), Height())) {
        return;
    }
    // Rows are stored bottom-up: start at the rectangle's bottom row, the lowest address.
    const BYTE* src = PixelAddress(static_cast<INT>(srcX), static_cast<INT>(srcY + h - 1));
    BYTE* dst = dest->PixelAddress(static_cast<INT>(x), static_cast<INT>(y + h - 1));
    const long long srcStride = Stride();
    const long long dstStride = dest->Stride();
    if (key == NO_KEY) {
        for (long long row = 0; row < h; ++row) {
            std::memcpy(dst, src, static_cast<std::size_t>(w));
            src += srcStride;
            dst += dstStride;
        }
        return;
    }
    const BYTE k = static_cast<BYTE>(key & 0xFF);
    for (long long row = 0; row < h; ++row) {
        CopyRowKeyed(dst, src, static_cast<std::size_t>(w), k);
        src += srcStride;
        dst += dstStride;
    }
}

void Sprite::GetRect(RECT* rect) {
    *rect = RECT{x, y, x + Width(), y + Height()};
}

INT Sprite::GetX() {
    return x;
}
INT Sprite::GetY() {
    return y;
}
INT Sprite::GetExtra() {
    return extra;
}

void Sprite::DrawClipped(Image* dest, const RECT* clip) {
    RECT r;
    GetRect(&r);
    if (clip != nullptr) {
        RECT whole = r;
        if (!IntersectRect(&r, clip, &whole)) {
            return;
        }
    }
    Draw(dest, r.left, r.top, static_cast<UINT>(r.right - r.left),
         static_cast<UINT>(r.bottom - r.top), r.left - x, r.top - y,
         keyed != 0 ? (key | KEY_FLAG) : NO_KEY);
}

int Sprite::Load(LPCWSTR path) {
    if (LoadDC8(path) == 0) {
        return 0;
    }
    TakeKeyFromCorner();
    return 1;
}

int Sprite::HitTest(INT px, INT py) {
    if (!(x < px && px < x + Width() && y < py && py < y + Height())) {
        return 0;
    }
    BYTE* p = PixelAddress(px - x, py - y);
    return p != nullptr && *p != key ? 1 : 0;
}

void Sprite::SetPosition(INT newX, INT newY) {
    x = newX;
    y = newY;
}

void Sprite::TakeKeyFromCorner() {
    BYTE* corner = PixelAddress(0, 0);
    if (corner != nullptr) {
        key = *corner;
    }
}
