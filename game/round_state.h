// The state of a fishing round: plain globals shared by the frame driver, the game clock and
// the fishing mechanics. Positions are scene pixels, y downwards, water surface at y 148.
#pragma once

#include "platform/types.h"

// Set when a round is entered; the other screens touch these too.
extern BYTE g_roundShown;       // first-present flag of the round
extern BYTE g_regionIndex;      // fishing ground - 1, set when a round is entered
extern BYTE g_difficultyIndex;  // difficulty - 1
extern BYTE g_difficultyLevel;  // difficulty: 1 easy, 2 normal, 3 hard
extern INT g_score;
extern INT g_scoreShown;  // the value the status bar shows while it counts up

// Frame driver.
extern INT g_frameCount;  // frames of the fishing screen; paces the energy drain, never reset
extern INT g_energy;      // 0..170, also the energy bar's width; the round ends below 0
extern INT g_fishermanX;  // 0..400 in steps of 20
extern INT g_facingRight;
extern INT g_cameraX;        // always g_fishermanX / 2
extern INT g_redrawX;        // left edge of the 300-pixel strip renewed each frame
extern INT g_bottomScrollX;  // source x into the sea-bottom strip
extern INT g_waveScrollX;    // source x into the wave strip
extern BYTE g_bob;           // swell offset 0..8
extern BYTE g_bobRising;
extern INT g_frameTick;  // animation counter 0..120
extern INT g_basketX;
extern INT g_basketRight;
extern INT g_basketY;  // 81 - g_bob, rewritten every frame
extern INT g_basketFull;

// Timed effects, in frames; zero means off.
extern BYTE g_basketRush;
extern BYTE g_cheerCount;
extern BYTE g_splashCount;
extern BYTE g_inkCount;

constexpr INT ENERGY_MAX = 170;

// Puts the round state back to its starting values when a round ends. The score, the frame
// count, the clock's counter and the round-entry copies are left alone.
void RoundReset();
