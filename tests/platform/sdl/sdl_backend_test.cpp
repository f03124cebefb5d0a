// The SDL backend driven as the game drives it: through the platform's window, message, GDI
// and timer calls, against a real window on an X display (run under xvfb-run). Without a
// display every test here skips.
//
// The platform keeps one window per process, so the window is made once and shared; ctest
// runs each test in its own process, and running the binary directly works as well.
#include <SDL.h>
#include <gtest/gtest.h>
#include <sys/resource.h>
#include <unistd.h>

#include <chrono>
#include <cstdlib>
#include <functional>
#include <string>
#include <vector>

#include "platform/core/backend.h"
#include "platform/core/window_state.h"
#include "platform/gdi.h"
#include "platform/sdl/sdl_backend.h"
#include "platform/timer.h"
#include "platform/window.h"

namespace {

std::vector<MSG> g_seen;  // what the window procedure was given

LRESULT CALLBACK_RecordingProc(HWND window, UINT message, WPARAM wParam, LPARAM lParam) {
    g_seen.push_back(MSG{window, message, wParam, lParam, 0, {0, 0}});
    if (message == WM_CLOSE) {
        return 0;  // keep the window for the other tests
    }
    return DefWindowProcW(window, message, wParam, lParam);
}

struct Session {
    bool ok = false;
    std::string why;
    HWND window = nullptr;
};

const Session& OpenSession() {
    static Session session = [] {
        Session s;
        if (std::getenv("DISPLAY") == nullptr) {
            s.why = "no X display (DISPLAY is unset): run under xvfb-run -a";
            return s;
        }
        SDL_SetHint(SDL_HINT_AUDIODRIVER, "dummy");  // tests make no noise
        char folder[] = "/tmp/redizor-sdl-device-XXXXXX";
        if (::mkdtemp(folder) == nullptr) {
            s.why = "cannot make a device folder";
            return s;
        }
        sdl::Config config;
        config.deviceDir = folder;
        config.instanceScope = "test" + std::to_string(::getpid());
        if (!sdl::Install(config)) {
            s.why = std::string("SDL video did not start: ") + SDL_GetError();
            return s;
        }
        WNDCLASSW wc{};
        wc.lpfnWndProc = CALLBACK_RecordingProc;
        wc.lpszClassName = u"fishing";
        RegisterClassW(&wc);
        s.window =
            CreateWindowExW(0, u"fishing", u"Redizor", WS_VISIBLE, CW_USEDEFAULT, CW_USEDEFAULT,
                            CW_USEDEFAULT, CW_USEDEFAULT, nullptr, nullptr, nullptr, nullptr);
        if (s.window == nullptr || sdl::Window() == nullptr) {
            s.why = "the window did not open";
            return s;
        }
        ShowWindow(s.window, SW_SHOW);
        UpdateWindow(s.window);
        s.ok = true;
        return s;
    }();
    return session;
}

#define REQUIRE_WINDOW()                    \
    const Session& session = OpenSession(); \
    if (!session.ok) {                      \
        GTEST_SKIP() << session.why;        \
    }

// One pass of the game's main loop, without the frame handler.
void Pass() {
    MSG m;
    if (PeekMessageW(&m, nullptr, 0, 0, PM_NOREMOVE) && GetMessageW(&m, nullptr, 0, 0)) {
        TranslateMessage(&m);
        DispatchMessageW(&m);
    }
}

// Runs passes until the window procedure has seen `count` messages of interest (or ~2 s).
std::vector<MSG> Collect(std::size_t count, const std::function<bool(UINT)>& interesting) {
    std::vector<MSG> got;
    for (int pass = 0; pass < 50 && got.size() < count; ++pass) {
        std::size_t before = g_seen.size();
        Pass();
        for (std::size_t i = before; i < g_seen.size(); ++i) {
            if (interesting(g_seen[i].message)) {
                got.push_back(g_seen[i]);
            }
        }
    }
    return got;
}

bool IsKey(UINT m) {
    return m == WM_KEYDOWN || m == WM_KEYUP;
}
bool IsPen(UINT m) {
    return m == WM_LBUTTONDOWN || m == WM_LBUTTONUP;
}

void PushKey(Uint32 type, SDL_Keycode sym, Uint8 repeat = 0) {
    SDL_Event e{};
    e.type = type;
    e.key.windowID = SDL_GetWindowID(sdl::Window());
    e.key.state = type == SDL_KEYDOWN ? SDL_PRESSED : SDL_RELEASED;
    e.key.repeat = repeat;
    e.key.keysym.sym = sym;
    e.key.keysym.scancode = SDL_GetScancodeFromKey(sym);
    ASSERT_EQ(SDL_PushEvent(&e), 1);
}

void PushButton(Uint32 type, int windowX, int windowY) {
    SDL_Event e{};
    e.type = type;
    e.button.windowID = SDL_GetWindowID(sdl::Window());
    e.button.button = SDL_BUTTON_LEFT;
    e.button.state = type == SDL_MOUSEBUTTONDOWN ? SDL_PRESSED : SDL_RELEASED;
    e.button.clicks = 1;
    e.button.x = windowX;
    e.button.y = windowY;
    ASSERT_EQ(SDL_PushEvent(&e), 1);
}

// Where the picture sits in a window (or output) of this size: the largest whole factor
// that fits, centred.
struct Placement {
    int scale, left, top;
};
Placement PictureIn(int width, int height) {
    int s = std::min(width / 240, height / 293);
    return {s, (width - 240 * s) / 2, (height - 293 * s) / 2};
}

Placement WindowPlacement() {
    int w = 0, h = 0;
    SDL_GetWindowSize(sdl::Window(), &w, &h);
    return PictureIn(w, h);
}

// Resizes the window and lets the resize come through before going on.
void ResizeWindow(int width, int height) {
    SDL_SetWindowSize(sdl::Window(), width, height);
    for (int i = 0; i < 50; ++i) {
        Pass();
        int w = 0, h = 0;
        SDL_GetWindowSize(sdl::Window(), &w, &h);
        if (w == width && h == height) {
            break;
        }
    }
    for (int i = 0; i < 3; ++i) {
        Pass();  // the size-changed event reaches the renderer's viewport
    }
}

TEST(SdlWindow, OpensTitledAndScaledByAWholeFactor) {
    REQUIRE_WINDOW();
    EXPECT_STREQ(SDL_GetWindowTitle(sdl::Window()), "Redizor");
    int w = 0, h = 0;
    SDL_GetWindowSize(sdl::Window(), &w, &h);
    EXPECT_EQ(w % 240, 0) << w;
    EXPECT_EQ(h % 293, 0) << h;
    EXPECT_EQ(w / 240, h / 293);
    EXPECT_GE(w / 240, 2) << "at least twice the handheld's size";
    SDL_Rect usable{};
    ASSERT_EQ(SDL_GetDisplayUsableBounds(0, &usable), 0);
    EXPECT_LE(h, usable.h) << "the automatic scale fits the desktop";
    EXPECT_TRUE(SDL_GetWindowFlags(sdl::Window()) & SDL_WINDOW_RESIZABLE);
}

TEST(SdlWindow, KeysArriveAsTheHandheldsKeyMessages) {
    REQUIRE_WINDOW();
    const std::pair<SDL_Keycode, WPARAM> cases[] = {
        {SDLK_RIGHT, 39},  {SDLK_LEFT, 37},  {SDLK_UP, 38},       {SDLK_DOWN, 40},
        {SDLK_RETURN, 13}, {SDLK_SPACE, 13}, {SDLK_KP_ENTER, 13},
    };
    for (auto [sym, vk] : cases) {
        SCOPED_TRACE(SDL_GetKeyName(sym));
        PushKey(SDL_KEYDOWN, sym);
        PushKey(SDL_KEYDOWN, sym, 1);  // auto-repeat
        PushKey(SDL_KEYUP, sym);
        std::vector<MSG> got = Collect(3, IsKey);
        ASSERT_EQ(got.size(), 3u);
        EXPECT_EQ(got[0].message, WM_KEYDOWN);
        EXPECT_EQ(got[1].message, WM_KEYDOWN);
        EXPECT_EQ(got[2].message, WM_KEYUP);
        for (const MSG& m : got) {
            EXPECT_EQ(m.wParam, vk);
            EXPECT_EQ(m.hwnd, session.window);
        }
    }
}

TEST(SdlWindow, ClicksArriveAtTheClientPixelUnderThePointer) {
    REQUIRE_WINDOW();
    int w0 = 0, h0 = 0;
    SDL_GetWindowSize(sdl::Window(), &w0, &h0);
    struct Case {
        const char* name;
        int extraWidth, extraHeight;  // added to the window's own size: bars around the picture
        int x, y;                     // client pixel clicked
    };
    const Case cases[] = {
        {"inside", 0, 0, 100, 200},
        {"top-left pixel", 0, 0, 0, 0},
        {"bottom-right pixel", 0, 0, 239, 292},
        {"wider window: picture centred between bars", 100, 0, 100, 200},
        {"taller window, not a whole factor more", 0, 150, 5, 290},
    };
    for (const Case& c : cases) {
        SCOPED_TRACE(c.name);
        ResizeWindow(w0 + c.extraWidth, h0 + c.extraHeight);
        Placement p = WindowPlacement();
        int wx = p.left + c.x * p.scale + p.scale / 2;
        int wy = p.top + c.y * p.scale + p.scale / 2;
        PushButton(SDL_MOUSEBUTTONDOWN, wx, wy);
        PushButton(SDL_MOUSEBUTTONUP, wx, wy);
        std::vector<MSG> got = Collect(2, IsPen);
        ASSERT_EQ(got.size(), 2u);
        EXPECT_EQ(got[0].message, WM_LBUTTONDOWN);
        EXPECT_EQ(got[1].message, WM_LBUTTONUP);
        for (const MSG& m : got) {
            EXPECT_EQ(LOWORD(m.lParam), c.x);
            EXPECT_EQ(HIWORD(m.lParam), c.y);
        }
    }
    // A press on the bar left of the picture lands on its left edge.
    ResizeWindow(w0 + 100, h0);
    PushButton(SDL_MOUSEBUTTONDOWN, 10, 100);
    PushButton(SDL_MOUSEBUTTONUP, w0 + 95, 100);
    std::vector<MSG> got = Collect(2, IsPen);
    ASSERT_EQ(got.size(), 2u);
    EXPECT_EQ(LOWORD(got[0].lParam), 0);
    EXPECT_EQ(LOWORD(got[1].lParam), 239);
    ResizeWindow(w0, h0);
}

TEST(SdlWindow, F11AndAltEnterToggleFullScreen) {
    REQUIRE_WINDOW();
    auto fullScreen = [] {
        return (SDL_GetWindowFlags(sdl::Window()) & SDL_WINDOW_FULLSCREEN_DESKTOP) ==
               SDL_WINDOW_FULLSCREEN_DESKTOP;
    };
    ASSERT_FALSE(fullScreen());
    int w0 = 0, h0 = 0;
    SDL_GetWindowSize(sdl::Window(), &w0, &h0);
    g_seen.clear();
    PushKey(SDL_KEYDOWN, SDLK_F11);
    PushKey(SDL_KEYUP, SDLK_F11);
    for (int i = 0; i < 5; ++i) {
        Pass();
    }
    EXPECT_TRUE(fullScreen());
    SDL_Event e{};
    e.type = SDL_KEYDOWN;
    e.key.windowID = SDL_GetWindowID(sdl::Window());
    e.key.keysym.sym = SDLK_RETURN;
    e.key.keysym.mod = KMOD_LALT;
    ASSERT_EQ(SDL_PushEvent(&e), 1);
    e.type = SDL_KEYUP;
    ASSERT_EQ(SDL_PushEvent(&e), 1);
    for (int i = 0; i < 5; ++i) {
        Pass();
    }
    EXPECT_FALSE(fullScreen());
    ResizeWindow(w0, h0);  // waits for the window to be back at its size
    for (const MSG& m : g_seen) {
        EXPECT_FALSE(IsKey(m.message)) << "the toggle keys are not the game's";
    }
}

TEST(SdlWindow, ClosingTheWindowAsksItToClose) {
    REQUIRE_WINDOW();
    SDL_Event e{};
    e.type = SDL_WINDOWEVENT;
    e.window.event = SDL_WINDOWEVENT_CLOSE;
    e.window.windowID = SDL_GetWindowID(sdl::Window());
    ASSERT_EQ(SDL_PushEvent(&e), 1);
    std::vector<MSG> got = Collect(1, [](UINT m) { return m == WM_CLOSE; });
    ASSERT_EQ(got.size(), 1u);
    EXPECT_EQ(got[0].hwnd, session.window);
}

// A 240 x 293 8-bit section: left half colour 1, right half colour 2, rows 100-109 colour 3.
struct Picture {
    HBITMAP bitmap = nullptr;
    HDC dc = nullptr;
};

Picture MakePicture() {
    struct {
        BITMAPINFOHEADER header;
        RGBQUAD colours[256];
    } info{};
    info.header.biSize = sizeof(BITMAPINFOHEADER);
    info.header.biWidth = 240;
    info.header.biHeight = 293;
    info.header.biPlanes = 1;
    info.header.biBitCount = 8;
    info.colours[1] = RGBQUAD{0, 0, 255, 0};    // blue, green, red: red
    info.colours[2] = RGBQUAD{255, 128, 0, 0};  // a sky blue
    info.colours[3] = RGBQUAD{30, 200, 10, 0};  // green
    void* bits = nullptr;
    Picture p;
    p.bitmap = CreateDIBSection(nullptr, reinterpret_cast<BITMAPINFO*>(&info), DIB_RGB_COLORS,
                                &bits, nullptr, 0);
    auto* pixels = static_cast<BYTE*>(bits);
    for (int y = 0; y < 293; ++y) {
        BYTE* row = pixels + (292 - y) * 240;  // bottom-up, as the handheld stores it
        for (int x = 0; x < 240; ++x) {
            row[x] = (y >= 100 && y < 110) ? 3 : (x < 120 ? 1 : 2);
        }
    }
    p.dc = CreateCompatibleDC(nullptr);
    SelectObject(p.dc, p.bitmap);
    return p;
}

void FreePicture(Picture& p) {
    DeleteDC(p.dc);
    DeleteObject(p.bitmap);
}

// Shows the picture on the window as a game frame.
void PresentFrame(HWND window, const Picture& p) {
    HDC dc = GetDC(window);
    BitBlt(dc, 0, 0, 240, 293, p.dc, 0, 0, SRCCOPY);
    ReleaseDC(window, dc);
}

TEST(SdlWindow, APresentedFrameShowsItsPixelsScaledSharply) {
    REQUIRE_WINDOW();
    Picture picture = MakePicture();
    PresentFrame(session.window, picture);

    SDL_Renderer* renderer = SDL_GetRenderer(sdl::Window());
    ASSERT_NE(renderer, nullptr);
    int ow = 0, oh = 0;
    ASSERT_EQ(SDL_GetRendererOutputSize(renderer, &ow, &oh), 0);
    std::vector<Uint32> shown(static_cast<std::size_t>(ow) * oh, 0xDEADBEEF);
    SDL_Rect all{0, 0, ow, oh};
    ASSERT_EQ(SDL_RenderReadPixels(renderer, &all, SDL_PIXELFORMAT_RGB888, shown.data(), ow * 4), 0)
        << SDL_GetError();
    Placement p = PictureIn(ow, oh);
    auto at = [&](int ox, int oy) {
        return shown[static_cast<std::size_t>(oy) * ow + ox] & 0xFFFFFF;
    };
    struct Probe {
        const char* name;
        int outX, outY;
        Uint32 rgb;
    };
    const int s = p.scale;
    const Probe probes[] = {
        {"left half", p.left + 10 * s, p.top + 10 * s, 0xFF0000},
        {"right half", p.left + 200 * s + s / 2, p.top + 250 * s, 0x0080FF},
        {"the stripe", p.left + 60 * s, p.top + 105 * s, 0x0AC81E},
        // Nearest-neighbour: the last output pixel of client column 119 is not blended.
        {"left of the colour edge", p.left + 120 * s - 1, p.top + 50 * s, 0xFF0000},
        {"right of the colour edge", p.left + 120 * s, p.top + 50 * s, 0x0080FF},
        {"bottom-right corner", p.left + 240 * s - 1, p.top + 293 * s - 1, 0x0080FF},
    };
    for (const Probe& probe : probes) {
        SCOPED_TRACE(probe.name);
        EXPECT_EQ(at(probe.outX, probe.outY), probe.rgb) << std::hex << at(probe.outX, probe.outY);
    }
    FreePicture(picture);
}

double CpuSeconds() {
    rusage usage{};
    getrusage(RUSAGE_SELF, &usage);
    return usage.ru_utime.tv_sec + usage.ru_stime.tv_sec +
           (usage.ru_utime.tv_usec + usage.ru_stime.tv_usec) / 1e6;
}

TEST(SdlWindow, TheBusyLoopIsPacedToTheFrameRateWithoutSpinning) {
    REQUIRE_WINDOW();
    Picture picture = MakePicture();
    struct Case {
        const char* name;
        bool presents;
    };
    for (const Case& c : {Case{"passes that present a frame", true},
                          Case{"passes that present nothing (an idle screen)", false}}) {
        SCOPED_TRACE(c.name);
        Pass();  // settle onto the pace
        auto start = std::chrono::steady_clock::now();
        double cpuStart = CpuSeconds();
        for (int i = 0; i < 10; ++i) {
            if (c.presents) {
                PresentFrame(session.window, picture);
            }
            Pass();
        }
        double wallMs =
            std::chrono::duration<double, std::milli>(std::chrono::steady_clock::now() - start)
                .count();
        double cpuMs = (CpuSeconds() - cpuStart) * 1000;
        EXPECT_GE(wallMs, 300);  // 10 passes at 25 per second: 400 ms
        EXPECT_LE(wallMs, 700);
        EXPECT_LT(cpuMs, wallMs * 0.3) << "the wait must sleep, not spin";
    }
    FreePicture(picture);
}

TEST(SdlWindow, AnInterleavedRevealTakesAboutAQuarterSecond) {
    REQUIRE_WINDOW();
    Picture picture = MakePicture();
    Pass();
    auto start = std::chrono::steady_clock::now();
    HDC dc = GetDC(session.window);
    for (int pass = 0; pass < 15; ++pass) {
        for (int y = pass; y < 293; y += 15) {
            BitBlt(dc, 0, y, 240, 1, picture.dc, 0, y, SRCCOPY);
        }
    }
    ReleaseDC(session.window, dc);
    double wallMs =
        std::chrono::duration<double, std::milli>(std::chrono::steady_clock::now() - start).count();
    // 14 shown steps at 1/60 s and the final frame's slot.
    EXPECT_GE(wallMs, 200);
    EXPECT_LE(wallMs, 450);
    FreePicture(picture);
}

TEST(SdlWindow, SleepWaitsWhileInputKeepsArriving) {
    REQUIRE_WINDOW();
    Pass();
    platform::MessageQueue().clear();
    PushKey(SDL_KEYDOWN, SDLK_UP);
    DWORD before = GetTickCount();
    auto start = std::chrono::steady_clock::now();
    double cpuStart = CpuSeconds();
    Sleep(200);
    double wallMs =
        std::chrono::duration<double, std::milli>(std::chrono::steady_clock::now() - start).count();
    EXPECT_GE(wallMs, 195);
    EXPECT_LE(wallMs, 400);
    EXPECT_NEAR(static_cast<double>(GetTickCount() - before), wallMs, 20)
        << "the tick count is the wall clock in milliseconds";
    EXPECT_LT((CpuSeconds() - cpuStart) * 1000, wallMs * 0.3);
    bool posted = false;
    for (const MSG& m : platform::MessageQueue()) {
        posted |= m.message == WM_KEYDOWN && m.wParam == VK_UP;
    }
    EXPECT_TRUE(posted) << "a key pressed during the sleep is queued for afterwards";
    PushKey(SDL_KEYUP, SDLK_UP);
    Collect(2, IsKey);
}

TEST(SdlWindow, TimersTickWhileTheLoopWaitsForMessages) {
    REQUIRE_WINDOW();
    Pass();
    g_seen.clear();
    ASSERT_EQ(SetTimer(session.window, 10, 100, nullptr), 10u);
    auto start = std::chrono::steady_clock::now();
    MSG m;
    int ticks = 0;
    while (ticks < 3 && GetMessageW(&m, nullptr, 0, 0)) {  // blocks in WaitForMessage
        DispatchMessageW(&m);
        ticks += m.message == WM_TIMER && m.wParam == 10;
    }
    double wallMs =
        std::chrono::duration<double, std::milli>(std::chrono::steady_clock::now() - start).count();
    EXPECT_EQ(ticks, 3);
    EXPECT_GE(wallMs, 280);
    EXPECT_LE(wallMs, 450);
}

TEST(SdlWindow, ASecondCopyFindsThisOneByItsTitle) {
    REQUIRE_WINDOW();
    platform::Backend& backend = platform::CurrentBackend();
    EXPECT_TRUE(backend.FindRunningCopy("Redizor"));
    backend.RaiseRunningCopy();
    for (int i = 0; i < 5; ++i) {
        Pass();  // the request is taken and the window raised
    }
    EXPECT_FALSE(backend.FindRunningCopy("Some other program"));
    EXPECT_EQ(FindWindowW(nullptr, u"Some other program"), nullptr);
    EXPECT_EQ(FindWindowW(nullptr, u"Redizor"), session.window);
    EXPECT_TRUE(IsWindow(session.window));
}

}  // namespace
