// The floating basket: on easy it follows the boat with speed growing by distance (thresholds
// 20 pixels lower on the left); on normal and hard it patrols between x 30 and 370, faster
// while a rush lasts.
#include <gtest/gtest.h>

#include <vector>

#include "game/round_state.h"
#include "round_driver.h"

using namespace round_test;

namespace {

struct BasketCase {
    INT boat, basketX;
    INT heading;  // before the frame
    BYTE rush;
    INT expectX, expectHeading;
    BYTE expectRush;
};

// Runs the cases one per frame in a single round: each is set up after one frame and
// checked after the next.
void RunBasketCases(BYTE difficulty, const std::vector<BasketCase>& cases) {
    std::vector<BasketCase> seen;
    RunRound({difficulty, false, static_cast<long>(cases.size()) + 2}, [&](long frame) {
        if (frame >= 2 && static_cast<size_t>(frame - 2) < cases.size()) {
            BasketCase got = cases[static_cast<size_t>(frame - 2)];
            got.expectX = g_basketX;
            got.expectHeading = g_basketRight;
            got.expectRush = g_basketRush;
            seen.push_back(got);
        }
        if (frame >= 1 && static_cast<size_t>(frame - 1) < cases.size()) {
            const BasketCase& c = cases[static_cast<size_t>(frame - 1)];
            PlaceBoat(c.boat, true);
            g_basketX = c.basketX;
            g_basketRight = c.heading;
            g_basketRush = c.rush;
        }
    });
    ASSERT_EQ(seen.size(), cases.size());
    for (size_t i = 0; i < cases.size(); ++i) {
        const BasketCase& c = cases[i];
        SCOPED_TRACE(::testing::Message() << "case " << i << ": boat " << c.boat << ", basket "
                                          << c.basketX << " heading " << c.heading);
        EXPECT_EQ(seen[i].expectX, c.expectX);
        EXPECT_EQ(seen[i].expectHeading, c.expectHeading);
        EXPECT_EQ(seen[i].expectRush, c.expectRush);
    }
}

TEST(BasketTest, EasyFollowsTheBoatFasterTheFurtherBehind) {
    RunBasketCases(
        1, {
               // boat right of the basket by d
               {200, 101, 0, 0, 101, 1, 0},  // d 99: turns right, stays
               {200, 100, 0, 0, 106, 1, 0},  // d 100
               {300, 171, 1, 0, 177, 1, 0},  // d 129
               {300, 170, 1, 0, 179, 1, 0},  // d 130
               {300, 121, 1, 0, 130, 1, 0},  // d 179
               {300, 120, 1, 0, 132, 1, 0},  // d 180
               {300, 71, 1, 0, 83, 1, 0},    // d 229
               {300, 70, 1, 0, 85, 1, 0},    // d 230
                                             // basket right of the boat (or level with it) by e
               {0, 0, 1, 0, 0, 0, 0},        // e 0: turns left, stays
               {0, 79, 1, 0, 79, 0, 0},      // e 79
               {0, 80, 1, 0, 74, 0, 0},      // e 80
               {0, 109, 1, 0, 103, 0, 0},    // e 109
               {0, 110, 1, 0, 101, 0, 0},    // e 110
               {0, 159, 1, 0, 150, 0, 0},    // e 159
               {0, 160, 1, 0, 148, 0, 0},    // e 160
               {0, 209, 1, 0, 197, 0, 0},    // e 209
               {0, 210, 1, 0, 195, 0, 0},    // e 210
               {0, 100, 1, 7, 94, 0, 7},     // the rush does nothing on easy
           });
}

TEST(BasketTest, NormalPatrolsTwoPixelsAFrameAndTurnsOutsideThirtyToThreeSeventy) {
    RunBasketCases(2, {
                          {0, 31, 0, 0, 29, 1, 0},    // below 30: turns right
                          {0, 29, 1, 0, 31, 1, 0},    // and comes back
                          {0, 32, 0, 0, 30, 0, 0},    // 30 itself is not below 30
                          {0, 369, 1, 0, 371, 0, 0},  // above 370: turns left
                          {0, 368, 1, 0, 370, 1, 0},
                          {0, 200, 1, 3, 207, 1, 2},  // rush: 5 more
                          {0, 200, 0, 1, 193, 0, 0},
                          {400, 200, 1, 0, 202, 1, 0},  // the boat does not matter
                      });
}

TEST(BasketTest, HardPatrolsFourPixelsAFrameAndRushesTenMore) {
    RunBasketCases(3, {
                          {0, 100, 1, 1, 114, 1, 0},
                          {0, 100, 0, 2, 86, 0, 1},
                          {0, 33, 0, 0, 29, 1, 0},
                          {0, 367, 1, 0, 371, 0, 0},
                          {0, 300, 1, 0, 304, 1, 0},
                      });
}

}  // namespace
