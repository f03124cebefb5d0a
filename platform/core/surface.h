// The window's client area as the host shows it: 0x00RRGGBB pixels, top row first.
#pragma once

#include <cstdint>
#include <vector>

namespace platform {

struct Surface {
    int width = 0;
    int height = 0;
    std::vector<std::uint32_t> pixels;

    void Resize(int w, int h) {
        width = w;
        height = h;
        pixels.assign(static_cast<std::size_t>(w) * h, 0x00FFFFFFu);
    }
    std::uint32_t At(int x, int y) const { return pixels[static_cast<std::size_t>(y) * width + x]; }
};

}  // namespace platform
