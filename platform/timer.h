// Time. The title's exit pause and the ranking list's line pace call Sleep.
#pragma once

#include "platform/types.h"

// Blocks the program for ms milliseconds (the headless backend advances its clock instead).
void Sleep(DWORD ms);
// Milliseconds since the platform started; wraps after 49 days.
DWORD GetTickCount();
