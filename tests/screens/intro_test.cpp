// The intro page through real stylus messages: the story's geometry at the scroll positions
// where it changes, the portrait frames, the two buttons at and past their strict bounds and
// the reveal. The menu's Go always brings difficulty 1; the other difficulties' pages are seen
// by setting g_difficulty while the page shows, as a menu offering them would.
#include <gtest/gtest.h>

#include <string>

#include "app/input.h"
#include "app/shell.h"
#include "assets/catalogue.h"
#include "platform/headless/headless.h"
#include "screen_driver.h"
#include "screens/intro.h"
#include "screens/options.h"

namespace {

using screens_test::PixelOf;
using screens_test::Route;

constexpr int kWindowTop = 170, kWindowBottom = 240;

// Whether the favourites strip, drawn over the story, covers frame pixel (x, y).
bool UnderFavourites(BYTE difficulty, int x, int y) {
    const int rows[] = {0, 23, 46}, heights[] = {23, 23, 26};
    int fx = x - 24, fy = y - 160;
    if (fx < 0 || fx >= 192 || fy < 0 || fy >= heights[difficulty - 1]) {
        return false;
    }
    return PixelOf(g_img_favorite, fx, rows[difficulty - 1] + fy) != g_img_favorite->key;
}

// Checks every row of the story window of the frame just composed: rows top..top+height-1
// show story rows from sourceRow on, the others the page background. Returns the number of
// story pixels compared, so that a check of blank rows cannot pass unnoticed.
int CheckStoryWindow(BYTE difficulty, int top, int height, int sourceRow) {
    int compared = 0;
    for (int y = kWindowTop; y < kWindowBottom; ++y) {
        bool story = y >= top && y < top + height;
        for (int x = 0; x < 232; ++x) {
            if (UnderFavourites(difficulty, 4 + x, y)) {
                continue;
            }
            BYTE shown = PixelOf(g_frameImage, 4 + x, y);
            BYTE expected = PixelOf(g_img_intro, 4 + x, y);
            if (story) {
                BYTE s = PixelOf(g_img_story, x, sourceRow + y - top);
                if (s != g_img_story->key) {
                    expected = s;
                    ++compared;
                }
            }
            if (shown != expected) {
                ADD_FAILURE() << "pixel (" << 4 + x << ", " << y << ") "
                              << (story ? "should show the story" : "should show the page");
                return compared;
            }
        }
    }
    return compared;
}

struct StoryCase {
    BYTE difficulty;
    int scroll;  // g_storyScroll on the frame checked
    int top, height, sourceRow;
    int scrollAfter;  // the value the frame leaves (0 when it wrapped)
};

class IntroStoryTest : public ::testing::TestWithParam<StoryCase> {};

TEST_P(IntroStoryTest, StoryWindowShowsTheRowsOfItsScroll) {
    const StoryCase c = GetParam();
    Route run;
    run.legs = {{SCREEN_INTRO, 4}};
    screens_test::Walk(run, [&](int, long k) {
        if (k == 2) {
            g_difficulty = c.difficulty;
            g_storyScroll = static_cast<WORD>(c.scroll - 1);  // the next frame advances it
        } else if (k == 3) {
            EXPECT_EQ(g_storyScroll, c.scrollAfter);
            int compared = CheckStoryWindow(c.difficulty, c.top, c.height, c.sourceRow);
            if (c.height > 0) {
                EXPECT_GT(compared, 0);
            }
            EXPECT_TRUE(screens_test::ScreenShowsFrame());
        }
    });
}

INSTANTIATE_TEST_SUITE_P(
    Scroll, IntroStoryTest,
    ::testing::Values(StoryCase{1, 12, 234, 6, 0, 12}, StoryCase{1, 60, 210, 30, 0, 60},
                      StoryCase{2, 139, 171, 69, 153, 139}, StoryCase{2, 140, 170, 70, 153, 140},
                      StoryCase{2, 200, 170, 46, 183, 200}, StoryCase{2, 292, 170, 0, 153, 292},
                      StoryCase{2, 293, 240, 0, 153, 0}, StoryCase{1, 306, 170, 70, 83, 306},
                      StoryCase{1, 308, 170, 69, 84, 308}, StoryCase{1, 446, 170, 0, 0, 446},
                      StoryCase{3, 200, 170, 70, 259, 200}, StoryCase{3, 280, 170, 35, 299, 280},
                      StoryCase{3, 351, 240, 0, 229, 0}),
    [](const ::testing::TestParamInfo<StoryCase>& info) {
        return "d" + std::to_string(info.param.difficulty) + "_s" +
               std::to_string(info.param.scroll);
    });

struct PortraitCase {
    BYTE difficulty;
    int tick;  // g_introTick on the frame checked
    int frame;
};

class IntroPortraitTest : public ::testing::TestWithParam<PortraitCase> {};

// Which of the portrait's 100 x 110 frames shows at (50, 50), or -1.
int ShownPortraitFrame(BYTE difficulty) {
    Sprite* strip = difficulty == 1 ? g_img_intro_n : g_img_intro_j;
    for (int frame = 0; frame < (difficulty == 1 ? 4 : 2); ++frame) {
        if (screens_test::ShowsBlock(g_frameImage, 50, 50, strip, 100 * frame, 0, 100, 110, true)) {
            return frame;
        }
    }
    return -1;
}

TEST_P(IntroPortraitTest, PortraitFrameFollowsTheTick) {
    const PortraitCase c = GetParam();
    Route run;
    run.legs = {{SCREEN_INTRO, 4}};
    screens_test::Walk(run, [&](int, long k) {
        if (k == 2) {
            g_difficulty = c.difficulty;
            g_introTick = static_cast<BYTE>(c.tick == 0 ? 240 : c.tick - 1);
        } else if (k == 3) {
            EXPECT_EQ(g_introTick, c.tick);
            EXPECT_EQ(ShownPortraitFrame(c.difficulty), c.frame);
        }
    });
}

INSTANTIATE_TEST_SUITE_P(
    Ticks, IntroPortraitTest,
    ::testing::Values(PortraitCase{1, 1, 0}, PortraitCase{1, 2, 0}, PortraitCase{1, 3, 1},
                      PortraitCase{1, 5, 1}, PortraitCase{1, 6, 2}, PortraitCase{1, 9, 3},
                      PortraitCase{1, 11, 3}, PortraitCase{1, 12, 0}, PortraitCase{1, 240, 0},
                      PortraitCase{1, 0, 0}, PortraitCase{2, 5, 0}, PortraitCase{2, 6, 1},
                      PortraitCase{2, 11, 1}, PortraitCase{2, 12, 0}, PortraitCase{2, 239, 1}),
    [](const ::testing::TestParamInfo<PortraitCase>& info) {
        return "d" + std::to_string(info.param.difficulty) + "_t" + std::to_string(info.param.tick);
    });

// The hard page's pieces: the head alternates every 4 ticks and shows its third frame in the
// first ticks of each 60; the flying piece and the hand show early in each 40.
TEST(IntroTest, HardPortraitPiecesFollowTheTick) {
    struct Step {
        int tick;
        int headX;
        bool flyingPiece;  // the 26 x 40 piece at source x 120, at (67 - 13r, 70 - 2r)
        bool hand;         // the piece at source x 146, at (50, 72)
    };
    const Step steps[] = {{20, 40, false, false}, {24, 0, false, false}, {3, 80, true, true},
                          {41, 0, false, true},   {44, 40, true, true},  {62, 80, false, false}};
    std::size_t i = 0;
    Route run;
    run.legs = {{SCREEN_INTRO, 3 + 2 * static_cast<long>(std::size(steps))}};
    screens_test::Walk(run, [&](int, long k) {
        if (k < 2 || i >= std::size(steps)) {
            return;
        }
        const Step& s = steps[i];
        if (k % 2 == 0) {
            g_difficulty = 3;
            g_introTick = static_cast<BYTE>(s.tick - 1);
            return;
        }
        // Rows 59..94 of the head lie above the portrait drawn over it.
        EXPECT_TRUE(screens_test::ShowsBlock(g_frameImage, 67, 59, g_img_intro_p2, s.headX, 0, 40,
                                             36, true))
            << "tick " << s.tick;
        EXPECT_TRUE(
            screens_test::ShowsBlock(g_frameImage, 50, 95, g_img_intro_p, 0, 0, 88, 54, true));
        int r = s.tick % 40;
        if (s.flyingPiece) {
            // Its left 22 columns, clear of the hand drawn after it.
            EXPECT_TRUE(screens_test::ShowsBlock(g_frameImage, 67 - 13 * r, 70 - 2 * r,
                                                 g_img_intro_p2, 120, 0, 22, 40, true))
                << "tick " << s.tick;
        }
        // The hand's columns left of the head and rows above the portrait.
        bool handShown =
            screens_test::ShowsBlock(g_frameImage, 50, 72, g_img_intro_p2, 146, 0, 17, 23, true);
        if (s.hand) {
            EXPECT_TRUE(handShown) << "tick " << s.tick;
        }
        ++i;
    });
    EXPECT_EQ(i, std::size(steps));
}

TEST(IntroTest, TickCountsToTwoHundredFortyThenZero) {
    std::vector<int> ticks;
    Route run;
    run.legs = {{SCREEN_INTRO, 6}};
    screens_test::Walk(run, [&](int, long k) {
        if (k == 1) {
            g_introTick = 238;
        } else if (k > 1) {
            ticks.push_back(g_introTick);
        }
    });
    EXPECT_EQ(ticks, (std::vector<int>{239, 240, 0, 1, 2}));
}

struct ButtonCase {
    int x, y;
    BYTE leadsTo;
    const char* cue;
};

class IntroButtonTest : public ::testing::TestWithParam<ButtonCase> {};

TEST_P(IntroButtonTest, TapActsOnlyStrictlyInsideAButton) {
    const ButtonCase c = GetParam();
    Route run;
    run.legs = {{SCREEN_INTRO, 5}};
    screens_test::Walk(run, [&](int, long k) {
        if (k == 1) {
            headless::Log().Clear();
            headless::Tap(c.x, c.y);
        } else if (k == 3) {
            EXPECT_EQ(g_screen, c.leadsTo);
            if (c.cue != nullptr) {
                EXPECT_EQ(screens_test::CueCount(c.cue), 1);
                EXPECT_EQ(g_storyScroll, 0);
            } else {
                EXPECT_TRUE(headless::Log().cues.empty());
                EXPECT_EQ(g_storyScroll, 3);
            }
            g_screen = 0xFF;
        }
    });
}

INSTANTIATE_TEST_SUITE_P(
    Bounds, IntroButtonTest,
    ::testing::Values(ButtonCase{94, 275, SCREEN_OPTIONS, "\\menu.mc8"},
                      ButtonCase{41, 269, SCREEN_OPTIONS, "\\menu.mc8"},
                      ButtonCase{40, 275, SCREEN_INTRO, nullptr},
                      ButtonCase{95, 275, SCREEN_INTRO, nullptr},
                      ButtonCase{145, 275, SCREEN_INTRO, nullptr},
                      ButtonCase{146, 269, SCREEN_FISHING, "\\n_taken_succ.mc8"},
                      ButtonCase{199, 281, SCREEN_FISHING, "\\n_taken_succ.mc8"},
                      ButtonCase{200, 275, SCREEN_INTRO, nullptr},
                      ButtonCase{150, 268, SCREEN_INTRO, nullptr},
                      ButtonCase{150, 282, SCREEN_INTRO, nullptr}),
    [](const ::testing::TestParamInfo<ButtonCase>& info) {
        return "x" + std::to_string(info.param.x) + "_y" + std::to_string(info.param.y);
    });

TEST(IntroTest, FirstFrameRevealsThenWholeFrames) {
    std::vector<std::size_t> blits;
    Route run;
    run.legs = {{SCREEN_INTRO, 4}};
    screens_test::Walk(run, [&](int, long k) {
        if (k > 0) {
            blits.push_back(screens_test::BlitCount());
        }
        headless::Log().Clear();
    });
    EXPECT_EQ(blits, (std::vector<std::size_t>{300, 1, 1, 1}));
}

// With no difficulty the page is its background alone, and the buttons still work.
TEST(IntroTest, UnknownDifficultyShowsOnlyTheBackground) {
    Route run;
    run.legs = {{SCREEN_INTRO, 2}, {SCREEN_OPTIONS, 1}};
    screens_test::Walk(run, [&](int leg, long k) {
        if (leg == 0 && k == 1) {
            g_difficulty = 0;
        } else if (leg == 0 && k == 2) {
            EXPECT_TRUE(
                screens_test::ShowsBlock(g_frameImage, 0, 0, g_img_intro, 0, 0, 240, 293, false));
            EXPECT_EQ(g_storyScroll, 1) << "the story does not move without a story";
        }
    });
}

}  // namespace
