// The title screen: three stylus areas on the left edge and a waving flag.
#pragma once

#include "platform/types.h"

extern BYTE g_flagFrame;      // flag animation counter, 0..200
extern BYTE g_exitRequested;  // the exit area has been used; never cleared

// Frame handler of its screen: called once per main-loop pass while the screen is current.
void TitleFrame();
