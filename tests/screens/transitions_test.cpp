// Entering a round from the intro page's Start with each ground and difficulty, and entering
// the menu again after Back: the picture loaded, the cue, and the state prepared.
#include <gtest/gtest.h>

#include <string>

#include "app/input.h"
#include "app/shell.h"
#include "game/round_state.h"
#include "platform/headless/headless.h"
#include "platform/window.h"
#include "screen_driver.h"
#include "screens/options.h"

namespace {

using screens_test::Route;

struct RoundCase {
    BYTE region, difficulty;
    const char* picture;
    const char* cue;
};

class EnterFishingTest : public ::testing::TestWithParam<RoundCase> {};

// The intro page starts the round with g_region and g_difficulty; the menu's Go always makes
// them (2, 1), so the other pairs are set while the page shows, as a fuller menu would.
TEST_P(EnterFishingTest, StartPreparesTheRoundForGroundAndDifficulty) {
    const RoundCase c = GetParam();
    Route run;
    run.legs = {{SCREEN_INTRO, 6}, {SCREEN_FISHING, 0}};
    screens_test::Walk(run, [&](int leg, long k) {
        if (leg == 0 && k == 1) {
            g_region = c.region;
            g_difficulty = c.difficulty;
            g_score = 1234;
            g_scoreShown = 1200;
            g_roundShown = 1;
            // Keys pressed before the round must not reach it.
            headless::KeyDown(VK_UP);
            headless::KeyDown(VK_LEFT);
            headless::KeyDown(VK_RETURN);
        } else if (leg == 0 && k == 6) {
            EXPECT_EQ(g_keyUp, 1);
            EXPECT_EQ(g_keyEnter, 1);
            headless::Log().Clear();
        } else if (leg == 1 && k == 0) {
            EXPECT_EQ(screens_test::OpenedCount(std::string("\\image\\") + c.picture), 1);
            EXPECT_EQ(headless::Log().filesOpened.size(), 1u);
            EXPECT_EQ(screens_test::CueCount(c.cue), 1);
            EXPECT_EQ(headless::Log().cues.size(), 1u);
            EXPECT_EQ(g_regionIndex, c.region - 1);
            EXPECT_EQ(g_difficultyIndex, c.difficulty - 1);
            EXPECT_EQ(g_difficultyLevel, c.difficulty);
            EXPECT_EQ(g_score, 0);
            EXPECT_EQ(g_scoreShown, 0);
            EXPECT_EQ(g_roundShown, 0);
            EXPECT_EQ(g_keyUp + g_keyDown + g_keyLeft + g_keyRight + g_keyEnter, 0);
            g_screen = 0xFF;  // only the South ground has round art
        }
    });
}

INSTANTIATE_TEST_SUITE_P(Grounds, EnterFishingTest,
                         ::testing::Values(RoundCase{2, 1, "n_set_scr.dc8", "\\n_taken_succ.mc8"},
                                           RoundCase{1, 3, "p_set_scr.dc8", "\\p_taken_succ.mc8"},
                                           RoundCase{3, 2, "j_set_scr.dc8", "\\j_taken_succ.mc8"},
                                           RoundCase{1, 1, "p_set_scr.dc8", "\\n_taken_succ.mc8"}),
                         [](const ::testing::TestParamInfo<RoundCase>& info) {
                             return "ground" + std::to_string(info.param.region) + "_difficulty" +
                                    std::to_string(info.param.difficulty);
                         });

// The menu left by Back is entered afresh: its picture and cue, and its flags cleared, so
// its first pass is a reveal again.
TEST(EnterMenuTest, MenuEnteredAgainStartsFresh) {
    Route run;
    run.legs = {{SCREEN_TITLE, 1}, {SCREEN_OPTIONS, 1}, {SCREEN_TITLE, 1}, {SCREEN_OPTIONS, 1}};
    screens_test::Walk(run, [&](int leg, long k) {
        if (leg == 2 && k == 0) {
            EXPECT_EQ(g_menuLeaving, 1);
        } else if (leg == 2 && k == 1) {
            headless::Log().Clear();
        } else if (leg == 3 && k == 0) {
            EXPECT_EQ(g_menuLeaving, 0);
            EXPECT_EQ(g_menuShown, 0);
            EXPECT_EQ(screens_test::OpenedCount("\\image\\menu.dc8"), 1);
            EXPECT_EQ(screens_test::CueCount("\\menu.mc8"), 1);
            headless::Log().Clear();
        } else if (leg == 3 && k == 1) {
            EXPECT_EQ(screens_test::BlitCount(), 300u);
        }
    });
}

}  // namespace
