#include "screens/title.h"

#include "app/input.h"
#include "app/shell.h"
#include "assets/catalogue.h"
#include "assets/cues.h"
#include "platform/timer.h"
#include "platform/window.h"
#include "screens/present.h"
#include "screens/transitions.h"

BYTE g_flagFrame = 0;
BYTE g_exitRequested = 0;

namespace {

constexpr DWORD EXIT_PAUSE_MS = 1500;  // long enough for the exit cue to be heard
constexpr BYTE FLAG_LAST = 200;

// Tests the three areas in order; true when one acted and the pass must end undrawn.
bool HandleStylus() {
    if (g_penY > 219 && g_penY < 232 && g_penX < 33) {
        EnterFishing(2, 1);
        g_screen = SCREEN_FISHING;
        return true;
    }
    // The flag keeps a stylus held on the area from quitting twice while the loop ends.
    if (g_penY > 240 && g_penY < 254 && g_penX < 41 && g_exitRequested == 0) {
        g_exitRequested = 1;
        PlayCue(u"\\exit.mc8");
        Sleep(EXIT_PAUSE_MS);
        PostQuitMessage(0);
        return true;
    }
    if (g_penY > 261 && g_penY < 274 && g_penX < 50) {
        EnterMenu();
        g_screen = SCREEN_OPTIONS;
        return true;
    }
    return false;
}

}  // namespace

void TitleFrame() {
    if (g_penDown == 1 && HandleStylus()) {
        return;
    }
    g_img_start->Draw(g_sceneImage, 0, 0, 240, 293, 0, 0, NO_KEY);
    // Three frames of three passes each.
    INT sourceX = 44 * ((g_flagFrame % 9) / 3);
    g_img_start_flag->Draw(g_sceneImage, 109, 16, 44, 31, sourceX, 0,
                           g_img_start_flag->key | KEY_FLAG);
    g_flagFrame = static_cast<BYTE>(g_flagFrame + 1);
    if (g_flagFrame > FLAG_LAST) {
        g_flagFrame = 0;
    }
    g_sceneImage->Draw(g_frameImage, 0, 0, 240, 293, 0, 0, NO_KEY);
    PresentFrame(g_titleShown);
    g_titleShown = 1;
}
