// Whole rounds: a round left alone ends by its energy after the expected number of frames,
// is revealed on its first frame only, and keeps its fish in their bands all the way; a round
// on a ground or difficulty without art draws the South pictures.
#include <gtest/gtest.h>

#include <cstdlib>
#include <string>
#include <vector>

#include "app/shell.h"
#include "assets/catalogue.h"
#include "game/fish.h"
#include "game/hook.h"
#include "game/round_state.h"
#include "platform/headless/headless.h"
#include "platform/window.h"
#include "round_driver.h"

using namespace round_test;

namespace {

struct EndCase {
    BYTE difficulty;
    long framesPerDrain;
};

void PrintTo(const EndCase& c, std::ostream* os) {
    *os << "level " << static_cast<int>(c.difficulty);
}

class RoundEndTest : public ::testing::TestWithParam<EndCase> {};

// Swimmers of the school are in y 150..190 once they have moved; a fish still at its entry
// point (x 0 heading right or 420 heading left) has not moved yet.
std::string BandViolation() {
    for (int i = 0; i < SWIM_SLOTS; ++i) {
        const FishSlot& f = g_swimFish[i];
        if (f.active != 1) {
            continue;
        }
        if (i >= SCHOOL_SLOTS) {
            return "escaped slot " + std::to_string(i) + " filled without a catch";
        }
        const bool fresh = (f.x == 0 && f.direction == 1) || (f.x == 420 && f.direction == 0);
        if (!fresh && (f.y < 150 || f.y > 190)) {
            return "swimmer " + std::to_string(i) + " at y " + std::to_string(f.y);
        }
        if (f.x < 0 || f.x > 420) {
            return "swimmer " + std::to_string(i) + " at x " + std::to_string(f.x);
        }
    }
    for (int i = 0; i < BOTTOM_SLOTS; ++i) {
        const FishSlot& f = g_bottomFish[i];
        if (f.active != 1) {
            continue;
        }
        if (i >= BOTTOM_SCHOOL_SLOTS) {
            return "escaped bottom slot " + std::to_string(i) + " filled without a catch";
        }
        if (f.y < 220 || f.y > 250) {
            return "bottom fish " + std::to_string(i) + " at y " + std::to_string(f.y);
        }
    }
    return "";
}

TEST_P(RoundEndTest, RoundLeftAloneEndsWhenTheEnergyFallsBelowZero) {
    const EndCase c = GetParam();
    const long expectedEnd = 171 * c.framesPerDrain;
    long endFrame = -1;
    std::vector<std::string> faults;
    std::vector<size_t> blitsPerFrame;
    size_t blitsBefore = 0;
    long presentsBefore = 0, presentsOnEnd = -1;
    INT energyAfterEnd = -1, hookXAfterEnd = -1;
    int fishSeen = 0;
    RunRound({c.difficulty, true, expectedEnd + 3}, [&](long frame) {
        const auto& log = headless::Log();
        if (frame == 0) {
            blitsBefore = log.windowBlits.size();
            presentsBefore = log.presents;
            return;
        }
        if (endFrame >= 0) {
            return;
        }
        if (g_screen != SCREEN_FISHING) {
            endFrame = frame;
            presentsOnEnd = log.presents - presentsBefore;
            energyAfterEnd = g_energy;
            hookXAfterEnd = g_hookX;
            return;
        }
        blitsPerFrame.push_back(log.windowBlits.size() - blitsBefore);
        blitsBefore = log.windowBlits.size();
        presentsBefore = log.presents;
        const INT expectedEnergy = 170 - static_cast<INT>(frame / c.framesPerDrain);
        if (g_energy != expectedEnergy && faults.size() < 5) {
            faults.push_back("frame " + std::to_string(frame) + ": energy " +
                             std::to_string(g_energy));
        }
        const std::string band = BandViolation();
        if (!band.empty() && faults.size() < 5) {
            faults.push_back("frame " + std::to_string(frame) + ": " + band);
        }
        for (const FishSlot& f : g_swimFish) {
            fishSeen += f.active == 1;
        }
    });
    EXPECT_EQ(endFrame, expectedEnd);
    EXPECT_TRUE(faults.empty()) << faults.front();
    EXPECT_EQ(presentsOnEnd, 0) << "the frame that ends the round draws nothing";
    EXPECT_EQ(energyAfterEnd, 170) << "the round is reset";
    EXPECT_EQ(hookXAfterEnd, 40);
    EXPECT_GT(fishSeen, 0) << "the clock spawned fish during the round";
    ASSERT_EQ(blitsPerFrame.size(), static_cast<size_t>(expectedEnd - 1));
    EXPECT_EQ(blitsPerFrame[0], 300u) << "the first frame is revealed";
    for (size_t i = 1; i < blitsPerFrame.size(); ++i) {
        ASSERT_EQ(blitsPerFrame[i], 1u) << "frame " << i + 1 << " is a plain copy";
    }
}

INSTANTIATE_TEST_SUITE_P(Difficulties, RoundEndTest,
                         ::testing::Values(EndCase{1, 5}, EndCase{2, 4}, EndCase{3, 3}),
                         [](const ::testing::TestParamInfo<EndCase>& info) {
                             return "Level" + std::to_string(info.param.difficulty);
                         });

// The title's start area begins a round: its first frame is revealed in 300 strips, the next
// ones are plain copies, and the round runs on the South ground at easy.
TEST(RoundStartTest, TapOnTheTitleStartsARoundRevealedOnItsFirstFrame) {
    long firstFrame = -1;
    std::vector<size_t> blits;
    size_t before = 0;
    int region = -1, level = -1, entryCues = -1;
    test::RunGame(test::PackConfig(40), [&](long pass) {
        if (pass == 0) {
            headless::Log().Clear();
            headless::Tap(10, 225);
            return;
        }
        const size_t now = headless::Log().windowBlits.size();
        if (firstFrame < 0 && g_screen == SCREEN_FISHING && g_frameCount > 0) {
            firstFrame = pass;
            region = g_regionIndex;
            level = g_difficultyLevel;
            entryCues = CueCount("n_taken_succ.mc8");
        }
        if (firstFrame >= 0 && blits.size() < 4) {
            blits.push_back(now - before);
        }
        before = now;
    });
    ASSERT_GE(firstFrame, 0) << "the tap did not start a round";
    EXPECT_EQ(region, 1);
    EXPECT_EQ(level, 1);
    EXPECT_EQ(entryCues, 1);
    EXPECT_EQ(blits, (std::vector<size_t>{300, 1, 1, 1}));
}

// Non-key pixels of the fisherman picture [1][0] at its place in the scene that no later
// draw covers (above the waves, left of the rod tip); counts matches and mismatches.
void CompareFisherman(int* matches, int* mismatches) {
    Sprite* art = g_img_fisherman[1][0];
    const int left = g_fishermanX, top = 82;  // drawn with the swell at 0
    for (int row = 0; row < 38; ++row) {
        for (int col = 0; col < 45; ++col) {
            const BYTE source = PixelOf(art, col, row);
            if (source == art->key) {
                continue;
            }
            if (PixelOf(g_sceneImage, left + col, top + row) == source) {
                ++*matches;
            } else {
                ++*mismatches;
            }
        }
    }
}

struct ArtCase {
    const char* name;
    BYTE difficulty;                   // entered with
    int regionIndex, difficultyIndex;  // forced after entry; -1: as entered
};

void PrintTo(const ArtCase& c, std::ostream* os) {
    *os << c.name;
}

class MissingArtTest : public ::testing::TestWithParam<ArtCase> {};

TEST_P(MissingArtTest, RoundDrawsTheSouthArtWhenItsSlotHoldsNone) {
    const ArtCase c = GetParam();
    int matches = 0, mismatches = 0, backMismatches = 0;
    int regionAfter = -1, difficultyAfter = -1;
    RunRound({c.difficulty, true, 30}, [&](long frame) {
        if (frame == 0) {
            if (c.regionIndex >= 0) {
                g_regionIndex = static_cast<BYTE>(c.regionIndex);
            }
            if (c.difficultyIndex >= 0) {
                g_difficultyIndex = static_cast<BYTE>(c.difficultyIndex);
            }
        }
        if (frame == 27) {
            g_bob = 0;
            g_bobRising = 1;
            g_cheerCount = 0;
        } else if (frame == 28) {
            CompareFisherman(&matches, &mismatches);
            for (int x = g_redrawX; x < g_redrawX + 300; ++x) {
                for (int y = 0; y < 10; ++y) {
                    backMismatches += PixelOf(g_sceneImage, x, y) != PixelOf(g_img_back[1], x, y);
                }
            }
            regionAfter = g_regionIndex;
            difficultyAfter = g_difficultyIndex;
        }
    });
    EXPECT_GT(matches, 50);
    EXPECT_EQ(mismatches, 0);
    EXPECT_EQ(backMismatches, 0);
    EXPECT_EQ(regionAfter, c.regionIndex >= 0 ? c.regionIndex : 1) << "the round's copy stays";
    EXPECT_EQ(difficultyAfter, c.difficultyIndex >= 0 ? c.difficultyIndex : c.difficulty - 1);
}

INSTANTIATE_TEST_SUITE_P(Slots, MissingArtTest,
                         ::testing::Values(ArtCase{"HardFishermanEmpty", 3, -1, -1},
                                           ArtCase{"PacificEmptyObjects", 1, 0, -1},
                                           ArtCase{"AmazonNullSlots", 2, 2, 1},
                                           ArtCase{"IndexPastTheTables", 1, 7, 9}),
                         [](const ::testing::TestParamInfo<ArtCase>& info) {
                             return info.param.name;
                         });

// Writes round.png (a round in play) and round_dark.png (the dark water) into
// $REDIZOR_SCREENSHOT_DIR. The pictures in docs/screenshots come from, in the repository:
//   REDIZOR_SCREENSHOT_DIR=$PWD/docs/screenshots build/tests/game_tests
//   --gtest_filter='RoundScreenshot.*'
TEST(RoundScreenshot, WritesTheRoundAndTheDarkWater) {
    const char* dir = std::getenv("REDIZOR_SCREENSHOT_DIR");
    if (dir == nullptr || *dir == '\0') {
        GTEST_SKIP() << "set REDIZOR_SCREENSHOT_DIR to write the screenshots";
    }
    const std::string out = dir;
    bool wroteRound = false, wroteDark = false;
    RunRound({1, true, 200}, [&](long frame) {
        if (frame == 60) {
            PressKey(VK_RIGHT);
        } else if (frame == 66) {
            ReleaseKey(VK_RIGHT);
        } else if (frame == 100) {
            // Something on the hook and in the basket, for the picture.
            PlaceHooked(0, 1);
            g_basketFull = 1;
            g_score = 2300;
        } else if (frame == 140) {
            wroteRound = headless::SaveScreenshot(out + "/round.png");
            g_inkCount = 30;
        } else if (frame == 150) {
            wroteDark = headless::SaveScreenshot(out + "/round_dark.png");
        }
    });
    EXPECT_TRUE(wroteRound);
    EXPECT_TRUE(wroteDark);
}

}  // namespace
