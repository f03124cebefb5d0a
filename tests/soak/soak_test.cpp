// A long seeded run of random input through every screen, checking after every pass what
// must always hold. REDIZOR_SOAK_PASSES sets its length (the sanitizer run uses 200000).
#include <gtest/gtest.h>

#include <cstdlib>
#include <fstream>
#include <random>

#include "app/input.h"
#include "app/shell.h"
#include "game/fish.h"
#include "game/round_state.h"
#include "support/game_run.h"

namespace {

long SoakPasses() {
    const char* env = std::getenv("REDIZOR_SOAK_PASSES");
    return env != nullptr ? std::atol(env) : 20000;
}

// Resident memory in kilobytes.
long ResidentKb() {
    std::ifstream statm("/proc/self/statm");
    long pages = 0, resident = 0;
    statm >> pages >> resident;
    return resident * 4;
}

bool InTitleExitArea(int x, int y) {
    return y > 240 && y < 254 && x < 41;
}

bool InRoundExitArea(int x, int y) {
    return y > 270 && x < 50;
}

void CheckFish(const FishSlot* slots, int count, int kinds, void (*size)(int, INT*, INT*),
               const char* table, long pass) {
    for (int i = 0; i < count; ++i) {
        const FishSlot& f = slots[i];
        if (f.active != 1) {
            continue;
        }
        SCOPED_TRACE(std::string(table) + " slot " + std::to_string(i) + " pass " +
                     std::to_string(pass));
        ASSERT_LT(f.kind, kinds);
        INT w = 0, h = 0;
        size(f.kind, &w, &h);
        ASSERT_EQ(f.width, w);
        ASSERT_EQ(f.height, h);
        ASSERT_TRUE(f.frameX == 0 || f.frameX == f.width) << f.frameX;
        ASSERT_GE(f.x, -200);
        ASSERT_LE(f.x, 600);
        ASSERT_GE(f.y, -400);
        ASSERT_LE(f.y, 300);
    }
}

TEST(SoakTest, RandomInputThroughEveryScreenKeepsTheGameSound) {
    const long passes = SoakPasses();
    std::mt19937 rng(20261206);
    long screensSeen[5] = {};
    long baselineKb = 0;
    long grownKb = 0;
    const UINT keys[] = {37, 38, 39, 40, 13};
    // Places worth tapping: every button and line of every screen, and anywhere at all.
    const int targets[][2] = {{10, 225},  {10, 265},  {120, 98},  {100, 122}, {120, 148},
                              {140, 212}, {140, 237}, {140, 260}, {30, 280},  {220, 280},
                              {60, 275},  {170, 275}, {20, 280},  {25, 278}};
    auto onPass = [&](long pass) {
        ASSERT_LE(g_screen, SCREEN_INTRO) << "pass " << pass;
        ++screensSeen[g_screen];
        ASSERT_LE(g_energy, 170) << "pass " << pass;
        CheckFish(g_swimFish, SWIM_SLOTS, 6, SwimFishSize, "swim", pass);
        CheckFish(g_bottomFish, BOTTOM_SLOTS, 2, BottomFishSize, "bottom", pass);
        CheckFish(g_hookedFish, HOOKED_SLOTS, 8, HookedFishSize, "hooked", pass);
        headless::Log().Clear();
        unsigned roll = rng() % 100;
        if (roll < 12) {
            UINT key = keys[rng() % 5];
            (rng() % 2 ? headless::KeyDown : headless::KeyUp)(key);
        } else if (roll < 16) {
            int x, y;
            if (rng() % 3 == 0) {
                x = static_cast<int>(rng() % 240);
                y = static_cast<int>(rng() % 293);
            } else {
                const int* t = targets[rng() % (sizeof targets / sizeof targets[0])];
                x = t[0];
                y = t[1];
            }
            // Quitting ends the soak, and leaving every round at once never lets one run out.
            bool quits = g_screen == SCREEN_TITLE && InTitleExitArea(x, y);
            bool leavesRound =
                g_screen == SCREEN_FISHING && InRoundExitArea(x, y) && rng() % 20 != 0;
            if (!quits && !leavesRound) {
                headless::Tap(x, y);
            }
        }
        if (pass == passes / 4) {
            baselineKb = ResidentKb();
        }
        if (pass == passes - 1) {
            grownKb = ResidentKb() - baselineKb;
        }
    };
    test::RunResult result = test::RunGame(test::PackConfig(passes), onPass);
    EXPECT_EQ(result.exitCode, 0);
    EXPECT_FALSE(result.exitedThroughExitProcess);
    EXPECT_GE(headless::PassCount(), passes) << "the game ran to the end of the soak";
    for (int s = 0; s < 5; ++s) {
        EXPECT_GT(screensSeen[s], 0) << "screen " << s << " was never reached";
    }
    EXPECT_LT(grownKb, 8 * 1024) << "resident memory grew over the run";
    std::printf("soak: %ld passes, screens %ld/%ld/%ld/%ld/%ld, memory grew %ld kB\n", passes,
                screensSeen[0], screensSeen[1], screensSeen[2], screensSeen[3], screensSeen[4],
                grownKb);
}

}  // namespace
