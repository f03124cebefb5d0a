// The score in the status bar, read back from the frame's pixels, and the road of one catch
// from the action key to the basket.
#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "game/catch.h"
#include "game/fish.h"
#include "game/hook.h"
#include "game/round_state.h"
#include "platform/window.h"
#include "round_driver.h"

using namespace round_test;

namespace {

TEST(ScoreTest, RoundStartsWithASingleZeroAtTheUnitsPlace) {
    std::vector<std::string> shown;
    std::vector<bool> presented;
    RunRound({1, false, 4}, [&](long frame) {
        if (frame >= 1 && frame <= 3) {
            shown.push_back(ShownScore());
            presented.push_back(ScreenShowsFrame());
        }
    });
    EXPECT_EQ(shown, (std::vector<std::string>{"0", "0", "0"}));
    // The window shows the finished frame, status bar included, revealed or copied.
    EXPECT_EQ(presented, (std::vector<bool>{true, true, true}));
}

// Strike through a frozen kind-1 fish, let the clock drop the hook into the basket and watch
// the shown score count up by 50 a frame from the landing frame on.
TEST(ScoreTest, FirstCatchWorthEightHundredCountsUpOverSixteenFrames) {
    std::vector<std::string> shown;
    long landingFrame = -1;
    INT scoreAtLanding = 0;
    RunRound({1, false, 60}, [&](long frame) {
        if (frame == 0) {
            PressKey(VK_RETURN);
        } else if (frame == 1) {
            PlaceBoat(100, true);
            g_basketX = 80;  // level enough with the boat to stay put on easy
            g_hookX = 100;
            g_hookY = 200;
            g_freezeCount = 3;
            // The strike takes the hook to (104, 170): the hook point is (124, 180).
            PlaceSwimmer(0, 1, 102, 197, 1);
        }
        if (frame >= 2 && g_strikeCount == 0 && g_hookY < 150 && landingFrame < 0) {
            Tick();  // let the clock drop the thrown hook
        }
        if (landingFrame < 0 && g_score != 0) {
            landingFrame = frame;
            scoreAtLanding = g_score;
        }
        if (landingFrame >= 0 && frame - landingFrame < 18) {
            shown.push_back(ShownScore());
        }
    });
    ASSERT_GE(landingFrame, 0) << "the fish never reached the basket";
    EXPECT_EQ(scoreAtLanding, 800);
    std::vector<std::string> expected;
    for (int v = 50; v <= 800; v += 50) {
        expected.push_back(std::to_string(v));
    }
    expected.push_back("800");
    expected.push_back("800");
    EXPECT_EQ(shown, expected);
    EXPECT_EQ(g_basketFull, 1);
}

TEST(ScoreTest, LastStepOfTheCountUpDrawsFourDigitsThenStops) {
    std::vector<std::string> shown;
    std::vector<INT> values;
    RunRound({1, false, 5}, [&](long frame) {
        if (frame == 1) {
            g_score = 1200;
            g_scoreShown = 1150;
        } else if (frame >= 2 && frame <= 4) {
            shown.push_back(ShownScore());
            values.push_back(g_scoreShown);
        }
    });
    // ShownScore reads places x 155..225 and rejects gaps, so "1150" means x 195..225.
    EXPECT_EQ(shown, (std::vector<std::string>{"1150", "1200", "1200"}));
    EXPECT_EQ(values, (std::vector<INT>{1200, 1200, 1200}));
}

TEST(ScoreTest, ScoreIsHeldAtTheLargestValueTheEightDigitsShow) {
    INT score = 0;
    std::vector<std::string> shown;
    RunRound({1, false, 6}, [&](long frame) {
        if (frame == 0) {
            PlaceBoat(100, true);
            g_basketX = 100;
            g_hookX = 120;
            g_hookY = 120;
            g_score = 99998000;
            g_scoreShown = 99999850;
            PlaceHooked(0, 5);  // +1500
            PlaceHooked(1, 7);  // +2000
        } else if (frame == 1) {
            score = g_score;
        }
        if (frame >= 1 && frame <= 3) {
            shown.push_back(ShownScore());
        }
    });
    EXPECT_EQ(score, SCORE_LIMIT);
    EXPECT_EQ(shown, (std::vector<std::string>{"99999850", "99999900", "99999900"}));
}

}  // namespace
