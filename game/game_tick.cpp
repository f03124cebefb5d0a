#include "game/game_tick.h"

#include "assets/cues.h"
#include "game/fish.h"
#include "game/hook.h"
#include "game/round_state.h"

BYTE g_tickCount = 0;

namespace {

constexpr BYTE TICK_CYCLE_LAST = 56;

// A hook thrown high falls back fast; one left alone settles about y 200.
void FloatHook() {
    const INT y = g_hookY;
    if (y < 0) {
        return;
    }
    if (y <= 54) {
        g_hookY += 18;
    } else if (y <= 84) {
        g_hookY += 22;
    } else if (y <= 119) {
        g_hookY += 25;
    } else if (y <= 199) {
        g_hookY += 4;
    } else if (y <= 419) {
        g_hookY -= 4;
    }
}

// Even slots enter from the left heading right, odd ones from the right heading left.
void PlaceAtEdge(FishSlot& fish, int slot) {
    fish.active = 1;
    fish.direction = slot % 2 == 0 ? 1 : 0;
    fish.x = slot % 2 == 0 ? 0 : SCENE_FISH_RIGHT;
    fish.frameX = 0;
}

void SpawnSwimmer() {
    for (int i = 0; i < SCHOOL_SLOTS; ++i) {
        FishSlot& fish = g_swimFish[i];
        if (fish.active == 1) {
            continue;
        }
        PlaceAtEdge(fish, i);
        fish.y = 150 + 7 * i;
        fish.kind = static_cast<BYTE>((5 * g_fishermanX + g_tickCount + i) % 6);
        SwimFishSize(fish.kind, &fish.width, &fish.height);
        if (i % 5 == 0) {
            PlayCue(u"\\p_sound.mc8");
        }
        return;
    }
}

void SpawnBottom() {
    for (int i = 0; i < BOTTOM_SCHOOL_SLOTS; ++i) {
        FishSlot& fish = g_bottomFish[i];
        if (fish.active == 1) {
            continue;
        }
        PlaceAtEdge(fish, i);
        fish.y = 220 + 2 * i;
        fish.kind = static_cast<BYTE>(i % 2);
        BottomFishSize(fish.kind, &fish.width, &fish.height);
        return;
    }
}

}  // namespace

void GameTick() {
    g_tickCount = static_cast<BYTE>(g_tickCount + 1);
    if (g_tickCount > TICK_CYCLE_LAST) {
        g_tickCount = 0;
    }
    FloatHook();
    // Swimmers on four ticks out of eight, bottom fish on one out of seven; none while frozen.
    if (g_tickCount % 8 >= 4 && g_freezeCount == 0) {
        SpawnSwimmer();
    }
    if (g_tickCount % 7 == 0 && g_freezeCount == 0) {
        SpawnBottom();
    }
}
