// The game clock's spawning: which tick fills which slot with which kind, where the fish
// start, the cue on slots 0, 5 and 10, the counter's wrap and the freeze. The clock runs on
// every screen, so these run on the title screen with timer messages posted one at a time.
#include <gtest/gtest.h>

#include <vector>

#include "game/fish.h"
#include "game/game_tick.h"
#include "game/hook.h"
#include "game/round_state.h"
#include "platform/headless/headless.h"
#include "round_driver.h"

using namespace round_test;

namespace {

struct Spawn {
    int tick;
    bool bottom;
    int slot, kind;
    INT x, y, direction, width, height;
    bool cue;
};

struct Snapshot {
    INT swim[SWIM_SLOTS];
    INT bottom[BOTTOM_SLOTS];
};

Snapshot Take() {
    Snapshot s{};
    for (int i = 0; i < SWIM_SLOTS; ++i) {
        s.swim[i] = g_swimFish[i].active;
    }
    for (int i = 0; i < BOTTOM_SLOTS; ++i) {
        s.bottom[i] = g_bottomFish[i].active;
    }
    return s;
}

// Runs the clock tick by tick on the title screen; step(n) is called after tick n (0: before
// the first) and may change the state before the next tick.
void RunTicks(long ticks, const std::function<void(long tick)>& step) {
    headless::Config config = test::PackConfig(ticks + 2);
    config.automaticTimer = false;
    test::RunGame(config, [&](long pass) {
        if (pass == 0) {
            headless::Log().Clear();
        }
        if (pass <= ticks) {
            step(pass);
        }
        if (pass < ticks) {
            Tick();
        }
    });
}

void ExpectSpawns(const std::vector<Spawn>& got, const std::vector<Spawn>& expected) {
    ASSERT_EQ(got.size(), expected.size());
    for (size_t i = 0; i < expected.size(); ++i) {
        const Spawn& g = got[i];
        const Spawn& e = expected[i];
        SCOPED_TRACE(::testing::Message() << "spawn " << i << " expected on tick " << e.tick);
        EXPECT_EQ(g.tick, e.tick);
        EXPECT_EQ(g.bottom, e.bottom);
        EXPECT_EQ(g.slot, e.slot);
        EXPECT_EQ(g.kind, e.kind);
        EXPECT_EQ(g.x, e.x);
        EXPECT_EQ(g.y, e.y);
        EXPECT_EQ(g.direction, e.direction);
        EXPECT_EQ(g.width, e.width);
        EXPECT_EQ(g.height, e.height);
        EXPECT_EQ(g.cue, e.cue);
    }
}

// Records every slot that became occupied on a tick, and whether the spawn cue played.
struct SpawnRecorder {
    Snapshot before = Take();
    std::vector<Spawn> spawns;
    int cues = 0;

    void After(long tick) {
        const Snapshot now = Take();
        const int cuesNow = CueCount("p_sound.mc8");
        const bool cue = cuesNow > cues;
        cues = cuesNow;
        for (int i = 0; i < BOTTOM_SLOTS; ++i) {
            if (now.bottom[i] == 1 && before.bottom[i] != 1) {
                const FishSlot& f = g_bottomFish[i];
                spawns.push_back({static_cast<int>(tick), true, i, f.kind, f.x, f.y, f.direction,
                                  f.width, f.height, false});
            }
        }
        for (int i = 0; i < SWIM_SLOTS; ++i) {
            if (now.swim[i] == 1 && before.swim[i] != 1) {
                const FishSlot& f = g_swimFish[i];
                spawns.push_back({static_cast<int>(tick), false, i, f.kind, f.x, f.y, f.direction,
                                  f.width, f.height, cue});
            }
        }
        before = now;
    }
};

TEST(ClockTest, FillsTheSchoolOnFourTicksOfEightAndTheBottomOnOneOfSeven) {
    SpawnRecorder recorder;
    int tickCount = -1;
    RunTicks(34, [&](long tick) {
        if (tick > 0) {
            recorder.After(tick);
        }
        if (tick == 34) {
            tickCount = g_tickCount;
        }
    });
    // kind (5 x boat + tick + slot) mod 6 with the boat at 0; even slots enter at x 0 heading
    // right, odd ones at x 420 heading left; y 150 + 7 x slot and 220 + 2 x slot.
    const std::vector<Spawn> expected = {
        {4, false, 0, 4, 0, 150, 1, 37, 29, true},
        {5, false, 1, 0, 420, 157, 0, 63, 35, false},
        {6, false, 2, 2, 0, 164, 1, 44, 34, false},
        {7, true, 0, 0, 0, 220, 1, 71, 41, false},
        {7, false, 3, 4, 420, 171, 0, 37, 29, false},
        {12, false, 4, 4, 0, 178, 1, 37, 29, false},
        {13, false, 5, 0, 420, 185, 0, 63, 35, true},
        {14, true, 1, 1, 420, 222, 0, 28, 30, false},
        {14, false, 6, 2, 0, 192, 1, 44, 34, false},
        {15, false, 7, 4, 420, 199, 0, 37, 29, false},
        {20, false, 8, 4, 0, 206, 1, 37, 29, false},
        {21, true, 2, 0, 0, 224, 1, 71, 41, false},
        {21, false, 9, 0, 420, 213, 0, 63, 35, false},
        {22, false, 10, 2, 0, 220, 1, 44, 34, true},
        {23, false, 11, 4, 420, 227, 0, 37, 29, false},
        {28, false, 12, 4, 0, 234, 1, 37, 29, false},
        {29, false, 13, 0, 420, 241, 0, 63, 35, false},
        {30, false, 14, 2, 0, 248, 1, 44, 34, false},
        // ticks 31 and 28 (bottom): every slot taken, nothing more and no cue
    };
    ExpectSpawns(recorder.spawns, expected);
    EXPECT_EQ(recorder.cues, 3);
    EXPECT_EQ(tickCount, 34);
    for (int i = SCHOOL_SLOTS; i < SWIM_SLOTS; ++i) {
        EXPECT_NE(g_swimFish[i].active, 1) << "slot " << i << " is for escaped fish";
    }
    for (int i = BOTTOM_SCHOOL_SLOTS; i < BOTTOM_SLOTS; ++i) {
        EXPECT_NE(g_bottomFish[i].active, 1) << "bottom slot " << i << " is for escaped fish";
    }
}

TEST(ClockTest, CounterWrapsAfterFiftySixOntoABottomTickWithoutASwimmer) {
    SpawnRecorder recorder;
    std::vector<int> counters;
    int slotOneAtTheEnd = -1;
    RunTicks(60, [&](long tick) {
        if (tick > 0) {
            recorder.After(tick);
            counters.push_back(g_tickCount);
        }
        if (tick == 40) {
            recorder.spawns.clear();
        }
        if (tick == 56) {
            // the next tick wraps to 0: a bottom fish is tried, a swimmer is not
            g_swimFish[1].active = 0;
            g_bottomFish[1].active = 0;
            recorder.before = Take();
        }
        if (tick == 60) {
            slotOneAtTheEnd = g_swimFish[1].active;
        }
    });
    ASSERT_EQ(counters.size(), 60u);
    EXPECT_EQ(counters[55], 56);
    EXPECT_EQ(counters[56], 0);
    EXPECT_EQ(counters[57], 1);
    const std::vector<Spawn> refills = {
        {57, true, 1, 1, 420, 222, 0, 28, 30, false},
    };
    ExpectSpawns(recorder.spawns, refills);
    EXPECT_EQ(slotOneAtTheEnd, 0) << "ticks 0 to 3 try no swimmer";
}

TEST(ClockTest, FrozenFishAreNotSpawnedButTheHookFloatsAndTheCounterRuns) {
    std::vector<INT> heights;
    int spawnedWhileFrozen = 0;
    int spawnedAfter = 0;
    int counter = -1;
    RunTicks(16, [&](long tick) {
        if (tick == 0) {
            g_freezeCount = 5;  // nothing on the title screen counts it down
        }
        if (tick >= 1 && tick <= 8) {
            heights.push_back(g_hookY);
            for (const FishSlot& f : g_swimFish) {
                spawnedWhileFrozen += f.active == 1;
            }
            for (const FishSlot& f : g_bottomFish) {
                spawnedWhileFrozen += f.active == 1;
            }
        }
        if (tick == 8) {
            counter = g_tickCount;
            g_freezeCount = 0;
        }
        if (tick == 16) {
            for (const FishSlot& f : g_swimFish) {
                spawnedAfter += f.active == 1;
            }
        }
    });
    EXPECT_EQ(spawnedWhileFrozen, 0);
    EXPECT_EQ(counter, 8);
    EXPECT_EQ(heights, (std::vector<INT>{196, 200, 196, 200, 196, 200, 196, 200}));
    EXPECT_EQ(spawnedAfter, 4) << "ticks 12 to 15 spawn again";
}

}  // namespace
