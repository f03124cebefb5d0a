// The one 256-colour palette shared by every picture of the pack.
//
// The game copies palette indices from one picture into another and presents the result with
// the palette of whichever picture happens to be the frame, so every picture must agree on what
// each index means. Index 0 is the colour key: a loud magenta that no art uses, placed at pixel
// (0, 0) of every picture drawn with a key (the game takes a sprite's key from that corner).
#pragma once

#include <array>
#include <cstdint>

namespace packgen {

struct Rgb {
    int r = 0, g = 0, b = 0;
};

// The colour-key index: transparent wherever a picture is drawn keyed.
constexpr std::uint8_t kKey = 0;

// A run of palette entries from dark to light, used for shading and gradients.
struct Ramp {
    int base;
    int count;
    // Entry i of the ramp (clamped into the ramp).
    std::uint8_t at(int i) const;
    // Entry for a brightness t in [0, 1], rounded to the nearest entry.
    std::uint8_t lerp(double t) const;
    // Entry for a brightness t in [0, 1], ordered-dithered between the two nearest entries by the
    // pixel position, so smooth gradients survive the small palette.
    std::uint8_t dither(double t, int x, int y) const;
};

namespace ramp {
extern const Ramp kGrey;
extern const Ramp kSea;
extern const Ramp kSky;
extern const Ramp kSand;
extern const Ramp kWood;
extern const Ramp kSkin;
extern const Ramp kRed;
extern const Ramp kGold;
extern const Ramp kGreen;
extern const Ramp kPurple;
extern const Ramp kTeal;
extern const Ramp kPaper;
extern const Ramp kNavy;
extern const Ramp kPink;
extern const Ramp kYellow;
extern const Ramp kHair;
extern const Ramp kInk;
}  // namespace ramp

// The 256 colours, index 0 being the key.
const std::array<Rgb, 256>& Palette();

// The palette entry closest to a colour, never the key.
std::uint8_t Nearest(Rgb c);

// Mix of two colours, a = 0 gives `from`, a = 1 gives `to`.
Rgb Mix(Rgb from, Rgb to, double a);

// Ordered-dither threshold in [0, 1) for a pixel position (4 x 4 Bayer matrix).
double Bayer(int x, int y);

}  // namespace packgen
