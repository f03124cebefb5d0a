#pragma once

// The game's slow clock: the window procedure calls it for every tick of the 100 ms timer.
void GameTick();
