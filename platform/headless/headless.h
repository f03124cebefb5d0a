// The headless backend: no window on screen, no audio device, a virtual clock.
// Tests and the replay runner drive the game through it with real window messages.
#pragma once

#include <functional>
#include <string>

#include "platform/core/record.h"
#include "platform/core/surface.h"
#include "platform/types.h"

namespace headless {

struct Config {
    std::string deviceDir;       // host folder standing in for the device's root
    DWORD passMs = 40;           // virtual time each main-loop pass takes
    bool automaticTimer = true;  // post WM_TIMER by the virtual clock
    long maxPasses = -1;         // after this many passes the window is closed; -1: no limit
    bool quiet = false;          // do not echo message boxes on standard error
};

// Selects the headless backend and sets the device folder; call before WinMain.
void Install(const Config& config);

// Called at the end of every main-loop pass with its number, counted from 0. Events posted
// from here are handled from the next pass on, one message per pass.
void SetPassHook(std::function<void(long pass)> hook);
// Called once when WinMain is about to enter its main loop (the pictures are loaded).
void SetLoopStartHook(std::function<void()> hook);
// Called when the program ends itself through ExitProcess (a picture that cannot be read).
// A test can throw from it to get control back; otherwise the process exits.
void SetExitHook(std::function<void(int code)> hook);

long PassCount();
DWORD Now();

// Input, posted to the window as the hardware would deliver it.
void KeyDown(UINT virtualKey);
void KeyUp(UINT virtualKey);
void PenDown(int x, int y);
void PenUp(int x, int y);
void Tap(int x, int y);  // a press and its release at the same point
void Timer(UINT_PTR id);
void Close();  // the user closes the window (WM_CLOSE)

// What the program did: block copies to the window, cues, message boxes, files.
platform::Record& Log();
// The window's client area as last presented.
const platform::Surface& Screen();
// Writes the client area as a PNG file. False when the file cannot be written.
bool SaveScreenshot(const std::string& pngPath, int scale = 1);

}  // namespace headless
