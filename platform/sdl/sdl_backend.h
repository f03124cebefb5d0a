// The desktop backend: a real window through SDL2, integer-scaled, with keyboard, mouse and
// audio, paced to the handheld's frame rate.
#pragma once

#include <string>

struct SDL_Window;

namespace sdl {

struct Config {
    std::string deviceDir;
    int scale = 0;  // window scale factor; 0: the largest that fits the desktop, >= 2
    bool fullscreen = false;
    int framesPerSecond = 25;  // presentation pace; the game's loop is busy by design
    // Keeps copies from seeing each other in the single-instance check unless they share it;
    // empty in normal use, tests running side by side each set their own.
    std::string instanceScope;
};

// Selects the SDL backend; call before WinMain. False (with a message on standard error) when
// SDL cannot start its video.
bool Install(const Config& config);

// The backend's window while the game's window is open, else null (for tests and diagnostics).
SDL_Window* Window();

}  // namespace sdl
