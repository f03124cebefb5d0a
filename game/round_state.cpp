#include "game/round_state.h"

BYTE g_roundShown = 0;
BYTE g_regionIndex = 0;
BYTE g_difficultyIndex = 0;
BYTE g_difficultyLevel = 0;
INT g_score = 0;
INT g_scoreShown = 0;
