#include "app/input.h"

#include "platform/window.h"

INT g_keyUp = 0;
INT g_keyDown = 0;
INT g_keyLeft = 0;
INT g_keyRight = 0;
INT g_keyEnter = 0;

INT g_penDown = 0;
INT g_penX = 0;
INT g_penY = 0;

void OnKeyDown(WPARAM virtualKey) {
    switch (virtualKey) {
        case VK_UP:
            g_keyUp = 1;
            break;
        case VK_DOWN:
            g_keyDown = 1;
            break;
        case VK_LEFT:
            g_keyLeft = 1;
            break;
        case VK_RIGHT:
            g_keyRight = 1;
            break;
        case VK_RETURN:
            g_keyEnter = 1;
            break;
        default:
            break;
    }
}

void OnKeyUp(WPARAM virtualKey) {
    // Releasing the action key changes nothing: a press is kept until it is used.
    switch (virtualKey) {
        case VK_UP:
            g_keyUp = 0;
            break;
        case VK_DOWN:
            g_keyDown = 0;
            break;
        case VK_LEFT:
            g_keyLeft = 0;
            break;
        case VK_RIGHT:
            g_keyRight = 0;
            break;
        default:
            break;
    }
}

void OnPenDown(LPARAM position) {
    g_penDown = 1;
    g_penX = LOWORD(static_cast<std::uintptr_t>(position));
    g_penY = HIWORD(static_cast<std::uintptr_t>(position));
}

void OnPenUp(LPARAM position) {
    g_penDown = 0;
    g_penX = LOWORD(static_cast<std::uintptr_t>(position));
    g_penY = HIWORD(static_cast<std::uintptr_t>(position));
}
