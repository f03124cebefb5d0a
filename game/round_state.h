// The state of a fishing round that screens outside the round also touch.
#pragma once

#include "platform/types.h"

extern BYTE g_roundShown;       // first-present flag of the round
extern BYTE g_regionIndex;      // fishing ground - 1, set when a round is entered
extern BYTE g_difficultyIndex;  // difficulty - 1
extern BYTE g_difficultyLevel;  // difficulty: 1 easy, 2 normal, 3 hard
extern INT g_score;
extern INT g_scoreShown;        // the value the status bar shows while it counts up
