#include "screens/intro.h"

#include "app/input.h"
#include "app/shell.h"
#include "assets/catalogue.h"
#include "screens/options.h"
#include "screens/present.h"
#include "screens/transitions.h"

BYTE g_introTick = 0;
WORD g_storyScroll = 0;
BYTE g_introShown = 0;

namespace {

constexpr BYTE TICK_LAST = 240;
constexpr INT STORY_W = 232;
constexpr INT STORY_WINDOW_H = 70;  // the story shows through rows 170..239
constexpr INT STORY_WINDOW_BOTTOM = 240;
constexpr INT STORY_RISE = 140;  // passes while the first rows rise into the window

struct Story {
    INT tail;      // half the scroll limit
    INT firstRow;  // where the story starts in g_img_story
};

constexpr Story STORIES[] = {{223, 0}, {146, 153}, {175, 229}};

struct Favourites {
    INT row, height;
};

constexpr Favourites FAVOURITES[] = {{0, 23}, {23, 23}, {46, 26}};

DWORD KeyOf(const Sprite* sprite) {
    return sprite->key | KEY_FLAG;
}

void DrawLastPortrait(INT t) {
    INT r = t % 40;
    INT q = t % 60;
    if (r >= 3 && r <= 5) {
        // A piece that flies up and to the left over three passes.
        g_img_intro_p2->Draw(g_sceneImage, 67 - 13 * r, 2 * (35 - r), 26, 40, 120, 0,
                             KeyOf(g_img_intro_p2));
    }
    if (r >= 1 && r <= 6) {
        g_img_intro_p2->Draw(g_sceneImage, 50, 72, 26, 40, 146, 0, KeyOf(g_img_intro_p2));
    }
    INT headX = (q >= 1 && q <= 6) ? 80 : 40 * ((t % 8) / 4);
    g_img_intro_p2->Draw(g_sceneImage, 67, 59, 40, 40, headX, 0, KeyOf(g_img_intro_p2));
    g_img_intro_p->Draw(g_sceneImage, 50, 95, 88, 54, 0, 0, KeyOf(g_img_intro_p));
}

void DrawPortrait(INT d, INT t) {
    switch (d) {
        case 1:
            g_img_intro_n->Draw(g_sceneImage, 50, 50, 100, 110, 100 * ((t % 12) / 3), 0,
                                KeyOf(g_img_intro_n));
            break;
        case 2:
            g_img_intro_j->Draw(g_sceneImage, 50, 50, 100, 110, 100 * ((t % 12) / 6), 0,
                                KeyOf(g_img_intro_j));
            break;
        default:
            DrawLastPortrait(t);
            break;
    }
}

void DrawStory(const Story& story) {
    g_storyScroll = static_cast<WORD>(g_storyScroll + 1);
    if (g_storyScroll > 2 * story.tail) {
        g_storyScroll = 0;
    }
    INT s = g_storyScroll;
    INT y, row, height;
    if (s < STORY_RISE) {
        height = s / 2;
        y = STORY_WINDOW_BOTTOM - s / 2;
        row = story.firstRow;
    } else {
        y = STORY_WINDOW_BOTTOM - STORY_WINDOW_H;
        row = story.firstRow + s / 2 - STORY_WINDOW_H;
        height = story.tail - s / 2;
        if (height > STORY_WINDOW_H) {
            height = STORY_WINDOW_H;
        }
    }
    g_img_story->Draw(g_sceneImage, 4, y, STORY_W, static_cast<UINT>(height), 0, row,
                      KeyOf(g_img_story));
}

void HandleButtons() {
    if (g_penDown != 1 || g_penY <= 268 || g_penY >= 282) {
        return;
    }
    if (g_penX > 40 && g_penX < 95) {
        g_storyScroll = 0;
        EnterMenu();
        g_screen = SCREEN_OPTIONS;
    } else if (g_penX > 145 && g_penX < 200) {
        g_storyScroll = 0;
        EnterFishing(g_region, g_difficulty);
        g_screen = SCREEN_FISHING;
    }
}

}  // namespace

void IntroFrame() {
    g_introTick = static_cast<BYTE>(g_introTick + 1);
    if (g_introTick > TICK_LAST) {
        g_introTick = 0;
    }
    INT t = g_introTick;
    g_img_intro->Draw(g_sceneImage, 0, 0, 240, 293, 0, 0, NO_KEY);
    INT d = g_difficulty;
    if (d >= 1 && d <= 3) {
        DrawPortrait(d, t);
        g_img_profile->Draw(g_sceneImage, 150, 30, 84, 75, 84 * (d - 1), 0, KeyOf(g_img_profile));
        DrawStory(STORIES[d - 1]);
        // Over the story: the strip hides the window's top rows where it is not keyed.
        const Favourites& fav = FAVOURITES[d - 1];
        g_img_favorite->Draw(g_sceneImage, 24, 160, 192, static_cast<UINT>(fav.height), 0, fav.row,
                             KeyOf(g_img_favorite));
    }
    g_sceneImage->Draw(g_frameImage, 0, 0, 240, 293, 0, 0, NO_KEY);
    PresentFrame(g_introShown);
    g_introShown = 1;
    HandleButtons();
}
