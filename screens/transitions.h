// Moving from one screen to the next: each clears the entered screen's first-present flag,
// replaces g_frameImage with that screen's picture and starts its cue. The caller sets
// g_screen.
#pragma once

#include "platform/types.h"

void EnterMenu();
void EnterEnd();
void EnterIntro();
// Also prepares a round: ground (1 Pacific, 2 South, 3 Amazon) and difficulty (1-3) copies,
// score and key latches cleared.
void EnterFishing(BYTE region, BYTE difficulty);
