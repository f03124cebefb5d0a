// The title screen through real stylus messages: its three areas at and just past their
// bounds, the exit pause, the flag and the first-present rule.
#include <gtest/gtest.h>

#include <string>

#include "app/input.h"
#include "app/shell.h"
#include "assets/catalogue.h"
#include "platform/headless/headless.h"
#include "platform/window.h"
#include "screen_driver.h"
#include "screens/title.h"

namespace {

using screens_test::Route;

struct AreaCase {
    int x, y;
    BYTE screen;      // where the tap leads
    const char* cue;  // the cue it plays, or null
};

class TitleAreaTest : public ::testing::TestWithParam<AreaCase> {};

TEST_P(TitleAreaTest, TapLeadsWhereTheAreaSays) {
    const AreaCase c = GetParam();
    std::size_t blitsBefore = 0;
    Route run;
    run.legs = {{SCREEN_TITLE, 6}};
    screens_test::Walk(run, [&](int, long k) {
        if (k == 2) {
            headless::Log().Clear();
            headless::Tap(c.x, c.y);
        } else if (k == 3) {
            blitsBefore = screens_test::BlitCount();
        } else if (k == 4) {
            // Frame 4 is the one that saw the stylus down.
            EXPECT_EQ(g_screen, c.screen);
            if (c.cue != nullptr) {
                EXPECT_EQ(screens_test::CueCount(c.cue), 1);
                EXPECT_EQ(headless::Log().cues.size(), 1u);
                EXPECT_EQ(screens_test::BlitCount(), blitsBefore) << "a leaving pass draws nothing";
            } else {
                EXPECT_TRUE(headless::Log().cues.empty());
                EXPECT_EQ(screens_test::BlitCount(), blitsBefore + 1);
            }
            g_screen = 0xFF;  // no screen from here: what follows is other screens' business
        }
    });
}

INSTANTIATE_TEST_SUITE_P(
    Bounds, TitleAreaTest,
    ::testing::Values(
        AreaCase{10, 225, SCREEN_FISHING, "\\n_taken_succ.mc8"},
        AreaCase{32, 220, SCREEN_FISHING, "\\n_taken_succ.mc8"},
        AreaCase{0, 231, SCREEN_FISHING, "\\n_taken_succ.mc8"},
        AreaCase{33, 225, SCREEN_TITLE, nullptr}, AreaCase{10, 219, SCREEN_TITLE, nullptr},
        AreaCase{10, 232, SCREEN_TITLE, nullptr}, AreaCase{10, 265, SCREEN_OPTIONS, "\\menu.mc8"},
        AreaCase{45, 265, SCREEN_OPTIONS, "\\menu.mc8"},
        AreaCase{49, 273, SCREEN_OPTIONS, "\\menu.mc8"}, AreaCase{50, 265, SCREEN_TITLE, nullptr},
        AreaCase{10, 261, SCREEN_TITLE, nullptr}, AreaCase{10, 274, SCREEN_TITLE, nullptr},
        AreaCase{41, 245, SCREEN_TITLE, nullptr}, AreaCase{10, 240, SCREEN_TITLE, nullptr},
        AreaCase{10, 254, SCREEN_TITLE, nullptr}),
    [](const ::testing::TestParamInfo<AreaCase>& info) {
        return "x" + std::to_string(info.param.x) + "_y" + std::to_string(info.param.y);
    });

// The exit area plays its cue, holds the program for 1500 ms and ends it. Messages queued
// ahead of the quit keep the loop going a few passes with the stylus still held there: the
// cue does not play again.
TEST(TitleTest, ExitPlaysItsCueOncePausesAndQuits) {
    DWORD before = 0;
    long lastPass = 0;
    Route run;
    run.legs = {{SCREEN_TITLE, 100}};
    test::RunResult result = screens_test::Walk(run, [&](int, long k) {
        lastPass = k;
        if (k == 2) {
            headless::Log().Clear();
            headless::PenDown(10, 245);  // and never lifted
            for (int i = 0; i < 3; ++i) {
                headless::Timer(TICK_TIMER_ID);
            }
            before = headless::Now();
        }
    });
    EXPECT_EQ(result.exitCode, 0);
    EXPECT_FALSE(result.exitedThroughExitProcess);
    EXPECT_EQ(lastPass, 6) << "the quit message, queued behind three ticks, ends the loop";
    EXPECT_EQ(g_exitRequested, 1);
    EXPECT_GE(headless::Now() - before, 1500u);
    EXPECT_LT(headless::Now() - before, 1800u);
    EXPECT_EQ(screens_test::CueCount("\\exit.mc8"), 1);
    EXPECT_EQ(headless::Log().cues.size(), 1u);
}

TEST(TitleTest, StylusUpOverAnAreaDoesNothing) {
    Route run;
    run.legs = {{SCREEN_TITLE, 8}};
    screens_test::Walk(run, [&](int, long k) {
        if (k == 1) {
            headless::PenUp(10, 225);
            headless::PenUp(10, 245);
            headless::PenUp(10, 265);
        }
        if (k == 8) {
            EXPECT_EQ(g_screen, SCREEN_TITLE);
            EXPECT_EQ(g_exitRequested, 0);
        }
    });
}

// First frame after LoadAssets: the reveal's 300 strips of one row; then one copy per frame.
TEST(TitleTest, FirstFrameRevealsThenWholeFrames) {
    Route run;
    run.legs = {{SCREEN_TITLE, 4}};
    screens_test::Walk(run, [&](int, long k) {
        if (k == 0) {
            headless::Log().Clear();
        } else if (k == 1) {
            const auto& blits = headless::Log().windowBlits;
            ASSERT_EQ(blits.size(), 300u);
            EXPECT_EQ(blits[0].y, 0);
            EXPECT_EQ(blits[1].y, 15);
            EXPECT_EQ(blits[0].height, 1);
            EXPECT_EQ(g_titleShown, 1);
            headless::Log().Clear();
        } else {
            EXPECT_EQ(screens_test::BlitCount(), 1u);
            EXPECT_TRUE(screens_test::AllBlitsWholeFrames());
            EXPECT_TRUE(screens_test::ScreenShowsFrame());
            headless::Log().Clear();
        }
    });
}

// Which of the three flag frames the presented picture shows.
int ShownFlagFrame() {
    for (int frame = 0; frame < 3; ++frame) {
        if (screens_test::ShowsBlock(g_frameImage, 109, 16, g_img_start_flag, 44 * frame, 0, 44, 31,
                                     true)) {
            return frame;
        }
    }
    return -1;
}

// Three passes a frame; the counter's 201 values make frame 0 last six passes at the wrap.
TEST(TitleTest, FlagFramesFollowTheCounter) {
    struct Step {
        BYTE counterBefore;
        int frame;
        BYTE counterAfter;
    };
    const Step steps[] = {{0, 0, 1}, {2, 0, 3},  {3, 1, 4},     {5, 1, 6},     {6, 2, 7},
                          {8, 2, 9}, {9, 0, 10}, {197, 2, 198}, {198, 0, 199}, {200, 0, 0}};
    std::size_t i = 0;
    Route run;
    run.legs = {{SCREEN_TITLE, 2 + static_cast<long>(std::size(steps))}};
    screens_test::Walk(run, [&](int, long k) {
        if (k >= 2 && i < std::size(steps)) {
            if (k > 2) {
                EXPECT_EQ(ShownFlagFrame(), steps[i].frame)
                    << "counter " << +steps[i].counterBefore;
                EXPECT_EQ(g_flagFrame, steps[i].counterAfter);
                ++i;
            }
            if (i < std::size(steps)) {
                g_flagFrame = steps[i].counterBefore;
            }
        }
    });
    EXPECT_EQ(i, std::size(steps));
}

}  // namespace
