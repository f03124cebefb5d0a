#pragma once

// One frame of the fishing round: called once per main-loop pass during a round.
void FishingFrame();
