// In-memory pictures for drawing tests.
#pragma once

#include <functional>
#include <memory>

#include "gfx/image.h"

namespace test {

// A w x h 8-bit picture whose pixel (x, y) is fill(x, y).
template <typename T = Image>
std::unique_ptr<T> MakePicture(int w, int h, const std::function<BYTE(int, int)>& fill) {
    auto image = std::make_unique<T>();
    struct {
        BITMAPINFOHEADER header;
        RGBQUAD palette[256];
    } info{};
    info.header.biSize = 40;
    info.header.biWidth = w;
    info.header.biHeight = h;
    info.header.biPlanes = 1;
    info.header.biBitCount = 8;
    int stride = (w + 3) & ~3;
    info.header.biSizeImage = static_cast<DWORD>(stride * h);
    for (int i = 0; i < 256; ++i) {
        info.palette[i] =
            RGBQUAD{static_cast<BYTE>(i), static_cast<BYTE>(255 - i), static_cast<BYTE>(i / 2), 0};
    }
    std::vector<BYTE> pixels(static_cast<std::size_t>(stride * h), 0);
    for (int y = 0; y < h; ++y) {
        for (int x = 0; x < w; ++x) {
            pixels[static_cast<std::size_t>((h - 1 - y) * stride + x)] = fill(x, y);
        }
    }
    image->CreateSection(&info.header, pixels.data());
    return image;
}

inline BYTE PixelAt(Image& image, int x, int y) {
    return *image.PixelAddress(x, y);
}

}  // namespace test
