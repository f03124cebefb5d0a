// The input latch: key and stylus messages only record state here; the frame handlers read
// it on their next pass and decide what it means.
#pragma once

#include "platform/types.h"

extern INT g_keyUp;
extern INT g_keyDown;
extern INT g_keyLeft;
extern INT g_keyRight;
extern INT g_keyEnter;  // stays 1 after a press until a consumer clears it

extern INT g_penDown;
extern INT g_penX;
extern INT g_penY;

void OnKeyDown(WPARAM virtualKey);
void OnKeyUp(WPARAM virtualKey);
void OnPenDown(LPARAM position);
void OnPenUp(LPARAM position);
