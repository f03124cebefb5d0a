#include "assets/cues.h"

#include "app/paths.h"
#include "platform/sound.h"

void PlayCue(LPCWSTR fileName) {
    sndPlaySoundW(SoundPath(fileName), SND_ASYNC);
}

LPCWSTR CueForDifficulty(BYTE difficulty, LPCWSTR forEasy, LPCWSTR forNormal, LPCWSTR forHard) {
    switch (difficulty) {
        case 1:
            return forEasy;
        case 2:
            return forNormal;
        case 3:
            return forHard;
        default:
            return nullptr;
    }
}
