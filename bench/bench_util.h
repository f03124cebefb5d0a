// Pictures and SDL surfaces of the game's sizes for the benchmarks.
#pragma once

#include <SDL.h>

#include <memory>
#include <random>
#include <vector>

#include "gfx/image.h"

namespace bench {

constexpr BYTE kKey = 0xFE;

struct Size {
    int w, h;
};

// The sizes the game draws: dots, fish, boat, basket, strips, the frame and the scene window.
const std::vector<Size>& GameSizes();

enum class Coverage { kOpaque, kEllipse, kRandom };

// A w x h 8-bit picture; with kEllipse an ellipse of colours inside key pixels (a sprite), with
// kRandom key pixels scattered at random over half the picture (the worst case for branches).
std::unique_ptr<Sprite> MakeSprite(int w, int h, Coverage coverage, unsigned seed = 1);

// An 8-bit SDL surface holding the same pixels, with the key set when keyed.
SDL_Surface* ToSurface(Image& image, bool keyed, bool rle);

}  // namespace bench
