// Hooking during a strike, landing in the basket and escaping over the water.
#include <gtest/gtest.h>

#include <vector>

#include "game/catch.h"
#include "game/fish.h"
#include "game/hook.h"
#include "game/round_state.h"
#include "platform/window.h"
#include "round_driver.h"

using namespace round_test;

namespace {

// A strike from (100, 150) with the boat at 100 lifts the hook to (100, 120) without pull or
// drift: swimmers are tested around (120, 130), bottom fish around (110, 130). The fish are
// frozen so that their hit points stay where they were placed.
void AimStrike() {
    PlaceBoat(100, true);
    g_hookX = 100;
    g_hookY = 150;
    g_freezeCount = 50;
}

TEST(CatchTest, StrikeHooksFishWhoseHitPointIsStrictlyWithinHalfTheirSize) {
    int hookedBeforeStrike = -1;
    FishSlot hooked[HOOKED_SLOTS] = {};
    FishSlot swim[SWIM_SLOTS] = {};
    FishSlot bottom[BOTTOM_SLOTS] = {};
    int next = -1;
    auto place = [] {
        ClearAllFish();
        PlaceSwimmer(0, 2, 98, 147, 1);      // hit (120, 130): dead on
        PlaceSwimmer(1, 2, 120, 147, 1);     // hit x 142: 22 away, half its width
        PlaceSwimmer(2, 2, 98, 164, 1);      // hit y 147: 17 away, half its height
        PlaceSwimmer(3, 1, 98, 163, 1);      // hit y 146: inside
        PlaceSwimmer(15, 2, 98, 147, 1);     // escaped: cannot be hooked again
        PlaceBottomFish(0, 1, 96, 145, 1);   // hit (110, 130): bottom fish are tested at + 10
        PlaceBottomFish(1, 1, 110, 145, 1);  // hit x 124: 14 from 110, though 4 from 120
        PlaceBottomFish(3, 1, 96, 145, 1);   // escaped
    };
    RunRound({1, false, 4}, [&](long frame) {
        if (frame == 0) {
            PressKey(VK_RETURN);
            AimStrike();
            place();
        } else if (frame == 1) {
            // Frame 1 had no strike: nothing is hooked by merely touching.
            hookedBeforeStrike = 0;
            for (const FishSlot& f : g_hookedFish) {
                hookedBeforeStrike += f.active == 1;
            }
            AimStrike();
            place();
        } else if (frame == 2) {
            std::copy(std::begin(g_hookedFish), std::end(g_hookedFish), hooked);
            std::copy(std::begin(g_swimFish), std::end(g_swimFish), swim);
            std::copy(std::begin(g_bottomFish), std::end(g_bottomFish), bottom);
            next = g_hookedNext;
        }
    });
    EXPECT_EQ(hookedBeforeStrike, 0);
    // Swimmers first in slot order, then bottom fish.
    EXPECT_EQ(hooked[0].active, 1);
    EXPECT_EQ(hooked[0].kind, 2);
    EXPECT_EQ(hooked[0].width, 38);
    EXPECT_EQ(hooked[0].height, 36);
    EXPECT_EQ(hooked[1].active, 1);
    EXPECT_EQ(hooked[1].kind, 1);
    EXPECT_EQ(hooked[1].width, 28);
    EXPECT_EQ(hooked[1].height, 37);
    EXPECT_EQ(hooked[2].active, 1);
    EXPECT_EQ(hooked[2].kind, 7) << "bottom kind 1 hangs on the hook as kind 7";
    EXPECT_EQ(hooked[2].width, 22);
    EXPECT_EQ(hooked[2].height, 22);
    EXPECT_EQ(hooked[3].active, 0);
    EXPECT_EQ(next, 3);
    // Hooked fish hang 10 pixels up and left of the hook.
    EXPECT_EQ(hooked[0].x, 90);
    EXPECT_EQ(hooked[0].y, 110);

    EXPECT_EQ(swim[0].active, 0);
    EXPECT_EQ(swim[1].active, 1);
    EXPECT_EQ(swim[2].active, 1);
    EXPECT_EQ(swim[3].active, 0);
    EXPECT_EQ(swim[15].active, 1);
    EXPECT_EQ(bottom[0].active, 0);
    EXPECT_EQ(bottom[1].active, 1);
    EXPECT_EQ(bottom[3].active, 1);
}

TEST(CatchTest, EleventhFishCaughtInOneStrikeReplacesTheOldest) {
    FishSlot hooked[HOOKED_SLOTS] = {};
    int next = -1, swimLeft = -1;
    RunRound({1, false, 3}, [&](long frame) {
        if (frame == 0) {
            PressKey(VK_RETURN);
        } else if (frame == 1) {
            AimStrike();
            ClearAllFish();
            for (int i = 0; i < 10; ++i) {
                PlaceSwimmer(i, 0, 89, 147, 1);  // hit (120, 130)
            }
            PlaceSwimmer(10, 5, 101, 141, 1);  // the same hit point for the 38 x 23 kind
        } else if (frame == 2) {
            std::copy(std::begin(g_hookedFish), std::end(g_hookedFish), hooked);
            next = g_hookedNext;
            swimLeft = 0;
            for (const FishSlot& f : g_swimFish) {
                swimLeft += f.active == 1;
            }
        }
    });
    EXPECT_EQ(hooked[0].kind, 5);
    EXPECT_EQ(hooked[0].width, 29);
    EXPECT_EQ(hooked[0].height, 34);
    for (int i = 1; i < HOOKED_SLOTS; ++i) {
        EXPECT_EQ(hooked[i].active, 1) << "slot " << i;
        EXPECT_EQ(hooked[i].kind, 0) << "slot " << i;
    }
    EXPECT_EQ(next, 1);
    EXPECT_EQ(swimLeft, 0);
}

// The hook (120, 120) lies in the landing box of a basket at x 100 whatever the swell: the
// box is x 110..135 and y from basketY + 30 to basketY + 60, with basketY 73..81.
void AimAtBasket() {
    PlaceBoat(100, true);  // level with the basket on easy: it stays put
    g_basketX = 100;
    g_hookX = 120;
    g_hookY = 120;
    g_strikeCount = 0;
}

TEST(CatchTest, LandingKindsSevenAndFourTogether) {
    INT energy = 0, score = 0;
    int freeze = -1, ink = -1, cheer = -1, full = -1, hookedLeft = -1;
    std::vector<int> splash;
    int cues = -1;
    RunRound({1, false, 6}, [&](long frame) {
        if (frame == 0) {
            AimAtBasket();
            PlaceHooked(0, 7);
            PlaceHooked(1, 4);
            g_energy = 160;
        } else if (frame == 1) {
            energy = g_energy;
            score = g_score;
            freeze = g_freezeCount;
            ink = g_inkCount;
            cheer = g_cheerCount;
            full = g_basketFull;
            hookedLeft = 0;
            for (const FishSlot& f : g_hookedFish) {
                hookedLeft += f.active == 1;
            }
        }
        if (frame >= 1 && frame <= 4) {
            splash.push_back(g_splashCount);
        }
        if (frame == 4) {
            cues = CueCount("n_taken_succ.mc8");
        }
    });
    EXPECT_EQ(energy, 170) << "160 + 20 + 2, capped";
    EXPECT_EQ(score, 2200);
    EXPECT_EQ(freeze, 100) << "counted down from the next frame on";
    EXPECT_EQ(ink, 99) << "the landing frame already shows the dark water";
    EXPECT_EQ(cheer, 16);
    EXPECT_EQ(full, 1);
    EXPECT_EQ(hookedLeft, 0);
    EXPECT_EQ(splash, (std::vector<int>{2, 1, 0, 0})) << "one splash of three frames";
    EXPECT_EQ(cues, 1);
}

TEST(CatchTest, EachKindIsWorthItsEnergyScoreAndEffect) {
    struct Value {
        int kind;
        INT energy, score;
        int rush, ink, freeze;  // counters after the landing frame
    };
    const std::vector<Value> values = {
        {0, 5, 500, 0, 0, 0},   {1, 8, 800, 0, 0, 0},     {2, 2, 200, 100, 0, 0},
        {3, 3, 300, 0, 0, 0},   {4, 2, 200, 0, 99, 0},    {5, 15, 1500, 0, 0, 0},
        {6, 12, 1200, 0, 0, 0}, {7, 20, 2000, 0, 0, 100},
    };
    struct Got {
        INT energy, score;
        int rush, ink, freeze;
        bool drained;
    };
    std::vector<Got> got;
    INT scoreBefore = 0;
    RunRound({1, false, static_cast<long>(values.size()) + 2}, [&](long frame) {
        if (frame >= 2 && static_cast<size_t>(frame - 2) < values.size()) {
            got.push_back({g_energy, g_score - scoreBefore, g_basketRush, g_inkCount, g_freezeCount,
                           g_frameCount % 5 == 0});
        }
        if (frame >= 1 && static_cast<size_t>(frame - 1) < values.size()) {
            AimAtBasket();
            PlaceHooked(0, values[static_cast<size_t>(frame - 1)].kind);
            g_energy = 50;
            scoreBefore = g_score;
            g_basketRush = 0;
            g_inkCount = 0;
            g_freezeCount = 0;
        }
    });
    ASSERT_EQ(got.size(), values.size());
    for (size_t i = 0; i < values.size(); ++i) {
        const Value& v = values[i];
        SCOPED_TRACE(::testing::Message() << "kind " << v.kind);
        EXPECT_EQ(got[i].energy, 50 - (got[i].drained ? 1 : 0) + v.energy);
        EXPECT_EQ(got[i].score, v.score);
        EXPECT_EQ(got[i].rush, v.rush) << "easy leaves the rush alone";
        EXPECT_EQ(got[i].ink, v.ink);
        EXPECT_EQ(got[i].freeze, v.freeze);
    }
}

// The hook at (300, 140) with the boat at 100 drifts to (293, 140): in the strip just above
// the water, far from the basket.
void AimAtTheEscapeStrip() {
    PlaceBoat(100, true);
    g_basketX = 100;
    g_hookX = 300;
    g_hookY = 140;
    g_strikeCount = 0;
}

TEST(CatchTest, EscapeWithFullEscapeSlotsLosesTheSwimmerButStillSplashes) {
    FishSlot swim[SWIM_SLOTS] = {};
    FishSlot bottom[BOTTOM_SLOTS] = {};
    INT hookX = 0;
    std::vector<int> splash;
    int fails = -1, hookedLeft = -1;
    RunRound({1, false, 7}, [&](long frame) {
        if (frame == 0) {
            AimAtTheEscapeStrip();
            for (int i = 15; i < 20; ++i) {
                PlaceSwimmer(i, 0, 200, 180, 1);
            }
            PlaceHooked(0, 3);
            PlaceHooked(1, 6);
        } else if (frame == 1) {
            std::copy(std::begin(g_swimFish), std::end(g_swimFish), swim);
            std::copy(std::begin(g_bottomFish), std::end(g_bottomFish), bottom);
            hookX = g_hookX;
            hookedLeft = 0;
            for (const FishSlot& f : g_hookedFish) {
                hookedLeft += f.active == 1;
            }
        }
        if (frame >= 1 && frame <= 5) {
            splash.push_back(g_splashCount);
        }
        if (frame == 5) {
            fails = CueCount("n_taken_fail.mc8");
        }
    });
    ASSERT_EQ(hookX, 293);
    EXPECT_EQ(hookedLeft, 0);
    for (int i = 15; i < 20; ++i) {
        EXPECT_EQ(swim[i].active, 1);
        EXPECT_EQ(swim[i].kind, 0) << "slot " << i << " keeps its fish";
    }
    // The bottom fish goes back to the first escape slot of its table as bottom kind 0.
    EXPECT_EQ(bottom[3].active, 1);
    EXPECT_EQ(bottom[3].kind, 0);
    EXPECT_EQ(bottom[3].direction, 0) << "odd slot: heading left";
    EXPECT_EQ(bottom[3].x, 303);
    EXPECT_EQ(bottom[3].y, 120);
    EXPECT_EQ(bottom[3].width, 71);
    EXPECT_EQ(bottom[3].height, 41);
    EXPECT_EQ(bottom[3].frameX, 0);
    EXPECT_EQ(bottom[4].active, 0);
    // Three frames at the hook, then one empty frame.
    EXPECT_EQ(splash, (std::vector<int>{6, 5, 4, 0, 0}));
    EXPECT_EQ(fails, 1);
}

TEST(CatchTest, EscapedSwimmerTakesTheFirstFreeSlotAndHeadsByItsParity) {
    FishSlot slot16{};
    int splashAfter = -1;
    RunRound({1, false, 3}, [&](long frame) {
        if (frame == 0) {
            AimAtTheEscapeStrip();
            PlaceSwimmer(15, 0, 200, 180, 1);
            PlaceHooked(4, 3);
        } else if (frame == 1) {
            slot16 = g_swimFish[16];
            splashAfter = g_splashCount;
        }
    });
    EXPECT_EQ(slot16.active, 1);
    EXPECT_EQ(slot16.kind, 3);
    EXPECT_EQ(slot16.direction, 1) << "even slot: heading right";
    EXPECT_EQ(slot16.width, 64);
    EXPECT_EQ(slot16.height, 36);
    EXPECT_EQ(slot16.x, 303);
    EXPECT_EQ(slot16.y, 120);
    EXPECT_EQ(splashAfter, 6);
}

}  // namespace
