// The ranking screen after a round: a background, then up to ten lines of name and score from
// the ranking file written straight onto the window, one more line each pass.
#pragma once

#include "platform/types.h"

extern INT g_rankingPass;    // pass counter, 0..50000; lines grow while it is 1..11
extern BYTE g_rankingDrawn;  // the background has been presented
extern BYTE g_rankingShown;  // first-present flag

// Frame handler of its screen: called once per main-loop pass while the screen is current.
void RankingFrame();
