// The game's state as one JSON object, for the headless runner's traces.
#include <sstream>

#include "app/input.h"
#include "app/shell.h"
#include "assets/catalogue.h"
#include "game/catch.h"
#include "game/fish.h"
#include "game/game_tick.h"
#include "game/hook.h"
#include "game/round_state.h"
#include "platform/host.h"

int GameScreenState() {
    return g_screen;
}

std::string GameStateJson() {
    std::ostringstream out;
    bool first = true;
    auto field = [&](const char* name, long long value) {
        out << (first ? "{" : ", ") << '"' << name << "\": " << value;
        first = false;
    };
#define REDIZOR_FIELD(name) field(#name, static_cast<long long>(name))
    REDIZOR_FIELD(g_screen);
    REDIZOR_FIELD(g_penDown);
    REDIZOR_FIELD(g_penX);
    REDIZOR_FIELD(g_penY);
    REDIZOR_FIELD(g_keyUp);
    REDIZOR_FIELD(g_keyDown);
    REDIZOR_FIELD(g_keyLeft);
    REDIZOR_FIELD(g_keyRight);
    REDIZOR_FIELD(g_keyEnter);
    // SCREEN g_region
    // SCREEN g_difficulty
    // SCREEN g_menuArmed
    // SCREEN g_menuShown
    // SCREEN g_menuLeaving
    REDIZOR_FIELD(g_titleShown);
    // SCREEN g_flagFrame
    // SCREEN g_exitRequested
    // SCREEN g_introTick
    // SCREEN g_storyScroll
    // SCREEN g_introShown
    // SCREEN g_rankingPass
    // SCREEN g_rankingDrawn
    // SCREEN g_rankingShown
    REDIZOR_FIELD(g_regionIndex);
    REDIZOR_FIELD(g_difficultyIndex);
    REDIZOR_FIELD(g_difficultyLevel);
    REDIZOR_FIELD(g_roundShown);
    REDIZOR_FIELD(g_frameCount);
    REDIZOR_FIELD(g_energy);
    REDIZOR_FIELD(g_fishermanX);
    REDIZOR_FIELD(g_facingRight);
    REDIZOR_FIELD(g_cameraX);
    REDIZOR_FIELD(g_redrawX);
    REDIZOR_FIELD(g_bottomScrollX);
    REDIZOR_FIELD(g_waveScrollX);
    REDIZOR_FIELD(g_bob);
    REDIZOR_FIELD(g_bobRising);
    REDIZOR_FIELD(g_frameTick);
    REDIZOR_FIELD(g_hookX);
    REDIZOR_FIELD(g_hookY);
    REDIZOR_FIELD(g_basketX);
    REDIZOR_FIELD(g_basketY);
    REDIZOR_FIELD(g_basketRight);
    REDIZOR_FIELD(g_basketFull);
    REDIZOR_FIELD(g_basketRush);
    REDIZOR_FIELD(g_cheerCount);
    REDIZOR_FIELD(g_splashCount);
    REDIZOR_FIELD(g_inkCount);
    REDIZOR_FIELD(g_freezeCount);
    REDIZOR_FIELD(g_strikeCount);
    REDIZOR_FIELD(g_linePulse);
    REDIZOR_FIELD(g_hookedNext);
    REDIZOR_FIELD(g_motionIndex);
    REDIZOR_FIELD(g_tickCount);
    REDIZOR_FIELD(g_score);
    REDIZOR_FIELD(g_scoreShown);
#undef REDIZOR_FIELD
    auto table = [&](const char* name, const FishSlot* slots, int count, bool hooked) {
        out << ", \"" << name << "\": [";
        for (int i = 0; i < count; ++i) {
            const FishSlot& f = slots[i];
            out << (i ? ", [" : "[") << f.active;
            if (!hooked) {
                out << ", " << f.direction;
            }
            out << ", " << int{f.kind} << ", " << f.frameX << ", " << f.x << ", " << f.y << ", "
                << f.width << ", " << f.height;
            if (!hooked) {
                out << ", " << f.hitX << ", " << f.hitY;
            }
            out << "]";
        }
        out << "]";
    };
    table("g_swimFish", g_swimFish, SWIM_SLOTS, false);
    table("g_bottomFish", g_bottomFish, BOTTOM_SLOTS, false);
    table("g_hookedFish", g_hookedFish, HOOKED_SLOTS, true);
    out << "}";
    return out.str();
}
