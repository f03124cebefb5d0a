// Dark water with a spot of light at the hook, painted over the finished frame.
#pragma once

#include "platform/types.h"

// Screen coordinates: the camera x of the view and the hook's scene position.
void DrawInkDarkness(INT cameraX, INT hookX, INT hookY);
