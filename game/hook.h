// The hook on its line: strike, reeling, drift towards the fisherman, and the dotted line.
#pragma once

#include "platform/types.h"

constexpr INT HOOK_START_X = 40;
constexpr INT HOOK_START_Y = 200;

extern INT g_hookX;  // top-left of the 20 x 20 hook picture, scene pixels
extern INT g_hookY;
extern BYTE g_strikeCount;  // frames of strike left; 0 = idle
extern BYTE g_linePulse;    // 0..16: where the bright band runs down the line

// Applies the strike, the up and down keys and the drift, then draws the hook.
void UpdateHook(INT fishermanX);
// Sixteen dots from the rod tip (x0, y0) to the hook end (x1, y1), with the travelling pulse.
void DrawFishingLine(INT x0, INT y0, INT x1, INT y1);
