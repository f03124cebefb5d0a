// The presentation every front-end screen ends its pass with.
#pragma once

#include "platform/types.h"

// Shows g_frameImage in the window between GetDC and ReleaseDC: all 293 rows at once when
// shown is 1, otherwise the interleaved reveal. The caller keeps its own first-present flag.
void PresentFrame(BYTE shown);
