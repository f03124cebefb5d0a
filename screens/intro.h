// The intro page between the options menu and the round: an animated portrait, a profile
// card, a favourites strip and a scrolling story, all chosen by the difficulty.
#pragma once

#include "platform/types.h"

extern BYTE g_introTick;    // portrait animation, 0..240; keeps counting across visits
extern WORD g_storyScroll;  // story position, restarted whenever the page is left
extern BYTE g_introShown;   // first-present flag

// Frame handler of its screen: called once per main-loop pass while the screen is current.
void IntroFrame();
