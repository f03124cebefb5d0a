#include "game/catch.h"

#include "assets/catalogue.h"
#include "assets/cues.h"
#include "game/art.h"
#include "game/fish.h"
#include "game/hook.h"
#include "game/round_state.h"

BYTE g_hookedNext = 0;

namespace {

// Energy and score a landed fish is worth, by hooked kind.
struct CatchValue {
    INT energy;
    INT score;
    BYTE* effect;  // the timed effect it starts, or null
};

const CatchValue& ValueOf(int hookedKind) {
    static const CatchValue values[8] = {
        {5, 500, nullptr},   {8, 800, nullptr},          {2, 200, &g_basketRush},
        {3, 300, nullptr},   {2, 200, &g_inkCount},      {15, 1500, nullptr},
        {12, 1200, nullptr}, {20, 2000, &g_freezeCount},
    };
    return values[(hookedKind >= 0 && hookedKind < 8) ? hookedKind : 0];
}

// Strict on every side: a hit point exactly half a width away is missed.
bool Touches(const FishSlot& fish, INT pointX, INT pointY) {
    return pointX - fish.width / 2 < fish.hitX && fish.hitX < pointX + fish.width / 2 &&
           pointY - fish.height / 2 < fish.hitY && fish.hitY < pointY + fish.height / 2;
}

// The hooked table is a ring: with ten on the hook the next catch replaces the oldest.
void PutOnHook(BYTE* k, int hookedKind) {
    FishSlot& hooked = g_hookedFish[*k];
    hooked.active = 1;
    hooked.kind = static_cast<BYTE>(hookedKind);
    hooked.frameX = 0;
    HookedFishSize(hookedKind, &hooked.width, &hooked.height);
    *k = static_cast<BYTE>(*k + 1);
    if (*k >= HOOKED_SLOTS) {
        *k = 0;
    }
}

void Land() {
    for (FishSlot& hooked : g_hookedFish) {
        if (hooked.active != 1) {
            continue;
        }
        hooked.active = 0;
        g_basketFull = 1;
        const CatchValue& value = ValueOf(hooked.kind);
        g_energy += value.energy;
        g_score += value.score;
        if (value.effect != nullptr) {
            *value.effect = EFFECT_FRAMES;
        }
        if (g_energy > ENERGY_MAX) {
            g_energy = ENERGY_MAX;
        }
        if (g_score > SCORE_LIMIT) {
            g_score = SCORE_LIMIT;
        }
        g_splashCount = 3;
        g_cheerCount = 16;
    }
}

// An escaped fish goes back to the first free slot of its table's escape range, if any.
void Release(const FishSlot& hooked) {
    const bool fromBottom = hooked.kind >= HOOKED_FROM_BOTTOM;
    FishSlot* table = fromBottom ? g_bottomFish : g_swimFish;
    const int first = fromBottom ? BOTTOM_SCHOOL_SLOTS : SCHOOL_SLOTS;
    const int end = fromBottom ? BOTTOM_SLOTS : SWIM_SLOTS;
    for (int i = first; i < end; ++i) {
        FishSlot& fish = table[i];
        if (fish.active == 1) {
            continue;
        }
        fish.active = 1;
        fish.direction = i % 2 == 0 ? 1 : 0;
        fish.frameX = 0;
        if (fromBottom) {
            fish.kind = static_cast<BYTE>(hooked.kind - HOOKED_FROM_BOTTOM);
            BottomFishSize(fish.kind, &fish.width, &fish.height);
        } else {
            fish.kind = hooked.kind;
            SwimFishSize(fish.kind, &fish.width, &fish.height);
        }
        fish.x = g_hookX + 10;
        fish.y = g_hookY - 20;
        return;
    }
}

void Escape() {
    for (FishSlot& hooked : g_hookedFish) {
        if (hooked.active != 1) {
            continue;
        }
        hooked.active = 0;
        g_splashCount = 7;
        Release(hooked);
    }
}

}  // namespace

void HookFish() {
    if (g_strikeCount == 0) {
        return;
    }
    BYTE k = g_hookedNext;
    // Escaped fish (the upper slots of each table) cannot be caught again straight away.
    for (int i = 0; i < SCHOOL_SLOTS; ++i) {
        FishSlot& fish = g_swimFish[i];
        if (fish.active == 1 && Touches(fish, g_hookX + 20, g_hookY + 10)) {
            PutOnHook(&k, fish.kind);
            fish.active = 0;
        }
    }
    for (int i = 0; i < BOTTOM_SCHOOL_SLOTS; ++i) {
        FishSlot& fish = g_bottomFish[i];
        if (fish.active == 1 && Touches(fish, g_hookX + 10, g_hookY + 10)) {
            PutOnHook(&k, fish.kind + HOOKED_FROM_BOTTOM);
            fish.active = 0;
        }
    }
    g_hookedNext = k;
}

void ResolveCatch() {
    if (g_strikeCount != 0) {
        return;
    }
    const bool inBasket = g_basketX + 10 <= g_hookX && g_hookX <= g_basketX + 35 &&
                          g_basketY + 30 <= g_hookY && g_hookY <= g_basketY + 60;
    if (inBasket) {
        Land();
    } else if (g_hookY + 10 > g_basketY + 60 && g_hookY < 150) {
        // The hook hangs in the air just above the water, outside the basket.
        Escape();
    }
}

void DrawSplash() {
    const BYTE v = g_splashCount;
    if (v == 0) {
        return;
    }
    Sprite* spray = RegionArt(g_img_spray);
    if (v >= 1 && v <= 3) {
        DrawKeyed(spray, g_sceneImage, g_basketX, g_basketY - 5, 55, 37, 0, 0);
        if (v == 3) {
            LPCWSTR cue = CueForDifficulty(g_difficultyLevel, u"\\n_taken_succ.mc8",
                                           u"\\j_taken_succ.mc8", u"\\p_taken_succ.mc8");
            if (cue != nullptr) {
                PlayCue(cue);
            }
        }
    } else if (v >= 5 && v <= 7) {
        DrawKeyed(spray, g_sceneImage, g_hookX, g_hookY - 30, 55, 37, 0, 0);
        if (v == 7) {
            LPCWSTR cue = CueForDifficulty(g_difficultyLevel, u"\\n_taken_fail.mc8",
                                           u"\\j_taken_fail.mc8", u"\\p_taken_fail.mc8");
            if (cue != nullptr) {
                PlayCue(cue);
            }
        }
    }
    // An escape ends with one empty frame.
    g_splashCount = v == 4 ? 0 : static_cast<BYTE>(v - 1);
}
