// Fish movement: the shared motion cursor, leaving the water, the depth bands of the school,
// the bottom and the escaped ranges, animation frames and the freeze.
#include <gtest/gtest.h>

#include <vector>

#include "game/fish.h"
#include "game/round_state.h"
#include "round_driver.h"

using namespace round_test;

namespace {

TEST(FishTest, FishLeavingTheWaterIsFreedAndTheNextFishTakesTheSamePair) {
    FishSlot leaving{}, next{};
    int cursor = -1;
    RunRound({1, false, 3}, [&](long frame) {
        if (frame == 0) {
            PlaceSwimmer(0, 0, 418, 170, 1);  // pair 0 is (4, -3): steps to 421
            PlaceSwimmer(1, 1, 300, 170, 0);
            g_motionIndex = 0;
        } else if (frame == 1) {
            leaving = g_swimFish[0];
            next = g_swimFish[1];
            cursor = g_motionIndex;
        }
    });
    EXPECT_EQ(leaving.active, 0);
    EXPECT_EQ(next.x, 297) << "the second fish moves with pair 0 too";
    EXPECT_EQ(next.y, 167);
    EXPECT_EQ(cursor, 1) << "a freed fish does not advance the cursor";
}

TEST(FishTest, EachTableKeepsItsDepthBandAndSpeed) {
    FishSlot escapedBottom{}, school{}, escapedSwimmer{}, diving{}, bottomFloor{};
    int cursor = -1;
    RunRound({1, false, 3}, [&](long frame) {
        if (frame == 0) {
            // Bottom fish move first, then swimmers; the cursor hands out 4 to 8 in turn.
            g_motionIndex = 4;
            PlaceBottomFish(2, 0, 200, 250, 0);  // (3, -5): back one pixel, y 245
            PlaceBottomFish(3, 1, 100, 100, 1);  // (7, -6): escaped, +6 and sinks by dy + 7
            PlaceSwimmer(0, 2, 100, 150, 1);     // (6, 4)
            PlaceSwimmer(15, 3, 300, 230, 0);    // (5, -5): escaped, 4 more and dives
            PlaceSwimmer(16, 4, 300, 120, 1);    // (4, -6): dives by 6 all the same
        } else if (frame == 1) {
            bottomFloor = g_bottomFish[2];
            escapedBottom = g_bottomFish[3];
            school = g_swimFish[0];
            escapedSwimmer = g_swimFish[15];
            diving = g_swimFish[16];
            cursor = g_motionIndex;
        }
    });
    EXPECT_EQ(bottomFloor.x, 201) << "dx 3 - 4 heading left moves it right by one";
    EXPECT_EQ(bottomFloor.y, 245);
    EXPECT_EQ(escapedBottom.x, 106);  // 7 - 4 + 3
    EXPECT_EQ(escapedBottom.y, 101);  // 100 - 6, below 220 so +7
    EXPECT_EQ(school.x, 105);         // (6, 4): 6 - 1
    EXPECT_EQ(school.y, 154);
    EXPECT_EQ(escapedSwimmer.x, 292);  // 5 - 1 + 4 to the left
    EXPECT_EQ(escapedSwimmer.y, 190);  // 230 + 5, clamped
    EXPECT_EQ(diving.x, 307);
    EXPECT_EQ(diving.y, 126) << "escaped swimmers only go down";
    EXPECT_EQ(cursor, 9);
}

TEST(FishTest, EscapedBottomFishSinksBackAndThenStaysOnTheBottom) {
    std::vector<INT> ys;
    RunRound({1, false, 40}, [&](long frame) {
        if (frame == 0) {
            PlaceBottomFish(4, 0, 10, 100, 1);
        } else if (g_bottomFish[4].active == 1) {
            ys.push_back(g_bottomFish[4].y);
        }
    });
    ASSERT_GE(ys.size(), 20u);
    INT previous = 100;
    bool reached = false;
    for (size_t i = 0; i < ys.size(); ++i) {
        if (!reached) {
            EXPECT_GE(ys[i] - previous, 1) << "frame " << i + 1;
            EXPECT_LE(ys[i] - previous, 13) << "frame " << i + 1;
        } else {
            EXPECT_GE(ys[i], 220) << "frame " << i + 1;
            EXPECT_LE(ys[i], 250) << "frame " << i + 1;
        }
        reached = reached || ys[i] >= 220;
        previous = ys[i];
    }
    EXPECT_TRUE(reached);
}

TEST(FishTest, FrozenFishStayPutButKeepTheirHitPointsCurrent) {
    FishSlot frozen{}, thawed{};
    int freezeAfterFirst = -1, cursorFrozen = -1;
    RunRound({1, false, 4}, [&](long frame) {
        if (frame == 0) {
            PlaceSwimmer(0, 0, 100, 170, 1);
            g_swimFish[0].hitX = -999;
            g_swimFish[0].hitY = -999;
            g_motionIndex = 0;
            g_freezeCount = 1;
            g_frameTick = 0;
        } else if (frame == 1) {
            frozen = g_swimFish[0];
            freezeAfterFirst = g_freezeCount;
            cursorFrozen = g_motionIndex;
        } else if (frame == 2) {
            thawed = g_swimFish[0];
        }
    });
    EXPECT_EQ(frozen.x, 100);
    EXPECT_EQ(frozen.y, 170);
    EXPECT_EQ(frozen.frameX, 0) << "no frame change while frozen";
    EXPECT_EQ(frozen.hitX, 100 + 63 / 2);
    EXPECT_EQ(frozen.hitY, 170 - 35 / 2) << "half a height above the top edge";
    EXPECT_EQ(freezeAfterFirst, 0);
    EXPECT_EQ(cursorFrozen, 0);
    EXPECT_EQ(thawed.x, 103) << "moves again with pair 0";
    EXPECT_EQ(thawed.y, 167);
}

}  // namespace
