#include "screens/transitions.h"

#include "app/input.h"
#include "assets/catalogue.h"
#include "assets/cues.h"
#include "game/round_state.h"
#include "screens/intro.h"
#include "screens/options.h"
#include "screens/ranking.h"

void EnterMenu() {
    g_menuShown = 0;
    g_menuLeaving = 0;
    ReplaceFrameImage(u"\\menu.dc8");
    PlayCue(u"\\menu.mc8");
}

void EnterEnd() {
    g_rankingShown = 0;
    // Every visit starts the list afresh: background first, then one more line per pass.
    g_rankingPass = 0;
    g_rankingDrawn = 0;
    ReplaceFrameImage(u"\\end.dc8");
    PlayCue(u"\\end.mc8");
}

void EnterIntro() {
    g_introShown = 0;
    ReplaceFrameImage(u"\\intro.dc8");
    PlayCue(u"\\intro.mc8");
}

namespace {

// The round's backdrop by ground; the grounds' letters differ from the difficulties'.
LPCWSTR GroundPicture(BYTE region) {
    switch (region) {
        case 1:
            return u"\\p_set_scr.dc8";
        case 3:
            return u"\\j_set_scr.dc8";
        default:
            return u"\\n_set_scr.dc8";  // South, the one ground whose art is loaded
    }
}

}  // namespace

void EnterFishing(BYTE region, BYTE difficulty) {
    g_roundShown = 0;
    g_regionIndex = static_cast<BYTE>(region - 1);
    g_difficultyIndex = static_cast<BYTE>(difficulty - 1);
    g_difficultyLevel = difficulty;
    g_score = 0;
    g_scoreShown = 0;
    // An action key pressed on an earlier screen must not strike in the new round.
    g_keyUp = 0;
    g_keyDown = 0;
    g_keyLeft = 0;
    g_keyRight = 0;
    g_keyEnter = 0;
    ReplaceFrameImage(GroundPicture(region));
    if (LPCWSTR cue = CueForDifficulty(difficulty, u"\\n_taken_succ.mc8", u"\\j_taken_succ.mc8",
                                       u"\\p_taken_succ.mc8")) {
        PlayCue(cue);
    }
}
