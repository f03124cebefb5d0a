#include "round_driver.h"

#include <gtest/gtest.h>

#include "app/shell.h"
#include "assets/catalogue.h"
#include "game/fish.h"
#include "game/round_state.h"
#include "platform/headless/headless.h"
#include "platform/window.h"
#include "screens/transitions.h"

namespace round_test {

test::RunResult RunRound(const Options& options, const std::function<void(long)>& onFrame) {
    headless::Config config = test::PackConfig(options.frames + 1);
    config.automaticTimer = options.clock;
    const BYTE difficulty = options.difficulty;
    return test::RunGame(config, [&onFrame, difficulty](long pass) {
        if (pass == 0) {
            // What the title's start area does.
            EnterFishing(2, difficulty);
            g_screen = SCREEN_FISHING;
            headless::Log().Clear();
        }
        onFrame(pass);
    });
}

void PressKey(UINT virtualKey) {
    headless::KeyDown(virtualKey);
}

void ReleaseKey(UINT virtualKey) {
    headless::KeyUp(virtualKey);
}

void Tick() {
    headless::Timer(TICK_TIMER_ID);
}

void PlaceBoat(INT x, bool facingRight) {
    g_fishermanX = x;
    g_cameraX = x / 2;
    g_bottomScrollX = x / 20 * 30;
    g_facingRight = facingRight ? 1 : 0;
}

void PlaceSwimmer(int slot, int kind, INT x, INT y, INT direction) {
    FishSlot& fish = g_swimFish[slot];
    fish.active = 1;
    fish.kind = static_cast<BYTE>(kind);
    fish.frameX = 0;
    fish.x = x;
    fish.y = y;
    fish.direction = direction;
    SwimFishSize(kind, &fish.width, &fish.height);
}

void PlaceBottomFish(int slot, int kind, INT x, INT y, INT direction) {
    FishSlot& fish = g_bottomFish[slot];
    fish.active = 1;
    fish.kind = static_cast<BYTE>(kind);
    fish.frameX = 0;
    fish.x = x;
    fish.y = y;
    fish.direction = direction;
    BottomFishSize(kind, &fish.width, &fish.height);
}

void PlaceHooked(int slot, int hookedKind) {
    FishSlot& fish = g_hookedFish[slot];
    fish.active = 1;
    fish.kind = static_cast<BYTE>(hookedKind);
    fish.frameX = 0;
    HookedFishSize(hookedKind, &fish.width, &fish.height);
}

void ClearAllFish() {
    for (FishSlot& fish : g_swimFish) {
        fish.active = 0;
    }
    for (FishSlot& fish : g_bottomFish) {
        fish.active = 0;
    }
    for (FishSlot& fish : g_hookedFish) {
        fish.active = 0;
    }
}

int CueCount(const std::string& fileName) {
    int count = 0;
    for (const std::string& cue : headless::Log().cues) {
        if (cue.size() >= fileName.size() &&
            cue.compare(cue.size() - fileName.size(), fileName.size(), fileName) == 0) {
            ++count;
        }
    }
    return count;
}

BYTE PixelOf(Image* image, int x, int y) {
    return *image->PixelAddress(x, y);
}

bool ScreenShowsFrame() {
    const platform::Surface& screen = headless::Screen();
    if (screen.width < 240 || screen.height < 293) {
        return false;
    }
    for (int y = 0; y < 293; ++y) {
        for (int x = 0; x < 240; ++x) {
            const RGBQUAD& c = g_frameImage->info->bmiColors[PixelOf(g_frameImage, x, y)];
            const std::uint32_t rgb = (static_cast<std::uint32_t>(c.rgbRed) << 16) |
                                      (static_cast<std::uint32_t>(c.rgbGreen) << 8) | c.rgbBlue;
            if (screen.At(x, y) != rgb) {
                return false;
            }
        }
    }
    return true;
}

namespace {

// True when the 9 x 11 place at (x, 277) of the frame shows digit d over the scene.
bool PlaceShows(int x, int d) {
    Sprite* digits = g_img_number[1];
    for (int row = 0; row < 11; ++row) {
        for (int col = 0; col < 9; ++col) {
            const BYTE source = PixelOf(digits, 9 * d + col, row);
            const BYTE shown = PixelOf(g_frameImage, x + col, 277 + row);
            const BYTE under = PixelOf(g_sceneImage, g_cameraX + x + col, 277 + row);
            if (shown != (source == digits->key ? under : source)) {
                return false;
            }
        }
    }
    return true;
}

bool PlaceBlank(int x) {
    for (int row = 0; row < 11; ++row) {
        for (int col = 0; col < 9; ++col) {
            if (PixelOf(g_frameImage, x + col, 277 + row) !=
                PixelOf(g_sceneImage, g_cameraX + x + col, 277 + row)) {
                return false;
            }
        }
    }
    return true;
}

}  // namespace

std::string ShownScore() {
    std::string shown;
    for (int x = 155; x <= 225; x += 10) {
        if (PlaceBlank(x)) {
            if (!shown.empty()) {
                return "?";  // a gap inside the number
            }
            continue;
        }
        int found = -1;
        for (int d = 0; d < 10 && found < 0; ++d) {
            if (PlaceShows(x, d)) {
                found = d;
            }
        }
        if (found < 0) {
            return "?";
        }
        shown += static_cast<char>('0' + found);
    }
    return shown;
}

}  // namespace round_test
