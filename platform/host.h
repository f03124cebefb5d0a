// The seam between the host's process entry and the game: the host parses its own options,
// chooses a backend and then calls the game's WinMain, which takes no options of its own.
#pragma once

#include "platform/types.h"

// Provided by the game: the program's entry, as on the handheld. Returns the exit code.
int WinMain(HINSTANCE instance, HINSTANCE previous, LPWSTR commandLine, int showCommand);

#include <string>

// Provided by the game for headless traces: the screen state the main loop dispatches on,
// and every piece of the game's state as one JSON object, keyed by the globals' names.
int GameScreenState();
std::string GameStateJson();
