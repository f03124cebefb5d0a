// Process entry and the main loop.
#include "app/shell.h"
#include "assets/catalogue.h"
#include "game/fishing_frame.h"
#include "platform/host.h"
#include "platform/shell.h"
#include "platform/window.h"
#include "screens/intro.h"
#include "screens/options.h"
#include "screens/ranking.h"
#include "screens/title.h"

HWND g_hWnd = nullptr;
HDC g_hdc = nullptr;
BYTE g_screen = SCREEN_TITLE;

static void RunScreenFrame() {
    switch (g_screen) {
        case SCREEN_TITLE:
            TitleFrame();
            break;
        case SCREEN_OPTIONS:
            OptionsFrame();
            break;
        case SCREEN_FISHING:
            FishingFrame();
            break;
        case SCREEN_RANKING:
            RankingFrame();
            break;
        case SCREEN_INTRO:
            IntroFrame();
            break;
        default:
            break;  // no screen: the window still answers its messages
    }
}

int WinMain(HINSTANCE instance, HINSTANCE previous, LPWSTR commandLine, int showCommand) {
    (void)previous;
    (void)commandLine;

    WNDCLASSW windowClass{};
    windowClass.style = CS_HREDRAW | CS_VREDRAW;
    windowClass.lpfnWndProc = WndProc;
    windowClass.hInstance = instance;
    windowClass.hIcon = LoadIconW(instance, nullptr);
    windowClass.hbrBackground = GetStockObject(WHITE_BRUSH);
    windowClass.lpszClassName = u"fishing";
    RegisterClassW(&windowClass);

    g_hWnd = FindWindowW(nullptr, u"Redizor");
    if (g_hWnd != nullptr) {
        SetForegroundWindow(reinterpret_cast<HWND>(reinterpret_cast<std::uintptr_t>(g_hWnd) | 1));
        SHFullScreen(g_hWnd, SHFS_HIDESIPBUTTON);
        return 0;
    }

    g_hWnd = CreateWindowExW(0, u"fishing", u"Redizor", WS_VISIBLE, CW_USEDEFAULT, CW_USEDEFAULT,
                             CW_USEDEFAULT, CW_USEDEFAULT, nullptr, nullptr, instance, nullptr);
    if (g_hWnd == nullptr) {
        return 1;  // without a window there is nothing to run
    }
    ShowWindow(g_hWnd, showCommand);
    SHFullScreen(g_hWnd, SHFS_HIDESIPBUTTON);
    LoadAssets();
    UpdateWindow(g_hWnd);

    // A busy loop: one frame per pass, and at most one message between two frames.
    MSG msg{};
    for (;;) {
        RunScreenFrame();
        if (!PeekMessageW(&msg, nullptr, 0, 0, PM_NOREMOVE)) {
            continue;
        }
        if (!GetMessageW(&msg, nullptr, 0, 0)) {
            return static_cast<int>(msg.wParam);
        }
        TranslateMessage(&msg);
        DispatchMessageW(&msg);
        if (!IsWindow(g_hWnd)) {
            return 0;  // the pictures are gone with the window: no frame may run again
        }
    }
}
