#include <algorithm>
#include <cmath>

#include "tools/packgen/art.h"

namespace packgen {

Rgb Colour(std::uint8_t index) {
    return Palette()[index];
}

void DrawSky(Canvas& c, int x, int y, int w, int h, double t0, double t1) {
    c.vgradient(x, y, w, h, ramp::kSky, t0, t1);
}

void DrawSea(Canvas& c, int x, int y, int w, int h, double t0, double t1) {
    c.paint(x, y, w, h, [&](int i, int j) {
        double f = h > 1 ? double(j - y) / (h - 1) : 0.0;
        double t = t0 + (t1 - t0) * f;
        // Slanted shafts of light from the surface, fading with depth.
        double shaft = 0.5 + 0.5 * std::sin((i + 0.6 * (j - y)) * 0.09) *
                                 std::sin((i - 0.3 * (j - y)) * 0.031 + 1.3);
        t += 0.07 * shaft * (1.0 - f);
        return ramp::kSea.dither(t, i, j);
    });
}

void DrawSun(Canvas& c, double cx, double cy, double r) {
    for (int j = int(cy - r * 2.2); j <= int(cy + r * 2.2); ++j) {
        for (int i = int(cx - r * 2.2); i <= int(cx + r * 2.2); ++i) {
            double d = std::hypot(i + 0.5 - cx, j + 0.5 - cy) / r;
            if (d <= 1.0) {
                c.set(i, j, ramp::kYellow.dither(0.95 - 0.35 * d * d, i, j));
            } else if (d < 2.2 && c.get(i, j) != kKey) {
                double glow = (2.2 - d) / 1.2;
                if (glow * 0.6 > Bayer(i, j)) {
                    c.blend(i, j, {255, 245, 200}, 0.35 * glow);
                }
            }
        }
    }
}

void DrawCloud(Canvas& c, double cx, double cy, double size, std::uint32_t seed) {
    Rng rng(seed);
    struct Puff {
        double x, y, r;
    };
    std::vector<Puff> puffs;
    int n = 5 + rng.pick(3);
    for (int k = 0; k < n; ++k) {
        double px = cx + rng.range(-1.6, 1.6) * size;
        double r = size * rng.range(0.45, 0.85) * (1.0 - std::fabs(px - cx) / (2.6 * size));
        puffs.push_back({px, cy - r * 0.35 + rng.range(-0.15, 0.15) * size, r});
    }
    for (int j = int(cy - 2 * size); j <= int(cy + size); ++j) {
        for (int i = int(cx - 3 * size); i <= int(cx + 3 * size); ++i) {
            double best = 0;
            for (const Puff& p : puffs) {
                double d = std::hypot(i + 0.5 - p.x, (j + 0.5 - p.y) * 1.2) / p.r;
                if (d < 1.0) {
                    best = std::max(best, 1.0 - d);
                }
            }
            if (best > 0 && j < cy + size * 0.25) {
                double flat = std::clamp((j - (cy - size)) / (1.5 * size), 0.0, 1.0);
                double t = 1.0 - 0.35 * flat + 0.05 * best;
                c.set(i, j, ramp::kGrey.dither(std::min(t, 1.0), i, j));
            }
        }
    }
}

void DrawPalm(Canvas& c, int x, int baseY, int height, double lean) {
    double tx = x + lean * height, ty = baseY - height;
    for (int k = 0; k <= height; ++k) {
        double f = double(k) / height;
        double px = x + lean * height * f * f, py = baseY - k;
        c.rect(int(px), int(py), 2, 1, ramp::kWood.at(k % 4 == 0 ? 3 : 5));
    }
    for (int leaf = 0; leaf < 6; ++leaf) {
        double ang = -2.9 + leaf * 0.55;
        double len = height * 0.55;
        for (int k = 0; k < int(len); ++k) {
            double f = k / len;
            double lx = tx + std::cos(ang) * k, ly = ty + std::sin(ang) * k + f * f * len * 0.5;
            c.set(int(lx), int(ly), ramp::kGreen.at(3 + (leaf & 1)));
            c.set(int(lx), int(ly) + 1, ramp::kGreen.at(2));
        }
    }
}

void DrawIsland(Canvas& c, int cx, int baseY, int width, int height, std::uint32_t seed) {
    Rng rng(seed);
    for (int i = cx - width / 2; i <= cx + width / 2; ++i) {
        double f = double(i - cx) / (width / 2.0);
        double top = height * std::pow(std::max(0.0, 1.0 - f * f), 0.7) *
                     (0.9 + 0.1 * std::sin(i * 0.3 + seed));
        for (int j = baseY - int(top); j < baseY; ++j) {
            double sh = 0.25 + 0.35 * (1.0 - f) * 0.5 + 0.2 * (double(baseY - j) / (top + 1));
            c.set(i, j, ramp::kGreen.dither(sh, i, j));
        }
        // A rim of sand where the island meets the sea.
        if (std::fabs(f) < 0.95) {
            c.set(i, baseY - 1, ramp::kSand.at(7));
        }
    }
    int palms = 2 + rng.pick(2);
    for (int k = 0; k < palms; ++k) {
        int px = cx + int(rng.range(-0.3, 0.3) * width);
        DrawPalm(c, px, baseY - int(height * 0.7), int(height * rng.range(0.7, 1.0)),
                 rng.range(-0.35, 0.35));
    }
}

void DrawBoat(Canvas& c, int x, int y, double s, bool right) {
    // Drawn facing right into a scratch canvas, then mirrored if needed.
    int w = int(54 * s), h = int(24 * s);
    Canvas b(w, h);
    auto X = [&](double v) { return v * s; };
    // Hull: a deck line with a raised bow, a rounded keel.
    std::vector<Point> hull = {{X(1), X(3)},   {X(44), X(3)},  {X(53), X(0)},
                               {X(50), X(8)},  {X(45), X(15)}, {X(36), X(20)},
                               {X(12), X(20)}, {X(5), X(16)},  {X(2), X(9)}};
    b.polygon(hull, ramp::kWood.at(5));
    b.paint(0, 0, w, h, [&](int i, int j) {
        std::uint8_t cur = b.get(i, j);
        if (cur == kKey) {
            return cur;
        }
        double f = double(j) / h;
        int plank = int(j / (3.0 * s));
        double t = 0.62 - 0.35 * f + (plank % 2 ? 0.06 : 0.0);
        if (j >= int(X(5)) && j < int(X(7))) {
            return ramp::kRed.dither(0.55 - 0.1 * f, i, j);  // painted stripe
        }
        if (j >= int(X(7)) && j < int(X(8))) {
            return ramp::kGrey.at(14);
        }
        return ramp::kWood.dither(t, i, j);
    });
    // Gunwale and a porthole.
    b.rect(int(X(1)), int(X(3)), int(X(44)), std::max(1, int(s)), ramp::kWood.at(9));
    b.ball(X(38), X(12), X(2), X(2), ramp::kTeal, 0.3, 0.9);
    b.outline(ramp::kWood.at(0));
    if (right) {
        c.blit(b, 0, 0, w, h, x, y, true);
    } else {
        Canvas m(w, h);
        m.blitMirrored(b, 0, 0, w, h, 0, 0);
        c.blit(m, 0, 0, w, h, x, y, true);
    }
}

void DrawPanel(Canvas& c, int x, int y, int w, int h, const Ramp& r, int radius) {
    c.roundRect(x, y, w, h, radius, r.at(0));
    Canvas inner(w - 2, h - 2);
    inner.roundRect(0, 0, w - 2, h - 2, std::max(0, radius - 1), 1);
    for (int j = 0; j < h - 2; ++j) {
        for (int i = 0; i < w - 2; ++i) {
            if (inner.get(i, j) == kKey) {
                continue;
            }
            double f = double(j) / std::max(1, h - 3);
            double t = 0.85 - 0.2 * f;
            if (j == 0 || i == 0) {
                t = 1.0;
            }
            if (j == h - 3 || i == w - 3) {
                t = 0.45;
            }
            c.set(x + 1 + i, y + 1 + j, r.dither(t, x + 1 + i, y + 1 + j));
        }
    }
}

void DrawButton(Canvas& c, int x, int y, int w, int h, const char* label, const Ramp& r,
                bool pressed, double textSize) {
    c.roundRect(x, y, w, h, 4, ramp::kGrey.at(1));
    for (int j = y + 1; j < y + h - 1; ++j) {
        for (int i = x + 1; i < x + w - 1; ++i) {
            if (c.get(i, j) != ramp::kGrey.at(1)) {
                continue;
            }
            double f = double(j - y) / h;
            double t = pressed ? 0.35 + 0.3 * f : 0.85 - 0.4 * f;
            if (!pressed && j == y + 1) {
                t = 1.0;
            }
            c.set(i, j, r.dither(t, i, j));
        }
    }
    TextStyle st;
    st.size = textSize;
    st.bold = true;
    st.colour = pressed ? Rgb{255, 250, 200} : Rgb{255, 255, 255};
    st.shadow = 1;
    st.shadowColour = Colour(r.at(0));
    DrawTextIn(c, x + (pressed ? 1 : 0), y + (pressed ? 1 : 0), w, h, label, st);
}

}  // namespace packgen
