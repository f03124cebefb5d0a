// Working the hook: the strike, reeling up and down, the drift towards the fisherman, and the
// clock letting the hook float back to its resting depth.
#include <gtest/gtest.h>

#include <vector>

#include "game/game_tick.h"
#include "game/hook.h"
#include "game/round_state.h"
#include "platform/window.h"
#include "round_driver.h"

using namespace round_test;

namespace {

TEST(HookTest, StrikeLiftsThirtyAFrameAndEndsAboveFortyFive) {
    std::vector<INT> heights;
    std::vector<int> counts;
    int strikeCues = 0;
    RunRound({1, false, 10}, [&](long frame) {
        if (frame == 0) {
            PressKey(VK_RETURN);
        } else if (frame == 1) {
            PlaceBoat(0, true);
            g_hookX = 40;
            g_hookY = 200;
        } else if (frame >= 2 && frame <= 8) {
            heights.push_back(g_hookY);
            counts.push_back(g_strikeCount);
        }
        if (frame == 8) {
            strikeCues = CueCount("\\taken_fish.mc8");
        }
    });
    EXPECT_EQ(heights, (std::vector<INT>{170, 140, 110, 80, 50, 20, 20}));
    // At y 20 the count, then 4, is cleared.
    EXPECT_EQ(counts, (std::vector<int>{9, 8, 7, 6, 5, 0, 0}));
    EXPECT_EQ(strikeCues, 1);
}

TEST(HookTest, StrikePullsTowardsTheFishermanOnlyWhenHeIsTenOrMoreRightOrAnyLeft) {
    struct PullCase {
        INT fisherman, expectX;
    };
    const std::vector<PullCase> cases = {
        {110, 110}, {109, 100}, {100, 100}, {99, 90}, {0, 90},
    };
    std::vector<INT> got;
    std::vector<INT> ys;
    // Each case: press after frame 3k, set the hook after frame 3k + 1, strike in 3k + 2.
    RunRound({1, false, static_cast<long>(cases.size()) * 3 + 2}, [&](long frame) {
        const size_t k = static_cast<size_t>(frame / 3);
        if (k >= cases.size()) {
            return;
        }
        if (frame % 3 == 0) {
            PressKey(VK_RETURN);
        } else if (frame % 3 == 1) {
            PlaceBoat(cases[k].fisherman, true);
            g_hookX = 100;
            g_hookY = 120;  // lifted to 90: out of the water, so no drift
            g_strikeCount = 0;
        } else {
            got.push_back(g_hookX);
            ys.push_back(g_hookY);
        }
    });
    ASSERT_EQ(got.size(), cases.size());
    for (size_t i = 0; i < cases.size(); ++i) {
        EXPECT_EQ(got[i], cases[i].expectX) << "fisherman at " << cases[i].fisherman;
        EXPECT_EQ(ys[i], 90);
    }
}

TEST(HookTest, UpKeyRaisesOnlyUnderWaterSoTheHookHoversAtTheSurface) {
    std::vector<INT> heights;
    RunRound({1, false, 8}, [&](long frame) {
        if (frame == 0) {
            PressKey(VK_UP);
        } else if (frame == 1) {
            g_hookY = 150;
        } else if (frame >= 2 && frame <= 6) {
            heights.push_back(g_hookY);
        }
    });
    EXPECT_EQ(heights, (std::vector<INT>{153, 146, 149, 152, 145}));
}

TEST(HookTest, DownKeySinksFastInTheAirSlowerBelowAndStopsAtTwoFortyThree) {
    std::vector<INT> heights;
    RunRound({1, false, 12}, [&](long frame) {
        if (frame == 0) {
            PressKey(VK_DOWN);
        } else if (frame == 1) {
            g_hookY = 238;
        } else if (frame == 2 || frame == 3 || frame == 4) {
            heights.push_back(g_hookY);
        }
        if (frame == 4) {
            g_hookY = 119;
        } else if (frame == 5) {
            heights.push_back(g_hookY);
            g_hookY = 100;
        } else if (frame == 6) {
            heights.push_back(g_hookY);
        }
    });
    EXPECT_EQ(heights, (std::vector<INT>{243, 243, 243, 126, 107}));
}

struct DriftCase {
    const char* name;
    INT fisherman;
    bool facingRight;
    INT hookX, hookY;
    std::vector<INT> expectX;  // after each frame
};

void PrintTo(const DriftCase& c, std::ostream* os) {
    *os << c.name;
}

class DriftTest : public ::testing::TestWithParam<DriftCase> {};

TEST_P(DriftTest, HookFollowsTheFishermanUnderWater) {
    const DriftCase c = GetParam();
    std::vector<INT> xs;
    RunRound({1, false, static_cast<long>(c.expectX.size()) + 2}, [&](long frame) {
        if (frame == 0) {
            PlaceBoat(c.fisherman, c.facingRight);
            g_hookX = c.hookX;
            g_hookY = c.hookY;
        } else if (static_cast<size_t>(frame) <= c.expectX.size()) {
            xs.push_back(g_hookX);
        }
    });
    EXPECT_EQ(xs, c.expectX);
}

INSTANTIATE_TEST_SUITE_P(
    Cases, DriftTest,
    ::testing::Values(
        // Six a frame when deep, then a jump to 39 right of him once less than 6 is left.
        DriftCase{"DeepFacingRight", 100, true, 100, 200, {106, 112, 118, 124, 130, 136, 139, 139}},
        // Facing left it settles 9 left of him.
        DriftCase{"DeepFacingLeft", 100, false, 100, 200, {94, 91, 91}},
        // Shallower water drifts slower; far behind the boat it catches up by 5 more.
        DriftCase{"ShallowOnePixel", 100, true, 100, 135, {101, 102, 103}},
        DriftCase{"TwoPixels", 100, true, 100, 150, {102, 104}},
        DriftCase{"FourPixels", 100, true, 100, 170, {104, 108}},
        DriftCase{"CatchUpRight", 200, true, 100, 135, {106, 112}},
        DriftCase{"CatchUpLeft", 100, false, 200, 135, {194, 188}},
        // Facing right but already past the resting place: it drifts back left, then jumps
        // to 39 right of him once it is less than 6 short.
        DriftCase{"FacingRightFromBeyond", 0, true, 50, 200, {44, 38, 39, 39}},
        // At y 130 it is not under water yet.
        DriftCase{"NotUnderWater", 100, true, 100, 130, {100, 100}}),
    [](const ::testing::TestParamInfo<DriftCase>& info) { return info.param.name; });

TEST(HookTest, ClockFloatsTheHookByDepth) {
    struct FloatCase {
        INT y, expect;
    };
    const std::vector<FloatCase> cases = {
        {-1, -1},   {0, 18},    {54, 72},   {55, 77},   {84, 106},  {85, 110},
        {119, 144}, {120, 124}, {199, 203}, {200, 196}, {419, 415}, {420, 420},
    };
    std::vector<INT> got;
    RunRound({1, false, static_cast<long>(cases.size()) + 2}, [&](long frame) {
        if (frame >= 2 && static_cast<size_t>(frame - 2) < cases.size()) {
            got.push_back(g_hookY);
        }
        if (frame >= 1 && static_cast<size_t>(frame - 1) < cases.size()) {
            g_hookY = cases[static_cast<size_t>(frame - 1)].y;
            g_hookX = 40;
            Tick();  // dispatched after the next frame, which leaves y alone without keys
        }
    });
    ASSERT_EQ(got.size(), cases.size());
    for (size_t i = 0; i < cases.size(); ++i) {
        EXPECT_EQ(got[i], cases[i].expect) << "from y " << cases[i].y;
    }
}

}  // namespace
