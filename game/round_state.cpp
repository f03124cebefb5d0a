#include "game/round_state.h"

#include "game/catch.h"
#include "game/fish.h"
#include "game/hook.h"

BYTE g_roundShown = 0;
BYTE g_regionIndex = 0;
BYTE g_difficultyIndex = 0;
BYTE g_difficultyLevel = 0;
INT g_score = 0;
INT g_scoreShown = 0;

// The start values equal the reset values, so the first round of a run needs no reset.
INT g_frameCount = 0;
INT g_energy = ENERGY_MAX;
INT g_fishermanX = 0;
INT g_facingRight = 1;
INT g_cameraX = 0;
INT g_redrawX = 0;
INT g_bottomScrollX = 0;
INT g_waveScrollX = 0;
BYTE g_bob = 0;
BYTE g_bobRising = 1;
INT g_frameTick = 0;
INT g_basketX = 100;
INT g_basketRight = 1;
INT g_basketY = 0;
INT g_basketFull = 0;

BYTE g_basketRush = 0;
BYTE g_cheerCount = 0;
BYTE g_splashCount = 0;
BYTE g_inkCount = 0;

void RoundReset() {
    g_cameraX = 0;
    g_frameTick = 0;
    g_waveScrollX = 0;
    g_fishermanX = 0;
    g_redrawX = 0;
    g_bottomScrollX = 0;
    g_basketY = 0;
    g_basketFull = 0;
    g_hookX = HOOK_START_X;
    g_hookY = HOOK_START_Y;
    g_energy = ENERGY_MAX;
    g_facingRight = 1;
    g_basketRight = 1;
    g_basketX = 100;
    g_bob = 0;
    g_bobRising = 1;
    g_motionIndex = 0;
    g_strikeCount = 0;
    g_linePulse = 0;
    g_hookedNext = 0;
    g_splashCount = 0;
    g_basketRush = 0;
    g_inkCount = 0;
    g_freezeCount = 0;
    g_cheerCount = 0;
    // A slot is free by its active flag alone; the other fields are left as they are.
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
