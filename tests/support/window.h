// A game window of the platform layer with a recording window procedure, for tests that
// exercise the platform without the game.
#pragma once

#include <vector>

#include "platform/window.h"

namespace test {

// Messages the window procedure of OpenTestWindow received, in order.
std::vector<MSG>& ReceivedMessages();
// Registers a class and creates the window (once per process).
HWND OpenTestWindow();

}  // namespace test
