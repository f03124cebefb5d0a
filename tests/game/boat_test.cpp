// The boat and the camera under the left and right keys, and how the boat drags a shallow
// hook, the swell, and the stylus exit button.
#include <gtest/gtest.h>

#include <vector>

#include "app/input.h"
#include "app/shell.h"
#include "game/hook.h"
#include "game/round_state.h"
#include "platform/window.h"
#include "round_driver.h"

using namespace round_test;

namespace {

struct Point {
    INT x, y;
};

TEST(BoatTest, RightKeyAtTheEdgeDragsAShallowHookTwice) {
    Point hook{};
    INT boat = 0, camera = 0, scroll = 0;
    RunRound({1, false, 4}, [&](long frame) {
        if (frame == 0) {
            PressKey(VK_RIGHT);
        } else if (frame == 1) {
            PlaceBoat(380, true);
            g_hookX = 360;
            g_hookY = 120;
        } else if (frame == 2) {
            hook = {g_hookX, g_hookY};
            boat = g_fishermanX;
            camera = g_cameraX;
            scroll = g_bottomScrollX;
        }
    });
    EXPECT_EQ(boat, 400);
    EXPECT_EQ(camera, 200);
    EXPECT_EQ(scroll, 600);
    // Dragged by 20 and 14 to (380, 134); that is under water, so the drift adds its one
    // pixel towards the resting place right of the fisherman.
    EXPECT_EQ(hook.x, 381);
    EXPECT_EQ(hook.y, 134);
}

TEST(BoatTest, LeftKeyAtTheLeftEdgeLimitsTheStepBeforeThePull) {
    std::vector<Point> hooks;
    RunRound({1, false, 9}, [&](long frame) {
        if (frame == 0) {
            PressKey(VK_LEFT);
        } else if (frame == 1) {
            g_hookX = 40;  // boat at 0 still facing right, as after a reset
            g_hookY = 100;
        } else if (frame >= 2 && frame <= 7) {
            hooks.push_back({g_hookX, g_hookY});
        }
    });
    const std::vector<Point> expected = {
        {21, 107},
        {2, 114},
        {-9, 121},
        {-9, 128},
        {-8, 135},  // dragged to (-9, 135); now under water the drift takes it one pixel
                    // right
        {-7, 135},  // too deep to be dragged: only the drift moves it
    };
    ASSERT_EQ(hooks.size(), expected.size());
    for (size_t i = 0; i < expected.size(); ++i) {
        EXPECT_EQ(hooks[i].x, expected[i].x) << "frame " << i + 2;
        EXPECT_EQ(hooks[i].y, expected[i].y) << "frame " << i + 2;
    }
}

TEST(BoatTest, SwellRunsUpToEightAndBackWithAPeriodOfSixteen) {
    std::vector<int> bob;
    RunRound({1, false, 34}, [&](long frame) {
        if (frame >= 1) {
            bob.push_back(g_bob);
        }
    });
    const std::vector<int> cycle = {1, 2, 3, 4, 5, 6, 7, 8, 7, 6, 5, 4, 3, 2, 1, 0};
    ASSERT_GE(bob.size(), 32u);
    for (size_t i = 0; i < 32; ++i) {
        EXPECT_EQ(bob[i], cycle[i % 16]) << "frame " << i + 1;
    }
}

// A press inside the exit button leaves the round for the options menu; the bounds are
// strict (y above 270, x below 50).
struct ExitCase {
    int x, y;
    bool leaves;
};

void PrintTo(const ExitCase& c, std::ostream* os) {
    *os << "(" << c.x << ", " << c.y << ")";
}

class ExitButtonTest : public ::testing::TestWithParam<ExitCase> {};

TEST_P(ExitButtonTest, PressAtThePointLeavesOnlyInsideTheButton) {
    const ExitCase c = GetParam();
    BYTE screen = 0;
    INT energy = 0, boat = -1, penDown = -1;
    RunRound({1, false, 6}, [&](long frame) {
        if (frame == 0) {
            PressKey(VK_RIGHT);
        } else if (frame == 2) {
            headless::PenDown(c.x, c.y);
        } else if (frame == 4) {
            screen = g_screen;
            energy = g_energy;
            boat = g_fishermanX;
            penDown = g_penDown;
        }
    });
    if (c.leaves) {
        EXPECT_EQ(screen, SCREEN_OPTIONS);
        EXPECT_EQ(energy, 170) << "the round is reset on the way out";
        EXPECT_EQ(boat, 0);
        EXPECT_EQ(penDown, 0) << "the press is used up";
    } else {
        EXPECT_EQ(screen, SCREEN_FISHING);
        EXPECT_GT(boat, 0);
    }
}

INSTANTIATE_TEST_SUITE_P(Bounds, ExitButtonTest,
                         ::testing::Values(ExitCase{49, 271, true}, ExitCase{0, 292, true},
                                           ExitCase{50, 271, false}, ExitCase{10, 270, false}));

}  // namespace
