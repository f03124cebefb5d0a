// Presenting a picture to the window.
#include <algorithm>

#include "gfx/image.h"

int PresentImage(Image* image, HDC hdc, INT x, INT y, INT width, INT height) {
    if (image == nullptr || image->bitmap == nullptr) {
        return 0;
    }
    HDC memory = CreateCompatibleDC(hdc);
    SelectObject(memory, image->bitmap);
    int result = 1;
    if (height == 293) {
        result = BitBlt(hdc, x, y, width, 293, memory, 0, 0, SRCCOPY);
    } else {
        // The interleaved reveal: fifteen passes, each copying every fifteenth strip, so the
        // picture appears evenly over the old one. Rows past the bottom are clamped to 293,
        // below the last row.
        for (int pass = 0; pass < 15; ++pass) {
            for (int k = 0; k < 20; ++k) {
                int row = std::min(pass + 15 * k, 293);
                BitBlt(hdc, x, row, width, height, memory, 0, row, SRCCOPY);
            }
        }
    }
    DeleteDC(memory);
    return result;
}
