#include "tools/packgen/palette.h"

#include <algorithm>
#include <cmath>
#include <map>
#include <vector>

namespace packgen {

namespace {

struct RampSpec {
    int count;
    std::vector<Rgb> stops;
};

// Ramps in palette order, starting at index 1. Their bases are derived below, so adding a ramp
// only moves the general-purpose colours that fill the rest of the table.
const std::vector<RampSpec>& RampSpecs() {
    static const std::vector<RampSpec> specs = {
        {16, {{0, 0, 0}, {255, 255, 255}}},  // grey
        {24,
         {{4, 10, 34},
          {10, 30, 80},
          {16, 62, 128},
          {30, 104, 172},
          {60, 160, 210},
          {150, 220, 240}}},                                                      // sea
        {16, {{40, 80, 170}, {90, 150, 225}, {170, 210, 245}, {255, 236, 205}}},  // sky
        {12, {{80, 60, 34}, {170, 140, 86}, {230, 205, 140}, {255, 245, 210}}},   // sand
        {12, {{34, 16, 6}, {100, 56, 24}, {170, 110, 52}, {235, 190, 120}}},      // wood
        {8, {{96, 48, 28}, {196, 128, 88}, {255, 218, 186}}},                     // skin
        {12, {{54, 4, 8}, {150, 20, 24}, {226, 60, 50}, {255, 180, 165}}},        // red
        {12, {{70, 34, 0}, {180, 110, 10}, {240, 180, 30}, {255, 246, 150}}},     // gold
        {12, {{6, 32, 12}, {30, 96, 34}, {80, 170, 60}, {200, 245, 140}}},        // green
        {8, {{34, 10, 56}, {120, 56, 168}, {232, 196, 252}}},                     // purple
        {8, {{0, 44, 44}, {20, 150, 140}, {170, 252, 232}}},                      // teal
        {8, {{128, 100, 64}, {226, 204, 160}, {255, 250, 232}}},                  // paper
        {8, {{10, 16, 42}, {40, 62, 126}, {156, 176, 226}}},                      // navy
        {8, {{84, 20, 42}, {228, 110, 142}, {255, 214, 224}}},                    // pink
        {8, {{84, 72, 0}, {240, 220, 40}, {255, 255, 210}}},                      // yellow
        {8, {{22, 12, 6}, {96, 58, 22}, {196, 146, 84}}},                         // hair
        {8, {{0, 0, 6}, {4, 10, 30}, {12, 26, 58}}},                              // ink
    };
    return specs;
}

Rgb Sample(const std::vector<Rgb>& stops, double t) {
    if (stops.size() == 1) {
        return stops[0];
    }
    double p = t * static_cast<double>(stops.size() - 1);
    int i = std::min(static_cast<int>(p), static_cast<int>(stops.size()) - 2);
    return Mix(stops[i], stops[i + 1], p - i);
}

std::array<Rgb, 256> Build() {
    std::array<Rgb, 256> pal{};
    pal[kKey] = {255, 0, 255};
    int next = 1;
    for (const RampSpec& spec : RampSpecs()) {
        for (int i = 0; i < spec.count; ++i) {
            pal[next++] = Sample(spec.stops, spec.count == 1 ? 0.0 : i / double(spec.count - 1));
        }
    }
    // The rest is a coarse colour cube, so that blends of arbitrary colours (anti-aliased
    // lettering) always find something near.
    const int levels[4] = {0, 88, 170, 255};
    for (int r = 0; r < 4 && next < 256; ++r) {
        for (int g = 0; g < 4 && next < 256; ++g) {
            for (int b = 0; b < 4 && next < 256; ++b) {
                pal[next++] = {levels[r], levels[g],
                               levels[b] == 255 && r == 3 && g == 0
                                   ? 200  // keep magenta for the key alone
                                   : levels[b]};
            }
        }
    }
    while (next < 256) {
        pal[next] = {200, 200, 190};
        ++next;
    }
    return pal;
}

int RampBase(int which) {
    int base = 1;
    for (int i = 0; i < which; ++i) {
        base += RampSpecs()[i].count;
    }
    return base;
}

Ramp MakeRamp(int which) {
    return Ramp{RampBase(which), RampSpecs()[which].count};
}

}  // namespace

namespace ramp {
const Ramp kGrey = MakeRamp(0);
const Ramp kSea = MakeRamp(1);
const Ramp kSky = MakeRamp(2);
const Ramp kSand = MakeRamp(3);
const Ramp kWood = MakeRamp(4);
const Ramp kSkin = MakeRamp(5);
const Ramp kRed = MakeRamp(6);
const Ramp kGold = MakeRamp(7);
const Ramp kGreen = MakeRamp(8);
const Ramp kPurple = MakeRamp(9);
const Ramp kTeal = MakeRamp(10);
const Ramp kPaper = MakeRamp(11);
const Ramp kNavy = MakeRamp(12);
const Ramp kPink = MakeRamp(13);
const Ramp kYellow = MakeRamp(14);
const Ramp kHair = MakeRamp(15);
const Ramp kInk = MakeRamp(16);
}  // namespace ramp

std::uint8_t Ramp::at(int i) const {
    return static_cast<std::uint8_t>(base + std::clamp(i, 0, count - 1));
}

std::uint8_t Ramp::lerp(double t) const {
    return at(static_cast<int>(std::lround(std::clamp(t, 0.0, 1.0) * (count - 1))));
}

std::uint8_t Ramp::dither(double t, int x, int y) const {
    double v = std::clamp(t, 0.0, 1.0) * (count - 1);
    int i = static_cast<int>(v);
    return at(v - i > Bayer(x, y) ? i + 1 : i);
}

const std::array<Rgb, 256>& Palette() {
    static const std::array<Rgb, 256> pal = Build();
    return pal;
}

std::uint8_t Nearest(Rgb c) {
    static std::map<int, std::uint8_t> cache;
    int keyv =
        (std::clamp(c.r, 0, 255) << 16) | (std::clamp(c.g, 0, 255) << 8) | std::clamp(c.b, 0, 255);
    auto it = cache.find(keyv);
    if (it != cache.end()) {
        return it->second;
    }
    const auto& pal = Palette();
    int best = 1;
    long bestd = -1;
    for (int i = 1; i < 256; ++i) {
        long dr = pal[i].r - c.r, dg = pal[i].g - c.g, db = pal[i].b - c.b;
        // Weighted towards green, to which the eye is most sensitive.
        long d = 3 * dr * dr + 4 * dg * dg + 2 * db * db;
        if (bestd < 0 || d < bestd) {
            bestd = d;
            best = i;
        }
    }
    cache[keyv] = static_cast<std::uint8_t>(best);
    return static_cast<std::uint8_t>(best);
}

Rgb Mix(Rgb from, Rgb to, double a) {
    auto m = [a](int p, int q) { return static_cast<int>(std::lround(p + (q - p) * a)); };
    return {m(from.r, to.r), m(from.g, to.g), m(from.b, to.b)};
}

double Bayer(int x, int y) {
    static const int m[4][4] = {{0, 8, 2, 10}, {12, 4, 14, 6}, {3, 11, 1, 9}, {15, 7, 13, 5}};
    return (m[y & 3][x & 3] + 0.5) / 16.0;
}

}  // namespace packgen
