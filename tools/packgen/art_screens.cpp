// The screens around the round: title, options, intro page, ending, ranking, loading.
#include <algorithm>
#include <cmath>
#include <string>

#include "tools/packgen/art.h"

namespace packgen {

namespace {

constexpr double kPi = 3.14159265358979323846;

TextStyle Lettering(double size, Rgb colour, bool bold = true) {
    TextStyle st;
    st.size = size;
    st.bold = bold;
    st.colour = colour;
    return st;
}

// A wooden plank sign that exactly covers a stylus area, with its word centred on it.
void DrawSign(Canvas& c, int x0, int y0, int x1, int y1, const char* word) {
    int w = x1 - x0 + 1, h = y1 - y0 + 1;
    c.rect(x0, y0, w, h, ramp::kWood.at(1));
    for (int y = y0 + 1; y < y1; ++y) {
        for (int x = x0; x < x1; ++x) {
            double t = 0.55 + 0.12 * std::sin(x * 0.7 + y * 2.1) * 0.5 - 0.25 * (y - y0) / h;
            if (y == y0 + 1) {
                t = 0.85;
            }
            c.set(x, y, ramp::kWood.dither(t, x, y));
        }
    }
    c.set(x1 - 2, y0 + h / 2, ramp::kGrey.at(9));  // a nail
    TextStyle st = Lettering(12, {255, 250, 230});
    st.shadow = 1;
    st.shadowColour = Colour(ramp::kWood.at(0));
    DrawTextIn(c, x0, y0, w - 2, h, word, st);
}

}  // namespace

Canvas DrawTitle() {
    Canvas c(240, 293);
    DrawSky(c, 0, 0, 240, 160, 0.0, 0.95);
    DrawSun(c, 200, 122, 16);
    DrawCloud(c, 40, 30, 11, 2);
    DrawCloud(c, 200, 50, 9, 4);
    DrawIsland(c, 30, 160, 70, 14, 8);
    DrawSea(c, 0, 160, 240, 133, 0.8, 0.3);
    // The sun's glitter on the water.
    for (int y = 162; y < 196; y += 3) {
        int half = 14 - (y - 162) / 4;
        for (int x = 200 - half; x < 200 + half; ++x) {
            if (std::sin(x * 0.9 + y * 2.3) > 0.2) {
                c.set(x, y, ramp::kYellow.at(7));
            }
        }
    }
    // Mast with its truck; the flag sprite waves from it at (109, 16).
    c.rect(107, 14, 2, 150, ramp::kWood.at(3));
    c.rect(107, 14, 1, 150, ramp::kWood.at(6));
    c.ball(107.5, 13, 2.5, 2.5, ramp::kGold, 0.4, 1.0);
    // A sail.
    std::vector<Point> sail = {{110, 52}, {110, 150}, {165, 150}};
    c.polygon(sail, ramp::kPaper.at(6));
    c.paint(110, 52, 56, 99, [&](int x, int y) {
        std::uint8_t cur = c.get(x, y);
        if (cur != ramp::kPaper.at(6)) {
            return cur;
        }
        double t = 0.55 + 0.4 * (1.0 - (x - 110) / 55.0) * 0.6 + ((y / 12) % 2 ? 0.05 : 0.0);
        return ramp::kPaper.dither(t, x, y);
    });
    c.line(110, 52, 165, 150, ramp::kWood.at(2));
    DrawBoat(c, 48, 148, 2.4, true);
    // Waves lapping the hull.
    for (int x = 0; x < 240; ++x) {
        int crest = 196 + int(2.5 * std::sin(x * 0.2));
        for (int y = crest; y < crest + 3; ++y) {
            c.set(x, y, y == crest ? ramp::kGrey.at(15) : ramp::kSea.at(20));
        }
    }
    // Big lettering.
    TextStyle big = Lettering(44, Colour(ramp::kGold.at(10)));
    big.outlineWidth = 2;
    big.outlineColour = Colour(ramp::kNavy.at(0));
    big.shadow = 3;
    big.shadowColour = Colour(ramp::kNavy.at(1));
    DrawTextIn(c, 0, 64, 240, 44, "Redizor", big);
    TextStyle sub = Lettering(12, {255, 255, 255});
    sub.outlineWidth = 1;
    sub.outlineColour = Colour(ramp::kNavy.at(1));
    DrawTextIn(c, 0, 112, 240, 14, "a fishing game", sub);
    // A golden fish leaping on the right.
    Canvas fish = DrawFishStrip(5);
    c.blit(fish, 0, 0, 38, 23, 180, 232, true);
    Canvas fish2 = DrawFishStrip(1);
    c.blit(fish2, 44 * 2, 0, 44, 34, 120, 250, true);
    // The three stylus areas, lettered exactly where they react.
    DrawSign(c, 0, 220, 32, 231, "Start");
    DrawSign(c, 0, 241, 40, 253, "Exit");
    DrawSign(c, 0, 262, 49, 273, "Menu");
    return c;
}

Canvas DrawTitleFlag() {
    Canvas c(132, 31);
    for (int f = 0; f < 3; ++f) {
        double phase = f * 2 * kPi / 3;
        for (int x = 0; x < 42; ++x) {
            double amp = 3.0 * x / 42.0;
            double off = amp * std::sin(2 * kPi * x / 26.0 - phase);
            double slope = std::cos(2 * kPi * x / 26.0 - phase) * amp;
            int top = int(std::lround(3 + off + x * 0.05));
            int bottom = int(std::lround(24 + off - x * 0.08));
            for (int y = top; y <= bottom; ++y) {
                double t = 0.6 + 0.18 * slope - 0.1 * (y - top) / 20.0;
                // A white fish emblem on red.
                double fx = (x - 19) / 9.0, fy = (y - off - 13.5) / 4.5;
                bool body = fx * fx + fy * fy < 1.0;
                bool tail = x >= 6 && x < 11 && std::fabs(y - off - 13.5) < (11 - x) * 0.9;
                std::uint8_t col = (body || tail) ? ramp::kGrey.dither(0.85 + 0.1 * slope, x, y)
                                                  : ramp::kRed.dither(t, x, y);
                if (body && std::hypot(x - 24.0, y - off - 12.5) < 1.2) {
                    col = ramp::kNavy.at(0);
                }
                c.set(44 * f + x, y, col);
            }
        }
        c.outline(44 * f, 0, 44, 31, ramp::kRed.at(0));
    }
    c.set(0, 0, kKey);
    return c;
}

namespace {

struct MenuLine {
    const char* id;
    const char* label;
    int x0, y0, x1, y1;  // stylus area, both ends included
    int hx, hy, hw, hh;  // highlight picture rectangle
};

const MenuLine kMenuLines[] = {
    {"pacific", "Pacific", 90, 92, 149, 104, 15, 87, 210, 23},
    {"south", "South Seas", 76, 117, 169, 128, 15, 111, 210, 23},
    {"amazon", "Amazon", 89, 142, 155, 153, 15, 136, 210, 23},
    {"easy", "Easy", 118, 206, 160, 219, 90, 200, 120, 23},
    {"normal", "Normal", 107, 231, 174, 244, 90, 224, 120, 23},
    {"hard", "Hard", 119, 253, 162, 266, 90, 248, 120, 23},
};

}  // namespace

Canvas DrawMenu(const char* lit) {
    std::string on = lit ? lit : "";
    Canvas c(240, 293);
    DrawSea(c, 0, 0, 240, 293, 0.7, 0.2);
    Rng rng(31);
    for (int k = 0; k < 30; ++k) {
        double bx = rng.range(0, 240), by = rng.range(0, 293);
        c.ellipse(bx, by, 1.2, 1.2, ramp::kSea.at(18));
    }
    // Title banner.
    DrawPanel(c, 40, 6, 160, 34, ramp::kWood, 6);
    TextStyle title = Lettering(22, Colour(ramp::kGold.at(11)));
    title.shadow = 1;
    title.shadowColour = Colour(ramp::kWood.at(0));
    DrawTextIn(c, 40, 6, 160, 34, "Options", title);
    // Two parchment boards: fishing grounds and difficulty.
    DrawPanel(c, 8, 48, 224, 114, ramp::kPaper, 6);
    DrawPanel(c, 80, 170, 120, 99, ramp::kPaper, 6);
    TextStyle head = Lettering(12, Colour(ramp::kWood.at(1)));
    DrawTextIn(c, 8, 54, 224, 16, "Fishing ground", head);
    DrawTextIn(c, 80, 175, 120, 16, "Difficulty", head);
    c.rect(40, 72, 160, 1, ramp::kPaper.at(2));
    c.rect(100, 192, 80, 1, ramp::kPaper.at(2));
    for (const MenuLine& m : kMenuLines) {
        bool lit = on == m.id;
        if (lit) {
            // A glowing band inside the highlight picture, inset so it never reaches the
            // neighbouring pictures' rectangles.
            int bx = m.hx + 3, by = m.hy + 2, bw = m.hw - 6, bh = m.hh - 4;
            c.roundRect(bx, by, bw, bh, 6, ramp::kGold.at(3));
            c.paint(bx + 1, by + 1, bw - 2, bh - 2, [&](int x, int y) {
                std::uint8_t cur = c.get(x, y);
                if (cur != ramp::kGold.at(3)) {
                    return cur;
                }
                return ramp::kGold.dither(0.85 - 0.35 * (y - by) / bh, x, y);
            });
        }
        // The pill that marks the exact area of the line.
        int w = m.x1 - m.x0 + 1, h = m.y1 - m.y0 + 1;
        c.roundRect(m.x0, m.y0, w, h, 4, lit ? ramp::kRed.at(4) : ramp::kNavy.at(5));
        c.roundRect(m.x0 + 1, m.y0 + 1, w - 2, h - 2, 3,
                    lit ? ramp::kRed.at(6) : ramp::kSky.at(13));
        TextStyle st = Lettering(12, lit ? Rgb{255, 255, 240} : Colour(ramp::kNavy.at(1)));
        DrawTextIn(c, m.x0, m.y0, w, h, m.label, st);
        if (lit) {
            // A small fish pointing at the chosen line.
            double cy = m.y0 + h / 2.0;
            c.polygon({{m.x0 - 9.0, cy - 3}, {m.x0 - 3.0, cy}, {m.x0 - 9.0, cy + 3}},
                      ramp::kRed.at(7));
            c.ellipse(m.x0 - 11.0, cy, 3.5, 2.5, ramp::kRed.at(7));
        }
    }
    // Buttons, exactly over their stylus areas.
    DrawButton(c, 7, 273, 48, 15, "Back", ramp::kWood, on == "back", 11);
    DrawButton(c, 206, 273, 28, 15, "Go", ramp::kGreen, on == "go", 11);
    return c;
}

Canvas DrawIntroPage() {
    Canvas c(240, 293);
    DrawSky(c, 0, 0, 240, 293, 0.3, 0.9);
    // Title.
    TextStyle title = Lettering(16, Colour(ramp::kNavy.at(1)));
    DrawTextLeft(c, 8, 6, 20, "Today's angler", title);
    // Portrait frame: a seaside view behind the angler.
    c.roundRect(46, 46, 108, 118, 4, ramp::kWood.at(2));
    c.rect(48, 48, 104, 114, ramp::kWood.at(7));
    DrawSky(c, 50, 50, 100, 70, 0.2, 0.85);
    DrawCloud(c, 78, 70, 6, 13);
    DrawSea(c, 50, 120, 100, 40, 0.85, 0.5);
    DrawIsland(c, 130, 120, 30, 6, 5);
    // Profile card slot (the card itself is a picture of its own).
    c.roundRect(148, 28, 88, 79, 5, ramp::kNavy.at(2));
    // Story window with its rim; the favourites strip covers its upper rows.
    DrawPanel(c, 1, 166, 238, 77, ramp::kPaper, 5);
    c.rect(4, 170, 232, 70, ramp::kPaper.at(6));
    // Buttons, exactly over their stylus areas.
    DrawButton(c, 41, 269, 54, 13, "Back", ramp::kWood, false, 11);
    DrawButton(c, 146, 269, 54, 13, "Start", ramp::kGreen, false, 11);
    TextStyle hint = Lettering(10, Colour(ramp::kNavy.at(2)), false);
    DrawTextIn(c, 0, 250, 240, 14, "Tap Start to cast off", hint);
    return c;
}

Canvas DrawEndScreen() {
    Canvas c(240, 293);
    // Dusk: warm sky, a red sun sinking, the boat coming home.
    c.paint(0, 0, 240, 160, [](int x, int y) {
        double f = std::clamp(y / 159.0 + (Bayer(x, y) - 0.5) * 0.07, 0.0, 1.0);
        Rgb top{56, 30, 110}, mid{204, 92, 124}, low{255, 196, 90};
        return Nearest(f < 0.5 ? Mix(top, mid, f * 2) : Mix(mid, low, (f - 0.5) * 2));
    });
    c.ball(120, 160, 30, 30, ramp::kRed, 0.55, 0.95);
    DrawSea(c, 0, 160, 240, 133, 0.55, 0.1);
    // The sun's path on the water: short strokes narrowing towards the viewer.
    Rng rng(4);
    for (int y = 163; y < 250; y += 2 + (y - 160) / 25) {
        int half = 34 - (y - 160) / 3;
        for (int k = 0; k < 4; ++k) {
            int x = 120 + int(rng.range(-half, half)), len = 3 + rng.pick(6);
            c.rect(x - len / 2, y, len, 1, ramp::kGold.at(9 - k % 3));
        }
    }
    DrawBoat(c, 36, 178, 1.6, false);
    for (int x = 30; x < 130; ++x) {
        int crest = 208 + int(1.5 * std::sin(x * 0.3));
        c.rect(x, crest, 1, 2, ramp::kSea.at(8));
        c.set(x, crest - 1, ramp::kGold.at(6));
    }
    TextStyle big = Lettering(30, Colour(ramp::kGold.at(11)));
    big.outlineWidth = 2;
    big.outlineColour = Colour(ramp::kPurple.at(0));
    DrawTextIn(c, 0, 40, 240, 40, "Time's up!", big);
    TextStyle sub = Lettering(12, {255, 255, 255});
    sub.outlineWidth = 1;
    sub.outlineColour = Colour(ramp::kPurple.at(0));
    DrawTextIn(c, 0, 90, 240, 16, "The energy is gone.", sub);
    DrawTextIn(c, 0, 108, 240, 16, "Let's see the ranking...", sub);
    return c;
}

Canvas DrawGroundBackdrop(int ground) {
    Canvas c(240, 293);
    const char* name = ground == 1 ? "Pacific" : (ground == 2 ? "South Seas" : "Amazon");
    if (ground == 3) {
        // A jungle river: green banks, brown water.
        DrawSky(c, 0, 0, 240, 110, 0.15, 0.8);
        for (int x = 0; x < 240; ++x) {
            int top = 70 + int(12 * std::sin(x * 0.05) + 6 * std::sin(x * 0.17));
            for (int y = top; y < 150; ++y) {
                double t = 0.2 + 0.4 * std::sin(x * 0.4 + y * 0.3) * 0.5 + 0.15 * (y - top) / 80.0;
                c.set(x, y, ramp::kGreen.dither(t + 0.2, x, y));
            }
        }
        c.paint(0, 150, 240, 143, [](int x, int y) {
            double t = 0.55 - 0.3 * (y - 150) / 143.0 + 0.05 * std::sin(x * 0.3 + y * 0.7);
            return ramp::kHair.dither(t + 0.2, x, y);
        });
        for (int k = 0; k < 5; ++k) {
            DrawPalm(c, 20 + k * 50, 100 + (k % 2) * 8, 40, (k % 2 ? 0.3 : -0.3));
        }
    } else {
        DrawSky(c, 0, 0, 240, 150, 0.0, 0.9);
        DrawCloud(c, 60, 40, 12, ground * 3);
        DrawCloud(c, 180, 70, 9, ground * 5);
        if (ground == 2) {
            DrawSun(c, 190, 34, 13);
            DrawIsland(c, 80, 150, 100, 22, 17);
        }
        DrawSea(c, 0, 150, 240, 143, ground == 1 ? 0.6 : 0.8, ground == 1 ? 0.05 : 0.25);
        if (ground == 1) {
            // Big ocean swells.
            for (int row = 0; row < 6; ++row) {
                int base = 165 + row * 22;
                for (int x = 0; x < 240; ++x) {
                    int crest = base + int(4 * std::sin(x * 0.08 + row * 1.7));
                    c.set(x, crest, ramp::kSea.at(19 - row));
                    c.set(x, crest + 1, ramp::kSea.at(17 - row));
                }
            }
        }
    }
    TextStyle st = Lettering(24, {255, 255, 255});
    st.outlineWidth = 2;
    st.outlineColour = Colour(ramp::kNavy.at(0));
    DrawTextIn(c, 0, 20, 240, 30, name, st);
    if (ground == 2) {
        // The empty trough of the loading bar, seen between and beyond its cells.
        c.rect(62, 199, 116, 9, ramp::kInk.at(4));
    }
    return c;
}

Canvas DrawRankingScreen() {
    Canvas c(240, 293);
    DrawSea(c, 0, 0, 240, 293, 0.65, 0.2);
    DrawPanel(c, 6, 8, 228, 282, ramp::kPaper, 8);
    TextStyle title = Lettering(24, Colour(ramp::kGold.at(10)));
    title.outlineWidth = 1;
    title.outlineColour = Colour(ramp::kWood.at(0));
    DrawTextIn(c, 6, 16, 228, 36, "Ranking", title);
    // Medal fish either side of the title.
    Canvas fish = DrawFishStrip(5);
    c.blit(fish, 0, 0, 38, 23, 22, 22, true);
    c.blit(fish, 76, 0, 38, 23, 180, 22, true);
    TextStyle head = Lettering(11, Colour(ramp::kWood.at(1)));
    DrawTextLeft(c, 100, 76, 14, "Name", head);
    DrawTextLeft(c, 165, 76, 14, "Score", head);
    DrawTextLeft(c, 56, 76, 14, "Rank", head);
    c.rect(52, 91, 172, 1, ramp::kWood.at(4));
    TextStyle num = Lettering(11, Colour(ramp::kNavy.at(1)));
    for (int i = 0; i < 10; ++i) {
        int y = 95 + 18 * i;
        // A light band per row where the game writes the name and the score in black.
        std::uint8_t band = i % 2 ? ramp::kPaper.at(6) : ramp::kPaper.at(7);
        c.rect(52, y, 172, 18, band);
        const Ramp& medal = i == 0 ? ramp::kGold : (i == 1 ? ramp::kGrey : ramp::kWood);
        if (i < 3) {
            c.ball(72, y + 9, 6, 6, medal, 0.45, 1.0);
        }
        std::string label = std::to_string(i + 1) + ".";
        num.colour = i < 3 ? Colour(ramp::kGrey.at(0)) : Colour(ramp::kNavy.at(1));
        DrawTextIn(c, 62, y, 20, 18, label, num);
    }
    // A fishing rod leaning in the margin beside the list.
    c.thickLine(24, 262, 40, 100, 2, ramp::kWood.at(4));
    c.ellipse(27, 230, 4, 4, ramp::kGrey.at(8));
    c.line(40, 100, 44, 150, ramp::kGrey.at(12));
    c.ball(44, 154, 3, 4, ramp::kRed, 0.4, 1.0);
    // The back area: x below 50, below the last row.
    DrawButton(c, 2, 274, 46, 17, "Back", ramp::kWood, false, 11);
    return c;
}

Canvas DrawLoadPanel() {
    Canvas c(120, 125, ramp::kInk.at(4));
    // Panel, drawn at (62, 100): a wooden board with the word and a small boat.
    DrawPanel(c, 0, 0, 116, 99, ramp::kWood, 8);
    c.rect(6, 8, 104, 60, ramp::kSky.at(10));
    DrawSky(c, 6, 8, 104, 44, 0.2, 0.9);
    DrawSea(c, 6, 52, 104, 16, 0.8, 0.5);
    DrawBoat(c, 40, 40, 0.7, true);
    c.frame(6, 8, 104, 60, ramp::kWood.at(1));
    TextStyle st = Lettering(14, Colour(ramp::kGold.at(11)));
    st.shadow = 1;
    st.shadowColour = Colour(ramp::kWood.at(0));
    DrawTextIn(c, 0, 70, 116, 18, "Loading...", st);
    // The upper rim of the bar housing.
    c.rect(0, 94, 116, 5, ramp::kWood.at(1));
    c.rect(2, 95, 112, 1, ramp::kWood.at(4));
    // Seven cells of 15 x 9 at x 17k, row 99: lit segments that fill the bar.
    for (int k = 0; k < 7; ++k) {
        c.paint(17 * k, 99, 15, 9, [&](int x, int y) {
            double t =
                0.9 - 0.1 * std::fabs(y - 101.5) - (x == 17 * k || x == 17 * k + 14 ? 0.3 : 0);
            return ramp::kGreen.dither(t, x, y);
        });
        c.rect(17 * k + 2, 100, 10, 1, ramp::kGreen.at(11));
    }
    // Bar frame, drawn at (62, 208): the lower rim and a note.
    c.rect(0, 108, 116, 17, ramp::kWood.at(1));
    DrawPanel(c, 0, 108, 116, 17, ramp::kWood, 3);
    TextStyle small = Lettering(10, {255, 240, 210}, false);
    DrawTextIn(c, 0, 108, 116, 17, "baiting the hooks", small);
    return c;
}

}  // namespace packgen
