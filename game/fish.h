// The three fish tables of a round, the shared motion table and the per-frame movement.
#pragma once

#include "platform/types.h"

struct FishSlot {
    INT active;     // only 1 counts as occupied
    INT direction;  // 1 heading right, 0 heading left (not used on the hook)
    BYTE kind;
    INT frameX;  // source x of the current animation frame
    INT x, y;    // top-left of the drawn frame
    INT width, height;
    INT hitX, hitY;  // where hooking tests the fish; refreshed whenever it is drawn
};

constexpr int SWIM_SLOTS = 20;
constexpr int SCHOOL_SLOTS = 15;  // 0-14 spawned by the clock, 15-19 escaped from the hook
constexpr int BOTTOM_SLOTS = 6;
constexpr int BOTTOM_SCHOOL_SLOTS = 3;  // 0-2 spawned, 3-5 escaped
constexpr int HOOKED_SLOTS = 10;
constexpr int MOTION_PAIRS = 40;
constexpr int HOOKED_FROM_BOTTOM = 6;  // hooked kinds 6 and 7 are bottom kinds 0 and 1

constexpr INT SCENE_FISH_RIGHT = 420;  // fish leaving past 0..420 are gone
constexpr INT SCHOOL_TOP = 150;
constexpr INT SCHOOL_BOTTOM = 190;
constexpr INT BOTTOM_TOP = 220;
constexpr INT BOTTOM_FLOOR = 250;

extern FishSlot g_swimFish[SWIM_SLOTS];
extern FishSlot g_bottomFish[BOTTOM_SLOTS];
extern FishSlot g_hookedFish[HOOKED_SLOTS];

struct MotionStep {
    INT dx, dy;
};
extern const MotionStep g_motionTable[MOTION_PAIRS];
extern BYTE g_motionIndex;  // shared cursor: advances once per fish moved
extern BYTE g_freezeCount;  // frames left in which no fish moves and none is spawned

// Frame sizes by kind.
void SwimFishSize(int kind, INT* width, INT* height);
void BottomFishSize(int kind, INT* width, INT* height);
void HookedFishSize(int hookedKind, INT* width, INT* height);

// Moves every free fish one step, animates and draws every fish into the scene: hooked,
// then bottom, then swimming fish, so swimmers cover the others.
void UpdateAndDrawFish();
