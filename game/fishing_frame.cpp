#include "game/fishing_frame.h"

#include "app/input.h"
#include "app/shell.h"
#include "assets/catalogue.h"
#include "game/art.h"
#include "game/catch.h"
#include "game/fish.h"
#include "game/hook.h"
#include "game/ink.h"
#include "game/round_state.h"
#include "game/score.h"
#include "platform/gdi.h"
#include "screens/transitions.h"

namespace {

constexpr INT BOAT_STEP = 20;
constexpr INT BOAT_MAX_X = 400;
constexpr INT HOOK_MAX_X = 420;
constexpr INT SHALLOW_HOOK_Y = 130;  // a hook above this is dragged along by the boat
constexpr INT FRAME_W = 240;
constexpr INT FRAME_H = 293;
constexpr INT STRIP_W = 300;
constexpr INT BASKET_W = 55;
constexpr INT BASKET_H = 60;

// Frames per pixel of energy lost: easy 5, normal 4, hard 3.
INT DrainDivisor() {
    switch (g_difficultyLevel) {
        case 1:
            return 5;
        case 2:
            return 4;
        default:
            return 3;
    }
}

void DragHookRight() {
    g_hookX += 10;
    if (g_hookX > HOOK_MAX_X) {
        g_hookX = HOOK_MAX_X;
    }
    g_hookY += 7;
}

// The 10-pixel step is limited at 0 before any further pull is taken off.
void DragHookLeft() {
    g_hookX -= 10;
    if (g_hookX < 0) {
        g_hookX = 0;
    }
    g_hookY += 7;
}

// Four tests in a row, each seeing the ones before: on the frame the boat reaches an end of
// its range a shallow hook is dragged twice.
void MoveBoat() {
    if (g_keyRight == 1 && g_fishermanX < BOAT_MAX_X) {
        g_fishermanX += BOAT_STEP;
        g_cameraX += 10;
        g_bottomScrollX += 30;
        g_facingRight = 1;
        if (g_hookY < SHALLOW_HOOK_Y) {
            DragHookRight();
        }
    }
    if (g_keyLeft == 1 && g_fishermanX > 0) {
        g_fishermanX -= BOAT_STEP;
        g_cameraX -= 10;
        g_bottomScrollX -= 30;
        g_facingRight = 0;
        if (g_hookY < SHALLOW_HOOK_Y) {
            DragHookLeft();
        }
    }
    if (g_keyRight == 1 && g_fishermanX == BOAT_MAX_X && g_hookY < SHALLOW_HOOK_Y) {
        DragHookRight();
        if (g_facingRight == 0) {
            g_hookX -= 9;
        }
    }
    if (g_keyLeft == 1 && g_fishermanX == 0 && g_hookY < SHALLOW_HOOK_Y) {
        DragHookLeft();
        if (g_facingRight == 1) {
            g_hookX -= 9;
        }
    }
}

void DrawBasket(INT x, INT y) {
    Sprite* empty = RegionArt(g_img_basket);
    if (g_basketFull == 0) {
        DrawKeyed(empty, g_sceneImage, x, y, BASKET_W, BASKET_H, g_basketRight == 1 ? 55 : 0, 0);
        return;
    }
    // The full basket alternates its two frames; its pixels are keyed like the empty one's.
    const INT frame = g_frameTick % 2 + (g_basketRight == 1 ? 2 : 0);
    DrawKeyedAs(RegionArt(g_img_taken_basket), empty, g_sceneImage, x, y, BASKET_W, BASKET_H,
                frame * BASKET_W, 0);
}

// On easy the basket follows the boat, faster the further behind it is; the thresholds are
// 20 pixels lower on the left side.
void FollowBoat() {
    const INT d = g_fishermanX - g_basketX;
    if (d > 0) {
        g_basketRight = 1;
        if (d >= 230) {
            g_basketX += 15;
        } else if (d >= 180) {
            g_basketX += 12;
        } else if (d >= 130) {
            g_basketX += 9;
        } else if (d >= 100) {
            g_basketX += 6;
        }
    } else {
        const INT e = g_basketX - g_fishermanX;
        g_basketRight = 0;
        if (e >= 210) {
            g_basketX -= 15;
        } else if (e >= 160) {
            g_basketX -= 12;
        } else if (e >= 110) {
            g_basketX -= 9;
        } else if (e >= 80) {
            g_basketX -= 6;
        }
    }
}

// On normal and hard the basket patrols between x 30 and 370, rushing after a kind-2 catch.
void Patrol() {
    const INT step = g_difficultyLevel == 2 ? 2 : 4;
    const INT rush = g_difficultyLevel == 2 ? 5 : 10;
    if (g_basketRight == 0) {
        g_basketX -= step;
        if (g_basketRush > 0) {
            g_basketX -= rush;
            g_basketRush = static_cast<BYTE>(g_basketRush - 1);
        }
        if (g_basketX < 30) {
            g_basketRight = 1;
        }
    } else {
        g_basketX += step;
        if (g_basketRush > 0) {
            g_basketRush = static_cast<BYTE>(g_basketRush - 1);
            g_basketX += rush;
        }
        if (g_basketX > 370) {
            g_basketRight = 0;
        }
    }
}

void UpdateBasket() {
    g_basketY = 81 - g_bob;
    if (g_difficultyLevel == 1) {
        DrawBasket(g_basketX + 2 * g_bob, g_basketY);  // sways sideways with the swell
        FollowBoat();
    } else {
        Patrol();
        DrawBasket(g_basketX, g_basketY);
    }
}

void DrawFisherman() {
    INT sx = g_facingRight == 1 ? 0 : 94;
    if (g_cheerCount > 0) {
        if ((g_cheerCount / 4) % 2 == 0) {
            sx += 47;
        }
    }
    DrawKeyed(FishermanArt(), g_sceneImage, g_fishermanX, g_bob + 82, 47, 49, sx, 0);
    if (g_cheerCount > 0) {
        g_cheerCount = static_cast<BYTE>(g_cheerCount - 1);
    }
}

// The swell runs 0, 1, ..., 8, 7, ..., 0 with a period of 16 frames.
void Swell() {
    if (g_bobRising == 1) {
        g_bob = static_cast<BYTE>(g_bob + 1);
        if (g_bob > 7) {
            g_bobRising = 0;
        }
    } else {
        g_bob = static_cast<BYTE>(g_bob - 1);
        if (g_bob == 0) {
            g_bobRising = 1;
        }
    }
}

void DrawWaves() {
    DrawKeyed(RegionArt(g_img_wave), g_sceneImage, g_redrawX, 120, STRIP_W, 30, g_waveScrollX, 0);
    g_waveScrollX += 7;
    if (g_waveScrollX > 48) {
        g_waveScrollX = 0;
    }
}

void DrawStatusBar() {
    DrawKeyed(g_img_bar_case, g_frameImage, 10, 10, 180, 10, 0, 0);
    DrawOpaque(g_img_eng_bar, g_frameImage, 15, 12, g_energy, 6, 0, 0);
    DrawKeyed(RegionArt(g_img_eng_man), g_frameImage, 205, 5, 21, 27, (g_energy % 2) * 21, 0);
    DrawKeyed(RegionArt(g_img_exit), g_frameImage, 2, 266, 50, 25, 0, 0);
    DrawScore();
}

void Present() {
    g_hdc = GetDC(g_hWnd);
    if (g_roundShown == 1) {
        PresentImage(g_frameImage, g_hdc, 0, 0, FRAME_W, FRAME_H);
    } else {
        // The first frame of a round appears with the interleaved reveal.
        PresentImage(g_frameImage, g_hdc, 0, 0, FRAME_W, 1);
        g_roundShown = 1;
    }
    ReleaseDC(g_hWnd, g_hdc);
}

}  // namespace

void FishingFrame() {
    // energy drain
    g_frameCount += 1;
    if (g_frameCount % DrainDivisor() == 0) {
        g_energy -= 1;
    }
    // round over: nothing is drawn on the frame that ends it
    if (g_energy < 0) {
        RoundReset();
        g_screen = SCREEN_RANKING;
        EnterEnd();
        return;
    }
    // exit button (frame coordinates of the stylus latch)
    if (g_penDown == 1 && g_penY > 270 && g_penX < 50) {
        RoundReset();
        EnterMenu();
        g_screen = SCREEN_OPTIONS;
        g_penDown = 0;
        return;
    }

    MoveBoat();
    // Only a 300-pixel strip around the view is renewed each frame.
    g_redrawX = g_cameraX - 30;
    if (g_redrawX < 0) {
        g_redrawX = 0;
    }
    DrawOpaque(RegionArt(g_img_back), g_sceneImage, g_redrawX, 0, STRIP_W, FRAME_H, g_redrawX, 0);
    UpdateBasket();
    DrawKeyed(RegionArt(g_img_sheep), g_sceneImage, g_fishermanX, g_bob + 112, 54, 30,
              g_facingRight == 1 ? 0 : 54, 0);
    DrawFisherman();
    Swell();
    DrawWaves();

    UpdateAndDrawFish();
    g_frameTick += 1;
    if (g_frameTick > 120) {
        g_frameTick = 0;
    }
    UpdateHook(g_fishermanX);
    HookFish();
    ResolveCatch();
    // Hooked fish hang below the hook; they are drawn there on the next frame.
    for (FishSlot& hooked : g_hookedFish) {
        if (hooked.active == 1) {
            hooked.x = g_hookX - 10;
            hooked.y = g_hookY - 10;
        }
    }
    const INT rodX = g_facingRight == 1 ? g_fishermanX + 45 : g_fishermanX - 5;
    DrawFishingLine(rodX, g_bob + 90, g_hookX + 10, g_hookY);
    DrawKeyed(RegionArt(g_img_bottom), g_sceneImage, g_redrawX, 240, STRIP_W, 53, g_bottomScrollX,
              0);
    if (g_splashCount != 0) {
        DrawSplash();
    }

    DrawOpaque(g_sceneImage, g_frameImage, 0, 0, FRAME_W, FRAME_H, g_cameraX, 0);
    if (g_inkCount > 0) {
        DrawInkDarkness(g_fishermanX / 2, g_hookX, g_hookY);
        g_inkCount = static_cast<BYTE>(g_inkCount - 1);
    }
    DrawStatusBar();
    Present();
}
