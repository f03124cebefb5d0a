#include "game/fishing_frame.h"

void FishingFrame() {}
