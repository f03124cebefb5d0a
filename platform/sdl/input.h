// Turns SDL events into what the handheld would have delivered: key, stylus and close
// messages for the game's window, plus the few actions the desktop window handles itself.
#pragma once

#include <SDL.h>

#include <set>

#include "platform/types.h"

namespace sdl {

struct HostAction {
    enum class Kind {
        kNone,
        kPost,              // post message/wParam/lParam to the game's window
        kToggleFullScreen,  // F11 or Alt+Enter
        kRedraw,            // the window's picture was lost or resized: show the last frame
    };
    Kind kind = Kind::kNone;
    UINT message = 0;
    WPARAM wParam = 0;
    LPARAM lParam = 0;
};

class InputTranslator {
public:
    // Window events of other windows (a message box) are not the game's.
    void SetWindowId(Uint32 id) { windowId_ = id; }
    HostAction Translate(const SDL_Event& event);

private:
    HostAction Key(const SDL_KeyboardEvent& key, bool down);

    Uint32 windowId_ = 0;
    // Keys whose press reached the game, so that only their releases do: a key that toggled
    // full screen or was held before the window had focus stays unseen.
    std::set<SDL_Keycode> down_;
    // The stylus is one point: the first finger down plays it until it is lifted.
    bool penFingerDown_ = false;
    SDL_FingerID penFinger_ = 0;
};

// The stylus position message parameter of a client pixel, clamped to the client area.
LPARAM ClientPoint(int x, int y);

}  // namespace sdl
