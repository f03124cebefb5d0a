// Playing a fishing round through the headless backend the way the main loop does: the game
// starts from its start-up values, a round is entered at the end of the first pass, and the
// test looks at the state and the pictures after every frame.
//
// Timing of input: a message posted from the pass hook after frame n is dispatched after
// frame n + 1, so frame n + 2 is the first to see it. Tests that need an exact state for a
// key press therefore post the key after frame n and set the state after frame n + 1.
#pragma once

#include <functional>
#include <string>
#include <vector>

#include "gfx/image.h"
#include "platform/types.h"
#include "support/game_run.h"

namespace round_test {

struct Options {
    BYTE difficulty = 1;
    bool clock = false;  // false: no automatic 100 ms ticks; the test posts its own
    long frames = 40;    // round frames to run before the window is closed
};

// Runs the game once. onFrame(0) is called right after the round has been entered (before
// its first frame); onFrame(n) after round frame n and the message dispatched after it.
test::RunResult RunRound(const Options& options, const std::function<void(long frame)>& onFrame);

// Input through real window messages.
void PressKey(UINT virtualKey);
void ReleaseKey(UINT virtualKey);
void Tick();  // one timer message of the game clock

// Puts the boat at x (facing as given) with the camera where the frame driver keeps it.
void PlaceBoat(INT x, bool facingRight);
// Fills slot i of a table the way spawning and escape do, with the kind's frame size.
void PlaceSwimmer(int slot, int kind, INT x, INT y, INT direction);
void PlaceBottomFish(int slot, int kind, INT x, INT y, INT direction);
void PlaceHooked(int slot, int hookedKind);
void ClearAllFish();

// Cues played since the log was last cleared whose device path ends with fileName.
int CueCount(const std::string& fileName);

BYTE PixelOf(Image* image, int x, int y);

// True when the window shows g_frameImage as it is now, pixel for pixel through its palette.
bool ScreenShowsFrame();

// The number the status bar shows in g_frameImage, read digit by digit against the digit
// strip (keyed pixels show the scene underneath); "" when no digit is drawn, "?" when a place
// matches neither a digit nor the scene.
std::string ShownScore();

}  // namespace round_test
