// The SDL backend: the game's window on the desktop, its input, its pace and its cues.
#include "platform/sdl/sdl_backend.h"

#include <SDL.h>

#include <algorithm>
#include <cstdio>
#include <cstdlib>

#include "platform/core/backend.h"
#include "platform/core/device.h"
#include "platform/core/window_state.h"
#include "platform/sdl/frame_pacer.h"
#include "platform/sdl/input.h"
#include "platform/sdl/sdl_audio.h"
#include "platform/sdl/single_instance.h"

namespace sdl {

namespace {

// Room left for the window manager's title bar and borders when picking a scale that fits.
constexpr int kDecorationAllowance = 48;
constexpr int kMinAutoScale = 2;
// One interleaved-reveal pass per display refresh: 15 passes in about a quarter second.
constexpr std::uint64_t kRevealStepUs = 1000000 / 60;
// How long WaitForMessage sleeps at most, so due timers are posted promptly.
constexpr Uint32 kMessageWaitMs = 10;

class SdlBackend : public platform::Backend {
public:
    bool Start(const Config& config) {
        config_ = config;
        pacer_ = FramePacer(config.framesPerSecond);
        instance_.SetScope(config.instanceScope);
        if (SDL_Init(SDL_INIT_VIDEO | SDL_INIT_EVENTS) != 0) {
            std::fprintf(stderr, "redizor: cannot open the display: %s\n", SDL_GetError());
            return false;
        }
        started_ = true;
        ticksBase_ = SDL_GetTicks64();
        counterBase_ = SDL_GetPerformanceCounter();
        counterHz_ = SDL_GetPerformanceFrequency();
        if (SDL_InitSubSystem(SDL_INIT_AUDIO) != 0 || !audio_.Open()) {
            std::fprintf(stderr, "redizor: no audio (%s); running silent\n", SDL_GetError());
        }
        return true;
    }

    SDL_Window* window() const { return window_; }

    bool OpenWindow(const std::string& title, int width, int height) override {
        width_ = width;
        height_ = height;
        int scale = ChooseScale();
        Uint32 flags = SDL_WINDOW_RESIZABLE | SDL_WINDOW_SHOWN;
        if (config_.fullscreen) {
            flags |= SDL_WINDOW_FULLSCREEN_DESKTOP;
        }
        window_ = SDL_CreateWindow(title.c_str(), SDL_WINDOWPOS_CENTERED, SDL_WINDOWPOS_CENTERED,
                                   width * scale, height * scale, flags);
        if (window_ == nullptr) {
            std::fprintf(stderr, "redizor: cannot open a window: %s\n", SDL_GetError());
            return false;
        }
        fullScreen_ = config_.fullscreen;
        SDL_SetWindowMinimumSize(window_, width, height);
        // No vsync: the pace is ours, and a blocking present would add to it.
        renderer_ = SDL_CreateRenderer(window_, -1, 0);
        if (renderer_ == nullptr) {
            renderer_ = SDL_CreateRenderer(window_, -1, SDL_RENDERER_SOFTWARE);
        }
        // Nearest-neighbour at a whole factor keeps the handheld's pixels square and sharp.
        SDL_SetHint(SDL_HINT_RENDER_SCALE_QUALITY, "0");
        if (renderer_ != nullptr) {
            texture_ = SDL_CreateTexture(renderer_, SDL_PIXELFORMAT_RGB888,
                                         SDL_TEXTUREACCESS_STREAMING, width, height);
        }
        if (texture_ == nullptr) {
            std::fprintf(stderr, "redizor: cannot draw in the window: %s\n", SDL_GetError());
            CloseWindow();
            return false;
        }
        SDL_RenderSetLogicalSize(renderer_, width, height);
        SDL_RenderSetIntegerScale(renderer_, SDL_TRUE);
        // The client area starts white, as the window's surface does.
        platform::Surface blank;
        blank.Resize(width, height);
        Show(blank);
        input_.SetWindowId(SDL_GetWindowID(window_));
        instance_.Listen(title);
        return true;
    }

    void CloseWindow() override {
        instance_.StopListening();
        if (texture_ != nullptr) {
            SDL_DestroyTexture(texture_);
            texture_ = nullptr;
        }
        if (renderer_ != nullptr) {
            SDL_DestroyRenderer(renderer_);
            renderer_ = nullptr;
        }
        if (window_ != nullptr) {
            SDL_DestroyWindow(window_);
            window_ = nullptr;
        }
        input_.SetWindowId(0);
    }

    void Poll() override {
        Pump();
        // A pass that showed a frame has already waited for its slot; one that showed
        // nothing (an idle screen) waits here, so the loop never spins.
        if (!presentedSincePoll_) {
            WaitForSlot();
        }
        presentedSincePoll_ = false;
    }

    void WaitForMessage() override {
        SDL_Event event;
        if (SDL_WaitEventTimeout(&event, kMessageWaitMs) != 0) {
            Handle(event);
        }
        Pump();
    }

    void Present(const platform::Surface& surface, platform::PresentReason reason) override {
        Show(surface);
        switch (reason) {
            case platform::PresentReason::kFrame:
                presentedSincePoll_ = true;
                WaitForSlot();
                break;
            case platform::PresentReason::kRevealStep:
                WaitUntil(Micros() + kRevealStepUs);
                break;
            case platform::PresentReason::kSleep:
                break;  // the sleep that follows is the wait
        }
    }

    DWORD Now() override { return static_cast<DWORD>(SDL_GetTicks64() - ticksBase_); }

    void Sleep(DWORD ms) override { WaitUntil(Micros() + std::uint64_t{ms} * 1000); }

    void PlayCue(const std::string& hostPath) override { audio_.Play(hostPath); }

    void ShowMessageBox(const std::string& text, const std::string& caption) override {
        if (SDL_ShowSimpleMessageBox(SDL_MESSAGEBOX_INFORMATION, caption.c_str(), text.c_str(),
                                     window_) != 0) {
            std::fprintf(stderr, "%s: %s\n", caption.c_str(), text.c_str());
        }
    }

    bool FindRunningCopy(const std::string& title) override {
        return instance_.ConnectToRunningCopy(title);
    }

    void RaiseRunningCopy() override { instance_.AskRunningCopyToRaise(); }

    void RaiseWindow() override {
        if (window_ == nullptr) {
            return;
        }
        if ((SDL_GetWindowFlags(window_) & SDL_WINDOW_MINIMIZED) != 0) {
            SDL_RestoreWindow(window_);
        }
        SDL_RaiseWindow(window_);
    }

    void SetFullScreen(bool on) override {
        if (window_ != nullptr &&
            SDL_SetWindowFullscreen(window_, on ? SDL_WINDOW_FULLSCREEN_DESKTOP : 0) == 0) {
            fullScreen_ = on;
        }
    }

    void Shutdown(int exitCode) override {
        (void)exitCode;
        if (!started_) {
            return;
        }
        audio_.Close();
        CloseWindow();
        SDL_Quit();
        started_ = false;
    }

private:
    int ChooseScale() const {
        if (config_.scale > 0) {
            return config_.scale;
        }
        SDL_Rect usable{0, 0, 0, 0};
        if (SDL_GetDisplayUsableBounds(0, &usable) != 0) {
            return kMinAutoScale;
        }
        int fit = std::min(usable.w / width_, (usable.h - kDecorationAllowance) / height_);
        return std::max(kMinAutoScale, fit);
    }

    std::uint64_t Micros() const {
        // Split so a nanosecond counter does not overflow after a few hours.
        Uint64 elapsed = SDL_GetPerformanceCounter() - counterBase_;
        return elapsed / counterHz_ * 1000000 + elapsed % counterHz_ * 1000000 / counterHz_;
    }

    void Show(const platform::Surface& surface) {
        if (texture_ == nullptr || surface.width != width_ || surface.height != height_) {
            return;
        }
        SDL_UpdateTexture(texture_, nullptr, surface.pixels.data(),
                          surface.width * static_cast<int>(sizeof(std::uint32_t)));
        Render();
    }

    void Render() {
        if (renderer_ == nullptr) {
            return;
        }
        // The bars around the centred picture when the window is larger than a whole factor.
        SDL_SetRenderDrawColor(renderer_, 0, 0, 0, 255);
        SDL_RenderClear(renderer_);
        SDL_RenderCopy(renderer_, texture_, nullptr, nullptr);
        SDL_RenderPresent(renderer_);
    }

    void Handle(const SDL_Event& event) {
        HostAction action = input_.Translate(event);
        switch (action.kind) {
            case HostAction::Kind::kPost:
                if (HWND window = platform::GameWindow()) {
                    PostMessageW(window, action.message, action.wParam, action.lParam);
                }
                break;
            case HostAction::Kind::kToggleFullScreen:
                SetFullScreen(!fullScreen_);
                break;
            case HostAction::Kind::kRedraw:
                Render();
                break;
            case HostAction::Kind::kNone:
                break;
        }
    }

    // Takes every waiting event, and a second copy's request to come to the front.
    void Pump() {
        SDL_Event event;
        while (SDL_PollEvent(&event) != 0) {
            Handle(event);
        }
        if (instance_.RaiseRequested()) {
            RaiseWindow();
        }
    }

    // Sleeps until the deadline in the event wait, so input keeps flowing and the window
    // keeps answering, and the process does not burn a core.
    void WaitUntil(std::uint64_t deadlineUs) {
        for (;;) {
            std::uint64_t now = Micros();
            if (now >= deadlineUs) {
                break;
            }
            // Rounded up: waking a little early would leave a sub-millisecond busy loop.
            int ms = static_cast<int>((deadlineUs - now + 999) / 1000);
            SDL_Event event;
            if (SDL_WaitEventTimeout(&event, ms) != 0) {
                Handle(event);
            }
        }
        Pump();
    }

    void WaitForSlot() { WaitUntil(pacer_.NextSlot(Micros())); }

    Config config_;
    bool started_ = false;
    Uint64 ticksBase_ = 0;
    Uint64 counterBase_ = 0;
    Uint64 counterHz_ = 1;
    FramePacer pacer_{25};
    int width_ = platform::kClientWidth;
    int height_ = platform::kClientHeight;
    SDL_Window* window_ = nullptr;
    SDL_Renderer* renderer_ = nullptr;
    SDL_Texture* texture_ = nullptr;
    bool fullScreen_ = false;
    bool presentedSincePoll_ = false;
    InputTranslator input_;
    CuePlayer audio_;
    SingleInstance instance_;
};

SdlBackend g_backend;

// WinMain's return ends the process without a word to the backend: let go of the audio
// device and the display on the way out all the same.
void ShutdownAtExit() {
    g_backend.Shutdown(0);
}

}  // namespace

bool Install(const Config& config) {
    if (!g_backend.Start(config)) {
        return false;
    }
    std::atexit(ShutdownAtExit);
    platform::SetDeviceRoot(config.deviceDir);
    platform::InstallBackend(&g_backend);
    return true;
}

SDL_Window* Window() {
    return g_backend.window();
}

}  // namespace sdl
