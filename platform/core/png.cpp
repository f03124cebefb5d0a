#include "platform/core/png.h"

#include <stb/stb_image_write.h>

#include <vector>

namespace platform {

bool WritePng(const std::string& path, const Surface& surface, int scale) {
    if (scale < 1 || surface.width <= 0 || surface.height <= 0) {
        return false;
    }
    int w = surface.width * scale;
    int h = surface.height * scale;
    std::vector<unsigned char> rgb(static_cast<std::size_t>(w) * h * 3);
    for (int y = 0; y < h; ++y) {
        for (int x = 0; x < w; ++x) {
            std::uint32_t p = surface.At(x / scale, y / scale);
            unsigned char* o = &rgb[(static_cast<std::size_t>(y) * w + x) * 3];
            o[0] = static_cast<unsigned char>(p >> 16);
            o[1] = static_cast<unsigned char>(p >> 8);
            o[2] = static_cast<unsigned char>(p);
        }
    }
    return stbi_write_png(path.c_str(), w, h, 3, rgb.data(), w * 3) != 0;
}

}  // namespace platform
