#include "game/hook.h"

#include "app/input.h"
#include "assets/catalogue.h"
#include "assets/cues.h"
#include "game/art.h"
#include "game/round_state.h"

INT g_hookX = HOOK_START_X;
INT g_hookY = HOOK_START_Y;
BYTE g_strikeCount = 0;
BYTE g_linePulse = 0;

namespace {

constexpr BYTE STRIKE_FRAMES = 10;
constexpr INT STRIKE_LIFT = 30;
constexpr INT STRIKE_CEILING = 45;  // a strike stops once the hook is thrown above this

// Under water the hook drifts towards its resting place beside the fisherman: about 40
// pixels right of him when he faces right, about 10 left of him when he faces left.
void Drift(INT fishermanX) {
    const INT toRight = fishermanX - g_hookX + 40;
    const INT toLeft = g_hookX - fishermanX + 10;
    int move = 0;  // +1 right, -1 left
    if (g_facingRight == 1) {
        move = toRight > 0 ? 1 : (toLeft > 0 ? -1 : 0);
    } else {
        move = toLeft > 0 ? -1 : (toRight > 0 ? 1 : 0);
    }
    if (move == 0) {
        return;
    }
    // The deeper the hook, the faster it follows.
    INT step = 1;
    if (g_hookY >= 180) {
        step = 6;
    } else if (g_hookY >= 160) {
        step = 4;
    } else if (g_hookY >= 140) {
        step = 2;
    }
    if (move > 0) {
        if (step == 6 && toRight < 6) {
            g_hookX = fishermanX + 39;
        } else {
            g_hookX += step;
        }
        if (fishermanX - g_hookX > 70) {
            g_hookX += 5;  // catch up with a boat that has run ahead
        }
    } else {
        if (step == 6 && toLeft < 6) {
            g_hookX = fishermanX - 9;
        } else {
            g_hookX -= step;
        }
        if (g_hookX - fishermanX > 60) {
            g_hookX -= 5;
        }
    }
}

}  // namespace

void UpdateHook(INT fishermanX) {
    // strike start: a new press restarts the count
    if (g_keyEnter == 1) {
        g_keyEnter = 0;
        g_strikeCount = STRIKE_FRAMES;
        PlayCue(u"\\taken_fish.mc8");
    }
    // strike step: yank up and towards the fisherman
    if (g_strikeCount != 0 && g_hookY > STRIKE_CEILING) {
        g_hookY -= STRIKE_LIFT;
        if (fishermanX < g_hookX) {
            g_hookX -= 10;
        } else if (fishermanX >= g_hookX + 10) {
            g_hookX += 10;
        }
        g_strikeCount = static_cast<BYTE>(g_strikeCount - 1);
    }
    if (g_hookY < STRIKE_CEILING) {
        g_strikeCount = 0;
    }
    // Reeling lifts the hook only while it is under water; near the surface it hovers.
    if (g_keyUp == 1) {
        if (g_hookY > 150) {
            g_hookY -= 7;
        } else {
            g_hookY += 3;
        }
    }
    if (g_keyDown == 1) {
        if (g_hookY < 120) {
            g_hookY += 7;
        } else if (g_hookY < 240) {
            g_hookY += 5;
        }
    }
    if (g_hookY > 130) {
        Drift(fishermanX);
    }
    const INT sx = (g_linePulse == 15 || g_linePulse == 16) ? 20 : 0;
    DrawKeyed(RegionArt(g_img_hook), g_sceneImage, g_hookX, g_hookY, 20, 20, sx, 0);
}

void DrawFishingLine(INT x0, INT y0, INT x1, INT y1) {
    Sprite* rope = RegionArt(g_img_rope);
    const INT dx = x1 - x0;
    const INT dy = y1 - y0;
    const INT pulse = g_linePulse;
    // The line hangs almost straight from the rod and swings towards the hook near its end.
    for (INT n = 0; n < 15; ++n) {
        const INT py = y0 + (n * dy) / 15;
        const INT px = x0 + ((n * dx) / 15) / (n <= 6 ? n + 1 : 16 - n);
        const bool bright = pulse >= n - 1 && pulse <= n + 1;
        DrawKeyed(rope, g_sceneImage, px, py, 3, 3, bright ? 3 : 0, 0);
    }
    const INT lastY = (y0 + (14 * dy) / 15 + y1) / 2;
    const INT lastX = (x0 + ((14 * dx) / 15) / 2 + x1) / 2;
    const bool lastBright = pulse >= 14 && pulse <= 16;
    DrawKeyed(rope, g_sceneImage, lastX, lastY, 3, 3, lastBright ? 3 : 0, 0);

    g_linePulse = static_cast<BYTE>(g_linePulse + 1);
    if (g_linePulse > 16) {
        g_linePulse = 0;
    }
}
