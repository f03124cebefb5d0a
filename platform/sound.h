// One-shot sound cues.
#pragma once

#include "platform/types.h"

constexpr UINT SND_SYNC = 0x0000;
constexpr UINT SND_ASYNC = 0x0001;

// Plays a WAV file. With SND_ASYNC it returns at once; a new cue always cuts off the one still
// playing, so two cues never sound together. A file that cannot be played is silence.
BOOL sndPlaySoundW(LPCWSTR path, UINT flags);
