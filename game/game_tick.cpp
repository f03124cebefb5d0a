#include "game/game_tick.h"

void GameTick() {}
