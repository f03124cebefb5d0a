// Sound cues: short wave files played straight from the sound folder.
#pragma once

#include "platform/types.h"

// Plays the cue (a file name beginning with a backslash) without waiting; it cuts off
// whatever cue is still playing.
void PlayCue(LPCWSTR fileName);

// The cue file of a difficulty (1 "n", 2 "j", 3 "p" in front of suffix), or null when the
// difficulty is outside 1..3 and nothing is to play.
LPCWSTR CueForDifficulty(BYTE difficulty, LPCWSTR forEasy, LPCWSTR forNormal, LPCWSTR forHard);
