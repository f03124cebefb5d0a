// The objects behind HDC and HGDIOBJ.
#pragma once

#include <vector>

#include "platform/gdi.h"

struct HGDIOBJ__ {
    int width = 0;
    int height = 0;
    int bitsPerPixel = 0;
    int stride = 0;  // bytes per row, padded to 4
    RGBQUAD palette[256] = {};
    std::vector<BYTE> pixels;  // bottom-up rows
};

struct HDC__ {
    enum class Kind { kWindow, kScreen, kMemory } kind = Kind::kMemory;
    HGDIOBJ__* selected = nullptr;
    int bkMode = OPAQUE;
    bool drawn = false;  // something reached the window since GetDC
    int lastBlitY = -1;  // row of the last strip copied to the window, to see reveal passes
};
