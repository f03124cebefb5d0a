// The desktop backend: a real window through SDL2, integer-scaled, with keyboard, mouse and
// audio, paced to the handheld's frame rate.
#pragma once

#include <string>

namespace sdl {

struct Config {
    std::string deviceDir;
    int scale = 0;  // window scale factor; 0: the largest that fits the desktop, >= 2
    bool fullscreen = false;
    int framesPerSecond = 25;  // presentation pace; the game's loop is busy by design
};

// Selects the SDL backend; call before WinMain. False (with a message on standard error) when
// SDL cannot start its video.
bool Install(const Config& config);

}  // namespace sdl
