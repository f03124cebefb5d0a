// The round's scenery and props.
#include <algorithm>
#include <cmath>

#include "tools/packgen/art.h"

namespace packgen {

namespace {

constexpr double kPi = 3.14159265358979323846;

// Height of the wave crest in the wave strip's rows at strip column x. Periodic with 49 pixels:
// the round scrolls the strip by 7 pixels a frame and wraps after 42, so the pattern must repeat
// every 49 columns for the scroll to be seamless.
double WaveCrest(int x) {
    double p = 2 * kPi * x / 49.0;
    return 19.5 + 3.0 * std::sin(p) + 1.2 * std::sin(2 * p + 1.1) + 0.6 * std::sin(3 * p + 2.0);
}

}  // namespace

Canvas DrawRoundBack() {
    Canvas c(480, 293);
    DrawSky(c, 0, 0, 480, 148, 0.0, 0.85);
    DrawSun(c, 395, 38, 14);
    DrawCloud(c, 70, 40, 14, 3);
    DrawCloud(c, 190, 62, 10, 7);
    DrawCloud(c, 300, 30, 12, 11);
    DrawCloud(c, 450, 70, 9, 5);
    // Far islands on the horizon.
    DrawIsland(c, 120, 148, 90, 16, 21);
    DrawIsland(c, 330, 148, 46, 9, 22);
    // The sea down to a sandy floor.
    DrawSea(c, 0, 148, 480, 112, 0.78, 0.28);
    c.rect(0, 148, 480, 1, ramp::kSea.at(20));
    c.vgradient(0, 258, 480, 35, ramp::kSand, 0.35, 0.7);
    for (int i = 0; i < 480; ++i) {
        int edge = 256 + int(2.0 * std::sin(i * 0.07) + 1.5 * std::sin(i * 0.19));
        for (int j = edge; j < 260; ++j) {
            c.set(i, j, ramp::kSand.dither(0.35, i, j));
        }
    }
    Rng rng(5);
    // Rising bubbles.
    for (int k = 0; k < 40; ++k) {
        int bx = rng.pick(480), by = 160 + rng.pick(90);
        c.set(bx, by, ramp::kSea.at(21));
        if (k % 3 == 0) {
            c.set(bx + 1, by - 3, ramp::kSea.at(22));
        }
    }
    return c;
}

Canvas DrawWave() {
    Canvas c(392, 30);
    for (int x = 0; x < 392; ++x) {
        double crest = WaveCrest(x);
        for (int y = 0; y < 30; ++y) {
            double d = y - crest;
            if (d < 0) {
                continue;
            }
            std::uint8_t col;
            if (d < 1.0) {
                col = ramp::kGrey.at(15);  // foam along the crest
            } else if (d < 2.5) {
                col = ramp::kSea.at(21);
            } else {
                // Water that melts into the background's sea colour at the strip's last rows.
                double t = 0.86 - 0.08 * std::min(1.0, (d - 2.5) / 6.0);
                col = ramp::kSea.dither(t, x % 49, y);
            }
            c.set(x, y, col);
        }
        // Spray flecks above the highest crests, repeating with the same period.
        int px = x % 49;
        if (px == 12 || px == 14 || px == 37) {
            int fy = int(crest) - 2 - (px == 14 ? 1 : 0);
            c.set(x, fy, ramp::kGrey.at(14));
        }
    }
    return c;
}

Canvas DrawBottom() {
    Canvas c(900, 53);
    // Sand with a wavy top edge.
    for (int x = 0; x < 900; ++x) {
        int top = 24 + int(3.0 * std::sin(x * 0.045) + 2.0 * std::sin(x * 0.13 + 1.0));
        for (int y = top; y < 53; ++y) {
            double t = 0.55 - 0.25 * (y - top) / 30.0 + 0.08 * std::sin(x * 0.5 + y * 0.9);
            c.set(x, y, ramp::kSand.dither(t, x, y));
        }
        c.set(x, top, ramp::kSand.at(9));
    }
    Rng rng(77);
    // Rocks.
    for (int k = 0; k < 14; ++k) {
        double rx = rng.range(10, 890), r = rng.range(5, 11);
        c.ball(rx, 30 + rng.range(-2, 4), r * 1.4, r, ramp::kGrey, 0.2, 0.6);
    }
    // Seaweed: swaying ribbons.
    for (int k = 0; k < 26; ++k) {
        double sx = rng.range(5, 895);
        int hgt = 18 + rng.pick(26);
        double phase = rng.range(0, 6);
        for (int j = 0; j < hgt; ++j) {
            double px = sx + 2.5 * std::sin(j * 0.25 + phase) * (j / double(hgt));
            int y = 34 - j;
            std::uint8_t col = ramp::kGreen.at(3 + (j % 5 == 0 ? 2 : 0) + (k % 2));
            c.set(int(px), y, col);
            c.set(int(px) + 1, y, ramp::kGreen.at(2 + (k % 2)));
        }
    }
    // Coral fans.
    for (int k = 0; k < 12; ++k) {
        double cx = rng.range(15, 885);
        const Ramp& r = k % 3 == 0 ? ramp::kPink : (k % 3 == 1 ? ramp::kRed : ramp::kPurple);
        for (int b = 0; b < 5; ++b) {
            double ang = -kPi / 2 + (b - 2) * 0.35;
            double len = rng.range(8, 15);
            c.thickLine(cx, 33, cx + std::cos(ang) * len, 33 + std::sin(ang) * len, 2.0,
                        r.at(r.count / 2 + (b & 1)));
            c.ellipse(cx + std::cos(ang) * len, 33 + std::sin(ang) * len, 1.6, 1.6,
                      r.at(r.count - 2));
        }
    }
    // Starfish and shells on the sand.
    for (int k = 0; k < 10; ++k) {
        double sx = rng.range(10, 890), sy = rng.range(38, 48);
        if (k % 2 == 0) {
            for (int a = 0; a < 5; ++a) {
                double ang = a * 2 * kPi / 5 - kPi / 2;
                c.thickLine(sx, sy, sx + 4 * std::cos(ang), sy + 4 * std::sin(ang), 1.6,
                            ramp::kGold.at(7));
            }
            c.set(int(sx), int(sy), ramp::kGold.at(10));
        } else {
            c.ball(sx, sy, 3, 2, ramp::kPink, 0.4, 0.95);
        }
    }
    c.outline(0, 0, 900, 53, ramp::kSea.at(3));
    for (int x = 0; x < 900; ++x) {
        c.set(x, 0, kKey);  // the top row stays clear so the strip's corner is the key
    }
    return c;
}

// The boat, two frames: facing right at x 0, facing left at x 54.
Canvas DrawBoatStrip() {
    Canvas c(108, 30);
    DrawBoat(c, 0, 5, 1.0, true);
    DrawBoat(c, 54, 5, 1.0, false);
    return c;
}

namespace {

// One fisherman frame, facing right; the left frames are mirrors.
void DrawFishermanFrame(Canvas& c, int ox, bool cheer) {
    auto S = [&](int x, int y, std::uint8_t col) { c.set(ox + x, y, col); };
    // Rod first, so the hands cover its butt. The tip is at (45, 8), where the line starts.
    if (cheer) {
        c.thickLine(ox + 26, 26, ox + 45, 6, 1.4, ramp::kWood.at(3));
    } else {
        c.thickLine(ox + 24, 30, ox + 45, 8, 1.4, ramp::kWood.at(3));
    }
    S(45, cheer ? 6 : 8, ramp::kRed.at(8));
    // Torso: a striped shirt, standing at the gunwale (rows below 37 belong to the boat).
    for (int y = 19; y <= 36; ++y) {
        int half = y < 22 ? 5 + (y - 19) : 8;
        for (int x = 17 - half; x <= 17 + half; ++x) {
            bool stripe = (y / 3) % 2 == 0;
            double t = 0.75 - 0.35 * (x - (17 - half)) / (2.0 * half);
            S(x, y,
              stripe ? ramp::kGrey.dither(0.95 - 0.2 * (1 - t), x, y)
                     : ramp::kNavy.dither(t, x, y));
        }
    }
    // Head, face to the right.
    c.ball(ox + 18, 13, 5.5, 6, ramp::kSkin, 0.35, 1.0);
    S(21, 12, ramp::kGrey.at(0));  // eye
    S(23, 14, ramp::kSkin.at(2));  // nose
    if (cheer) {
        S(20, 16, ramp::kRed.at(3));
        S(21, 16, ramp::kRed.at(3));
        S(21, 17, ramp::kRed.at(2));
    } else {
        S(20, 16, ramp::kSkin.at(1));
        S(21, 16, ramp::kSkin.at(1));
    }
    // Straw hat with a red band.
    c.ellipse(ox + 17, 8.5, 9.5, 2.2, ramp::kGold.at(8));
    c.ball(ox + 17, 6.5, 5.5, 3.8, ramp::kGold, 0.5, 0.95);
    c.rect(ox + 12, 8, 11, 1, ramp::kRed.at(6));
    // Arms.
    if (cheer) {
        c.thickLine(ox + 12, 21, ox + 5, 9, 3, ramp::kNavy.at(4));  // free arm up, waving
        c.ball(ox + 5, 7, 2.2, 2.2, ramp::kSkin, 0.4, 1.0);
        c.thickLine(ox + 22, 22, ox + 27, 26, 3, ramp::kNavy.at(4));
        c.ball(ox + 27, 26, 2, 2, ramp::kSkin, 0.4, 1.0);
    } else {
        c.thickLine(ox + 21, 22, ox + 25, 29, 3, ramp::kNavy.at(4));
        c.ball(ox + 25, 29, 2, 2, ramp::kSkin, 0.4, 1.0);
        c.thickLine(ox + 12, 22, ox + 20, 31, 3, ramp::kNavy.at(3));
        c.ball(ox + 21, 31, 2, 2, ramp::kSkin, 0.4, 1.0);
    }
    c.outline(ox, 0, 47, 37, ramp::kHair.at(0));
}

}  // namespace

Canvas DrawFisherman() {
    Canvas c(188, 49);
    DrawFishermanFrame(c, 0, false);
    DrawFishermanFrame(c, 47, true);
    Canvas right = c.crop(0, 0, 94, 49);
    c.blitMirrored(right, 0, 0, 47, 49, 94, 0);
    c.blitMirrored(right, 47, 0, 47, 49, 141, 0);
    return c;
}

namespace {

// One basket frame; `headingRight` turns its pennant, `fish` fills it (0 none, 1 or 2 the two
// wobble poses).
void DrawBasketFrame(Canvas& c, int ox, bool headingRight, int fish) {
    Canvas f(55, 60);
    int tilt = fish == 2 ? 1 : 0;
    // Pennant on a stick, streaming away from the heading.
    f.rect(27, 3, 1, 28, ramp::kWood.at(4));
    std::vector<Point> flag = headingRight ? std::vector<Point>{{27, 3}, {15, 7}, {27, 11}}
                                           : std::vector<Point>{{28, 3}, {40, 7}, {28, 11}};
    f.polygon(flag, ramp::kRed.at(7));
    // Fish in the basket stick out of the opening.
    if (fish) {
        f.ball(20 - tilt, 27, 5, 8, ramp::kSea, 0.4, 0.9);
        f.polygon({{17.0 - tilt, 20}, {13.0 - tilt, 14}, {22.0 - tilt, 17}}, ramp::kSea.at(10));
        f.ball(34 + tilt, 27, 4, 7, ramp::kRed, 0.4, 0.9);
        f.polygon({{35.0 + tilt, 20}, {40.0 + tilt, 15}, {31.0 + tilt, 17}}, ramp::kRed.at(7));
        f.ball(27, 29, 4, 6, ramp::kGold, 0.4, 0.95);
    }
    // Wicker body, narrowing to the bottom.
    for (int y = 31; y < 57; ++y) {
        double fy = (y - 31) / 26.0;
        int half = int(19 - 6 * fy * fy);
        for (int x = 27 - half; x <= 27 + half; ++x) {
            bool weave = ((x + (y / 3) * 2) / 3 + y / 3) % 2 == 0;
            double t = 0.7 - 0.4 * std::fabs(x - 24.0) / half - 0.15 * fy + (weave ? 0.12 : 0);
            f.set(x, y + tilt * (x > 27 ? 1 : 0), ramp::kWood.dither(t, x, y));
        }
    }
    // The dark mouth of the basket (the landing opening) and its rim.
    if (!fish) {
        f.ellipse(27, 31, 17, 3.2, ramp::kWood.at(1));
    }
    f.rect(9, 30 + tilt, 37, 2, ramp::kWood.at(9));
    // A red and white float ring around the middle.
    for (int x = 5; x <= 49; ++x) {
        bool red = ((x - 5) / 6) % 2 == 0;
        for (int y = 41; y <= 45; ++y) {
            double t = 0.9 - 0.12 * std::fabs(y - 42.5);
            f.set(x, y, red ? ramp::kRed.dither(t - 0.25, x, y) : ramp::kGrey.dither(t, x, y));
        }
    }
    f.outline(ramp::kWood.at(0));
    c.blit(f, 0, 0, 55, 60, ox, 0, true);
}

}  // namespace

Canvas DrawBasket(bool full) {
    if (!full) {
        Canvas c(110, 60);
        DrawBasketFrame(c, 0, false, 0);
        DrawBasketFrame(c, 55, true, 0);
        return c;
    }
    Canvas c(220, 60);
    DrawBasketFrame(c, 0, false, 1);
    DrawBasketFrame(c, 55, false, 2);
    DrawBasketFrame(c, 110, true, 1);
    DrawBasketFrame(c, 165, true, 2);
    return c;
}

Canvas DrawExitButton() {
    Canvas c(50, 25);
    DrawButton(c, 1, 2, 48, 22, "Exit", ramp::kRed, false, 12);
    return c;
}

Canvas DrawNumbers() {
    Canvas c(90, 11);
    TextStyle st;
    st.size = 12;
    st.bold = true;
    st.colour = {255, 250, 225};
    st.overKey = {40, 40, 60};
    st.keyCut = 0.45;
    for (int d = 0; d < 10; ++d) {
        Canvas cell(9, 11);
        DrawTextIn(cell, 0, 0, 9, 11, std::string(1, char('0' + d)), st);
        cell.outline(ramp::kNavy.at(0));
        c.blit(cell, 0, 0, 9, 11, 9 * d, 0);
    }
    c.set(0, 0, kKey);
    return c;
}

Canvas DrawRope() {
    Canvas c(6, 3);
    const std::uint8_t plain = ramp::kGrey.at(13), bright = ramp::kYellow.at(7);
    for (int k = 0; k < 2; ++k) {
        std::uint8_t col = k ? bright : plain;
        c.set(3 * k + 1, 0, col);
        c.set(3 * k, 1, col);
        c.set(3 * k + 1, 1, k ? ramp::kGrey.at(15) : ramp::kGrey.at(15));
        c.set(3 * k + 2, 1, col);
        c.set(3 * k + 1, 2, col);
    }
    return c;
}

Canvas DrawHook() {
    Canvas c(40, 20);
    for (int k = 0; k < 2; ++k) {
        int ox = 20 * k;
        // Eye at the top centre, where the line ties on.
        c.set(ox + 9, 0, ramp::kGrey.at(12));
        c.set(ox + 10, 0, ramp::kGrey.at(12));
        c.set(ox + 8, 1, ramp::kGrey.at(10));
        c.set(ox + 11, 1, ramp::kGrey.at(10));
        c.set(ox + 9, 2, ramp::kGrey.at(12));
        c.set(ox + 10, 2, ramp::kGrey.at(12));
        // Shank, bend and point.
        c.rect(ox + 10, 3, 2, 11, ramp::kGrey.at(13));
        c.rect(ox + 10, 3, 1, 11, ramp::kGrey.at(15));
        for (int a = 0; a <= 12; ++a) {
            double ang = kPi * a / 12.0;
            int x = ox + int(std::lround(7 + 4 * std::cos(ang)));
            int y = int(std::lround(14 + 4 * std::sin(ang)));
            c.set(x, y, ramp::kGrey.at(12));
            c.set(x, y - 1, ramp::kGrey.at(11));
        }
        c.set(ox + 3, 12, ramp::kGrey.at(13));
        c.set(ox + 3, 11, ramp::kGrey.at(13));
        c.set(ox + 4, 12, ramp::kGrey.at(10));  // barb
        // A bait worm on the bend.
        c.set(ox + 6, 17, ramp::kPink.at(5));
        c.set(ox + 7, 17, ramp::kPink.at(5));
        c.set(ox + 8, 17, ramp::kPink.at(6));
        c.set(ox + 6, 18, ramp::kPink.at(3));
        if (k == 1) {
            // Glint: a small four-pointed star on the shank.
            int gx = ox + 12, gy = 7;
            c.set(gx, gy, ramp::kGrey.at(15));
            for (int d = 1; d <= 3; ++d) {
                std::uint8_t col = d == 3 ? ramp::kYellow.at(6) : ramp::kYellow.at(7);
                c.set(gx + d, gy, col);
                c.set(gx - d, gy, col);
                c.set(gx, gy + d, col);
                c.set(gx, gy - d, col);
            }
        }
        c.outline(ox, 0, 20, 20, ramp::kNavy.at(1));
    }
    c.set(0, 0, kKey);
    return c;
}

Canvas DrawSpray() {
    Canvas c(55, 37);
    Rng rng(9);
    // A crown of water: a foamy base with fingers and flying drops.
    for (int x = 4; x < 51; ++x) {
        double f = (x - 27.5) / 23.5;
        int top = 24 + int(6 * f * f);
        for (int y = top; y < 35; ++y) {
            double t = 0.95 - 0.03 * (y - top) - 0.1 * std::fabs(f);
            c.set(x, y, (x + y) % 3 ? ramp::kGrey.dither(t, x, y) : ramp::kSea.at(21));
        }
    }
    for (int k = 0; k < 7; ++k) {
        double bx = 8 + k * 6.5, top = 6 + 10 * std::fabs(k - 3) / 3.0;
        c.thickLine(bx, 28, bx + (k - 3) * 1.6, top, 2.4, ramp::kSea.at(22));
        c.ellipse(bx + (k - 3) * 1.8, top - 2, 1.6, 1.6, ramp::kGrey.at(15));
    }
    for (int k = 0; k < 14; ++k) {
        c.set(3 + rng.pick(49), 1 + rng.pick(20), ramp::kGrey.at(15));
    }
    c.outline(ramp::kSea.at(12));
    c.set(0, 0, kKey);
    return c;
}

Canvas DrawEnergyMan() {
    Canvas c(42, 27);
    for (int k = 0; k < 2; ++k) {
        int ox = 21 * k;
        // A small angler cheering the energy on: cap, face, arms by frame.
        c.ball(ox + 10.5, 10, 6, 6.5, ramp::kSkin, 0.35, 1.0);
        c.ellipse(ox + 10.5, 5, 7.5, 2, ramp::kRed.at(7));
        c.ball(ox + 10.5, 4, 5, 3, ramp::kRed, 0.4, 0.8);
        c.set(ox + 8, 10, ramp::kGrey.at(0));
        c.set(ox + 13, 10, ramp::kGrey.at(0));
        c.rect(ox + 9, 13, 4, 1, ramp::kRed.at(3));
        for (int y = 17; y < 26; ++y) {
            int half = 3 + (y - 17) / 3;
            c.rect(ox + 11 - half, y, 2 * half, 1, ramp::kNavy.dither(0.7, ox, y));
        }
        if (k == 0) {
            c.thickLine(ox + 6, 19, ox + 2, 24, 2, ramp::kSkin.at(5));
            c.thickLine(ox + 15, 19, ox + 19, 24, 2, ramp::kSkin.at(5));
        } else {
            c.thickLine(ox + 6, 19, ox + 2, 13, 2, ramp::kSkin.at(5));
            c.thickLine(ox + 15, 19, ox + 19, 13, 2, ramp::kSkin.at(5));
        }
        c.outline(ox, 0, 21, 27, ramp::kHair.at(0));
    }
    c.set(0, 0, kKey);
    return c;
}

namespace {

// The dark water's own pattern: two pixels in sixteen stay clear, the rest is a dither of the
// darkest blues. The light spot uses the same rule so its edges melt into it.
std::uint8_t DarkPixel(int x, int y) {
    double th = Bayer(x, y);
    if (th < 0.125) {
        return kKey;
    }
    return ramp::kInk.at(((x * 7 + y * 3) / 5 + (x ^ y)) % 3);
}

}  // namespace

Canvas DrawDark() {
    Canvas c(240, 145);
    c.paint(0, 0, 240, 145, DarkPixel);
    return c;
}

Canvas DrawLight() {
    Canvas c(50, 50);
    c.paint(0, 0, 50, 50, [](int x, int y) {
        double r = std::hypot(x + 0.5 - 25, y + 0.5 - 25) / 25.0;
        // Clear inside, then ever more of the darkness towards the corners.
        double clear = std::clamp((1.05 - r) / 0.5, 0.0, 1.0);
        double th = Bayer(x, y);
        if (th < 0.125 + 0.875 * clear) {
            return kKey;
        }
        return DarkPixel(x, y);
    });
    c.set(0, 0, kKey);
    return c;
}

Canvas DrawBarCase() {
    Canvas c(180, 10);
    c.roundRect(0, 0, 180, 10, 4, ramp::kGold.at(2));
    c.roundRect(1, 1, 178, 8, 3, ramp::kGold.at(9));
    c.rect(2, 1, 176, 1, ramp::kGold.at(11));
    c.rect(5, 2, 170, 6, ramp::kInk.at(5));  // the empty trough behind the fill
    c.rect(4, 2, 1, 6, ramp::kGold.at(4));
    c.rect(175, 2, 1, 6, ramp::kGold.at(4));
    c.set(0, 0, kKey);
    return c;
}

Canvas DrawEnergyBar() {
    Canvas c(170, 6);
    c.paint(0, 0, 170, 6, [](int x, int y) {
        double f = x / 169.0;
        double shade = y == 0 ? 0.95 : (y == 5 ? 0.45 : 0.75 - 0.05 * y);
        // Red when nearly empty through gold to green when full, the joins dithered.
        double band = f * 2.0 + (Bayer(x, y) - 0.5) * 0.5;
        const Ramp& r = band < 0.7 ? ramp::kRed : (band < 1.3 ? ramp::kGold : ramp::kGreen);
        return r.dither(shade, x, y);
    });
    return c;
}

}  // namespace packgen
