#include "screens/options.h"

#include "app/input.h"
#include "app/shell.h"
#include "assets/catalogue.h"
#include "screens/present.h"
#include "screens/transitions.h"

BYTE g_region = 1;
BYTE g_difficulty = 2;
BYTE g_menuArmed = 0;
BYTE g_menuShown = 0;
BYTE g_menuLeaving = 0;

namespace {

// An area of the menu; both end values belong to it.
struct Area {
    INT left, top, right, bottom;
};

constexpr Area BACK_BUTTON{7, 273, 54, 287};
constexpr Area GO_BUTTON{206, 273, 233, 287};

struct Line {
    Area area;
    BYTE value;
};

constexpr Line GROUND_LINES[] = {
    {{90, 92, 149, 104}, 1},
    {{76, 117, 169, 128}, 2},
    {{89, 142, 155, 153}, 3},
};
constexpr Line DIFFICULTY_LINES[] = {
    {{118, 206, 160, 219}, 1},
    {{107, 231, 174, 244}, 2},
    {{119, 253, 162, 266}, 3},
};

bool Contains(const Area& a) {
    return g_penX >= a.left && g_penX <= a.right && g_penY >= a.top && g_penY <= a.bottom;
}

bool InButtonRow() {
    return g_penY > 272 && g_penY < 288;
}

void Compose() {
    g_img_menu->Draw(g_sceneImage, 0, 0, 240, 293, 0, 0, NO_KEY);
    switch (g_region) {
        case 1:
            g_img_menu_pacific->Draw(g_sceneImage, 15, 87, 210, 23, 0, 0, NO_KEY);
            break;
        case 2:
            g_img_menu_south->Draw(g_sceneImage, 15, 111, 210, 23, 0, 0, NO_KEY);
            break;
        case 3:
            g_img_menu_amazon->Draw(g_sceneImage, 15, 136, 210, 23, 0, 0, NO_KEY);
            break;
        default:
            break;
    }
    switch (g_difficulty) {
        case 1:
            g_img_menu_easy->Draw(g_sceneImage, 90, 200, 120, 23, 0, 0, NO_KEY);
            break;
        case 2:
            g_img_menu_normal->Draw(g_sceneImage, 90, 224, 120, 23, 0, 0, NO_KEY);
            break;
        case 3:
            g_img_menu_hard->Draw(g_sceneImage, 90, 248, 120, 23, 0, 0, NO_KEY);
            break;
        default:
            break;
    }
}

void Press() {
    if (InButtonRow()) {
        // The pressed picture goes over the copied frame, so it shows on this pass only.
        if (Contains(BACK_BUTTON) && g_menuArmed == 0) {
            g_img_menu_back->Draw(g_frameImage, 0, 267, 90, 23, 0, 0, NO_KEY);
            g_menuArmed = 1;
            return;
        }
        if (Contains(GO_BUTTON) && g_menuArmed == 0) {
            g_img_menu_go->Draw(g_frameImage, 180, 268, 60, 23, 0, 0, NO_KEY);
            g_menuArmed = 1;
            return;
        }
    }
    for (const Line& line : GROUND_LINES) {
        if (Contains(line.area)) {
            g_region = line.value;
            return;
        }
    }
    for (const Line& line : DIFFICULTY_LINES) {
        if (Contains(line.area)) {
            g_difficulty = line.value;
            return;
        }
    }
}

// Either button acts on a release inside it, whichever of the two armed the menu.
void Release() {
    if (!InButtonRow() || g_menuArmed != 1) {
        return;
    }
    if (Contains(BACK_BUTTON)) {
        g_menuLeaving = 1;
        LoadAssets();
        g_menuArmed = 0;
        g_screen = SCREEN_TITLE;
    } else if (Contains(GO_BUTTON)) {
        g_menuLeaving = 1;
        EnterIntro();
        g_menuArmed = 0;
        g_screen = SCREEN_INTRO;
        // Rounds exist for this ground and difficulty only; the lines change the highlights.
        g_region = 2;
        g_difficulty = 1;
    }
}

}  // namespace

void OptionsFrame() {
    Compose();
    g_sceneImage->Draw(g_frameImage, 0, 0, 240, 293, 0, 0, NO_KEY);
    if (g_penDown == 1) {
        Press();
    } else if (g_penDown == 0) {
        Release();
    }
    // The leaving pass shows the next screen's freshly loaded picture with the reveal.
    PresentFrame(g_menuShown == 1 && g_menuLeaving == 0 ? 1 : 0);
    g_menuShown = 1;
}
