// Every picture of the pack, drawn in code. Each function returns a canvas of exactly the size
// the game reads from; the pack refuses to write a picture whose size disagrees.
#pragma once

#include <cstdint>

#include "tools/packgen/canvas.h"
#include "tools/packgen/text.h"

namespace packgen {

// A deterministic pseudo-random sequence, so every build draws the same art.
class Rng {
public:
    explicit Rng(std::uint32_t seed) : s_(seed * 2654435761u + 1) {}
    std::uint32_t next() {
        s_ ^= s_ << 13;
        s_ ^= s_ >> 17;
        s_ ^= s_ << 5;
        return s_;
    }
    double uniform() { return (next() >> 8) / double(1u << 24); }
    double range(double a, double b) { return a + (b - a) * uniform(); }
    int pick(int n) { return int(next() % std::uint32_t(n)); }

private:
    std::uint32_t s_;
};

// Scenery shared by several pictures.
void DrawSky(Canvas& c, int x, int y, int w, int h, double t0 = 0.05, double t1 = 0.9);
void DrawSea(Canvas& c, int x, int y, int w, int h, double t0 = 0.75, double t1 = 0.25);
void DrawSun(Canvas& c, double cx, double cy, double r);
void DrawCloud(Canvas& c, double cx, double cy, double size, std::uint32_t seed);
void DrawIsland(Canvas& c, int cx, int baseY, int width, int height, std::uint32_t seed);
void DrawPalm(Canvas& c, int x, int baseY, int height, double lean);
// A wooden fishing boat, bow at the right when facing right; `scale` 1 is the round's boat.
void DrawBoat(Canvas& c, int x, int y, double scale, bool facingRight);
// A rounded panel of paper or wood with a dark rim.
void DrawPanel(Canvas& c, int x, int y, int w, int h, const Ramp& r, int radius = 5);
// A small button: rounded, shaded, labelled.
void DrawButton(Canvas& c, int x, int y, int w, int h, const char* label, const Ramp& r,
                bool pressed, double textSize = 12);

// Colours used for lettering.
Rgb Colour(std::uint8_t index);

// Screens.
Canvas DrawTitle();
Canvas DrawTitleFlag();
// The options menu; `lit` names a line to highlight or a button to press ("" for none).
Canvas DrawMenu(const char* lit);
Canvas DrawIntroPage();
Canvas DrawEndScreen();
Canvas DrawGroundBackdrop(int ground);  // 1 Pacific, 2 South, 3 Amazon
Canvas DrawRankingScreen();
Canvas DrawLoadPanel();

// Intro pieces.
Canvas DrawIntroN();
Canvas DrawIntroJ();
Canvas DrawIntroP();
Canvas DrawIntroP2();
Canvas DrawProfile();
Canvas DrawFavorite();
Canvas DrawStory();

// Round pieces.
Canvas DrawRoundBack();
Canvas DrawFisherman();
Canvas DrawBoatStrip();
Canvas DrawBasket(bool full);
Canvas DrawWave();
Canvas DrawBottom();
Canvas DrawExitButton();
Canvas DrawNumbers();
Canvas DrawRope();
Canvas DrawHook();
Canvas DrawSpray();
Canvas DrawEnergyMan();
Canvas DrawDark();
Canvas DrawLight();
Canvas DrawBarCase();
Canvas DrawEnergyBar();

// Fish: swimming strips (4 frames), bottom dwellers and the hooked strips (2 frames).
Canvas DrawFishStrip(int kind);
Canvas DrawShellStrip(int kind);
Canvas DrawTakenStrip(int kind);

}  // namespace packgen
