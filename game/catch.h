// The fate of fish around the hook: hooked during a strike, then landed in the basket or lost
// over the water, with a splash and its cue.
#pragma once

#include "platform/types.h"

extern BYTE g_hookedNext;  // ring cursor: the hooked slot the next caught fish goes into

constexpr INT SCORE_LIMIT = 99999900;  // the largest score the eight digits show in full
constexpr BYTE EFFECT_FRAMES = 100;

// During a strike, moves every fish whose hit point the hook touches onto the hook.
void HookFish();
// Once the strike is over, lands the hooked fish in the basket or lets them escape.
void ResolveCatch();
// One frame of the running splash; counts it down.
void DrawSplash();
