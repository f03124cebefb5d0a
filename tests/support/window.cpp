#include "support/window.h"

namespace test {

std::vector<MSG>& ReceivedMessages() {
    static std::vector<MSG> messages;
    return messages;
}

static LRESULT RecordingProc(HWND window, UINT message, WPARAM wParam, LPARAM lParam) {
    ReceivedMessages().push_back(MSG{window, message, wParam, lParam, 0, {0, 0}});
    return DefWindowProcW(window, message, wParam, lParam);
}

HWND OpenTestWindow() {
    static HWND window = [] {
        WNDCLASSW cls{};
        cls.lpfnWndProc = RecordingProc;
        cls.lpszClassName = u"test";
        RegisterClassW(&cls);
        return CreateWindowExW(0, u"test", u"Test", WS_VISIBLE, 0, 0, 240, 293, nullptr, nullptr,
                               nullptr, nullptr);
    }();
    return window;
}

}  // namespace test
