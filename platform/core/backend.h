// What a host backend provides to the shared platform code. Only platform/ sees this header.
#pragma once

#include <string>

#include "platform/core/surface.h"
#include "platform/types.h"

namespace platform {

// Why a backend is asked to show the window's surface.
enum class PresentReason {
    kFrame,       // the window's device context was released after drawing: one game frame
    kRevealStep,  // one pass of an interleaved reveal is complete (more of the same frame follow)
    kSleep,       // the program is about to sleep with something new drawn on the window
};

class Backend {
public:
    virtual ~Backend() = default;
    // Opens the window that shows the client surface. False when no window can be had.
    virtual bool OpenWindow(const std::string& title, int width, int height) = 0;
    virtual void CloseWindow() = 0;
    // Called by PeekMessageW on every main-loop pass before it looks at the queue: turns host
    // input into posted messages, posts due timers and paces the loop.
    virtual void Poll() = 0;
    // Called when a main-loop pass has ended: after a dispatched message, or by a PeekMessageW
    // that found the queue empty.
    virtual void PassEnded() {}
    // Called by UpdateWindow, which WinMain calls right before its main loop begins.
    virtual void LoopStarting() {}
    // Called by GetMessageW when the queue is empty: wait until something is posted.
    virtual void WaitForMessage() = 0;
    virtual void Present(const Surface& surface, PresentReason reason) = 0;
    virtual DWORD Now() = 0;
    virtual void Sleep(DWORD ms) = 0;
    // Plays a cue file (host path; empty when the device has no such file), cutting off the
    // cue still playing.
    virtual void PlayCue(const std::string& hostPath) = 0;
    virtual void ShowMessageBox(const std::string& text, const std::string& caption) = 0;
    // Single instance: true when another copy of the program runs with a window of this title.
    virtual bool FindRunningCopy(const std::string& title) {
        (void)title;
        return false;
    }
    virtual void RaiseRunningCopy() {}
    virtual void RaiseWindow() {}
    virtual void SetFullScreen(bool on) { (void)on; }
    // The process is about to end with this code: let go of host devices.
    virtual void Shutdown(int exitCode) { (void)exitCode; }
};

// The backend chosen at start; the host installs it before calling WinMain.
void InstallBackend(Backend* backend);
Backend& CurrentBackend();

}  // namespace platform
