// The game's state as one JSON object, for the headless runner's traces.
#include <sstream>

#include "app/input.h"
#include "app/shell.h"
#include "assets/catalogue.h"
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
    REDIZOR_FIELD(g_titleShown);
    REDIZOR_FIELD(g_regionIndex);
    REDIZOR_FIELD(g_difficultyIndex);
    REDIZOR_FIELD(g_difficultyLevel);
    REDIZOR_FIELD(g_roundShown);
    REDIZOR_FIELD(g_score);
    REDIZOR_FIELD(g_scoreShown);
#undef REDIZOR_FIELD
    out << "}";
    return out.str();
}
