// The score in the status bar, counting up towards the real score.
#pragma once

// Draws the shown score into the frame's status bar and moves it 50 closer to g_score.
void DrawScore();
