#pragma once

#include "platform/types.h"

extern BYTE g_tickCount;  // 0..56, never reset

// The game's slow clock: the window procedure calls it for every tick of the 100 ms timer,
// on every screen. It floats the hook back and spawns fish into free slots.
void GameTick();
