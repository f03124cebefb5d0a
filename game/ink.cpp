#include "game/ink.h"

#include <algorithm>

#include "assets/catalogue.h"
#include "game/art.h"

namespace {

constexpr INT WATER_TOP = 148;  // the surface line on screen
constexpr INT FRAME_W = 240;
constexpr INT FRAME_H = 293;
constexpr INT SPOT = 50;
constexpr INT HALF_SPOT = SPOT / 2;

// A piece of the darkness, sampled at its own screen position less the water's top.
void DarkPiece(Sprite* dark, INT x, INT y, INT width, INT height) {
    DrawKeyed(dark, g_frameImage, x, y, width, height, x, y - WATER_TOP);
}

}  // namespace

void DrawInkDarkness(INT cameraX, INT hookX, INT hookY) {
    Sprite* dark = RegionArt(g_img_dark);
    // The spot is centred on the middle of the 20 x 20 hook.
    const INT lx = hookX - cameraX + 10;
    const INT ly = hookY + 10;
    if (ly <= WATER_TOP - HALF_SPOT || lx >= FRAME_W + HALF_SPOT || lx <= -HALF_SPOT) {
        DarkPiece(dark, 0, WATER_TOP, FRAME_W, FRAME_H - WATER_TOP);
        return;
    }
    const INT top = std::max(ly - (WATER_TOP + HALF_SPOT), 0);
    const INT left = lx - HALF_SPOT;
    const INT right = std::min(lx + HALF_SPOT, FRAME_W);
    const INT bottom = std::min(ly + HALF_SPOT, FRAME_H);
    // Four pieces around the spot; side pieces cover the rows a straddling spot leaves open.
    DarkPiece(dark, 0, WATER_TOP, FRAME_W, top);
    DarkPiece(dark, 0, WATER_TOP + top, std::max(left, 0), SPOT);
    DarkPiece(dark, right, WATER_TOP + top, FRAME_W - right, SPOT);
    DarkPiece(dark, 0, bottom, FRAME_W, FRAME_H - bottom);

    // The light, cut to the screen's sides and to the water.
    Sprite* light = RegionArt(g_img_light);
    INT x = left, width = SPOT, sx = 0;
    if (left < 0) {
        x = 0;
        width = lx + HALF_SPOT;
        sx = -left;
    } else if (left > FRAME_W - SPOT) {
        width = FRAME_W - left;
    }
    INT y = ly - HALF_SPOT, height = SPOT, sy = 0;
    if (ly - HALF_SPOT < WATER_TOP) {
        y = WATER_TOP;
        height = ly - (WATER_TOP - HALF_SPOT);
        sy = (WATER_TOP + HALF_SPOT) - ly;
    }
    DrawKeyed(light, g_frameImage, x, y, width, height, sx, sy);
}
