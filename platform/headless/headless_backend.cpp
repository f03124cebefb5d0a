#include <cstdio>
#include <cstring>

#include "platform/core/backend.h"
#include "platform/core/device.h"
#include "platform/core/window_state.h"
#include "platform/headless/headless.h"
#include "platform/window.h"

namespace headless {

namespace {

class HeadlessBackend : public platform::Backend {
public:
    Config config;
    DWORD now = 0;
    long passes = 0;
    bool closeRequested = false;
    std::function<void(long)> passHook;
    std::function<void(int)> exitHook;
    std::function<void()> loopStartHook;
    platform::Surface shown;

    bool OpenWindow(const std::string&, int width, int height) override {
        shown.Resize(width, height);
        return true;
    }
    void CloseWindow() override {}
    void Poll() override {}
    void LoopStarting() override {
        if (loopStartHook) {
            loopStartHook();
        }
    }
    void PassEnded() override {
        long pass = passes++;
        now += config.passMs;
        platform::PostDueTimers(now);
        if (passHook) {
            passHook(pass);
        }
        if (config.maxPasses >= 0 && passes >= config.maxPasses && !closeRequested) {
            closeRequested = true;
            Close();
        }
    }
    void WaitForMessage() override {
        // Nothing else can post: let virtual time run to the next timer tick.
        now += 1;
    }
    void Present(const platform::Surface& surface, platform::PresentReason) override {
        shown = surface;
    }
    DWORD Now() override { return now; }
    void Sleep(DWORD ms) override { now += ms; }
    void PlayCue(const std::string&) override {}
    void ShowMessageBox(const std::string& text, const std::string& caption) override {
        if (!config.quiet) {
            std::fprintf(stderr, "message box \"%s\": %s\n", caption.c_str(), text.c_str());
        }
    }
    void Shutdown(int exitCode) override {
        if (exitHook) {
            exitHook(exitCode);
        }
    }
};

HeadlessBackend g_backend;

void Post(UINT message, WPARAM wParam, LPARAM lParam) {
    if (HWND w = platform::GameWindow()) {
        PostMessageW(w, message, wParam, lParam);
    }
}

}  // namespace

void Install(const Config& config) {
    g_backend.config = config;
    platform::SetDeviceRoot(config.deviceDir);
    platform::SetAutomaticTimers(config.automaticTimer);
    platform::CallRecord().enabled = true;
    platform::InstallBackend(&g_backend);
}

void SetPassHook(std::function<void(long)> hook) {
    g_backend.passHook = std::move(hook);
}
void SetExitHook(std::function<void(int)> hook) {
    g_backend.exitHook = std::move(hook);
}
void SetLoopStartHook(std::function<void()> hook) {
    g_backend.loopStartHook = std::move(hook);
}
long PassCount() {
    return g_backend.passes;
}
DWORD Now() {
    return g_backend.now;
}

void KeyDown(UINT vk) {
    Post(WM_KEYDOWN, vk, 0);
}
void KeyUp(UINT vk) {
    Post(WM_KEYUP, vk, 0);
}
void PenDown(int x, int y) {
    Post(WM_LBUTTONDOWN, 0, MAKELPARAM(static_cast<WORD>(x), static_cast<WORD>(y)));
}
void PenUp(int x, int y) {
    Post(WM_LBUTTONUP, 0, MAKELPARAM(static_cast<WORD>(x), static_cast<WORD>(y)));
}
void Tap(int x, int y) {
    PenDown(x, y);
    PenUp(x, y);
}
void Timer(UINT_PTR id) {
    Post(WM_TIMER, id, 0);
}
void Close() {
    Post(WM_CLOSE, 0, 0);
}

platform::Record& Log() {
    return platform::CallRecord();
}
const platform::Surface& Screen() {
    return g_backend.shown;
}

}  // namespace headless

#include "platform/core/png.h"

bool headless::SaveScreenshot(const std::string& pngPath, int scale) {
    return platform::WritePng(pngPath, Screen(), scale);
}
