// The art where the game's logic depends on it: what the player taps must be drawn over the
// area that reacts, strips must hold their frames where the game reads them, scrolling
// patterns must repeat, overlays must be dark where they darken.
#include <gtest/gtest.h>

#include <algorithm>
#include <set>
#include <string>

#include "pack_reader.h"

namespace packtest {
namespace {

Dc8 Load(const std::string& file) {
    Dc8 d = ParseDc8(ReadBytes(ImagePath(file)));
    EXPECT_EQ(d.error, "") << file;
    return d;
}

struct Area {
    int x0, y0, x1, y1;  // both ends included
};

// Bright pixels (lettering) inside a rectangle of a picture, and their bounding box.
struct Ink {
    int count = 0;
    Area box{1 << 20, 1 << 20, -1, -1};
};

Ink BrightInk(const Dc8& d, Area a, int threshold) {
    Ink ink;
    for (int y = a.y0; y <= a.y1; ++y) {
        for (int x = a.x0; x <= a.x1; ++x) {
            if (d.lum(x, y) > threshold) {
                ++ink.count;
                ink.box = {std::min(ink.box.x0, x), std::min(ink.box.y0, y),
                           std::max(ink.box.x1, x), std::max(ink.box.y1, y)};
            }
        }
    }
    return ink;
}

struct TitleArea {
    const char* word;
    Area area;
};

void PrintTo(const TitleArea& a, std::ostream* os) {
    *os << a.word;
}

class TitleStylusArea : public ::testing::TestWithParam<TitleArea> {};

TEST_P(TitleStylusArea, IsLetteredExactlyWhereItReacts) {
    Dc8 d = Load("start.dc8");
    Area a = GetParam().area;
    // Search a margin around the area: the word's light letters must all lie inside it.
    Area around{std::max(0, a.x0 - 6), a.y0 - 6, a.x1 + 6, a.y1 + 6};
    Ink ink = BrightInk(d, around, 225);
    ASSERT_GT(ink.count, 20) << GetParam().word << " is not lettered";
    EXPECT_GE(ink.box.x0, a.x0);
    EXPECT_GE(ink.box.y0, a.y0);
    EXPECT_LE(ink.box.x1, a.x1);
    EXPECT_LE(ink.box.y1, a.y1);
    // The sign covers the whole area, so no sky or sea shows inside it.
    EXPECT_LT(d.blue(a.x0 + 1, a.y0 + 1), 150);
    EXPECT_LT(d.blue(a.x1 - 1, a.y1 - 1), 150);
}

INSTANTIATE_TEST_SUITE_P(Title, TitleStylusArea,
                         ::testing::Values(TitleArea{"Start", {0, 220, 32, 231}},
                                           TitleArea{"Exit", {0, 241, 40, 253}},
                                           TitleArea{"Menu", {0, 262, 49, 273}}),
                         [](const ::testing::TestParamInfo<TitleArea>& i) {
                             return std::string(i.param.word);
                         });

struct MenuPiece {
    const char* file;
    int x, y, w, h;  // where the game draws the picture over the menu
    Area stylus;     // the line or button it shows
};

const MenuPiece kMenuPieces[] = {
    {"menu_pacific.dc8", 15, 87, 210, 23, {90, 92, 149, 104}},
    {"menu_south.dc8", 15, 111, 210, 23, {76, 117, 169, 128}},
    {"menu_amazon.dc8", 15, 136, 210, 23, {89, 142, 155, 153}},
    {"menu_easy.dc8", 90, 200, 120, 23, {118, 206, 160, 219}},
    {"menu_normal.dc8", 90, 224, 120, 23, {107, 231, 174, 244}},
    {"menu_hard.dc8", 90, 248, 120, 23, {119, 253, 162, 266}},
    {"menu_back.dc8", 0, 267, 90, 23, {7, 273, 54, 287}},
    {"menu_go.dc8", 180, 268, 60, 23, {206, 273, 233, 287}},
};

void PrintTo(const MenuPiece& p, std::ostream* os) {
    *os << p.file;
}

class MenuHighlight : public ::testing::TestWithParam<MenuPiece> {};

TEST_P(MenuHighlight, RepeatsTheMenuAroundTheLitLine) {
    const MenuPiece& p = GetParam();
    Dc8 menu = Load("menu.dc8");
    Dc8 lit = Load(p.file);
    int same = 0, differ = 0;
    for (int y = 0; y < p.h; ++y) {
        for (int x = 0; x < p.w; ++x) {
            bool edge = y == 0 || x == 0 || y == p.h - 1 || x == p.w - 1;
            bool eq = lit.at(x, y) == menu.at(p.x + x, p.y + y);
            if (edge) {
                // Its border meets the menu seamlessly, whatever is drawn next to it.
                EXPECT_TRUE(eq) << p.file << " at " << x << "," << y;
            }
            (eq ? same : differ) += 1;
        }
    }
    EXPECT_GT(differ, 60) << p.file << " highlights nothing";
    EXPECT_GT(same, 0);
}

TEST_P(MenuHighlight, ChangesTheStylusAreaItself) {
    const MenuPiece& p = GetParam();
    Dc8 menu = Load("menu.dc8");
    Dc8 lit = Load(p.file);
    int differ = 0, cells = 0;
    for (int y = p.stylus.y0; y <= p.stylus.y1; ++y) {
        for (int x = p.stylus.x0; x <= p.stylus.x1; ++x) {
            ++cells;
            differ += lit.at(x - p.x, y - p.y) != menu.at(x, y);
        }
    }
    // Most of the area changes when lit, so the player sees the very thing he tapped.
    EXPECT_GT(differ, cells / 2) << p.file;
}

INSTANTIATE_TEST_SUITE_P(Menu, MenuHighlight, ::testing::ValuesIn(kMenuPieces),
                         [](const ::testing::TestParamInfo<MenuPiece>& i) {
                             std::string n = i.param.file;
                             return n.substr(0, n.find('.'));
                         });

TEST(Menu, EachLineIsMarkedOverItsStylusArea) {
    Dc8 menu = Load("menu.dc8");
    for (const MenuPiece& p : kMenuPieces) {
        const Area& a = p.stylus;
        int midY = (a.y0 + a.y1) / 2;
        // The marking (pill or button) fills the area and ends at its edges.
        EXPECT_NE(menu.at(a.x0 + 2, midY), menu.at(a.x0 - 3, midY)) << p.file;
        EXPECT_NE(menu.at(a.x1 - 2, midY), menu.at(a.x1 + 3, midY)) << p.file;
    }
}

TEST(Intro, ButtonsAreDrawnOverTheirAreas) {
    Dc8 d = Load("intro.dc8");
    for (Area a : {Area{41, 269, 94, 281}, Area{146, 269, 199, 281}}) {
        Ink ink = BrightInk(d, {a.x0 - 4, a.y0 - 4, a.x1 + 4, a.y1 + 4}, 240);
        ASSERT_GT(ink.count, 10);
        EXPECT_GE(ink.box.x0, a.x0);
        EXPECT_LE(ink.box.x1, a.x1);
        EXPECT_GE(ink.box.y0, a.y0);
        EXPECT_LE(ink.box.y1, a.y1);
    }
}

TEST(Ranking, RowsAreLightWhereTheGameWritesInBlack) {
    Dc8 d = Load("ranking.dc8");
    for (int i = 0; i < 10; ++i) {
        int y0 = 95 + 18 * i;
        long sum = 0, n = 0;
        for (int y = y0; y < y0 + 18; ++y) {
            for (int x = 100; x <= 215; ++x) {
                sum += d.lum(x, y);
                ++n;
            }
        }
        EXPECT_GT(sum / n, 180) << "row " << i;
    }
    // The back area at the lower left carries a label.
    EXPECT_GT(BrightInk(d, {0, 271, 49, 292}, 240).count, 10);
}

TEST(Round, WaveRepeatsEvery49Pixels) {
    Dc8 w = Load("n_wave.dc8");
    // Read from x 0..42 in steps of 7, 300 wide; after 42 the scroll wraps to 0.
    for (int y = 0; y < w.height; ++y) {
        for (int x = 0; x + 49 < w.width; ++x) {
            ASSERT_EQ(w.at(x, y), w.at(x + 49, y)) << "at " << x << "," << y;
        }
    }
    // Transparent sky above, water at the bottom row.
    EXPECT_EQ(w.at(100, 0), 0);
    EXPECT_NE(w.at(100, w.height - 1), 0);
}

TEST(Round, FullBasketIsDrawnWithTheEmptyBasketsKey) {
    Dc8 empty = Load("n_basket.dc8");
    Dc8 full = Load("n_taken_basket.dc8");
    EXPECT_EQ(full.at(0, 0), empty.at(0, 0));
    // Every frame leaves the same transparent corners, else the full basket drags a box.
    for (int f = 0; f < 4; ++f) {
        EXPECT_EQ(full.at(55 * f, 0), empty.at(0, 0)) << "frame " << f;
        EXPECT_EQ(full.at(55 * f + 54, 59), empty.at(0, 0)) << "frame " << f;
    }
}

TEST(Round, BasketMouthIsOverTheLandingBox) {
    // The hook lands when its top-left is 10..35 right of the basket and 30..60 below its top:
    // the picture's opening must be there for the landing to look right.
    Dc8 b = Load("n_basket.dc8");
    for (int f = 0; f < 2; ++f) {
        int solid = 0;
        for (int x = 20; x <= 45; ++x) {
            solid += b.at(55 * f + x, 34) != 0;
        }
        EXPECT_EQ(solid, 26) << "frame " << f;
    }
}

TEST(Round, RodTipIsWhereTheLineStarts) {
    Dc8 d = Load("nn_fisherman.dc8");
    auto near = [&](int cx, int cy) {
        for (int y = cy - 2; y <= cy + 2; ++y) {
            for (int x = std::max(0, cx - 2); x <= cx + 2; ++x) {
                if (d.at(x, y) != 0) {
                    return true;
                }
            }
        }
        return false;
    };
    EXPECT_TRUE(near(45, 8));  // facing right
    EXPECT_TRUE(near(47 + 45, 8));
    EXPECT_TRUE(near(94 + 1, 8));  // facing left, the tip at the frame's left edge
    // Below the gunwale the boat shows through.
    for (int x = 0; x < 188; ++x) {
        EXPECT_EQ(d.at(x, 45), 0) << x;
    }
}

struct Strip {
    const char* file;
    int frameWidth, frames;
    bool mirrored;  // frames 2-3 head left: mirror images of frames 0-1
};

void PrintTo(const Strip& s, std::ostream* os) {
    *os << s.file;
}

class SpriteStrip : public ::testing::TestWithParam<Strip> {};

TEST_P(SpriteStrip, EveryFrameHoldsItsOwnPicture) {
    const Strip& s = GetParam();
    Dc8 d = Load(s.file);
    ASSERT_EQ(d.width, s.frameWidth * s.frames);
    std::set<std::vector<std::uint8_t>> distinct;
    for (int f = 0; f < s.frames; ++f) {
        std::vector<std::uint8_t> frame;
        int solid = 0;
        for (int y = 0; y < d.height; ++y) {
            for (int x = 0; x < s.frameWidth; ++x) {
                std::uint8_t v = d.at(f * s.frameWidth + x, y);
                frame.push_back(v);
                solid += v != 0;
            }
        }
        EXPECT_GT(solid, s.frameWidth * d.height / 8) << s.file << " frame " << f;
        distinct.insert(frame);
        // A shape drawn too large for its frame is cut off at the edge: the edge columns never
        // run solid from top to bottom, and the corners stay clear.
        int leftEdge = 0, rightEdge = 0;
        for (int y = 0; y < d.height; ++y) {
            leftEdge += d.at(f * s.frameWidth, y) != 0;
            rightEdge += d.at(f * s.frameWidth + s.frameWidth - 1, y) != 0;
        }
        EXPECT_LT(leftEdge, d.height * 9 / 10) << s.file << " frame " << f;
        EXPECT_LT(rightEdge, d.height * 9 / 10) << s.file << " frame " << f;
        int x0 = f * s.frameWidth, x1 = x0 + s.frameWidth - 1, y1 = d.height - 1;
        EXPECT_EQ(d.at(x0, 0) | d.at(x1, 0) | d.at(x0, y1) | d.at(x1, y1), 0)
            << s.file << " frame " << f;
    }
    EXPECT_EQ(int(distinct.size()), s.frames) << s.file << " repeats a frame";
}

TEST_P(SpriteStrip, LeftFramesFaceTheOtherWay) {
    const Strip& s = GetParam();
    if (!s.mirrored) {
        GTEST_SKIP();
    }
    Dc8 d = Load(s.file);
    int w = s.frameWidth;
    for (int f = 0; f < 2; ++f) {
        int agree = 0, total = 0, straight = 0;
        for (int y = 0; y < d.height; ++y) {
            for (int x = 0; x < w; ++x) {
                bool right = d.at(f * w + x, y) != 0;
                bool left = d.at((f + 2) * w + (w - 1 - x), y) != 0;
                bool same = d.at((f + 2) * w + x, y) != 0;
                total += right;
                agree += right && left;
                straight += right && same;
            }
        }
        EXPECT_GT(agree, total * 9 / 10) << s.file << " frame " << f;
        EXPECT_LT(straight, agree) << s.file << " frame " << f << " is not turned";
    }
}

INSTANTIATE_TEST_SUITE_P(
    Round, SpriteStrip,
    ::testing::Values(
        Strip{"n_fish0.dc8", 63, 4, true}, Strip{"n_fish1.dc8", 44, 4, true},
        Strip{"n_fish2.dc8", 44, 4, true}, Strip{"n_fish3.dc8", 64, 4, true},
        Strip{"n_fish4.dc8", 37, 4, true}, Strip{"n_fish5.dc8", 38, 4, true},
        Strip{"n_shell_fish0.dc8", 71, 4, false}, Strip{"n_shell_fish1.dc8", 28, 4, false},
        Strip{"n_taken_fish0.dc8", 44, 2, false}, Strip{"n_taken_fish1.dc8", 28, 2, false},
        Strip{"n_taken_fish2.dc8", 38, 2, false}, Strip{"n_taken_fish3.dc8", 38, 2, false},
        Strip{"n_taken_fish4.dc8", 25, 2, false}, Strip{"n_taken_fish5.dc8", 29, 2, false},
        Strip{"n_taken_fish6.dc8", 66, 2, false}, Strip{"n_taken_fish7.dc8", 22, 2, false},
        Strip{"nn_fisherman.dc8", 47, 4, true}, Strip{"n_sheep.dc8", 54, 2, false},
        Strip{"n_hook.dc8", 20, 2, false}, Strip{"n_eng_man.dc8", 21, 2, false},
        Strip{"start_flag.dc8", 44, 3, false}, Strip{"intro_n.dc8", 100, 4, false},
        Strip{"intro_j.dc8", 100, 2, false}),
    [](const ::testing::TestParamInfo<Strip>& i) {
        std::string n = i.param.file;
        return n.substr(0, n.find('.'));
    });

TEST(Round, DigitsAreTenDistinctGlyphs) {
    Dc8 d = Load("n_number.dc8");
    std::set<std::vector<std::uint8_t>> glyphs;
    for (int k = 0; k < 10; ++k) {
        std::vector<std::uint8_t> g;
        int light = 0;
        for (int y = 0; y < 11; ++y) {
            for (int x = 0; x < 9; ++x) {
                g.push_back(d.at(9 * k + x, y));
                light += d.at(9 * k + x, y) != 0 && d.lum(9 * k + x, y) > 200;
            }
        }
        EXPECT_GT(light, 6) << "digit " << k;
        glyphs.insert(g);
    }
    EXPECT_EQ(glyphs.size(), 10u);
}

TEST(Round, DarkWaterIsDarkWithSomeClearPixels) {
    Dc8 d = Load("n_dark.dc8");
    long clear = 0, dark = 0;
    for (int y = 0; y < d.height; ++y) {
        for (int x = 0; x < d.width; ++x) {
            if (d.at(x, y) == 0) {
                ++clear;
            } else if (d.lum(x, y) < 40) {
                ++dark;
            }
        }
    }
    long n = long(d.width) * d.height;
    EXPECT_GT(dark, n * 3 / 4);
    EXPECT_GT(clear, n / 20);
    EXPECT_EQ(clear + dark, n);
}

TEST(Round, LightSpotIsClearInTheMiddleAndDarkAtTheCorners) {
    Dc8 d = Load("n_light.dc8");
    for (int y = 18; y < 32; ++y) {
        for (int x = 18; x < 32; ++x) {
            EXPECT_EQ(d.at(x, y), 0) << x << "," << y;
        }
    }
    int dark = 0;
    for (int y = 0; y < 5; ++y) {
        for (int x = 0; x < 5; ++x) {
            dark += d.at(x, y) != 0 && d.lum(x, y) < 40;
            dark += d.at(49 - x, 49 - y) != 0 && d.lum(49 - x, 49 - y) < 40;
        }
    }
    EXPECT_GT(dark, 35);
}

TEST(Round, BackgroundHasSkyAboveAndSeaBelowTheSurface) {
    Dc8 d = Load("n_back.dc8");
    for (int x = 0; x < 480; x += 40) {
        EXPECT_GT(d.lum(x, 100), d.lum(x, 200)) << x;  // bright sky, deeper water
        EXPECT_GT(d.blue(x, 200), d.red(x, 200)) << x;
        EXPECT_GT(d.red(x, 280), d.blue(x, 280)) << x;  // sand
    }
}

TEST(Round, EnergyFillIsOpaqueAndTheFrameLeavesItsTroughInside) {
    Dc8 bar = Load("eng_bar.dc8");
    for (std::uint8_t v : bar.rows) {
        EXPECT_NE(v, 0);
    }
    Dc8 box = Load("bar_case.dc8");
    // The fill is drawn at (5, 2) of the frame, up to 170 x 6; the frame's rim lies outside it.
    EXPECT_NE(box.at(4, 5), 0);
    EXPECT_NE(box.at(175, 5), 0);
    EXPECT_NE(box.at(90, 0), 0);
    EXPECT_NE(box.at(90, 9), 0);
}

TEST(Loading, CellsAreLitSegmentsOfTheBar) {
    Dc8 d = Load("load.dc8");
    for (int k = 0; k < 7; ++k) {
        long sum = 0;
        for (int y = 99; y < 108; ++y) {
            for (int x = 17 * k; x < 17 * k + 15; ++x) {
                sum += d.lum(x, y);
            }
        }
        EXPECT_GT(sum / (15 * 9), 100) << "cell " << k;
    }
}

struct StoryBand {
    int first, rows;
};

void PrintTo(const StoryBand& b, std::ostream* os) {
    *os << "rows from " << b.first;
}

class Story : public ::testing::TestWithParam<StoryBand> {};

TEST_P(Story, TextStartsAtTheTopOfItsBandAndStaysInside) {
    Dc8 d = Load("story.dc8");
    const StoryBand& b = GetParam();
    int firstInk = -1, lastInk = -1;
    for (int y = b.first; y < b.first + b.rows; ++y) {
        for (int x = 0; x < 232; ++x) {
            if (d.at(x, y) != 0) {
                lastInk = y;
                if (firstInk < 0) {
                    firstInk = y;
                }
            }
        }
    }
    // The story rises into the window from its first row; a blank head would show an empty
    // window for many passes.
    ASSERT_GE(firstInk, 0);
    EXPECT_LT(firstInk - b.first, 6);
    // Its last line ends before the next story begins.
    EXPECT_LT(lastInk, b.first + b.rows - 1);
    EXPECT_GT(lastInk - b.first, b.rows / 2);
}

INSTANTIATE_TEST_SUITE_P(Intro, Story,
                         ::testing::Values(StoryBand{0, 153}, StoryBand{153, 76},
                                           StoryBand{229, 105}));

}  // namespace
}  // namespace packtest
