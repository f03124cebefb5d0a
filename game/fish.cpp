#include "game/fish.h"

#include "assets/catalogue.h"
#include "game/art.h"
#include "game/round_state.h"

FishSlot g_swimFish[SWIM_SLOTS] = {};
FishSlot g_bottomFish[BOTTOM_SLOTS] = {};
FishSlot g_hookedFish[HOOKED_SLOTS] = {};

// The wandering: every dx lies in 3..8 and every |dy| in 3..6, read in order by all fish.
const MotionStep g_motionTable[MOTION_PAIRS] = {
    {4, -3}, {7, 3},  {3, 5},  {6, -4}, {3, -5}, {7, -6}, {6, 4},  {5, -5}, {4, -6}, {3, -6},
    {5, 6},  {3, 3},  {6, -3}, {7, -3}, {4, 4},  {6, 5},  {4, -5}, {3, 6},  {6, -6}, {5, 4},
    {3, -3}, {7, 6},  {5, -3}, {3, -6}, {5, 3},  {4, -4}, {8, 5},  {4, 5},  {6, 3},  {5, -6},
    {7, 4},  {5, -4}, {4, 3},  {3, -4}, {6, -5}, {6, 6},  {4, 6},  {7, 5},  {3, 4},  {5, 5},
};
BYTE g_motionIndex = 0;
BYTE g_freezeCount = 0;

void SwimFishSize(int kind, INT* width, INT* height) {
    static const INT sizes[6][2] = {{63, 35}, {44, 34}, {44, 34}, {64, 36}, {37, 29}, {38, 23}};
    const int k = (kind >= 0 && kind < 6) ? kind : 0;
    *width = sizes[k][0];
    *height = sizes[k][1];
}

void BottomFishSize(int kind, INT* width, INT* height) {
    static const INT sizes[2][2] = {{71, 41}, {28, 30}};
    const int k = (kind >= 0 && kind < 2) ? kind : 0;
    *width = sizes[k][0];
    *height = sizes[k][1];
}

void HookedFishSize(int hookedKind, INT* width, INT* height) {
    static const INT sizes[8][2] = {{44, 68}, {28, 37}, {38, 36}, {38, 68},
                                    {25, 34}, {29, 34}, {66, 38}, {22, 22}};
    const int k = (hookedKind >= 0 && hookedKind < 8) ? hookedKind : 0;
    *width = sizes[k][0];
    *height = sizes[k][1];
}

namespace {

void NextMotion() {
    g_motionIndex = static_cast<BYTE>(g_motionIndex + 1);
    if (g_motionIndex >= MOTION_PAIRS) {
        g_motionIndex = 0;
    }
}

// Two frames alternate: 0, width, 0, ...
void AdvanceFrame(FishSlot& fish) {
    fish.frameX += fish.width;
    if (fish.frameX > fish.width) {
        fish.frameX = 0;
    }
}

// Frames 0-1 of a strip head right, frames 2-3 head left.
void DrawFree(Sprite* art, FishSlot& fish) {
    const INT sx = fish.direction == 1 ? fish.frameX : fish.frameX + 2 * fish.width;
    DrawKeyed(art, g_sceneImage, fish.x, fish.y, fish.width, fish.height, sx, 0);
    // Half a height above the drawn frame's top edge, not its middle.
    fish.hitX = fish.x + fish.width / 2;
    fish.hitY = fish.y - fish.height / 2;
}

// Sideways step of a free fish; false when it has left the water and its slot was freed.
bool MoveSideways(FishSlot& fish, INT step) {
    if (fish.direction == 1) {
        fish.x += step;
        if (fish.x > SCENE_FISH_RIGHT) {
            fish.active = 0;
            return false;
        }
    } else {
        fish.x -= step;
        if (fish.x < 0) {
            fish.active = 0;
            return false;
        }
    }
    return true;
}

void UpdateHooked() {
    for (FishSlot& fish : g_hookedFish) {
        if (fish.active != 1) {
            continue;
        }
        DrawKeyed(HookedFishArt(fish.kind), g_sceneImage, fish.x, fish.y, fish.width, fish.height,
                  fish.frameX, 0);
        if (g_frameTick % 8 == 0) {
            AdvanceFrame(fish);
        }
    }
}

void UpdateBottom() {
    for (int i = 0; i < BOTTOM_SLOTS; ++i) {
        FishSlot& fish = g_bottomFish[i];
        if (fish.active != 1) {
            continue;
        }
        Sprite* art = BottomFishArt(fish.kind);
        if (g_freezeCount > 0) {
            DrawFree(art, fish);
            continue;
        }
        const MotionStep& step = g_motionTable[g_motionIndex];
        const bool escaped = i >= BOTTOM_SCHOOL_SLOTS;
        // Crawlers go between one pixel back and four forward; escaped ones hurry off.
        if (!MoveSideways(fish, step.dx - 4 + (escaped ? 3 : 0))) {
            continue;
        }
        fish.y += step.dy;
        if (fish.y < BOTTOM_TOP) {
            fish.y = escaped ? fish.y + 7 : BOTTOM_TOP;  // an escaped fish sinks back
        }
        if (fish.y > BOTTOM_FLOOR) {
            fish.y = BOTTOM_FLOOR;
        }
        NextMotion();
        DrawFree(art, fish);
        if (g_frameTick % 18 == 0) {
            AdvanceFrame(fish);
        }
    }
}

void UpdateSwimming() {
    for (int i = 0; i < SWIM_SLOTS; ++i) {
        FishSlot& fish = g_swimFish[i];
        if (fish.active != 1) {
            continue;
        }
        Sprite* art = SwimFishArt(fish.kind);
        if (g_freezeCount > 0) {
            DrawFree(art, fish);
            continue;
        }
        const MotionStep& step = g_motionTable[g_motionIndex];
        const bool escaped = i >= SCHOOL_SLOTS;
        if (!MoveSideways(fish, step.dx - 1 + (escaped ? 4 : 0))) {
            continue;
        }
        if (!escaped) {
            fish.y += step.dy;
            if (fish.y < SCHOOL_TOP) {
                fish.y = SCHOOL_TOP;
            }
        } else {
            fish.y += step.dy < 0 ? -step.dy : step.dy;  // escaped fish only dive
        }
        if (fish.y > SCHOOL_BOTTOM) {
            fish.y = SCHOOL_BOTTOM;
        }
        NextMotion();
        DrawFree(art, fish);
        if (g_frameTick % 7 == 0) {
            AdvanceFrame(fish);
        }
    }
}

}  // namespace

void UpdateAndDrawFish() {
    UpdateHooked();
    UpdateBottom();
    UpdateSwimming();
    if (g_freezeCount > 0) {
        g_freezeCount = static_cast<BYTE>(g_freezeCount - 1);
    }
}
