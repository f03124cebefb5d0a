#include "platform/sdl/input.h"

#include <algorithm>
#include <cmath>

#include "platform/core/window_state.h"
#include "platform/window.h"

namespace sdl {

namespace {

HostAction Post(UINT message, WPARAM wParam, LPARAM lParam) {
    return HostAction{HostAction::Kind::kPost, message, wParam, lParam};
}

// The handheld's d-pad and action key; 0 for keys it does not have.
UINT VirtualKey(SDL_Keycode key) {
    switch (key) {
        case SDLK_LEFT:
            return VK_LEFT;
        case SDLK_UP:
            return VK_UP;
        case SDLK_RIGHT:
            return VK_RIGHT;
        case SDLK_DOWN:
            return VK_DOWN;
        case SDLK_RETURN:
        case SDLK_KP_ENTER:
        case SDLK_SPACE:
            return VK_RETURN;
        default:
            return 0;
    }
}

bool IsEnter(SDL_Keycode key) {
    return key == SDLK_RETURN || key == SDLK_KP_ENTER;
}

}  // namespace

LPARAM ClientPoint(int x, int y) {
    x = std::clamp(x, 0, platform::kClientWidth - 1);
    y = std::clamp(y, 0, platform::kClientHeight - 1);
    return MAKELPARAM(static_cast<WORD>(x), static_cast<WORD>(y));
}

HostAction InputTranslator::Key(const SDL_KeyboardEvent& key, bool down) {
    SDL_Keycode sym = key.keysym.sym;
    if (!down) {
        if (down_.erase(sym) == 0) {
            return {};
        }
        return Post(WM_KEYUP, VirtualKey(sym), 0);
    }
    if (key.repeat != 0) {
        // The handheld repeats a held key as further presses.
        return down_.count(sym) != 0 ? Post(WM_KEYDOWN, VirtualKey(sym), 0) : HostAction{};
    }
    if (sym == SDLK_F11 || (IsEnter(sym) && (key.keysym.mod & KMOD_ALT) != 0)) {
        return HostAction{HostAction::Kind::kToggleFullScreen};
    }
    UINT vk = VirtualKey(sym);
    if (vk == 0) {
        return {};
    }
    down_.insert(sym);
    return Post(WM_KEYDOWN, vk, 0);
}

HostAction InputTranslator::Translate(const SDL_Event& event) {
    switch (event.type) {
        case SDL_QUIT:
            return Post(WM_CLOSE, 0, 0);
        case SDL_WINDOWEVENT:
            if (event.window.windowID != windowId_) {
                return {};
            }
            switch (event.window.event) {
                case SDL_WINDOWEVENT_CLOSE:
                    return Post(WM_CLOSE, 0, 0);
                case SDL_WINDOWEVENT_EXPOSED:
                case SDL_WINDOWEVENT_SIZE_CHANGED:
                case SDL_WINDOWEVENT_RESTORED:
                    return HostAction{HostAction::Kind::kRedraw};
                default:
                    return {};
            }
        case SDL_KEYDOWN:
        case SDL_KEYUP:
            return Key(event.key, event.type == SDL_KEYDOWN);
        case SDL_MOUSEBUTTONDOWN:
        case SDL_MOUSEBUTTONUP:
            // Touches come as finger events too; SDL's mouse copies of them would press twice.
            if (event.button.button != SDL_BUTTON_LEFT || event.button.which == SDL_TOUCH_MOUSEID) {
                return {};
            }
            // The renderer has already mapped the position into its 240 x 293 logical picture.
            return Post(event.type == SDL_MOUSEBUTTONDOWN ? WM_LBUTTONDOWN : WM_LBUTTONUP, 0,
                        ClientPoint(event.button.x, event.button.y));
        case SDL_FINGERDOWN:
        case SDL_FINGERUP: {
            bool down = event.type == SDL_FINGERDOWN;
            if (down ? penFingerDown_ : !penFingerDown_ || event.tfinger.fingerId != penFinger_) {
                return {};
            }
            penFingerDown_ = down;
            penFinger_ = event.tfinger.fingerId;
            // Finger positions arrive normalised over the renderer's logical picture.
            int x = static_cast<int>(std::floor(event.tfinger.x * platform::kClientWidth));
            int y = static_cast<int>(std::floor(event.tfinger.y * platform::kClientHeight));
            return Post(down ? WM_LBUTTONDOWN : WM_LBUTTONUP, 0, ClientPoint(x, y));
        }
        default:
            return {};
    }
}

}  // namespace sdl
