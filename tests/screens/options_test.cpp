// The options menu through real stylus messages: its lines at and just past their inclusive
// bounds, the Back and Go buttons that arm on the press and act on the release, and its
// reveals.
#include <gtest/gtest.h>

#include <string>

#include "app/input.h"
#include "app/shell.h"
#include "assets/catalogue.h"
#include "platform/headless/headless.h"
#include "screen_driver.h"
#include "screens/options.h"

namespace {

using screens_test::Route;

struct LineCase {
    int x, y;
    BYTE region;      // chosen ground, 0: none
    BYTE difficulty;  // chosen difficulty, 0: none
};

// The highlight the menu draws for a choice, as the presented frame shows it.
bool ShowsGround(BYTE region) {
    Image* pictures[] = {g_img_menu_pacific, g_img_menu_south, g_img_menu_amazon};
    const int rows[] = {87, 111, 136};
    return screens_test::ShowsBlock(g_frameImage, 15, rows[region - 1], pictures[region - 1], 0, 0,
                                    210, 23, false);
}

bool ShowsDifficulty(BYTE difficulty) {
    Image* pictures[] = {g_img_menu_easy, g_img_menu_normal, g_img_menu_hard};
    const int rows[] = {200, 224, 248};
    return screens_test::ShowsBlock(g_frameImage, 90, rows[difficulty - 1],
                                    pictures[difficulty - 1], 0, 0, 120, 23, false);
}

class OptionsLineTest : public ::testing::TestWithParam<LineCase> {};

TEST_P(OptionsLineTest, TapSelectsTheLineUnderIt) {
    const LineCase c = GetParam();
    Route run;
    run.legs = {{SCREEN_TITLE, 1}, {SCREEN_OPTIONS, 5}};
    screens_test::Walk(run, [&](int leg, long k) {
        if (leg != 1) {
            return;
        }
        if (k == 1) {
            // Nothing chosen, so that any choice shows.
            g_region = 0;
            g_difficulty = 0;
            headless::Tap(c.x, c.y);
        } else if (k == 3) {
            EXPECT_EQ(g_region, c.region);
            EXPECT_EQ(g_difficulty, c.difficulty);
        } else if (k == 4) {
            // Composition comes before the stylus test: the highlight shows one pass later.
            if (c.region != 0) {
                EXPECT_TRUE(ShowsGround(c.region));
            }
            if (c.difficulty != 0) {
                EXPECT_TRUE(ShowsDifficulty(c.difficulty));
            }
            EXPECT_EQ(g_screen, SCREEN_OPTIONS);
            EXPECT_EQ(g_menuArmed, 0);
        }
    });
}

INSTANTIATE_TEST_SUITE_P(
    Bounds, OptionsLineTest,
    ::testing::Values(LineCase{120, 98, 1, 0}, LineCase{90, 92, 1, 0}, LineCase{149, 104, 1, 0},
                      LineCase{89, 98, 0, 0}, LineCase{150, 98, 0, 0}, LineCase{120, 91, 0, 0},
                      LineCase{120, 105, 0, 0}, LineCase{75, 122, 0, 0}, LineCase{76, 117, 2, 0},
                      LineCase{100, 122, 2, 0}, LineCase{169, 128, 2, 0}, LineCase{170, 122, 0, 0},
                      LineCase{100, 129, 0, 0}, LineCase{89, 142, 3, 0}, LineCase{155, 153, 3, 0},
                      LineCase{88, 147, 0, 0}, LineCase{120, 154, 0, 0}, LineCase{118, 206, 0, 1},
                      LineCase{160, 219, 0, 1}, LineCase{117, 210, 0, 0}, LineCase{140, 205, 0, 0},
                      LineCase{107, 231, 0, 2}, LineCase{174, 244, 0, 2}, LineCase{175, 240, 0, 0},
                      LineCase{140, 245, 0, 0}, LineCase{119, 253, 0, 3}, LineCase{162, 266, 0, 3},
                      LineCase{163, 260, 0, 0}, LineCase{140, 252, 0, 0}, LineCase{140, 267, 0, 0}),
    [](const ::testing::TestParamInfo<LineCase>& info) {
        return "x" + std::to_string(info.param.x) + "_y" + std::to_string(info.param.y);
    });

struct ButtonCase {
    int x, y;
    bool arms;
    BYTE leadsTo;
};

class OptionsButtonTest : public ::testing::TestWithParam<ButtonCase> {};

// A tap is a press (arms, shows the pressed picture) and a release at the same point.
TEST_P(OptionsButtonTest, TapOnAButtonArmsAndLeavesOnTheRelease) {
    const ButtonCase c = GetParam();
    Route run;
    run.legs = {{SCREEN_TITLE, 1}, {SCREEN_OPTIONS, 5}};
    screens_test::Walk(run, [&](int leg, long k) {
        if (leg != 1) {
            return;
        }
        if (k == 1) {
            headless::Tap(c.x, c.y);
        } else if (k == 3) {
            EXPECT_EQ(g_menuArmed, c.arms ? 1 : 0);
            EXPECT_EQ(g_screen, SCREEN_OPTIONS);
        } else if (k == 4) {
            EXPECT_EQ(g_screen, c.leadsTo);
            g_screen = 0xFF;
        }
    });
}

INSTANTIATE_TEST_SUITE_P(
    Bounds, OptionsButtonTest,
    ::testing::Values(
        ButtonCase{30, 280, true, SCREEN_TITLE}, ButtonCase{7, 273, true, SCREEN_TITLE},
        ButtonCase{54, 287, true, SCREEN_TITLE}, ButtonCase{6, 280, false, SCREEN_OPTIONS},
        ButtonCase{55, 280, false, SCREEN_OPTIONS}, ButtonCase{30, 272, false, SCREEN_OPTIONS},
        ButtonCase{30, 288, false, SCREEN_OPTIONS}, ButtonCase{220, 280, true, SCREEN_INTRO},
        ButtonCase{206, 273, true, SCREEN_INTRO}, ButtonCase{233, 287, true, SCREEN_INTRO},
        ButtonCase{205, 280, false, SCREEN_OPTIONS}, ButtonCase{234, 280, false, SCREEN_OPTIONS}),
    [](const ::testing::TestParamInfo<ButtonCase>& info) {
        return "x" + std::to_string(info.param.x) + "_y" + std::to_string(info.param.y);
    });

bool ScreenShowsBack() {
    return screens_test::ShowsBlock(g_frameImage, 0, 267, g_img_menu_back, 0, 0, 90, 23, false);
}

bool ScreenShowsGo() {
    return screens_test::ShowsBlock(g_frameImage, 180, 268, g_img_menu_go, 0, 0, 60, 23, false);
}

// Back pressed and held: its picture on exactly one presented frame; the release inside it
// runs LoadAssets again (one more start picture and cue, no loading screen) and the title
// reveals itself.
TEST(OptionsTest, BackShowsItsPictureOnceAndReturnsToTheTitle) {
    int framesWithBack = 0;
    Route run;
    run.legs = {{SCREEN_TITLE, 1}, {SCREEN_OPTIONS, 12}, {SCREEN_TITLE, 2}};
    screens_test::Walk(run, [&](int leg, long k) {
        if (leg == 1 && k == 1) {
            headless::PenDown(30, 280);
        } else if (leg == 1 && k >= 3 && k < 10) {
            EXPECT_TRUE(screens_test::ScreenShowsFrame());
            framesWithBack += ScreenShowsBack() ? 1 : 0;
            EXPECT_EQ(g_screen, SCREEN_OPTIONS) << "no release yet";
        } else if (leg == 1 && k == 10) {
            headless::PenUp(30, 280);  // dispatched after frame 11; frame 12 sees it
        } else if (leg == 1 && k == 11) {
            headless::Log().Clear();
        } else if (leg == 2 && k == 0) {
            EXPECT_EQ(screens_test::OpenedCount("\\image\\start.dc8"), 1);
            EXPECT_EQ(headless::Log().filesOpened.size(), 1u);
            EXPECT_EQ(screens_test::CueCount("\\start.mc8"), 1);
            EXPECT_EQ(headless::Log().cues.size(), 1u);
            EXPECT_EQ(headless::Log().presents, 1) << "only the leaving pass's reveal";
            EXPECT_EQ(screens_test::BlitCount(), 300u);
            EXPECT_EQ(g_menuLeaving, 1);
            EXPECT_EQ(g_menuArmed, 0);
            EXPECT_EQ(g_titleShown, 0);
            headless::Log().Clear();
        } else if (leg == 2 && k == 1) {
            EXPECT_EQ(screens_test::BlitCount(), 300u) << "the title reveals itself again";
        }
    });
    EXPECT_EQ(framesWithBack, 1);
}

// Pressing Back, sliding off and lifting leaves the menu armed; a later tap on Go performs
// Go without ever showing the pressed Go picture.
TEST(OptionsTest, ArmedByBackReleasedOnGoPerformsGo) {
    bool goShown = false;
    Route run;
    run.legs = {{SCREEN_TITLE, 1}, {SCREEN_OPTIONS, 14}};
    screens_test::Walk(run, [&](int leg, long k) {
        if (leg != 1) {
            return;
        }
        if (k == 1) {
            headless::PenDown(30, 280);
            headless::PenUp(30, 250);
        } else if (k == 6) {
            EXPECT_EQ(g_menuArmed, 1);
            EXPECT_EQ(g_screen, SCREEN_OPTIONS);
            headless::PenDown(220, 280);
        } else if (k > 6 && k < 10) {
            goShown = goShown || ScreenShowsGo();
            EXPECT_EQ(g_screen, SCREEN_OPTIONS) << "held on Go: no leaving until the release";
        } else if (k == 10) {
            headless::PenUp(220, 280);
        } else if (k == 12) {
            EXPECT_EQ(g_screen, SCREEN_INTRO);
            EXPECT_EQ(g_menuArmed, 0);
            g_screen = 0xFF;
        }
    });
    EXPECT_FALSE(goShown);
}

// The menu's choices only change its highlights: Go always leads to ground 2 on easy, and
// the reopened menu shows that.
TEST(OptionsTest, GoResetsTheChoiceToSouthAndEasy) {
    Route run;
    run.legs = {{SCREEN_TITLE, 1}, {SCREEN_OPTIONS, 10}, {SCREEN_INTRO, 1}, {SCREEN_OPTIONS, 2}};
    screens_test::Walk(run, [&](int leg, long k) {
        if (leg == 1 && k == 1) {
            headless::Tap(120, 147);  // Amazon
        } else if (leg == 1 && k == 5) {
            headless::Tap(140, 260);  // Hard
        } else if (leg == 1 && k == 9) {
            EXPECT_EQ(g_region, 3);
            EXPECT_EQ(g_difficulty, 3);
        } else if (leg == 2 && k == 0) {
            EXPECT_EQ(g_region, 2);
            EXPECT_EQ(g_difficulty, 1);
        } else if (leg == 3 && k == 2) {
            EXPECT_TRUE(ShowsGround(2));
            EXPECT_TRUE(ShowsDifficulty(1));
        }
    });
}

// Back keeps the choice: the menu opened again shows it.
TEST(OptionsTest, BackKeepsTheChoice) {
    Route run;
    run.legs = {{SCREEN_TITLE, 1}, {SCREEN_OPTIONS, 6}, {SCREEN_TITLE, 1}, {SCREEN_OPTIONS, 2}};
    screens_test::Walk(run, [&](int leg, long k) {
        if (leg == 1 && k == 1) {
            headless::Tap(120, 147);  // Amazon
        } else if (leg == 3 && k == 2) {
            EXPECT_EQ(g_region, 3);
            EXPECT_EQ(g_difficulty, 2);
            EXPECT_TRUE(ShowsGround(3));
            EXPECT_TRUE(ShowsDifficulty(2));
        }
    });
}

// First pass after EnterMenu and the leaving pass are reveals; every other pass one copy.
TEST(OptionsTest, RevealsOnEntryAndOnLeavingOnly) {
    std::vector<std::size_t> blits;
    Route run;
    run.legs = {{SCREEN_TITLE, 1}, {SCREEN_OPTIONS, 11}};
    screens_test::Walk(run, [&](int leg, long k) {
        if (leg != 1) {
            return;
        }
        if (k == 8) {
            headless::Tap(220, 280);  // pressed on frame 10, left on frame 11
        }
        if (k > 0) {
            blits.push_back(screens_test::BlitCount());
        }
        headless::Log().Clear();
        if (k == 11) {
            EXPECT_EQ(g_screen, SCREEN_INTRO);
            g_screen = 0xFF;
        }
    });
    const std::vector<std::size_t> expected = {300, 1, 1, 1, 1, 1, 1, 1, 1, 1, 300};
    EXPECT_EQ(blits, expected);
}

}  // namespace
