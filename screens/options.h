// The options menu: fishing ground and difficulty lines, and the Back and Go buttons, which
// arm on the press and act on the release.
#pragma once

#include "platform/types.h"

extern BYTE g_region;      // 1 Pacific, 2 South, 3 Amazon
extern BYTE g_difficulty;  // 1 easy, 2 normal, 3 hard
extern BYTE g_menuArmed;   // a press on Back or Go waits for its release
extern BYTE g_menuShown;   // first-present flag
extern BYTE g_menuLeaving;

// Frame handler of its screen: called once per main-loop pass while the screen is current.
void OptionsFrame();
