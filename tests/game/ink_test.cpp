// Dark water: the frame's water area is covered by the darkness picture in pieces around a
// spot of light at the hook. Each case is checked pixel by pixel: the expected frame is the
// scene window with the listed pieces of the dark and light pictures laid over it.
#include <gtest/gtest.h>

#include <vector>

#include "assets/catalogue.h"
#include "game/hook.h"
#include "game/round_state.h"
#include "round_driver.h"

using namespace round_test;

namespace {

struct Piece {
    bool light;
    int x, y, w, h, sx, sy;
};

struct InkCase {
    const char* name;
    INT boat;
    bool facingRight;
    INT startX, startY;  // the hook before the frame; the drift brings it to hookX
    INT hookX, hookY;    // where the frame draws it
    BYTE ink;
    std::vector<Piece> pieces;  // in drawing order; none: the plain scene
};

bool UnderStatusBar(int x, int y) {
    const bool exitButton = x >= 2 && x <= 51 && y >= 266 && y <= 290;
    const bool digits = x >= 155 && x <= 233 && y >= 277 && y <= 287;
    return exitButton || digits;
}

// Counts the water pixels of the frame that differ from the pieces laid over the scene.
int WaterMismatches(const std::vector<Piece>& pieces, std::string* first) {
    Sprite* dark = g_img_dark[1];
    Sprite* light = g_img_light[1];
    int mismatches = 0;
    for (int y = 148; y < 293; ++y) {
        for (int x = 0; x < 240; ++x) {
            if (UnderStatusBar(x, y)) {
                continue;
            }
            BYTE expected = PixelOf(g_sceneImage, g_cameraX + x, y);
            for (const Piece& p : pieces) {
                if (x >= p.x && x < p.x + p.w && y >= p.y && y < p.y + p.h) {
                    Sprite* art = p.light ? light : dark;
                    const BYTE source = PixelOf(art, p.sx + x - p.x, p.sy + y - p.y);
                    if (source != art->key) {
                        expected = source;
                    }
                }
            }
            if (PixelOf(g_frameImage, x, y) != expected) {
                if (mismatches == 0) {
                    *first = "(" + std::to_string(x) + ", " + std::to_string(y) + ")";
                }
                ++mismatches;
            }
        }
    }
    return mismatches;
}

TEST(InkTest, WaterIsDarkenedAroundASpotOfLightAtTheHook) {
    const std::vector<InkCase> cases = {
        {"spot in the open water",
         0,
         true,
         141,
         180,
         130,
         180,
         5,
         {{false, 0, 148, 240, 17, 0, 0},
          {false, 0, 165, 115, 50, 0, 17},
          {false, 165, 165, 75, 50, 165, 17},
          {false, 0, 215, 240, 78, 0, 67},
          {true, 115, 165, 50, 50, 0, 0}}},
        {"hook in the air: all dark, no light",
         0,
         true,
         40,
         100,
         40,
         100,
         5,
         {{false, 0, 148, 240, 145, 0, 0}}},
        {"spot cut at the left edge",
         100,
         true,
         44,
         180,
         50,
         180,
         5,
         {{false, 0, 148, 240, 17, 0, 0},
          {false, 35, 165, 205, 50, 35, 17},
          {false, 0, 215, 240, 78, 0, 67},
          {true, 0, 165, 35, 50, 15, 0}}},
        {"spot cut at the right edge",
         100,
         true,
         281,
         180,
         270,
         180,
         5,
         {{false, 0, 148, 240, 17, 0, 0},
          {false, 0, 165, 205, 50, 0, 17},
          {false, 0, 215, 240, 78, 0, 67},
          {true, 205, 165, 35, 50, 0, 0}}},
        {"spot straddling the surface",
         0,
         true,
         137,
         140,
         130,
         140,
         5,
         {{false, 0, 148, 115, 50, 0, 0},
          {false, 165, 148, 75, 50, 165, 0},
          {false, 0, 175, 240, 118, 0, 27},
          {true, 115, 148, 50, 27, 0, 23}}},
        {"last frame of the effect",
         0,
         true,
         141,
         180,
         130,
         180,
         1,
         {{false, 0, 148, 240, 17, 0, 0},
          {false, 0, 165, 115, 50, 0, 17},
          {false, 165, 165, 75, 50, 165, 17},
          {false, 0, 215, 240, 78, 0, 67},
          {true, 115, 165, 50, 50, 0, 0}}},
        {"effect over: plain water", 0, true, 141, 180, 130, 180, 0, {}},
    };
    struct Result {
        INT hookX, hookY, camera;
        int mismatches, inkAfter;
        std::string first;
    };
    std::vector<Result> results;
    RunRound({1, false, static_cast<long>(cases.size()) + 2}, [&](long frame) {
        if (frame >= 2 && static_cast<size_t>(frame - 2) < cases.size()) {
            const InkCase& c = cases[static_cast<size_t>(frame - 2)];
            Result r{g_hookX, g_hookY, g_cameraX, 0, g_inkCount, ""};
            r.mismatches = WaterMismatches(c.pieces, &r.first);
            results.push_back(r);
        }
        if (frame >= 1 && static_cast<size_t>(frame - 1) < cases.size()) {
            const InkCase& c = cases[static_cast<size_t>(frame - 1)];
            PlaceBoat(c.boat, c.facingRight);
            g_hookX = c.startX;
            g_hookY = c.startY;
            g_inkCount = c.ink;
        }
    });
    ASSERT_EQ(results.size(), cases.size());
    for (size_t i = 0; i < cases.size(); ++i) {
        const InkCase& c = cases[i];
        const Result& r = results[i];
        SCOPED_TRACE(c.name);
        ASSERT_EQ(r.hookX, c.hookX);
        ASSERT_EQ(r.hookY, c.hookY);
        EXPECT_EQ(r.camera, c.boat / 2);
        EXPECT_EQ(r.mismatches, 0) << "first at " << r.first;
        EXPECT_EQ(r.inkAfter, c.ink > 0 ? c.ink - 1 : 0);
    }
}

}  // namespace
