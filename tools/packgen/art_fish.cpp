// Fish, the squid, the crab and the scallop, swimming and hanging on the hook.
//
// A fish is described in its own coordinates: u runs along the body from the tail tip (0) to
// the nose (1), v across it from the back (-1) to the belly (1). Each frame maps its pixels into
// those coordinates (swimming right or left, or hanging nose up from the hook, with the tail
// bent for the swimming stroke), so one description gives every frame.
#include <algorithm>
#include <cmath>

#include "tools/packgen/art.h"

namespace packgen {

namespace {

constexpr double kPi = 3.14159265358979323846;

struct FishLook {
    Ramp back, belly, fin;
    double tailEnd;  // u where the tail meets the body
    double depth;    // body half-height at its deepest, in v
    double tailSpread;
    bool forked;
    double dorsal;  // extra fin height over the back
    int stripes;    // vertical bands across the body
    Ramp stripe;
    bool spots;
    double eyeU, eyeR;  // eye position along the body and radius in pixels
    bool sparkle;
};

enum class Pose { kRight, kLeft, kHanging };

double BodyHalf(const FishLook& f, double u) {
    if (u < f.tailEnd || u > 1.0) {
        return 0.0;
    }
    double s = (u - f.tailEnd) / (1.0 - f.tailEnd);
    // A blunt head and a slender tail root: s^0.45 (1 - s)^0.6, scaled to the depth.
    const double a = 0.6, b = 0.45;
    double peak = std::pow(a / (a + b), a) * std::pow(b / (a + b), b);
    return f.depth * std::pow(1.0 - s, a) * std::pow(s, b) / peak;
}

// Palette index of the fish at (u, v), or the key outside it. (px, py) pick the dither.
std::uint8_t FishAt(const FishLook& f, double u, double v, int px, int py) {
    double half = BodyHalf(f, u);
    if (half > 0 && std::fabs(v) <= half) {
        double w = (v / half + 1.0) / 2.0;  // 0 back, 1 belly
        double s = (u - f.tailEnd) / (1.0 - f.tailEnd);
        double t = 0.35 + 0.6 * (1.0 - std::min(1.0, std::fabs(w - 0.32) * 1.7));
        // Gill line behind the head.
        double gill = 0.78 + 0.04 * v * v;
        if (std::fabs(s - gill) < 0.018 && w > 0.15 && w < 0.9) {
            return f.back.at(2);
        }
        if (f.stripes > 0 && s > 0.15 && s < 0.8) {
            double band = std::fmod(s * f.stripes * 1.6, 1.0);
            if (band < 0.28) {
                return f.stripe.dither(t * 0.9, px, py);
            }
        }
        if (f.spots && w < 0.6) {
            double a = std::sin(u * 61.0) * std::sin(v * 23.0 + u * 11.0);
            if (a > 0.72) {
                return f.belly.at(f.belly.count - 1);
            }
        }
        if (f.sparkle && std::fmod(u * 37.0 + v * 5.0, 3.0) < 0.25 && w < 0.5) {
            return ramp::kYellow.at(7);
        }
        return w < 0.58 ? f.back.dither(t, px, py) : f.belly.dither(t + 0.1, px, py);
    }
    // Tail fin.
    if (u >= 0.0 && u < f.tailEnd + 0.02) {
        double tt = std::clamp((f.tailEnd - u) / f.tailEnd, 0.0, 1.0);
        double spread = 0.12 + (f.tailSpread - 0.12) * std::pow(tt, 0.8);
        if (std::fabs(v) <= spread) {
            if (f.forked && tt > 0.55 && std::fabs(v) < (tt - 0.55) * 1.3 * f.tailSpread) {
                return kKey;
            }
            bool ray = std::fmod(std::fabs(v) * 14.0, 1.0) < 0.3;
            return f.fin.dither(ray ? 0.75 : 0.55 - 0.2 * tt, px, py);
        }
    }
    // Dorsal fin over the back and a small fin under the belly.
    double s = (u - f.tailEnd) / (1.0 - f.tailEnd);
    if (s > 0.25 && s < 0.7 && v < 0) {
        double k = (s - 0.25) / 0.45;
        double extra = f.dorsal * std::sin(kPi * std::pow(k, 0.7));
        if (-v <= half + extra) {
            return f.fin.dither(0.6 + 0.2 * std::sin(u * 80), px, py);
        }
    }
    if (s > 0.35 && s < 0.55 && v > 0) {
        double k = (s - 0.35) / 0.2;
        if (v <= half + 0.35 * f.dorsal * std::sin(kPi * k)) {
            return f.fin.dither(0.5, px, py);
        }
    }
    return kKey;
}

// Maps a pixel of a frame to fish coordinates for a pose, with the tail bent by `bend`.
void Local(Pose pose, int x, int y, int w, int h, double bend, double* u, double* v) {
    const double m = 1.5;  // room for the outline
    if (pose == Pose::kHanging) {
        *u = 1.0 - (y + 0.5 - m) / (h - 2 * m);
        *v = (x + 0.5 - w / 2.0) / (w / 2.0 - m);
    } else {
        *u = (x + 0.5 - m) / (w - 2 * m);
        if (pose == Pose::kLeft) {
            *u = 1.0 - *u;
        }
        *v = (y + 0.5 - h / 2.0) / (h / 2.0 - m);
    }
    *v -= bend * std::pow(std::max(0.0, 0.6 - *u) / 0.6, 2.0);
}

void PixelOf(Pose pose, double u, double v, int w, int h, double* x, double* y) {
    const double m = 1.5;
    if (pose == Pose::kHanging) {
        *y = (1.0 - u) * (h - 2 * m) + m;
        *x = w / 2.0 + v * (w / 2.0 - m);
    } else {
        double uu = pose == Pose::kLeft ? 1.0 - u : u;
        *x = uu * (w - 2 * m) + m;
        *y = h / 2.0 + v * (h / 2.0 - m);
    }
}

void DrawFishFrame(Canvas& c, int ox, int w, int h, const FishLook& f, Pose pose, double bend) {
    for (int y = 0; y < h; ++y) {
        for (int x = 0; x < w; ++x) {
            double u, v;
            Local(pose, x, y, w, h, bend, &u, &v);
            std::uint8_t col = FishAt(f, u, v, ox + x, y);
            if (col != kKey) {
                c.set(ox + x, y, col);
            }
        }
    }
    // Eye: white, a dark pupil towards the nose, a glint.
    double ex, ey;
    PixelOf(pose, f.eyeU, -0.18 * f.depth, w, h, &ex, &ey);
    c.ellipse(ox + ex, ey, f.eyeR, f.eyeR, ramp::kGrey.at(15));
    double dir = pose == Pose::kLeft ? -1 : 1;
    if (pose == Pose::kHanging) {
        c.ellipse(ox + ex, ey - 0.3, f.eyeR * 0.6, f.eyeR * 0.6, ramp::kGrey.at(0));
    } else {
        c.ellipse(ox + ex + 0.3 * dir, ey, f.eyeR * 0.6, f.eyeR * 0.6, ramp::kGrey.at(0));
    }
    if (f.eyeR >= 2) {
        c.set(ox + int(ex), int(ey) - 1, ramp::kGrey.at(15));
    }
    // Mouth.
    double mx, my;
    PixelOf(pose, 0.985, 0.12 * f.depth, w, h, &mx, &my);
    c.set(ox + int(mx), int(my), f.back.at(0));
    c.outline(ox, 0, w, h, f.back.at(0));
}

FishLook LookOf(int kind) {
    using namespace ramp;
    switch (kind) {
        case 0:  // a big blue runner with a deeply forked tail
            return {kSea, kGrey, kNavy, 0.22,  0.62, 0.78, true,
                    0.3,  0,     kGrey, false, 0.88, 2.4,  false};
        case 1:  // a red snapper
            return {kRed, kPink, kRed, 0.2,   0.8,  0.75, false,
                    0.22, 0,     kRed, false, 0.86, 2.2,  false};
        case 2:  // a striped reef fish, deep bodied
            return {kYellow, kYellow, kGold, 0.18,  0.82, 0.7, false,
                    0.18,    3,       kNavy, false, 0.86, 2.0, false};
        case 3:  // a spotted grouper in greens
            return {kTeal, kGreen, kTeal, 0.2,  0.7,  0.75, false,
                    0.25,  0,      kTeal, true, 0.87, 2.5,  false};
        default:  // kind 5, the precious golden fish
            return {kGold, kYellow, kGold, 0.24,  0.62, 0.78, true,
                    0.3,   0,       kGold, false, 0.86, 2.0,  true};
    }
}

// The ink fish: a small squid, mantle first, arms trailing, purple with dark spots.
void DrawSquidFrame(Canvas& c, int ox, int w, int h, Pose pose, int phase) {
    for (int y = 0; y < h; ++y) {
        for (int x = 0; x < w; ++x) {
            double u, v;
            Local(pose, x, y, w, h, 0.0, &u, &v);
            std::uint8_t col = kKey;
            if (u > 0.4) {
                // Mantle: a long teardrop ending in a point, with fins near the tip.
                double s = (u - 0.4) / 0.6;
                double half = 0.62 * std::pow(1.0 - s, 0.55) * std::min(1.0, 0.55 + s * 2.2);
                double fin = s > 0.65 ? 0.9 * (s - 0.65) / 0.35 * (1.0 - s) * 3.0 : 0.0;
                if (std::fabs(v) <= half) {
                    double wv = (v / half + 1) / 2;
                    double t = 0.4 + 0.5 * (1.0 - std::fabs(wv - 0.35) * 1.5);
                    bool spot = std::sin(u * 70) * std::sin(v * 19 + u * 13) > 0.75;
                    col = spot ? ramp::kPurple.at(1) : ramp::kPurple.dither(t, ox + x, y);
                } else if (std::fabs(v) <= half + fin) {
                    col = ramp::kPink.dither(0.6, ox + x, y);
                }
            } else if (u > 0.3) {
                if (std::fabs(v) < 0.45) {
                    col = ramp::kPurple.dither(0.55, ox + x, y);  // head
                }
            } else {
                // Five arms, waving with the frame.
                for (int a = 0; a < 5; ++a) {
                    double base = -0.4 + a * 0.2;
                    double spread = base * (1.0 + (0.3 - u) * 2.0);
                    double wave = 0.12 * std::sin(u * 22 + a * 1.3 + phase * kPi);
                    if (std::fabs(v - spread - wave) < 0.075 + 0.05 * u / 0.3) {
                        col = ramp::kPink.dither(0.45 + 0.3 * u / 0.3, ox + x, y);
                    }
                }
            }
            if (col != kKey) {
                c.set(ox + x, y, col);
            }
        }
    }
    double ex, ey;
    PixelOf(pose, 0.36, -0.22, w, h, &ex, &ey);
    c.ellipse(ox + ex, ey, 2.0, 2.0, ramp::kGrey.at(15));
    c.ellipse(ox + ex, ey, 1.0, 1.0, ramp::kGrey.at(0));
    PixelOf(pose, 0.36, 0.22, w, h, &ex, &ey);
    c.ellipse(ox + ex, ey, 1.6, 1.6, ramp::kGrey.at(14));
    c.outline(ox, 0, w, h, ramp::kPurple.at(0));
}

// The crab: a red shell, two claws, three legs a side; `dangling` hangs it from the hook.
void DrawCrabFrame(Canvas& c, int ox, int w, int h, int phase, bool dangling) {
    Canvas f(w, h);
    double cx = w / 2.0, cy = dangling ? h * 0.42 : h * 0.6;
    double rx = w * 0.28, ry = h * (dangling ? 0.26 : 0.25);
    // Legs.
    for (int side = -1; side <= 1; side += 2) {
        for (int k = 0; k < 3; ++k) {
            double ang = (dangling ? 1.25 : 0.45) + k * 0.32 + (phase ^ (k & 1) ? 0.12 : -0.12);
            double lx = cx + side * rx * 0.7, ly = cy + ry * 0.2 + k * 1.5;
            double kx = lx + side * w * 0.14 * std::cos(ang * 0.5);
            double ky = ly - h * 0.08;
            double fx = kx + side * w * 0.08, fy = ky + h * (dangling ? 0.42 : 0.3) * std::sin(ang);
            f.thickLine(lx, ly, kx, ky, 2.0, ramp::kRed.at(6));
            f.thickLine(kx, ky, fx, std::min(fy, h - 2.0), 1.6, ramp::kRed.at(5));
        }
        // Claw arm and pincer.
        double ax = cx + side * rx * 0.8, ay = cy - ry * 0.5;
        double px = cx + side * (rx + w * 0.1), py = cy - ry * (dangling ? 1.6 : 1.3);
        f.thickLine(ax, ay, px, py, 2.6, ramp::kRed.at(6));
        f.ball(px, py - 2, w * 0.07, h * 0.1, ramp::kRed, 0.35, 0.95);
        double open = phase ? 0.9 : 0.4;
        f.thickLine(px, py - 2, px + side * w * 0.05, py - h * 0.2 - open, 2.0, ramp::kRed.at(8));
        f.thickLine(px, py - 2, px + side * w * 0.08, py - h * 0.1, 1.6, ramp::kRed.at(7));
    }
    f.ball(cx, cy, rx, ry, ramp::kRed, 0.3, 0.98);
    // Shell markings and eyes on stalks.
    f.rect(int(cx - rx * 0.4), int(cy - ry * 0.2), int(rx * 0.8), 1, ramp::kRed.at(4));
    for (int side = -1; side <= 1; side += 2) {
        double sx = cx + side * rx * 0.3;
        f.rect(int(sx), int(cy - ry - 3), 1, 3, ramp::kRed.at(5));
        f.ellipse(sx + 0.5, cy - ry - 4, 1.5, 1.5, ramp::kGrey.at(15));
        f.set(int(sx), int(cy - ry - 4), ramp::kGrey.at(0));
    }
    f.outline(ramp::kRed.at(0));
    f.set(0, 0, kKey);
    c.blit(f, 0, 0, w, h, ox, 0, true);
}

// The scallop: a ribbed fan with two lobes at its hinge; `open` lifts the upper valve.
void DrawShellFrame(Canvas& c, int ox, int w, int h, bool open) {
    Canvas f(w, h);
    double hx = w / 2.0, hy = h - 4.0;
    double r = std::min(w * 0.48, h * 0.8);
    if (open) {
        // The lower valve and a pearl inside.
        f.ellipse(hx, hy - r * 0.35, r * 0.85, r * 0.3, ramp::kPink.at(2));
        f.ball(hx, hy - r * 0.4, 2.2, 2.2, ramp::kGrey, 0.6, 1.0);
    }
    double lift = open ? r * 0.25 : 0.0;
    for (int y = 0; y < h; ++y) {
        for (int x = 0; x < w; ++x) {
            double dx = x + 0.5 - hx, dy = (y + 0.5) - (hy - lift);
            double d = std::hypot(dx, dy);
            double ang = std::atan2(-dy, dx);  // 0 right, pi/2 up
            if (d < r && ang > 0.25 && ang < kPi - 0.25) {
                double rib = std::fabs(std::sin(ang * 9.0));
                double t = 0.35 + 0.45 * rib + 0.15 * (1.0 - d / r);
                f.set(x, y, ramp::kGold.dither(std::min(t, 0.95), x, y));
            }
        }
    }
    // Hinge ears.
    f.rect(int(hx - 5), int(hy - lift - 2), 10, 3, ramp::kGold.at(6));
    f.outline(ramp::kGold.at(0));
    f.set(0, 0, kKey);
    c.blit(f, 0, 0, w, h, ox, 0, true);
}

const int kSwimW[6] = {63, 44, 44, 64, 37, 38};
const int kSwimH[6] = {35, 34, 34, 36, 29, 23};
const int kTakenW[8] = {44, 28, 38, 38, 25, 29, 66, 22};
const int kTakenH[8] = {68, 37, 36, 68, 34, 34, 38, 22};

}  // namespace

Canvas DrawFishStrip(int kind) {
    int w = kSwimW[kind], h = kSwimH[kind];
    Canvas c(4 * w, h);
    for (int frame = 0; frame < 4; ++frame) {
        Pose pose = frame < 2 ? Pose::kRight : Pose::kLeft;
        double bend = (frame % 2 == 0 ? 0.18 : -0.18);
        if (kind == 4) {
            DrawSquidFrame(c, frame * w, w, h, pose, frame % 2);
        } else {
            DrawFishFrame(c, frame * w, w, h, LookOf(kind), pose, bend);
        }
    }
    c.set(0, 0, kKey);
    return c;
}

Canvas DrawShellStrip(int kind) {
    int w = kind == 0 ? 71 : 28, h = kind == 0 ? 41 : 30;
    Canvas c(4 * w, h);
    for (int frame = 0; frame < 4; ++frame) {
        Canvas one(w, h);
        if (kind == 0) {
            DrawCrabFrame(one, 0, w, h, frame % 2, false);
        } else {
            DrawShellFrame(one, 0, w, h, frame % 2 == 1);
        }
        if (frame < 2) {
            c.blit(one, 0, 0, w, h, frame * w, 0);
        } else {
            c.blitMirrored(one, 0, 0, w, h, frame * w, 0);
        }
    }
    c.set(0, 0, kKey);
    return c;
}

Canvas DrawTakenStrip(int kind) {
    int w = kTakenW[kind], h = kTakenH[kind];
    Canvas c(2 * w, h);
    for (int frame = 0; frame < 2; ++frame) {
        double bend = frame == 0 ? 0.22 : -0.22;
        if (kind < 6 && kind != 4) {
            DrawFishFrame(c, frame * w, w, h, LookOf(kind), Pose::kHanging, bend);
        } else if (kind == 4) {
            DrawSquidFrame(c, frame * w, w, h, Pose::kHanging, frame);
        } else if (kind == 6) {
            DrawCrabFrame(c, frame * w, w, h, frame, true);
        } else {
            DrawShellFrame(c, frame * w, w, h, frame == 1);
        }
    }
    c.set(0, 0, kKey);
    return c;
}

}  // namespace packgen
