// The small services that only pass through to the backend: time, memory, message boxes,
// sound and the shell.
#include <cstdlib>

#include "platform/core/backend.h"
#include "platform/core/device.h"
#include "platform/core/record.h"
#include "platform/core/utf.h"
#include "platform/dialog.h"
#include "platform/memory.h"
#include "platform/shell.h"
#include "platform/sound.h"
#include "platform/timer.h"

namespace platform {
void PresentPendingDrawing();
}

void Sleep(DWORD ms) {
    platform::PresentPendingDrawing();
    platform::CurrentBackend().Sleep(ms);
}

DWORD GetTickCount() {
    return platform::CurrentBackend().Now();
}

LPVOID VirtualAlloc(LPVOID address, std::size_t size, DWORD allocationType, DWORD protect) {
    (void)address, (void)allocationType, (void)protect;
    if (size == 0) {
        return nullptr;
    }
    return std::calloc(size, 1);
}

BOOL VirtualFree(LPVOID address, std::size_t size, DWORD freeType) {
    (void)size, (void)freeType;
    if (address == nullptr) {
        return FALSE;
    }
    std::free(address);
    return TRUE;
}

int MessageBoxW(HWND owner, LPCWSTR text, LPCWSTR caption, UINT type) {
    (void)owner, (void)type;
    std::string t = platform::ToUtf8(text);
    std::string c = platform::ToUtf8(caption);
    platform::Record& record = platform::CallRecord();
    if (record.enabled) {
        record.messageBoxes.push_back({t, c});
    }
    platform::CurrentBackend().ShowMessageBox(t, c);
    return IDOK;
}

BOOL sndPlaySoundW(LPCWSTR path, UINT flags) {
    (void)flags;  // every cue is one-shot and cuts off the one playing
    std::string devicePath = platform::ToUtf8(path);
    platform::Record& record = platform::CallRecord();
    if (record.enabled) {
        record.cues.push_back(devicePath);
    }
    std::string hostPath =
        path == nullptr ? std::string() : platform::ResolveDevicePath(devicePath);
    platform::CurrentBackend().PlayCue(hostPath);
    return hostPath.empty() ? FALSE : TRUE;
}

BOOL SHFullScreen(HWND window, DWORD state) {
    (void)window, (void)state;
    return TRUE;  // the host window already shows the whole client area
}

void ExitProcess(UINT exitCode) {
    platform::CurrentBackend().Shutdown(static_cast<int>(exitCode));
    std::exit(static_cast<int>(exitCode));
}
