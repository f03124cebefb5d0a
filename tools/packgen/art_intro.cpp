// The intro page's pieces: three anglers' portraits, profile cards, favourites and stories.
#include <algorithm>
#include <cmath>
#include <cstdio>
#include <sstream>
#include <string>
#include <vector>

#include "tools/packgen/art.h"

namespace packgen {

namespace {

enum class Eyes { kOpen, kClosed, kWink };

struct Face {
    Ramp hair;
    bool cap = false;  // a peaked cap in `capRamp`
    Ramp capRamp = ramp::kRed;
    bool longHair = false;
    bool scarf = false;  // a headscarf in `capRamp` instead of a peaked cap
    bool beard = false;
    bool smile = true;
    bool laugh = false;
    Eyes eyes = Eyes::kOpen;
};

// A head centred at (cx, cy) with half-size (rx, ry).
void DrawHead(Canvas& c, double cx, double cy, double rx, double ry, const Face& f) {
    if (f.longHair) {
        // Hair behind the head, falling in two locks onto the shoulders.
        c.ball(cx, cy - ry * 0.1, rx * 1.22, ry * 1.02, f.hair, 0.2, 0.75);
        c.ball(cx - rx * 0.95, cy + ry * 0.65, rx * 0.38, ry * 0.8, f.hair, 0.2, 0.7);
        c.ball(cx + rx * 0.95, cy + ry * 0.65, rx * 0.38, ry * 0.8, f.hair, 0.2, 0.7);
    }
    // Ears, then the face.
    c.ball(cx - rx, cy + 1, rx * 0.2, ry * 0.22, ramp::kSkin, 0.3, 0.8);
    c.ball(cx + rx, cy + 1, rx * 0.2, ry * 0.22, ramp::kSkin, 0.3, 0.8);
    c.ball(cx, cy, rx, ry, ramp::kSkin, 0.4, 1.0);
    if (f.beard) {
        for (int y = int(cy + ry * 0.1); y <= int(cy + ry * 1.15); ++y) {
            for (int x = int(cx - rx); x <= int(cx + rx); ++x) {
                double dx = (x + 0.5 - cx) / rx, dy = (y + 0.5 - cy) / (ry * 1.15);
                if (dx * dx + dy * dy <= 1.0 && !(std::fabs(dx) < 0.35 && dy < 0.45 && dy > 0.2)) {
                    c.set(x, y, ramp::kGrey.dither(0.78 + 0.15 * std::sin(x * 1.3 + y), x, y));
                }
            }
        }
    }
    // Hair fringe or cap.
    if (f.cap || f.scarf) {
        for (int y = int(cy - ry * 1.1); y <= int(cy - ry * 0.35); ++y) {
            for (int x = int(cx - rx * 1.05); x <= int(cx + rx * 1.05); ++x) {
                double dx = (x + 0.5 - cx) / (rx * 1.05),
                       dy = (y + 0.5 - (cy - ry * 0.35)) / (ry * 0.8);
                if (dx * dx + dy * dy <= 1.0) {
                    c.set(x, y, f.capRamp.dither(0.7 - 0.4 * (dx + 1) / 2 + 0.1, x, y));
                }
            }
        }
        if (f.scarf) {
            // The knot and its two ends at the side of the head.
            c.ball(cx + rx * 0.95, cy - ry * 0.45, rx * 0.22, ry * 0.16, f.capRamp, 0.4, 0.9);
            c.thickLine(cx + rx * 1.0, cy - ry * 0.4, cx + rx * 1.35, cy - ry * 0.05, 3,
                        f.capRamp.at(4));
            c.thickLine(cx + rx * 1.0, cy - ry * 0.4, cx + rx * 1.2, cy + ry * 0.1, 3,
                        f.capRamp.at(3));
            for (int k = 0; k < 5; ++k) {  // white dots on the cloth
                c.set(int(cx - rx * 0.6 + k * rx * 0.3), int(cy - ry * (0.7 + 0.1 * (k & 1))),
                      ramp::kGrey.at(15));
            }
        } else {
            c.rect(int(cx - rx * 1.1), int(cy - ry * 0.38), int(rx * 2.6),
                   int(std::max(2.0, ry * 0.12)), f.capRamp.at(2));
            c.ball(cx, cy - ry * 0.8, rx * 0.25, ry * 0.15, ramp::kGold, 0.6, 1.0);  // badge
        }
    } else {
        for (int y = int(cy - ry * 1.08); y <= int(cy - ry * 0.3); ++y) {
            for (int x = int(cx - rx * 1.05); x <= int(cx + rx * 1.05); ++x) {
                double dx = (x + 0.5 - cx) / (rx * 1.05), dy = (y + 0.5 - cy) / (ry * 1.08);
                double fringe = -0.45 + 0.12 * std::sin(x * 0.9);
                if (dx * dx + dy * dy <= 1.0 && dy < fringe + (std::fabs(dx) > 0.8 ? 0.5 : 0)) {
                    c.set(x, y, f.hair.dither(0.55 + 0.3 * std::sin(x * 0.7) * 0.5, x, y));
                }
            }
        }
    }
    // Eyes.
    double ey = cy - ry * 0.05, ex = rx * 0.4;
    for (int side = -1; side <= 1; side += 2) {
        double x = cx + side * ex;
        bool closed = f.eyes == Eyes::kClosed || (f.eyes == Eyes::kWink && side == 1);
        if (closed) {
            c.rect(int(x - rx * 0.15), int(ey), int(rx * 0.32) + 1, 1, ramp::kHair.at(0));
        } else {
            c.ellipse(x, ey, rx * 0.17, ry * 0.13, ramp::kGrey.at(15));
            c.ellipse(x + 0.3, ey + 0.3, rx * 0.1, ry * 0.1, ramp::kHair.at(1));
            c.set(int(x), int(ey) - 1, ramp::kGrey.at(15));
        }
        // Brows.
        c.rect(int(x - rx * 0.18), int(ey - ry * 0.25), int(rx * 0.36) + 1, 1,
               f.beard ? ramp::kGrey.at(12) : f.hair.at(1));
    }
    // Nose and cheeks.
    c.rect(int(cx), int(cy + ry * 0.12), 2, 2, ramp::kSkin.at(3));
    c.set(int(cx - ex - 1), int(cy + ry * 0.3), ramp::kPink.at(5));
    c.set(int(cx + ex + 1), int(cy + ry * 0.3), ramp::kPink.at(5));
    // Mouth.
    double my = cy + ry * 0.48;
    if (f.laugh) {
        c.ellipse(cx, my + 1, rx * 0.3, ry * 0.16, ramp::kRed.at(2));
        c.rect(int(cx - rx * 0.2), int(my - 1), int(rx * 0.4), 1, ramp::kGrey.at(15));
    } else if (f.smile) {
        for (int k = -3; k <= 3; ++k) {
            int x = int(cx + k * rx * 0.09);
            int y = int(my + (9 - k * k) * 0.12);
            c.set(x, y, ramp::kRed.at(3));
        }
    } else {
        c.rect(int(cx - rx * 0.2), int(my), int(rx * 0.4), 1, ramp::kRed.at(3));
    }
}

// Shoulders and chest in a shirt colour, from row y0 to the bottom of a frame.
void DrawBust(Canvas& c, int ox, int w, int y0, int h, const Ramp& shirt, bool collar) {
    for (int y = y0; y < h; ++y) {
        double f = double(y - y0) / (h - y0);
        int half = int(w * (0.22 + 0.26 * std::sqrt(f)));
        for (int x = w / 2 - half; x < w / 2 + half; ++x) {
            double t = 0.75 - 0.45 * std::fabs(x - w * 0.4) / half;
            c.set(ox + x, y, shirt.dither(t, ox + x, y));
        }
    }
    if (collar) {
        c.polygon({{ox + w / 2.0 - 9, double(y0)},
                   {ox + w / 2.0, y0 + 9.0},
                   {ox + w / 2.0 + 9, double(y0)}},
                  ramp::kGrey.at(15));
    }
    c.ball(ox + w / 2.0, y0 - 1, 6, 4, ramp::kSkin, 0.3, 0.8);  // neck
}

void Hand(Canvas& c, double x, double y) {
    c.ball(x, y, 5, 5.5, ramp::kSkin, 0.4, 1.0);
}

}  // namespace

Canvas DrawIntroN() {
    // The young angler: blinks, then waves.
    Canvas c(400, 110);
    for (int k = 0; k < 4; ++k) {
        int ox = 100 * k;
        Canvas f(100, 110);
        DrawBust(f, 0, 100, 76, 110, ramp::kTeal, true);
        Face face;
        face.hair = ramp::kHair;
        face.cap = true;
        face.capRamp = ramp::kRed;
        face.eyes = k == 1 ? Eyes::kClosed : Eyes::kOpen;
        face.laugh = k >= 2;
        DrawHead(f, 50, 48, 22, 25, face);
        if (k >= 2) {
            double hx = k == 2 ? 84 : 88, hy = k == 2 ? 52 : 44;
            f.thickLine(72, 104, hx - 1, hy + 8, 11, ramp::kTeal.at(3));
            f.thickLine(73, 102, hx, hy + 8, 8, ramp::kTeal.at(5));
            Hand(f, hx, hy);
            f.thickLine(hx - 3, hy - 5, hx - 4, hy - 9, 2, ramp::kSkin.at(5));  // fingers
            f.thickLine(hx, hy - 5, hx, hy - 10, 2, ramp::kSkin.at(5));
            f.thickLine(hx + 3, hy - 5, hx + 4, hy - 9, 2, ramp::kSkin.at(5));
        }
        f.outline(ramp::kHair.at(0));
        f.set(0, 0, kKey);
        c.blit(f, 0, 0, 100, 110, ox, 0);
    }
    return c;
}

Canvas DrawIntroJ() {
    // The net mender: long hair and a bandana; smiles, then winks.
    Canvas c(200, 110);
    for (int k = 0; k < 2; ++k) {
        Canvas f(100, 110);
        DrawBust(f, 0, 100, 78, 110, ramp::kPurple, false);
        Face face;
        face.hair = ramp::kHair;
        face.longHair = true;
        face.scarf = true;
        face.capRamp = ramp::kYellow;
        face.eyes = k == 1 ? Eyes::kWink : Eyes::kOpen;
        face.laugh = k == 1;
        DrawHead(f, 50, 48, 21, 25, face);
        f.outline(ramp::kHair.at(0));
        f.set(0, 0, kKey);
        c.blit(f, 0, 0, 100, 110, 100 * k, 0);
    }
    return c;
}

Canvas DrawIntroP() {
    // The old captain's coat: the body below his face, drawn at (50, 95).
    Canvas c(88, 54);
    for (int y = 0; y < 54; ++y) {
        double f = y / 53.0;
        int half = int(20 + 23 * std::sqrt(f));
        for (int x = 44 - half; x < 44 + half; ++x) {
            double t = 0.6 - 0.4 * std::fabs(x - 40.0) / half;
            c.set(x, y, ramp::kNavy.dither(t, x, y));
        }
    }
    // Lapels, buttons and the beard's tip over the chest.
    c.polygon({{34, 0}, {44, 22}, {54, 0}}, ramp::kGrey.at(14));
    c.polygon({{30, 0}, {40, 26}, {36, 0}}, ramp::kNavy.at(6));
    c.polygon({{58, 0}, {48, 26}, {52, 0}}, ramp::kNavy.at(6));
    for (int k = 0; k < 3; ++k) {
        c.ball(38, 30 + k * 8, 1.8, 1.8, ramp::kGold, 0.5, 1.0);
        c.ball(50, 30 + k * 8, 1.8, 1.8, ramp::kGold, 0.5, 1.0);
    }
    c.ellipse(44, 2, 9, 5, ramp::kGrey.at(13));
    c.outline(ramp::kNavy.at(0));
    c.set(0, 0, kKey);
    return c;
}

Canvas DrawIntroP2() {
    Canvas c(172, 40);
    // Three faces: two that alternate (pipe glowing and not), one laughing.
    for (int k = 0; k < 3; ++k) {
        Canvas f(40, 40);
        Face face;
        face.hair = ramp::kGrey;
        face.cap = true;
        face.capRamp = ramp::kNavy;
        face.beard = true;
        face.smile = k != 0;
        face.laugh = k == 2;
        face.eyes = k == 2 ? Eyes::kClosed : Eyes::kOpen;
        DrawHead(f, 20, 20, 13, 15, face);
        if (k < 2) {
            // A pipe whose bowl glows on one frame.
            f.thickLine(22, 29, 31, 31, 1.5, ramp::kWood.at(2));
            f.rect(30, 27, 4, 4, ramp::kWood.at(3));
            f.set(31, 27, k == 1 ? ramp::kGold.at(10) : ramp::kWood.at(1));
            f.set(32, 27, k == 1 ? ramp::kRed.at(8) : ramp::kWood.at(1));
        }
        f.outline(ramp::kNavy.at(0));
        f.set(0, 0, kKey);
        c.blit(f, 0, 0, 40, 40, 40 * k, 0);
    }
    // A seagull that flies off up and to the left.
    {
        Canvas g(26, 40);
        g.thickLine(3, 14, 12, 19, 2.2, ramp::kGrey.at(15));
        g.thickLine(12, 19, 22, 12, 2.2, ramp::kGrey.at(15));
        g.ball(12, 20, 3.5, 2.5, ramp::kGrey, 0.7, 1.0);
        g.set(9, 19, ramp::kGold.at(9));
        g.set(3, 14, ramp::kGrey.at(4));
        g.set(22, 12, ramp::kGrey.at(4));
        g.outline(ramp::kGrey.at(5));
        g.set(0, 0, kKey);
        c.blit(g, 0, 0, 26, 40, 120, 0);
    }
    // The captain's hand raised in greeting.
    {
        Canvas h(26, 40);
        h.thickLine(17, 39, 13, 16, 8, ramp::kNavy.at(4));
        h.ball(12, 11, 6, 7, ramp::kSkin, 0.4, 1.0);
        for (int k = 0; k < 4; ++k) {
            h.thickLine(8 + k * 2.6, 7, 7 + k * 3.2, 1, 2, ramp::kSkin.at(5));
        }
        h.outline(ramp::kNavy.at(0));
        h.set(0, 0, kKey);
        c.blit(h, 0, 0, 26, 40, 146, 0);
    }
    return c;
}

namespace {

struct Angler {
    const char* name;
    const char* lines[4];
    const char* favourite;
    const char* story;
    int storyRows;
};

const Angler kAnglers[3] = {
    {"Tomi",
     {"Age: 12", "Home: Coral Bay", "Boat: Minnow", "Rod: bamboo"},
     "Favourite: red snapper",
     "Tomi grew up on the pier of Coral Bay. Every morning he rows out before school with "
     "his grandfather's bamboo rod. The fish of the South Seas know him well: the snappers "
     "tease him, the striped reef fish dart away, and once, just once, he saw the golden "
     "fish flash under his boat. Today the sea is calm and the basket is empty. Lower the "
     "hook, strike quickly, and drop every catch into the floating basket before your "
     "strength runs out!",
     153},
    {"Mira",
     {"Age: 26", "Home: Reef Point", "Boat: Gull", "Rod: carbon"},
     "Favourite: striped reef fish",
     "Mira mends nets at Reef Point and fishes at dawn. She knows where the striped fish "
     "gather and laughs at the crabs that nip her line. Her basket drifts, so chase it!",
     76},
    {"Old Oren",
     {"Age: 68", "Home: Cape Gale", "Boat: Albatross", "Rod: oak"},
     "Favourite: the golden fish",
     "Old Oren has fished these waters for fifty years and tells more tall tales than he "
     "lands fish. His basket never stops moving, but his eye is sharp: beware the ink fish "
     "that clouds the water, and hope for the scallop that makes every fish hold still.",
     105},
};

std::vector<std::string> Wrap(const std::string& text, const TextStyle& st, int width) {
    std::vector<std::string> lines;
    std::istringstream words(text);
    std::string word, line;
    while (words >> word) {
        std::string trial = line.empty() ? word : line + " " + word;
        if (!line.empty() && Advance(trial, st) > width) {
            lines.push_back(line);
            line = word;
        } else {
            line = trial;
        }
    }
    if (!line.empty()) {
        lines.push_back(line);
    }
    return lines;
}

}  // namespace

Canvas DrawProfile() {
    Canvas c(252, 75);
    for (int k = 0; k < 3; ++k) {
        int ox = 84 * k;
        c.roundRect(ox, 0, 84, 75, 5, ramp::kNavy.at(1));
        c.roundRect(ox + 1, 1, 82, 73, 4, ramp::kNavy.at(6));
        c.roundRect(ox + 3, 3, 78, 17, 3, ramp::kGold.at(8));
        TextStyle name;
        name.size = 12;
        name.bold = true;
        name.colour = Colour(ramp::kNavy.at(0));
        DrawTextIn(c, ox + 3, 3, 78, 17, kAnglers[k].name, name);
        TextStyle line;
        line.size = 10;
        line.colour = {255, 255, 255};
        for (int i = 0; i < 4; ++i) {
            DrawTextLeft(c, ox + 6, 22 + 13 * i, 13, kAnglers[k].lines[i], line);
        }
    }
    c.set(0, 0, kKey);
    return c;
}

Canvas DrawFavorite() {
    Canvas c(192, 72);
    const int top[3] = {0, 23, 46}, rows[3] = {23, 23, 26};
    for (int k = 0; k < 3; ++k) {
        int y = top[k], h = rows[k];
        c.roundRect(2, y + 1, 188, h - 2, 6, ramp::kRed.at(3));
        c.roundRect(3, y + 2, 186, h - 4, 5, ramp::kRed.at(7));
        c.rect(8, y + 3, 176, 1, ramp::kRed.at(9));
        // A fish badge at the left end.
        c.ball(14, y + h / 2.0, 6, 4, ramp::kGold, 0.4, 1.0);
        c.polygon({{8, y + h / 2.0}, {3, y + h / 2.0 - 4}, {3, y + h / 2.0 + 4}},
                  ramp::kGold.at(8));
        TextStyle st;
        st.size = 11;
        st.bold = true;
        st.colour = {255, 250, 230};
        st.shadow = 1;
        st.shadowColour = Colour(ramp::kRed.at(1));
        DrawTextIn(c, 22, y, 166, h, kAnglers[k].favourite, st);
    }
    c.set(0, 0, kKey);
    return c;
}

Canvas DrawStory() {
    Canvas c(232, 334);
    const int start[3] = {0, 153, 229};
    TextStyle st;
    st.size = 11;
    st.colour = Colour(ramp::kNavy.at(0));
    st.overKey = Colour(ramp::kPaper.at(6));  // the story window's colour on the intro page
    st.keyCut = 0.35;
    const int lineGap = 13;
    for (int k = 0; k < 3; ++k) {
        std::vector<std::string> lines = Wrap(kAnglers[k].story, st, 222);
        int capacity = (kAnglers[k].storyRows - 2) / lineGap;
        if (int(lines.size()) > capacity) {
            std::fprintf(stderr, "redizor-pack: story %d needs %zu lines, has room for %d\n", k + 1,
                         lines.size(), capacity);
            lines.resize(std::size_t(capacity));
        }
        for (std::size_t i = 0; i < lines.size(); ++i) {
            DrawText(c, 5, start[k] + 11 + int(i) * lineGap, lines[i], st);
        }
    }
    c.set(0, 0, kKey);
    return c;
}

}  // namespace packgen
